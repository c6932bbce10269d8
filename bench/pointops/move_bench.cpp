// Channel and pixel movement against OpenCV: SwapChannels_8u_C3R {2, 1, 0}
// against cvtColor BGR2RGB, Transpose_8u_C1R, _8u_C3R and _32f_C3R against
// transpose, and Mirror_8u_C4R flips 0 and 1 against flip; memref copies the
// same bytes.
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
};

std::shared_ptr<Bufs> MakeBufs(int srcRows, int srcCols, int dstRows, int dstCols, int type)
{
    auto b = std::make_shared<Bufs>();
    b->src.create(srcRows, srcCols, type);
    FillBytes(b->src.data, b->src.total() * b->src.elemSize(), 7);
    b->dst.create(dstRows, dstCols, type);
    b->ref.create(dstRows, dstCols, type);
    b->dst.setTo(0);
    b->ref.setTo(0);
    return b;
}

int Step(const cv::Mat& m) { return static_cast<int>(m.step); }

bool Same(const Bufs& b) { return cv::norm(b.dst, b.ref, cv::NORM_INF) == 0; }

PVX_BENCH_CASES(MoveCases)
{
    for (const Frame& f : kFrames) {
        PvxiSize roi{f.width, f.height};
        std::int64_t px = std::int64_t{f.width} * f.height;
        {
            auto b = MakeBufs(f.height, f.width, f.height, f.width, CV_8UC3);
            Case c;
            c.name = std::string("SwapChannels_8u_C3R/") + f.label;
            c.bytes = px * 3 * 2;
            c.pvx = [b, roi] {
                static const int order[3] = {2, 1, 0};
                pvxiSwapChannels_8u_C3R(b->src.data, Step(b->src), b->dst.data, Step(b->dst), roi, order);
            };
            c.peer = [b] { cv::cvtColor(b->src, b->ref, cv::COLOR_BGR2RGB); };
            c.memref = [b, px] { std::memcpy(b->dst.data, b->src.data, px * 3); };
            c.agree = [c, b] { c.pvx(); c.peer(); return Same(*b); };
            Register(c);
        }
        {
            auto b = MakeBufs(f.height, f.width, f.width, f.height, CV_8UC1);
            Case c;
            c.name = std::string("Transpose_8u_C1R/") + f.label;
            c.bytes = px * 2;
            c.pvx = [b, roi] { pvxiTranspose_8u_C1R(b->src.data, Step(b->src), b->dst.data, Step(b->dst), roi); };
            c.peer = [b] { cv::transpose(b->src, b->ref); };
            c.memref = [b, px] { std::memcpy(b->dst.data, b->src.data, px); };
            c.agree = [c, b] { c.pvx(); c.peer(); return Same(*b); };
            Register(c);
        }
        // Three-channel pixels of 3 and 12 bytes, the sizes with kernels of
        // their own.
        for (int type : {CV_8UC3, CV_32FC3}) {
            auto b = MakeBufs(f.height, f.width, f.width, f.height, type);
            const bool is8u = type == CV_8UC3;
            const std::int64_t pixelBytes = is8u ? 3 : 12;
            Case c;
            c.name = std::string(is8u ? "Transpose_8u_C3R/" : "Transpose_32f_C3R/") + f.label;
            c.bytes = px * pixelBytes * 2;
            c.pvx = [b, roi, is8u] {
                if (is8u) pvxiTranspose_8u_C3R(b->src.data, Step(b->src), b->dst.data, Step(b->dst), roi);
                else
                    pvxiTranspose_32f_C3R(b->src.ptr<Pvx32f>(), Step(b->src), b->dst.ptr<Pvx32f>(), Step(b->dst), roi);
            };
            c.peer = [b] { cv::transpose(b->src, b->ref); };
            c.memref = [b, px, pixelBytes] { std::memcpy(b->dst.data, b->src.data, px * pixelBytes); };
            c.agree = [c, b] {
                c.pvx();
                c.peer();
                return std::memcmp(b->dst.data, b->ref.data, b->dst.total() * b->dst.elemSize()) == 0;
            };
            Register(c);
        }
        for (int flip : {0, 1}) {
            auto b = MakeBufs(f.height, f.width, f.height, f.width, CV_8UC4);
            Case c;
            c.name = std::string("Mirror_8u_C4R_flip") + std::to_string(flip) + "/" + f.label;
            c.bytes = px * 4 * 2;
            c.pvx = [b, roi, flip] {
                pvxiMirror_8u_C4R(b->src.data, Step(b->src), b->dst.data, Step(b->dst), roi, flip);
            };
            c.peer = [b, flip] { cv::flip(b->src, b->ref, flip); };
            c.memref = [b, px] { std::memcpy(b->dst.data, b->src.data, px * 4); };
            c.agree = [c, b] { c.pvx(); c.peer(); return Same(*b); };
            Register(c);
        }
    }
}

}  // namespace
