// Add, Sub, Mul and their constant forms against OpenCV's add, subtract,
// multiply and addWeighted; memref is memcpy of half the bytes moved (it reads
// and writes each byte, as the kernels read sources and write a destination).
#include <opencv2/core.hpp>

#include <cstring>
#include <memory>

#include "bench.h"
#include "pvxi.h"

namespace {

using namespace pvxbench;

struct Bufs {
    cv::Mat a, b, dst, ref;
    std::vector<std::uint8_t> from, to;
};

// Sources of `type` filled uniformly in [lo, hi), two destinations, memcpy
// buffers for the bandwidth reference.
std::shared_ptr<Bufs> MakeBufs(const Frame& f, int type, double lo, double hi, std::int64_t bytes)
{
    auto b = std::make_shared<Bufs>();
    b->a.create(f.height, f.width, type);
    b->b.create(f.height, f.width, type);
    cv::theRNG().state = 12345;
    cv::randu(b->a, lo, hi);
    cv::randu(b->b, lo, hi);
    b->dst.create(f.height, f.width, type);
    b->ref.create(f.height, f.width, type);
    b->from.resize(bytes / 2, 1);
    b->to.resize(bytes / 2);
    return b;
}

int Step(const cv::Mat& m) { return static_cast<int>(m.step); }

void Finish(Case& c, const std::shared_ptr<Bufs>& b, double tolerance)
{
    c.memref = [b] { std::memcpy(b->to.data(), b->from.data(), b->from.size()); };
    c.agree = [pvx = c.pvx, peer = c.peer, b, tolerance] {
        pvx();
        peer();
        return cv::norm(b->dst, b->ref, cv::NORM_INF) <= tolerance;
    };
    Register(c);
}

PVX_BENCH_CASES(ArithCases)
{
    const Frame f = kFrames[0];
    const PvxiSize roi{f.width, f.height};
    const std::int64_t px = static_cast<std::int64_t>(f.width) * f.height;
    const std::string tag = std::string("/") + f.label;

    // 8u sums at scale factor 0 (saturating add) and 1 (halved, half to even;
    // addWeighted rounds the exact half sums to even as well).
    for (int sf : {0, 1}) {
        auto b = MakeBufs(f, CV_8U, 0, 256, px * 3);
        Case c;
        c.name = "Add_8u_C1RSfs_sf" + std::to_string(sf) + tag;
        c.bytes = px * 3;
        c.pvx = [b, roi, sf] {
            pvxiAdd_8u_C1RSfs(b->a.ptr(), Step(b->a), b->b.ptr(), Step(b->b), b->dst.ptr(), Step(b->dst), roi, sf);
        };
        if (sf == 0) c.peer = [b] { cv::add(b->a, b->b, b->ref); };
        else c.peer = [b] { cv::addWeighted(b->a, 0.5, b->b, 0.5, 0.0, b->ref); };
        Finish(c, b, 0);
    }
    {
        auto b = MakeBufs(f, CV_32F, -1000, 1000, px * 12);
        Case c;
        c.name = "Add_32f_C1R" + tag;
        c.bytes = px * 12;
        c.pvx = [b, roi] {
            pvxiAdd_32f_C1R(b->a.ptr<Pvx32f>(), Step(b->a), b->b.ptr<Pvx32f>(), Step(b->b), b->dst.ptr<Pvx32f>(),
                            Step(b->dst), roi);
        };
        c.peer = [b] { cv::add(b->a, b->b, b->ref); };
        Finish(c, b, 0);
    }
    {
        // second minus first
        auto b = MakeBufs(f, CV_16SC3, -32768, 32768, px * 18);
        Case c;
        c.name = "Sub_16s_C3RSfs_sf0" + tag;
        c.bytes = px * 18;
        c.pvx = [b, roi] {
            pvxiSub_16s_C3RSfs(b->a.ptr<Pvx16s>(), Step(b->a), b->b.ptr<Pvx16s>(), Step(b->b), b->dst.ptr<Pvx16s>(),
                               Step(b->dst), roi, 0);
        };
        c.peer = [b] { cv::subtract(b->b, b->a, b->ref); };
        Finish(c, b, 0);
    }
    {
        // Operands below 2^12 in magnitude: the peer's single-precision
        // product is then exact and both round the sixteenth half to even.
        auto b = MakeBufs(f, CV_16S, -4096, 4096, px * 6);
        Case c;
        c.name = "Mul_16s_C1RSfs_sf4" + tag;
        c.bytes = px * 6;
        c.pvx = [b, roi] {
            pvxiMul_16s_C1RSfs(b->a.ptr<Pvx16s>(), Step(b->a), b->b.ptr<Pvx16s>(), Step(b->b), b->dst.ptr<Pvx16s>(),
                               Step(b->dst), roi, 4);
        };
        c.peer = [b] { cv::multiply(b->a, b->b, b->ref, 1.0 / 16); };
        Finish(c, b, 0);
    }
    {
        auto b = MakeBufs(f, CV_8UC3, 0, 256, px * 6);
        Case c;
        c.name = "MulC_8u_C3RSfs_sf2" + tag;
        c.bytes = px * 6;
        c.pvx = [b, roi] {
            const Pvx8u v[3] = {3, 5, 7};
            pvxiMulC_8u_C3RSfs(b->a.ptr(), Step(b->a), v, b->dst.ptr(), Step(b->dst), roi, 2);
        };
        c.peer = [b] { cv::multiply(b->a, cv::Scalar(3, 5, 7), b->ref, 0.25); };
        Finish(c, b, 0);
    }
    {
        // MulScale truncates a * b / 255 and the peer rounds it: within one.
        auto b = MakeBufs(f, CV_8U, 0, 256, px * 3);
        Case c;
        c.name = "MulScale_8u_C1R" + tag;
        c.bytes = px * 3;
        c.pvx = [b, roi] {
            pvxiMulScale_8u_C1R(b->a.ptr(), Step(b->a), b->b.ptr(), Step(b->b), b->dst.ptr(), Step(b->dst), roi);
        };
        c.peer = [b] { cv::multiply(b->a, b->b, b->ref, 1.0 / 255); };
        Finish(c, b, 1);
    }
    {
        // Quotients rounded half to even; divisors from 1 (the peer writes 0
        // for a zero divisor). The peer divides in single precision: within one.
        auto b = MakeBufs(f, CV_8U, 1, 256, px * 3);
        Case c;
        c.name = "Div_Round_8u_C1RSfs_even" + tag;
        c.bytes = px * 3;
        c.pvx = [b, roi] {
            pvxiDiv_Round_8u_C1RSfs(b->a.ptr(), Step(b->a), b->b.ptr(), Step(b->b), b->dst.ptr(), Step(b->dst), roi,
                                    pvxRndNearestEven, 0);
        };
        c.peer = [b] { cv::divide(b->b, b->a, b->ref); };
        Finish(c, b, 1);
    }
    {
        auto b = MakeBufs(f, CV_32FC2, -1000, 1000, px * 16);
        Case c;
        c.name = "AddC_32fc_C1R" + tag;
        c.bytes = px * 16;
        c.pvx = [b, roi] {
            pvxiAddC_32fc_C1R(b->a.ptr<Pvx32fc>(), Step(b->a), Pvx32fc{1.25f, -3.5f}, b->dst.ptr<Pvx32fc>(),
                              Step(b->dst), roi);
        };
        c.peer = [b] { cv::add(b->a, cv::Scalar(1.25, -3.5), b->ref); };
        Finish(c, b, 0);
    }
}

}  // namespace
