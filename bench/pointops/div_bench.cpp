// Div_32f against cv::divide of two images, DivC_16u with a scale factor
// against cv::divide by a scalar, and the complex products and quotients of
// Mul_32fc and Div_32fc against mulSpectrums and divSpectrums. OpenCV rounds
// its 16u quotient in its own way, so the agree check compares pvx with the
// exact quotient and OpenCV with pvx to within one.
#include <opencv2/core.hpp>
#include <opencv2/imgproc.hpp>

#include <cmath>
#include <cstring>
#include <memory>
#include <vector>

#include "bench.h"
#include "pvxi.h"

namespace {

PVX_BENCH_CASES(DivCases)
{
    using namespace pvxbench;
    const Frame f = kFrames[0];
    PvxiSize roi{f.width, f.height};
    const std::int64_t px = static_cast<std::int64_t>(f.width) * f.height;
    {
        struct Bufs {
            cv::Mat den, num, dst, ref;
        };
        auto b = std::make_shared<Bufs>();
        b->den.create(f.height, f.width, CV_32F);
        b->num.create(f.height, f.width, CV_32F);
        cv::randu(b->den, 0.5, 300.0);  // no zero divisors: OpenCV writes 0 there
        cv::randu(b->num, -300.0, 300.0);
        b->dst.create(f.height, f.width, CV_32F);
        b->ref.create(f.height, f.width, CV_32F);
        Case c;
        c.name = std::string("Div_32f_C1R/") + f.label;
        c.bytes = px * 12;
        c.pvx = [b, roi] {
            pvxiDiv_32f_C1R(b->den.ptr<float>(), static_cast<int>(b->den.step), b->num.ptr<float>(),
                            static_cast<int>(b->num.step), b->dst.ptr<float>(), static_cast<int>(b->dst.step), roi);
        };
        c.peer = [b] { cv::divide(b->num, b->den, b->ref); };
        c.memref = [b] { std::memcpy(b->dst.data, b->num.data, b->num.total() * 4); };
        c.agree = [c, b] {
            c.pvx();
            c.peer();
            // the refined reciprocal may differ from exact division in the last bits
            cv::Mat diff = cv::abs(b->dst - b->ref), tol = cv::abs(b->ref) * 4e-7;
            return cv::countNonZero(diff > tol) == 0;
        };
        Register(c);
    }
    {
        struct Bufs {
            cv::Mat src, dst, ref;
        };
        auto b = std::make_shared<Bufs>();
        b->src.create(f.height, f.width, CV_16U);
        cv::randu(b->src, 0, 65536);
        b->dst.create(f.height, f.width, CV_16U);
        b->ref.create(f.height, f.width, CV_16U);
        const Pvx16u value = 7;
        Case c;
        c.name = std::string("DivC_16u_C1RSfs/") + f.label;
        c.bytes = px * 4;
        c.pvx = [b, roi, value] {
            pvxiDivC_16u_C1RSfs(b->src.ptr<Pvx16u>(), static_cast<int>(b->src.step), value, b->dst.ptr<Pvx16u>(),
                                static_cast<int>(b->dst.step), roi, 0);
        };
        c.peer = [b, value] { cv::divide(b->src, cv::Scalar(value), b->ref); };
        c.memref = [b] { std::memcpy(b->dst.data, b->src.data, b->src.total() * 2); };
        c.agree = [c, b, value] {
            c.pvx();
            c.peer();
            for (int y = 0; y < b->src.rows; ++y)
                for (int x = 0; x < b->src.cols; ++x) {
                    unsigned n = b->src.at<Pvx16u>(y, x), q = n / value, r = n % value;
                    if (2 * r > value || (2 * r == value && (q & 1))) ++q;  // half to even
                    if (b->dst.at<Pvx16u>(y, x) != q) return false;
                    if (std::abs(static_cast<int>(b->ref.at<Pvx16u>(y, x)) - static_cast<int>(q)) > 1) return false;
                }
            return true;
        };
        Register(c);
    }
    // Complex frames: two-channel float images are the peer's spectra. The
    // peer's quotient takes its own operation order, hence the tolerance.
    for (bool quot : {false, true}) {
        struct Bufs {
            cv::Mat a, b, dst, ref;
            std::vector<std::uint8_t> from, to;  // memcpy: half the bytes moved
        };
        auto b = std::make_shared<Bufs>();
        b->from.resize(px * 12, 1);
        b->to.resize(px * 12);
        b->a.create(f.height, f.width, CV_32FC2);
        b->b.create(f.height, f.width, CV_32FC2);
        cv::randu(b->a, -300.0, 300.0);
        cv::randu(b->b, 0.5, 300.0);
        b->dst.create(f.height, f.width, CV_32FC2);
        b->ref.create(f.height, f.width, CV_32FC2);
        Case c;
        c.name = std::string(quot ? "Div_32fc_C1R/" : "Mul_32fc_C1R/") + f.label;
        c.bytes = px * 24;
        auto ptr = [](cv::Mat& m) { return m.ptr<Pvx32fc>(); };
        auto step = [](const cv::Mat& m) { return static_cast<int>(m.step); };
        if (quot) {
            // a / b: the first image is the divisor
            c.pvx = [b, roi, ptr, step] {
                pvxiDiv_32fc_C1R(ptr(b->b), step(b->b), ptr(b->a), step(b->a), ptr(b->dst), step(b->dst), roi);
            };
            c.peer = [b] { cv::divSpectrums(b->a, b->b, b->ref, 0); };
        } else {
            c.pvx = [b, roi, ptr, step] {
                pvxiMul_32fc_C1R(ptr(b->a), step(b->a), ptr(b->b), step(b->b), ptr(b->dst), step(b->dst), roi);
            };
            c.peer = [b] { cv::mulSpectrums(b->a, b->b, b->ref, 0); };
        }
        c.memref = [b] { std::memcpy(b->to.data(), b->from.data(), b->from.size()); };
        c.agree = [c, b] {
            c.pvx();
            c.peer();
            // parts of up to 300 squared cancel in ac - bd: absolute room too
            cv::Mat diff = cv::abs(b->dst - b->ref), tol = cv::abs(b->ref) * 1e-5 + 0.05;
            return cv::countNonZero(diff.reshape(1) > tol.reshape(1)) == 0;
        };
        Register(c);
    }
}

}  // namespace
