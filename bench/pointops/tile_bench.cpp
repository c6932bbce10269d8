// Small regions: a 1080p frame processed as 8x8 tiles, one call a tile (32400
// calls), as block-based codecs and tiled pipelines call the library. What
// these cases time is mostly the cost of a call: checks, per-call set-up
// (shuffle masks, fill patterns, constant patterns, scale-factor constants)
// and row ends shorter than a block. The
// peer works on the same tiles through matrix headers of the same regions.
#include <opencv2/core.hpp>
#include <opencv2/imgproc.hpp>

#include <memory>

#include "bench.h"
#include "pvxi.h"

namespace {

using namespace pvxbench;

constexpr int kTile = 8;

struct Bufs {
    cv::Mat a, b, dst, ref;
};

std::shared_ptr<Bufs> MakeBufs(const Frame& f, int type)
{
    auto b = std::make_shared<Bufs>();
    for (cv::Mat* m : {&b->a, &b->b, &b->dst, &b->ref}) m->create(f.height, f.width, type);
    FillBytes(b->a.data, b->a.total() * b->a.elemSize(), 3);
    FillBytes(b->b.data, b->b.total() * b->b.elemSize(), 4);
    b->dst.setTo(0);
    b->ref.setTo(0);
    return b;
}

// Calls fn(x, y) for the top-left corner of every tile.
template <class Fn>
void ForTiles(const cv::Mat& m, Fn fn)
{
    for (int y = 0; y + kTile <= m.rows; y += kTile)
        for (int x = 0; x + kTile <= m.cols; x += kTile) fn(x, y);
}

void Finish(Case& c, const std::shared_ptr<Bufs>& b, const char* name, const Frame& f)
{
    c.name = std::string(name) + "_tiles8/" + f.label;
    c.bytes = static_cast<std::int64_t>(b->a.total() * b->a.elemSize()) * 2;
    c.agree = [pvx = c.pvx, peer = c.peer, b] {
        pvx();
        peer();
        return cv::norm(b->dst, b->ref, cv::NORM_INF) == 0;
    };
    Register(c);
}

PVX_BENCH_CASES(TileCases)
{
    const Frame f = kFrames[0];
    const PvxiSize tile{kTile, kTile};
    {
        auto b = MakeBufs(f, CV_8UC3);
        Case c;
        c.pvx = [b, tile] {
            static const int order[3] = {2, 1, 0};
            const int as = static_cast<int>(b->a.step), ds = static_cast<int>(b->dst.step);
            ForTiles(b->a, [&](int x, int y) {
                pvxiSwapChannels_8u_C3R(b->a.ptr(y, x), as, b->dst.ptr(y, x), ds, tile, order);
            });
        };
        c.peer = [b] {
            ForTiles(b->a, [&](int x, int y) {
                cv::Rect r(x, y, kTile, kTile);
                cv::Mat out = b->ref(r);
                cv::cvtColor(b->a(r), out, cv::COLOR_BGR2RGB);
            });
        };
        Finish(c, b, "SwapChannels_8u_C3R", f);
    }
    {
        auto b = MakeBufs(f, CV_8UC4);
        Case c;
        c.pvx = [b, tile] {
            const int as = static_cast<int>(b->a.step), ds = static_cast<int>(b->dst.step);
            ForTiles(b->a, [&](int x, int y) { pvxiMirror_8u_C4R(b->a.ptr(y, x), as, b->dst.ptr(y, x), ds, tile, 1); });
        };
        c.peer = [b] {
            ForTiles(b->a, [&](int x, int y) {
                cv::Rect r(x, y, kTile, kTile);
                cv::Mat out = b->ref(r);
                cv::flip(b->a(r), out, 1);
            });
        };
        Finish(c, b, "Mirror_8u_C4R_flip1", f);
    }
    {
        auto b = MakeBufs(f, CV_8UC3);
        Case c;
        c.pvx = [b, tile] {
            static const Pvx8u value[3] = {10, 20, 30};
            const int ds = static_cast<int>(b->dst.step);
            ForTiles(b->dst, [&](int x, int y) { pvxiSet_8u_C3R(value, b->dst.ptr(y, x), ds, tile); });
        };
        c.peer = [b] {
            ForTiles(b->ref, [&](int x, int y) { b->ref(cv::Rect(x, y, kTile, kTile)).setTo(cv::Scalar(10, 20, 30)); });
        };
        Finish(c, b, "Set_8u_C3R", f);
    }
    {
        auto b = MakeBufs(f, CV_8UC3);
        Case c;
        c.pvx = [b, tile] {
            const int as = static_cast<int>(b->a.step), bs = static_cast<int>(b->b.step);
            const int ds = static_cast<int>(b->dst.step);
            ForTiles(b->a, [&](int x, int y) {
                pvxiAdd_8u_C3RSfs(b->a.ptr(y, x), as, b->b.ptr(y, x), bs, b->dst.ptr(y, x), ds, tile, 0);
            });
        };
        c.peer = [b] {
            ForTiles(b->a, [&](int x, int y) {
                cv::Rect r(x, y, kTile, kTile);
                cv::Mat out = b->ref(r);
                cv::add(b->a(r), b->b(r), out);
            });
        };
        Finish(c, b, "Add_8u_C3RSfs_sf0", f);
    }
    {
        // (the products are exact in single precision, so the peer's rounding
        // of product times 1/4 is the scale-factor rule's)
        auto b = MakeBufs(f, CV_8UC3);
        Case c;
        c.pvx = [b, tile] {
            static const Pvx8u value[3] = {3, 4, 5};
            const int as = static_cast<int>(b->a.step), ds = static_cast<int>(b->dst.step);
            ForTiles(b->a, [&](int x, int y) {
                pvxiMulC_8u_C3RSfs(b->a.ptr(y, x), as, value, b->dst.ptr(y, x), ds, tile, 2);
            });
        };
        c.peer = [b] {
            ForTiles(b->a, [&](int x, int y) {
                cv::Rect r(x, y, kTile, kTile);
                cv::Mat out = b->ref(r);
                cv::multiply(b->a(r), cv::Scalar(3, 4, 5), out, 0.25);
            });
        };
        Finish(c, b, "MulC_8u_C3RSfs_sf2", f);
    }
    {
        auto b = MakeBufs(f, CV_8UC4);
        Case c;
        c.pvx = [b, tile] {
            static const int order[4] = {2, 1, 0, 3};
            const int as = static_cast<int>(b->a.step), ds = static_cast<int>(b->dst.step);
            ForTiles(b->a, [&](int x, int y) {
                pvxiSwapChannels_8u_C4R(b->a.ptr(y, x), as, b->dst.ptr(y, x), ds, tile, order);
            });
        };
        c.peer = [b] {
            ForTiles(b->a, [&](int x, int y) {
                cv::Rect r(x, y, kTile, kTile);
                cv::Mat out = b->ref(r);
                cv::cvtColor(b->a(r), out, cv::COLOR_BGRA2RGBA);
            });
        };
        Finish(c, b, "SwapChannels_8u_C4R", f);
    }
}

}  // namespace
