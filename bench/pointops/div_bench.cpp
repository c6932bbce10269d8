// Div_32f against cv::divide of two images, DivC_16u with a scale factor
// against cv::divide by a scalar. OpenCV rounds its 16u quotient in its own
// way, so the agree check compares pvx with the exact quotient and OpenCV
// with pvx to within one.
#include <opencv2/core.hpp>

#include <cmath>
#include <cstring>
#include <memory>

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
}

}  // namespace
