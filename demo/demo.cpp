// pvx_demo: uses the library the way an application does, through pvxi.h
// only. It draws its own input images (a colour test chart and a zone plate,
// each in 32f and 8u), runs each family on them, prints every call with its
// status, and writes the results as PNG files that any image viewer opens.
//
//   pvx_demo [output-directory]      (default: demo-out)
//
// Each family has one Demo* function below; main() calls them in turn. The
// process exits with 1 when a call returns a status other than the expected
// one or a file cannot be written.

#include <pvxi.h>

#include <algorithm>
#include <cerrno>
#include <cmath>
#include <cstdint>
#include <cstdio>
#include <cstring>
#include <string>
#include <vector>

#include <sys/stat.h>

namespace {

// ---- PNG writing -------------------------------------------------------------
// A minimal PNG writer: 8-bit grey or RGB, filter 0 on every row, the image
// data as stored (uncompressed) deflate blocks. Its own CRC-32 and Adler-32,
// so the demo needs nothing beyond the standard library.

class Crc32 {
public:
    Crc32()
    {
        for (std::uint32_t n = 0; n < 256; ++n) {
            std::uint32_t c = n;
            for (int k = 0; k < 8; ++k) c = (c & 1) ? 0xEDB88320u ^ (c >> 1) : c >> 1;
            table_[n] = c;
        }
    }
    std::uint32_t Of(const std::uint8_t* p, std::size_t n) const
    {
        std::uint32_t c = 0xFFFFFFFFu;
        for (std::size_t i = 0; i < n; ++i) c = table_[(c ^ p[i]) & 0xFF] ^ (c >> 8);
        return c ^ 0xFFFFFFFFu;
    }

private:
    std::uint32_t table_[256];
};

std::uint32_t Adler32(const std::uint8_t* p, std::size_t n)
{
    std::uint32_t a = 1, b = 0;
    for (std::size_t i = 0; i < n; ++i) {
        a = (a + p[i]) % 65521u;
        b = (b + a) % 65521u;
    }
    return (b << 16) | a;
}

void PutBe32(std::vector<std::uint8_t>& v, std::uint32_t x)
{
    v.push_back(static_cast<std::uint8_t>(x >> 24));
    v.push_back(static_cast<std::uint8_t>(x >> 16));
    v.push_back(static_cast<std::uint8_t>(x >> 8));
    v.push_back(static_cast<std::uint8_t>(x));
}

void PutChunk(std::vector<std::uint8_t>& file, const char type[4], const std::vector<std::uint8_t>& data)
{
    static const Crc32 crc;
    PutBe32(file, static_cast<std::uint32_t>(data.size()));
    std::vector<std::uint8_t> body(type, type + 4);
    body.insert(body.end(), data.begin(), data.end());
    file.insert(file.end(), body.begin(), body.end());
    PutBe32(file, crc.Of(body.data(), body.size()));
}

// Writes width x height pixels of `channels` (1 or 3) 8-bit samples whose rows
// start `step` bytes apart.
bool WritePng(const std::string& path, const Pvx8u* pixels, int step, int width, int height, int channels)
{
    const std::size_t rowBytes = static_cast<std::size_t>(width) * channels;
    std::vector<std::uint8_t> raw;  // filter byte + samples, per row
    raw.reserve((rowBytes + 1) * height);
    for (int y = 0; y < height; ++y) {
        const Pvx8u* row = pixels + static_cast<std::ptrdiff_t>(y) * step;
        raw.push_back(0);
        raw.insert(raw.end(), row, row + rowBytes);
    }

    std::vector<std::uint8_t> z = {0x78, 0x01};  // deflate, 32K window, no preset dictionary
    for (std::size_t at = 0; at < raw.size() || raw.empty();) {
        const std::size_t n = std::min<std::size_t>(raw.size() - at, 65535);
        const bool last = at + n == raw.size();
        z.push_back(last ? 1 : 0);  // BFINAL, BTYPE 00 (stored)
        z.push_back(static_cast<std::uint8_t>(n));
        z.push_back(static_cast<std::uint8_t>(n >> 8));
        z.push_back(static_cast<std::uint8_t>(~n));
        z.push_back(static_cast<std::uint8_t>(~n >> 8));
        z.insert(z.end(), raw.begin() + at, raw.begin() + at + n);
        at += n;
        if (last) break;
    }
    PutBe32(z, Adler32(raw.data(), raw.size()));

    std::vector<std::uint8_t> header;
    PutBe32(header, static_cast<std::uint32_t>(width));
    PutBe32(header, static_cast<std::uint32_t>(height));
    header.push_back(8);                      // bit depth
    header.push_back(channels == 3 ? 2 : 0);  // colour type: RGB or grey
    header.push_back(0);                      // deflate
    header.push_back(0);                      // filter method 0
    header.push_back(0);                      // no interlace

    std::vector<std::uint8_t> file = {0x89, 'P', 'N', 'G', '\r', '\n', 0x1A, '\n'};
    PutChunk(file, "IHDR", header);
    PutChunk(file, "IDAT", z);
    PutChunk(file, "IEND", {});

    std::FILE* f = std::fopen(path.c_str(), "wb");
    if (!f) return false;
    const bool ok = std::fwrite(file.data(), 1, file.size(), f) == file.size();
    return std::fclose(f) == 0 && ok;
}

// ---- the run: output directory, reporting ------------------------------------

struct Run {
    std::string outDir;
    int failures = 0;

    // Prints one call and its status; counts it as a failure when the status
    // is not the expected one.
    void Call(const std::string& what, PvxStatus status, PvxStatus expected = pvxStsNoErr)
    {
        std::printf("  %-58s -> %d %s\n", what.c_str(), static_cast<int>(status), pvxGetStatusString(status));
        if (status != expected) {
            std::printf("  ** expected %d %s\n", static_cast<int>(expected), pvxGetStatusString(expected));
            ++failures;
        }
    }

    void Write(const std::string& name, const Pvx8u* pixels, int step, int width, int height, int channels,
               const std::string& what)
    {
        const std::string path = outDir + "/" + name;
        if (WritePng(path, pixels, step, width, height, channels)) {
            std::printf("  wrote %-46s %s\n", path.c_str(), what.c_str());
        } else {
            std::printf("  ** cannot write %s: %s\n", path.c_str(), std::strerror(errno));
            ++failures;
        }
    }
};

// An image from pvxiMalloc_*: first pixel, step in bytes, size.
template <class T>
struct Image {
    T* data = nullptr;
    int step = 0;
    int width = 0;
    int height = 0;
    int channels = 1;

    T* Row(int y) const
    {
        return reinterpret_cast<T*>(reinterpret_cast<Pvx8u*>(data) + static_cast<std::ptrdiff_t>(y) * step);
    }
    PvxiSize Size() const { return PvxiSize{width, height}; }
};

template <class T>
void Release(Image<T>& image)
{
    pvxiFree(image.data);
    image.data = nullptr;
}

// Allocates with the pvxiMalloc_* member `fn` and reports the call.
template <class T>
Image<T> Allocate(Run& run, const char* name, T* (*fn)(int, int, int*), int width, int height, int channels)
{
    Image<T> image;
    image.width = width;
    image.height = height;
    image.channels = channels;
    image.data = fn(width, height, &image.step);
    std::printf("  %s(%d, %d) -> %s, step %d\n", name, width, height, image.data ? "image" : "null", image.step);
    if (!image.data) ++run.failures;
    return image;
}

// ---- the input images ----------------------------------------------------------

constexpr int kWidth = 512;
constexpr int kHeight = 384;
constexpr double kPi = 3.14159265358979323846;

struct Inputs {
    Image<Pvx32f> zone32f;   // C1, values from -16 to 271: a little beyond 8u at both ends
    Image<Pvx8u> zone8u;     // C1
    Image<Pvx32f> chart32f;  // C3, values 0..255 with fractions
    Image<Pvx8u> chart8u;    // C3
};

// A circular zone plate: cos(k r^2) with the frequency growing toward the
// corners, so every direction and spatial frequency occurs somewhere.
double ZonePlate(int x, int y)
{
    const double cx = x - kWidth / 2.0 + 0.5, cy = y - kHeight / 2.0 + 0.5;
    const double k = kPi / kWidth;  // reaches the Nyquist rate at the middle of the edges
    return std::cos(k * (cx * cx + cy * cy));
}

// A colour test chart: bars of the eight primaries and secondaries at the
// top, three colour ramps, a grey ramp, and a strip of fine black and white
// lines at the bottom. Values in 0..255, with fractions in the ramps.
void Chart(int x, int y, double rgb[3])
{
    static const double kBars[8][3] = {{255, 255, 255}, {255, 255, 0}, {0, 255, 255}, {0, 255, 0},
                                       {255, 0, 255},   {255, 0, 0},   {0, 0, 255},   {0, 0, 0}};
    const double t = (x + 0.5) * 255.0 / kWidth;  // 0..255 across
    const int band = y * 8 / kHeight;
    if (band < 3) {
        const double* bar = kBars[x * 8 / kWidth];
        for (int c = 0; c < 3; ++c) rgb[c] = bar[c];
    } else if (band < 6) {
        for (int c = 0; c < 3; ++c) rgb[c] = (c == band - 3) ? t : 0.0;
    } else if (band < 7) {
        for (int c = 0; c < 3; ++c) rgb[c] = t;
    } else {
        const int period = 1 + x * 4 / kWidth;  // lines 1, 2, 3 and 4 pixels wide
        const double v = ((x / period) % 2) ? 255.0 : 0.0;
        for (int c = 0; c < 3; ++c) rgb[c] = v;
    }
    // an orange marker in the top left corner shows orientation
    if (x < 48 && y < 48 && x + y < 48) {
        rgb[0] = 255;
        rgb[1] = 128;
        rgb[2] = 0;
    }
}

Inputs MakeInputs(Run& run)
{
    Inputs in;
    in.zone32f = Allocate(run, "pvxiMalloc_32f_C1", pvxiMalloc_32f_C1, kWidth, kHeight, 1);
    in.zone8u = Allocate(run, "pvxiMalloc_8u_C1", pvxiMalloc_8u_C1, kWidth, kHeight, 1);
    in.chart32f = Allocate(run, "pvxiMalloc_32f_C3", pvxiMalloc_32f_C3, kWidth, kHeight, 3);
    in.chart8u = Allocate(run, "pvxiMalloc_8u_C3", pvxiMalloc_8u_C3, kWidth, kHeight, 3);
    if (run.failures) return in;
    for (int y = 0; y < kHeight; ++y) {
        Pvx32f* zf = in.zone32f.Row(y);
        Pvx8u* z8 = in.zone8u.Row(y);
        Pvx32f* cf = in.chart32f.Row(y);
        Pvx8u* c8 = in.chart8u.Row(y);
        for (int x = 0; x < kWidth; ++x) {
            const double z = ZonePlate(x, y);
            zf[x] = static_cast<Pvx32f>(127.5 + 143.5 * z);
            z8[x] = static_cast<Pvx8u>(std::lround(127.5 + 127.5 * z));
            double rgb[3];
            Chart(x, y, rgb);
            for (int c = 0; c < 3; ++c) {
                cf[3 * x + c] = static_cast<Pvx32f>(rgb[c]);
                c8[3 * x + c] = static_cast<Pvx8u>(std::lround(rgb[c]));
            }
        }
    }
    run.Write("input_chart_8u_C3.png", in.chart8u.data, in.chart8u.step, kWidth, kHeight, 3, "colour test chart");
    run.Write("input_zoneplate_8u_C1.png", in.zone8u.data, in.zone8u.step, kWidth, kHeight, 1, "zone plate");
    return in;
}

// ---- one function per family -----------------------------------------------------

// Convert: the float zone plate to 8u in each rounding mode (values below 0 and
// above 255 saturate), and where two modes differ; the float chart to 8u,
// treating each C3 row as one C1 row three times as wide.
void DemoConvert(Run& run, const Inputs& in)
{
    std::printf("\nConvert\n");
    struct Mode {
        int value;
        const char* name;
        const char* file;
    };
    const Mode kModes[] = {{pvxRndTowardZero, "pvxRndTowardZero", "convert_zoneplate_towardzero.png"},
                           {pvxRndNearestEven, "pvxRndNearestEven", "convert_zoneplate_nearesteven.png"},
                           {pvxRndHalfAway, "pvxRndHalfAway", "convert_zoneplate_halfaway.png"}};
    Image<Pvx8u> out[3];
    for (int m = 0; m < 3; ++m) {
        out[m] = Allocate(run, "pvxiMalloc_8u_C1", pvxiMalloc_8u_C1, kWidth, kHeight, 1);
        if (!out[m].data) return;
        run.Call(std::string("pvxiConvert_32f8u_C1R(zone plate, ") + kModes[m].name + ")",
                 pvxiConvert_32f8u_C1R(in.zone32f.data, in.zone32f.step, out[m].data, out[m].step,
                                       in.zone32f.Size(), kModes[m].value));
        run.Write(kModes[m].file, out[m].data, out[m].step, kWidth, kHeight, 1,
                  std::string("zone plate, ") + kModes[m].name);
    }

    // white where truncation and rounding to nearest give different values
    Image<Pvx8u> diff = Allocate(run, "pvxiMalloc_8u_C1", pvxiMalloc_8u_C1, kWidth, kHeight, 1);
    if (diff.data) {
        long differing = 0;
        for (int y = 0; y < kHeight; ++y)
            for (int x = 0; x < kWidth; ++x) {
                const bool d = out[0].Row(y)[x] != out[1].Row(y)[x];
                diff.Row(y)[x] = d ? 255 : 0;
                differing += d;
            }
        std::printf("  towardzero and nearesteven differ in %ld of %d pixels\n", differing, kWidth * kHeight);
        run.Write("convert_zoneplate_rounding_differs.png", diff.data, diff.step, kWidth, kHeight, 1,
                  "white where the two rounding modes differ");
        Release(diff);
    }
    for (auto& o : out) Release(o);

    Image<Pvx8u> chart = Allocate(run, "pvxiMalloc_8u_C3", pvxiMalloc_8u_C3, kWidth, kHeight, 3);
    if (chart.data) {
        run.Call("pvxiConvert_32f8u_C1R(chart as C1 x3, pvxRndNearestEven)",
                 pvxiConvert_32f8u_C1R(in.chart32f.data, in.chart32f.step, chart.data, chart.step,
                                       PvxiSize{3 * kWidth, kHeight}, pvxRndNearestEven));
        run.Write("convert_chart_8u_C3.png", chart.data, chart.step, kWidth, kHeight, 3, "chart, float to 8u");
        Release(chart);
    }

    // Errors come back as statuses, and nothing is written.
    Pvx8u guard = 0x5A;
    run.Call("pvxiConvert_32f8u_C1R(null source)",
             pvxiConvert_32f8u_C1R(nullptr, 4, &guard, 1, PvxiSize{1, 1}, pvxRndNearestEven), pvxStsNullPtrErr);
    run.Call("pvxiConvert_32f8u_C1R(width 0)",
             pvxiConvert_32f8u_C1R(in.zone32f.data, in.zone32f.step, &guard, 1, PvxiSize{0, 1}, pvxRndNearestEven),
             pvxStsSizeErr);
    if (guard != 0x5A) {
        std::printf("  ** a failed call wrote to its destination\n");
        ++run.failures;
    }
}

// ---- data movement -------------------------------------------------------------

// Mirror: the chart flipped about each axis (the orange marker shows where the
// top left corner went), and the zone plate about the main diagonal.
void DemoMirror(Run& run, const Inputs& in)
{
    std::printf("\nMirror\n");
    const struct {
        int flip;
        const char* file;
        const char* what;
    } kFlips[] = {{pvxAxsHorizontal, "mirror_chart_horizontal.png", "top and bottom exchanged"},
                  {pvxAxsVertical, "mirror_chart_vertical.png", "left and right exchanged"},
                  {pvxAxsBoth, "mirror_chart_both.png", "turned by 180 degrees"}};
    Image<Pvx8u> out = Allocate(run, "pvxiMalloc_8u_C3", pvxiMalloc_8u_C3, kWidth, kHeight, 3);
    if (!out.data) return;
    for (const auto& f : kFlips) {
        run.Call("pvxiMirror_8u_C3R(chart, flip " + std::to_string(f.flip) + ")",
                 pvxiMirror_8u_C3R(in.chart8u.data, in.chart8u.step, out.data, out.step, in.chart8u.Size(), f.flip));
        run.Write(f.file, out.data, out.step, kWidth, kHeight, 3, f.what);
    }
    Release(out);

    // the diagonal flips exchange width and height; one-channel images only
    Image<Pvx8u> diag = Allocate(run, "pvxiMalloc_8u_C1", pvxiMalloc_8u_C1, kHeight, kWidth, 1);
    if (!diag.data) return;
    run.Call("pvxiMirror_8u_C1R(zone plate, flip 3: main diagonal)",
             pvxiMirror_8u_C1R(in.zone8u.data, in.zone8u.step, diag.data, diag.step, in.zone8u.Size(),
                               pvxAxsDiagonal));
    run.Write("mirror_zoneplate_diagonal.png", diag.data, diag.step, kHeight, kWidth, 1, "main diagonal");
    run.Call("pvxiMirror_8u_C3R(chart, flip 3)",
             pvxiMirror_8u_C3R(in.chart8u.data, in.chart8u.step, diag.data, diag.step, in.chart8u.Size(),
                               pvxAxsDiagonal),
             pvxStsMirrorFlipErr);
    Release(diag);

    // in place: the call with the same image on both sides is the in-place form
    Image<Pvx8u> copy = Allocate(run, "pvxiMalloc_8u_C3", pvxiMalloc_8u_C3, kWidth, kHeight, 3);
    if (!copy.data) return;
    run.Call("pvxiCopy_8u_C3R(chart)",
             pvxiCopy_8u_C3R(in.chart8u.data, in.chart8u.step, copy.data, copy.step, copy.Size()));
    run.Call("pvxiMirror_8u_C3IR(copy of the chart, flip 1)",
             pvxiMirror_8u_C3IR(copy.data, copy.step, copy.Size(), pvxAxsVertical));
    run.Write("mirror_chart_vertical_in_place.png", copy.data, copy.step, kWidth, kHeight, 3,
              "the same flip, in place");
    run.Call("pvxiMirror_8u_C3IR(one row, flip 0: changes nothing)",
             pvxiMirror_8u_C3IR(copy.data, copy.step, PvxiSize{kWidth, 1}, pvxAxsHorizontal), pvxStsSizeErr);
    Release(copy);
}

// Transpose: the chart with rows and columns exchanged, out of place and, on a
// square tile, in place.
void DemoTranspose(Run& run, const Inputs& in)
{
    std::printf("\nTranspose\n");
    Image<Pvx8u> out = Allocate(run, "pvxiMalloc_8u_C3", pvxiMalloc_8u_C3, kHeight, kWidth, 3);
    if (!out.data) return;
    run.Call("pvxiTranspose_8u_C3R(chart)",
             pvxiTranspose_8u_C3R(in.chart8u.data, in.chart8u.step, out.data, out.step, in.chart8u.Size()));
    run.Write("transpose_chart.png", out.data, out.step, kHeight, kWidth, 3, "rows and columns exchanged");
    Release(out);

    const int side = kHeight;  // the left square of the zone plate
    Image<Pvx8u> tile = Allocate(run, "pvxiMalloc_8u_C1", pvxiMalloc_8u_C1, side, side, 1);
    if (!tile.data) return;
    run.Call("pvxiCopy_8u_C1R(left square of the zone plate)",
             pvxiCopy_8u_C1R(in.zone8u.data, in.zone8u.step, tile.data, tile.step, tile.Size()));
    run.Call("pvxiTranspose_8u_C1IR(square tile)", pvxiTranspose_8u_C1IR(tile.data, tile.step, tile.Size()));
    run.Write("transpose_zoneplate_square_in_place.png", tile.data, tile.step, side, side, 1,
              "square tile, transposed in place");
    run.Call("pvxiTranspose_8u_C1IR(not square)",
             pvxiTranspose_8u_C1IR(tile.data, tile.step, PvxiSize{side, side - 1}), pvxStsSizeErr);
    Release(tile);
}

// SwapChannels and the planar copies: the chart as BGR, its green channel
// repeated, and the three planes of the chart side by side.
void DemoSwapChannels(Run& run, const Inputs& in)
{
    std::printf("\nSwapChannels and planar copies\n");
    Image<Pvx8u> out = Allocate(run, "pvxiMalloc_8u_C3", pvxiMalloc_8u_C3, kWidth, kHeight, 3);
    if (!out.data) return;
    const int bgr[3] = {2, 1, 0}, green[3] = {1, 1, 1}, bad[3] = {0, 3, 1};
    run.Call("pvxiSwapChannels_8u_C3R(chart, {2, 1, 0})",
             pvxiSwapChannels_8u_C3R(in.chart8u.data, in.chart8u.step, out.data, out.step, out.Size(), bgr));
    run.Write("swap_chart_bgr.png", out.data, out.step, kWidth, kHeight, 3, "red and blue exchanged");
    run.Call("pvxiSwapChannels_8u_C3R(chart, {1, 1, 1})",
             pvxiSwapChannels_8u_C3R(in.chart8u.data, in.chart8u.step, out.data, out.step, out.Size(), green));
    run.Write("swap_chart_green.png", out.data, out.step, kWidth, kHeight, 3, "the green channel as grey");
    run.Call("pvxiSwapChannels_8u_C3R(chart, {0, 3, 1})",
             pvxiSwapChannels_8u_C3R(in.chart8u.data, in.chart8u.step, out.data, out.step, out.Size(), bad),
             pvxStsChannelOrderErr);
    Release(out);

    // three planes stacked vertically in one grey image, then back to RGB
    Image<Pvx8u> planes = Allocate(run, "pvxiMalloc_8u_C1", pvxiMalloc_8u_C1, kWidth, 3 * kHeight, 1);
    Image<Pvx8u> back = Allocate(run, "pvxiMalloc_8u_C3", pvxiMalloc_8u_C3, kWidth, kHeight, 3);
    if (!planes.data || !back.data) return;
    Pvx8u* const p[3] = {planes.Row(0), planes.Row(kHeight), planes.Row(2 * kHeight)};
    run.Call("pvxiCopy_8u_C3P3R(chart)",
             pvxiCopy_8u_C3P3R(in.chart8u.data, in.chart8u.step, p, planes.step, in.chart8u.Size()));
    run.Write("copy_chart_planes.png", planes.data, planes.step, kWidth, 3 * kHeight, 1, "red, green, blue planes");
    const Pvx8u* const q[3] = {p[2], p[1], p[0]};
    run.Call("pvxiCopy_8u_P3C3R(planes in the order b, g, r)",
             pvxiCopy_8u_P3C3R(q, planes.step, back.data, back.step, back.Size()));
    run.Write("copy_chart_from_planes_bgr.png", back.data, back.step, kWidth, kHeight, 3,
              "planes merged in another order");
    Release(planes);
    Release(back);
}

// ---- arithmetic -------------------------------------------------------------------

// Arithmetic with scale factors: the chart and the zone plate added with
// halving (scale factor 1), their difference, a product scaled by 2^-8, and a
// constant brightening that saturates.
void DemoArithmetic(Run& run, const Inputs& in)
{
    std::printf("\nArithmetic\n");
    Image<Pvx8u> zone3 = Allocate(run, "pvxiMalloc_8u_C3", pvxiMalloc_8u_C3, kWidth, kHeight, 3);
    Image<Pvx8u> out = Allocate(run, "pvxiMalloc_8u_C3", pvxiMalloc_8u_C3, kWidth, kHeight, 3);
    if (!zone3.data || !out.data) return;
    run.Call("pvxiDup_8u_C1C3R(zone plate)",
             pvxiDup_8u_C1C3R(in.zone8u.data, in.zone8u.step, zone3.data, zone3.step, zone3.Size()));
    const PvxiSize size = out.Size();
    run.Call("pvxiAdd_8u_C3RSfs(chart, zone plate, sf 1)",
             pvxiAdd_8u_C3RSfs(in.chart8u.data, in.chart8u.step, zone3.data, zone3.step, out.data, out.step, size, 1));
    run.Write("arith_add_halved.png", out.data, out.step, kWidth, kHeight, 3, "(chart + zone plate) / 2");
    run.Call("pvxiSub_8u_C3RSfs(zone plate, chart, sf 0)",
             pvxiSub_8u_C3RSfs(zone3.data, zone3.step, in.chart8u.data, in.chart8u.step, out.data, out.step, size, 0));
    run.Write("arith_sub.png", out.data, out.step, kWidth, kHeight, 3, "chart - zone plate, saturated at 0");
    run.Call("pvxiMul_8u_C3RSfs(chart, zone plate, sf 8)",
             pvxiMul_8u_C3RSfs(in.chart8u.data, in.chart8u.step, zone3.data, zone3.step, out.data, out.step, size, 8));
    run.Write("arith_mul.png", out.data, out.step, kWidth, kHeight, 3, "chart * zone plate / 256");
    const Pvx8u brighter[3] = {96, 64, 32};
    run.Call("pvxiAddC_8u_C3RSfs(chart, {96, 64, 32}, sf 0)",
             pvxiAddC_8u_C3RSfs(in.chart8u.data, in.chart8u.step, brighter, out.data, out.step, size, 0));
    run.Write("arith_addc.png", out.data, out.step, kWidth, kHeight, 3, "brightened, saturating at 255");
    run.Call("pvxiAdd_8u_C3RSfs(sf 10: every result rounds to 0)",
             pvxiAdd_8u_C3RSfs(in.chart8u.data, in.chart8u.step, zone3.data, zone3.step, out.data, out.step, size, 10));

    // float: zone plate times itself, scaled back to 8u for viewing
    Image<Pvx32f> sq = Allocate(run, "pvxiMalloc_32f_C1", pvxiMalloc_32f_C1, kWidth, kHeight, 1);
    Image<Pvx8u> sq8 = Allocate(run, "pvxiMalloc_8u_C1", pvxiMalloc_8u_C1, kWidth, kHeight, 1);
    if (sq.data && sq8.data) {
        const Pvx32f inv255 = 1.0f / 255.0f;
        run.Call("pvxiMul_32f_C1R(zone plate, zone plate)",
                 pvxiMul_32f_C1R(in.zone32f.data, in.zone32f.step, in.zone32f.data, in.zone32f.step, sq.data, sq.step,
                                 sq.Size()));
        run.Call("pvxiMulC_32f_C1IR(1/255)", pvxiMulC_32f_C1IR(inv255, sq.data, sq.step, sq.Size()));
        run.Call("pvxiConvert_32f8u_C1R(product)",
                 pvxiConvert_32f8u_C1R(sq.data, sq.step, sq8.data, sq8.step, sq.Size(), pvxRndNearestEven));
        run.Write("arith_zoneplate_squared.png", sq8.data, sq8.step, kWidth, kHeight, 1, "zone plate squared (float)");
    }
    Release(sq);
    Release(sq8);
    Release(zone3);
    Release(out);
}

bool MakeDirectory(const std::string& dir)
{
    if (::mkdir(dir.c_str(), 0777) == 0 || errno == EEXIST) return true;
    std::printf("cannot create %s: %s\n", dir.c_str(), std::strerror(errno));
    return false;
}

}  // namespace

int main(int argc, char** argv)
{
    Run run;
    run.outDir = argc > 1 ? argv[1] : "demo-out";
    if (!MakeDirectory(run.outDir)) return 1;

    const PvxVersionRecord* v = pvxiGetLibVersion();
    std::printf("%s %s, built %s\n", v->name, v->versionText, v->buildDate);
    std::printf("writing to %s/\n\nInputs\n", run.outDir.c_str());

    Inputs in = MakeInputs(run);
    if (run.failures) return 1;

    DemoConvert(run, in);
    DemoMirror(run, in);
    DemoTranspose(run, in);
    DemoSwapChannels(run, in);
    DemoArithmetic(run, in);

    Release(in.zone32f);
    Release(in.zone8u);
    Release(in.chart32f);
    Release(in.chart8u);

    if (run.failures) {
        std::printf("\n%d call(s) or file(s) did not turn out as expected\n", run.failures);
        return 1;
    }
    std::printf("\nall calls gave the expected status\n");
    return 0;
}
