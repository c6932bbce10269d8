// One-operand arithmetic against OpenCV: Exp_32f and Ln_32f against cv::exp
// and cv::log, Sqrt_32f against cv::sqrt, Abs_16s against cv::abs (both
// saturate -32768), Sqr_16u with a scale factor against cv::multiply of the
// image with itself. Results are compared within what each side reaches:
// pvx's e^x and ln x are within 1 ulp; OpenCV's e^x is off by up to 4e-6
// relative (measured) and it rounds scaled 16u products its own way. 8u
// Sqrt and Ln at scale factor 0 against cv::LUT with a table of the same
// results, what a user would write instead: they must agree exactly.
#include <opencv2/core.hpp>

#include <cmath>
#include <cstring>
#include <memory>
#include <string>

#include "bench.h"
#include "pvxi.h"

namespace {

using pvxbench::Case;

struct Bufs {
    cv::Mat src, dst, ref;
};

// Registers one case on a 1080p frame of `type` filled uniformly in [lo, hi).
template <class Pvx, class Peer, class Agree>
void AddCase(const char* name, int type, double lo, double hi, int bytesPerPixel, Pvx pvx, Peer peer, Agree agree)
{
    const pvxbench::Frame f = pvxbench::kFrames[0];
    auto b = std::make_shared<Bufs>();
    b->src.create(f.height, f.width, type);
    cv::randu(b->src, lo, hi);
    b->dst.create(f.height, f.width, type);
    b->ref.create(f.height, f.width, type);
    Case c;
    c.name = std::string(name) + "/" + f.label;
    c.bytes = static_cast<std::int64_t>(f.width) * f.height * bytesPerPixel;
    PvxiSize roi{f.width, f.height};
    c.pvx = [b, roi, pvx] { pvx(*b, roi); };
    c.peer = [b, peer] { peer(*b); };
    c.memref = [b] { std::memcpy(b->dst.data, b->src.data, b->src.total() * b->src.elemSize()); };
    c.agree = [c, b, agree] {
        c.pvx();
        c.peer();
        return agree(*b);
    };
    pvxbench::Register(c);
}

bool FloatsAgree(const Bufs& b, double rel)
{
    cv::Mat diff = cv::abs(b.dst - b.ref), tol = cv::abs(b.ref) * rel;
    return cv::countNonZero(diff > tol) == 0;
}

PVX_BENCH_CASES(UnaryCases)
{
    AddCase(
        "Exp_32f_C1R", CV_32F, -80.0, 80.0, 8,
        [](Bufs& b, PvxiSize roi) {
            pvxiExp_32f_C1R(b.src.ptr<float>(), static_cast<int>(b.src.step), b.dst.ptr<float>(),
                            static_cast<int>(b.dst.step), roi);
        },
        [](Bufs& b) { cv::exp(b.src, b.ref); }, [](const Bufs& b) { return FloatsAgree(b, 1e-5); });
    AddCase(
        "Ln_32f_C1R", CV_32F, 1e-3, 1e6, 8,
        [](Bufs& b, PvxiSize roi) {
            pvxiLn_32f_C1R(b.src.ptr<float>(), static_cast<int>(b.src.step), b.dst.ptr<float>(),
                           static_cast<int>(b.dst.step), roi);
        },
        [](Bufs& b) { cv::log(b.src, b.ref); }, [](const Bufs& b) { return FloatsAgree(b, 1e-6); });
    AddCase(
        "Sqrt_32f_C1R", CV_32F, 0.0, 1e6, 8,
        [](Bufs& b, PvxiSize roi) {
            pvxiSqrt_32f_C1R(b.src.ptr<float>(), static_cast<int>(b.src.step), b.dst.ptr<float>(),
                             static_cast<int>(b.dst.step), roi);
        },
        [](Bufs& b) { cv::sqrt(b.src, b.ref); }, [](const Bufs& b) { return FloatsAgree(b, 0); });
    AddCase(
        "Abs_16s_C1R", CV_16S, -32768, 32768, 4,
        [](Bufs& b, PvxiSize roi) {
            pvxiAbs_16s_C1R(b.src.ptr<Pvx16s>(), static_cast<int>(b.src.step), b.dst.ptr<Pvx16s>(),
                            static_cast<int>(b.dst.step), roi);
        },
        [](Bufs& b) { b.ref = cv::abs(b.src); },
        [](const Bufs& b) { return cv::norm(b.dst, b.ref, cv::NORM_INF) == 0; });
    AddCase(
        "Sqr_16u_C1RSfs_sf8", CV_16U, 0, 65536, 4,
        [](Bufs& b, PvxiSize roi) {
            pvxiSqr_16u_C1RSfs(b.src.ptr<Pvx16u>(), static_cast<int>(b.src.step), b.dst.ptr<Pvx16u>(),
                               static_cast<int>(b.dst.step), roi, 8);
        },
        [](Bufs& b) { cv::multiply(b.src, b.src, b.ref, 1.0 / 256); },
        [](const Bufs& b) {
            cv::Mat d;
            cv::absdiff(b.dst, b.ref, d);
            double worst;
            cv::minMaxLoc(d, nullptr, &worst);
            return worst <= 1;
        });

    // 8u tables of round(sqrt x) and round(ln x) (ln 0: 0, the 8u minimum);
    // no value is a tie at scale factor 0.
    auto table = [](double (*f)(double)) {
        cv::Mat t(1, 256, CV_8U);
        for (int x = 0; x < 256; ++x) t.at<std::uint8_t>(x) = x == 0 ? 0 : static_cast<std::uint8_t>(std::lround(f(x)));
        return t;
    };
    auto exact = [](const Bufs& b) { return cv::norm(b.dst, b.ref, cv::NORM_INF) == 0; };
    AddCase(
        "Sqrt_8u_C1RSfs_sf0", CV_8U, 0, 256, 2,
        [](Bufs& b, PvxiSize roi) {
            pvxiSqrt_8u_C1RSfs(b.src.ptr<Pvx8u>(), static_cast<int>(b.src.step), b.dst.ptr<Pvx8u>(),
                               static_cast<int>(b.dst.step), roi, 0);
        },
        [t = table([](double x) { return std::sqrt(x); })](Bufs& b) { cv::LUT(b.src, t, b.ref); }, exact);
    AddCase(
        "Ln_8u_C1RSfs_sf0", CV_8U, 0, 256, 2,
        [](Bufs& b, PvxiSize roi) {
            pvxiLn_8u_C1RSfs(b.src.ptr<Pvx8u>(), static_cast<int>(b.src.step), b.dst.ptr<Pvx8u>(),
                             static_cast<int>(b.dst.step), roi, 0);
        },
        [t = table([](double x) { return std::log(x); })](Bufs& b) { cv::LUT(b.src, t, b.ref); }, exact);
}

}  // namespace
