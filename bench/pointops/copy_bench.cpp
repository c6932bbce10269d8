// Copy, Set and Dup against OpenCV's copyTo, setTo, split, merge and
// cvtColor(GRAY2BGR), with memcpy/memset of the same bytes as the bandwidth
// reference.
#include <opencv2/core.hpp>
#include <opencv2/imgproc.hpp>

#include <cstring>
#include <memory>

#include "bench.h"
#include "pvxi.h"

namespace {

using namespace pvxbench;

struct Bufs {
    cv::Mat src, dst, ref;
    cv::Mat planes[3], refPlanes[3];
    std::vector<unsigned char> a, b;
};

std::shared_ptr<Bufs> MakeBufs(const Frame& f, int type)
{
    auto b = std::make_shared<Bufs>();
    b->src.create(f.height, f.width, type);
    FillBytes(b->src.data, b->src.total() * b->src.elemSize(), 7);
    b->dst.create(f.height, f.width, type);
    b->ref.create(f.height, f.width, type);
    b->dst.setTo(0);
    b->ref.setTo(0);
    std::size_t bytes = b->src.total() * b->src.elemSize();
    b->a.assign(bytes, 1);
    b->b.assign(bytes, 2);
    return b;
}

bool Same(const cv::Mat& x, const cv::Mat& y)
{
    return cv::norm(x, y, cv::NORM_INF) == 0;
}

void CopyCase(const Frame& f, int type, const char* name)
{
    auto b = MakeBufs(f, type);
    PvxiSize roi{f.width, f.height};
    std::size_t bytes = b->src.total() * b->src.elemSize();
    Case c;
    c.name = std::string(name) + "/" + f.label;
    c.bytes = static_cast<std::int64_t>(bytes) * 2;
    if (CV_MAT_CN(type) == 1) {
        c.pvx = [b, roi] {
            pvxiCopy_8u_C1R(b->src.ptr(), static_cast<int>(b->src.step), b->dst.ptr(), static_cast<int>(b->dst.step),
                            roi);
        };
    } else {
        c.pvx = [b, roi] {
            pvxiCopy_8u_C3R(b->src.ptr(), static_cast<int>(b->src.step), b->dst.ptr(), static_cast<int>(b->dst.step),
                            roi);
        };
    }
    c.peer = [b] { b->src.copyTo(b->ref); };
    c.memref = [b, bytes] { std::memcpy(b->a.data(), b->b.data(), bytes); };
    c.agree = [c, b] {
        c.pvx();
        c.peer();
        return Same(b->dst, b->ref) && Same(b->dst, b->src);
    };
    Register(c);
}

void SetCase(const Frame& f)
{
    auto b = MakeBufs(f, CV_8UC3);
    PvxiSize roi{f.width, f.height};
    std::size_t bytes = b->dst.total() * b->dst.elemSize();
    Case c;
    c.name = std::string("Set_8u_C3R/") + f.label;
    c.bytes = static_cast<std::int64_t>(bytes);
    c.pvx = [b, roi] {
        const Pvx8u v[3] = {10, 20, 30};
        pvxiSet_8u_C3R(v, b->dst.ptr(), static_cast<int>(b->dst.step), roi);
    };
    c.peer = [b] { b->ref.setTo(cv::Scalar(10, 20, 30)); };
    c.memref = [b, bytes] { std::memset(b->a.data(), 10, bytes); };
    c.agree = [c, b] {
        c.pvx();
        c.peer();
        return Same(b->dst, b->ref);
    };
    Register(c);
}

void SplitCase(const Frame& f)
{
    auto b = MakeBufs(f, CV_8UC3);
    for (int i = 0; i < 3; ++i) {
        b->planes[i].create(f.height, f.width, CV_8U);
        b->refPlanes[i].create(f.height, f.width, CV_8U);
    }
    PvxiSize roi{f.width, f.height};
    std::size_t bytes = b->src.total() * b->src.elemSize();
    Case c;
    c.name = std::string("Copy_8u_C3P3R/") + f.label;
    c.bytes = static_cast<std::int64_t>(bytes) * 2;
    c.pvx = [b, roi] {
        Pvx8u* const p[3] = {b->planes[0].ptr(), b->planes[1].ptr(), b->planes[2].ptr()};
        pvxiCopy_8u_C3P3R(b->src.ptr(), static_cast<int>(b->src.step), p, static_cast<int>(b->planes[0].step), roi);
    };
    c.peer = [b] { cv::split(b->src, b->refPlanes); };
    c.memref = [b, bytes] { std::memcpy(b->a.data(), b->b.data(), bytes); };
    c.agree = [c, b] {
        c.pvx();
        c.peer();
        return Same(b->planes[0], b->refPlanes[0]) && Same(b->planes[1], b->refPlanes[1]) &&
               Same(b->planes[2], b->refPlanes[2]);
    };
    Register(c);
}

void MergeCase(const Frame& f)
{
    auto b = MakeBufs(f, CV_8UC3);
    for (int i = 0; i < 3; ++i) {
        b->planes[i].create(f.height, f.width, CV_8U);
        FillBytes(b->planes[i].data, b->planes[i].total(), 11 + i);
    }
    PvxiSize roi{f.width, f.height};
    std::size_t bytes = b->dst.total() * b->dst.elemSize();
    Case c;
    c.name = std::string("Copy_8u_P3C3R/") + f.label;
    c.bytes = static_cast<std::int64_t>(bytes) * 2;
    c.pvx = [b, roi] {
        const Pvx8u* const p[3] = {b->planes[0].ptr(), b->planes[1].ptr(), b->planes[2].ptr()};
        pvxiCopy_8u_P3C3R(p, static_cast<int>(b->planes[0].step), b->dst.ptr(), static_cast<int>(b->dst.step), roi);
    };
    c.peer = [b] { cv::merge(b->planes, 3, b->ref); };
    c.memref = [b, bytes] { std::memcpy(b->a.data(), b->b.data(), bytes); };
    c.agree = [c, b] {
        c.pvx();
        c.peer();
        return Same(b->dst, b->ref);
    };
    Register(c);
}

// One gray plane into the three channels of a color image.
void DupCase(const Frame& f)
{
    auto b = MakeBufs(f, CV_8UC1);
    auto d = std::make_shared<Bufs>();
    d->dst.create(f.height, f.width, CV_8UC3);
    d->ref.create(f.height, f.width, CV_8UC3);
    d->a.assign(static_cast<std::size_t>(f.width) * f.height * 4, 1);
    d->b.assign(d->a.size(), 2);
    PvxiSize roi{f.width, f.height};
    Case c;
    c.name = std::string("Dup_8u_C1C3R/") + f.label;
    c.bytes = static_cast<std::int64_t>(f.width) * f.height * 4;
    c.pvx = [b, d, roi] {
        pvxiDup_8u_C1C3R(b->src.ptr(), static_cast<int>(b->src.step), d->dst.ptr(), static_cast<int>(d->dst.step), roi);
    };
    c.peer = [b, d] { cv::cvtColor(b->src, d->ref, cv::COLOR_GRAY2BGR); };
    c.memref = [d] { std::memcpy(d->a.data(), d->b.data(), d->a.size()); };
    c.agree = [c, d] {
        c.pvx();
        c.peer();
        return Same(d->dst, d->ref);
    };
    Register(c);
}

PVX_BENCH_CASES(CopyCases)
{
    for (const Frame& f : kFrames) {
        CopyCase(f, CV_8UC1, "Copy_8u_C1R");
        CopyCase(f, CV_8UC3, "Copy_8u_C3R");
        SetCase(f);
        SplitCase(f);
        MergeCase(f);
        DupCase(f);
    }
}

}  // namespace
