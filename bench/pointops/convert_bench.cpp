// Convert_32f8u against OpenCV's convertTo (round to nearest even).
#include <opencv2/core.hpp>

#include "bench.h"
#include "pvxi.h"

namespace {

PVX_BENCH_CASES(ConvertCases)
{
    using namespace pvxbench;
    const Frame f = kFrames[0];
    struct Bufs {
        cv::Mat src, dst, ref;
    };
    auto b = std::make_shared<Bufs>();
    b->src.create(f.height, f.width, CV_32F);
    cv::randu(b->src, -20.0, 300.0);
    b->dst.create(f.height, f.width, CV_8U);
    b->ref.create(f.height, f.width, CV_8U);
    PvxiSize roi{f.width, f.height};
    Case c;
    c.name = std::string("Convert_32f8u_C1R/") + f.label;
    c.bytes = static_cast<std::int64_t>(f.width) * f.height * 5;
    c.pvx = [b, roi] {
        pvxiConvert_32f8u_C1R(b->src.ptr<float>(), static_cast<int>(b->src.step), b->dst.ptr(),
                              static_cast<int>(b->dst.step), roi, pvxRndNearestEven);
    };
    c.peer = [b] { b->src.convertTo(b->ref, CV_8U); };
    c.agree = [c, b] {
        c.pvx();
        c.peer();
        return cv::norm(b->dst, b->ref, cv::NORM_INF) == 0;
    };
    Register(c);
}

}  // namespace
