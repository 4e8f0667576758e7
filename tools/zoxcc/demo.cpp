#include "demo.hpp"

#include "zoxcc.h"

#include <algorithm>
#include <chrono>
#include <cstdio>

namespace zt {

bool Demo::time(const std::string& name, std::size_t bytes, const std::function<int()>& call)
{
    double best = 1e30;
    for (int i = 0; i < 5; ++i) {
        const auto t0 = std::chrono::steady_clock::now();
        const int status = call();
        const auto t1 = std::chrono::steady_clock::now();
        if (status != zoxStatusOk) {
            std::fprintf(stderr, "zoxcc: %s returned %d\n", name.c_str(), status);
            failed_ = true;
            return false;
        }
        best = std::min(best, std::chrono::duration<double, std::milli>(t1 - t0).count());
    }
    rows_.push_back({name, best, best > 0 ? bytes / (best * 1e3) : 0});
    return true;
}

bool Demo::write(const std::string& file, const Image& img)
{
    const std::string path = dir_ + "/" + file;
    if (!writePnm(path, img)) {
        std::fprintf(stderr, "zoxcc: cannot write %s\n", path.c_str());
        failed_ = true;
        return false;
    }
    files_.push_back(file);
    return true;
}

void Demo::printTable() const
{
    std::printf("%-36s %10s %12s\n", "conversion", "best ms", "MB/s in+out");
    for (const Row& r : rows_)
        std::printf("%-36s %10.3f %12.0f\n", r.name.c_str(), r.ms, r.mbps);
    std::printf("\nwrote %zu images to %s:", files_.size(), dir_.c_str());
    for (const auto& f : files_)
        std::printf(" %s", f.c_str());
    std::printf("\n");
}

namespace {

std::size_t pixels(const Image& img)
{
    return static_cast<std::size_t>(img.width) * img.height;
}

// Splits an interleaved image into one gray image a channel.
std::vector<Image> channels(const Image& img)
{
    std::vector<Image> out(img.channels, Image(img.width, img.height, 1));
    for (std::size_t i = 0; i < pixels(img); ++i)
        for (int c = 0; c < img.channels; ++c)
            out[c].pixels[i] = img.pixels[i * img.channels + c];
    return out;
}

using Convert = zoxStatus (*)(const uint8_t*, int, uint8_t*, int, ImageSize);

// The picture there and back through a pair of C3 conversions: the three planes of the way there and
// the picture come back.
void roundTrip(Demo& d, const char* there, Convert fwd, const char* back, Convert inv, const char* prefix,
               const char* const (&planeNames)[3])
{
    const Image& in = d.input();
    const ImageSize roi{in.width, in.height};
    Image mid(in.width, in.height, 3), out(in.width, in.height, 3);
    d.time(there, pixels(in) * 6, [&] { return fwd(in.data(), in.step(), mid.data(), mid.step(), roi); });
    d.time(back, pixels(in) * 6, [&] { return inv(mid.data(), mid.step(), out.data(), out.step(), roi); });
    const auto planes = channels(mid);
    const std::string p = prefix;
    for (int k = 0; k < 3; ++k)
        d.write(p + "-" + planeNames[k] + ".pgm", planes[k]);
    d.write(p + "-roundtrip.ppm", out);
}

void yuvDemo(Demo& d)
{
    roundTrip(d, "zoxiRGBToYUV_8u_C3R", zoxiRGBToYUV_8u_C3R, "zoxiYUVToRGB_8u_C3R", zoxiYUVToRGB_8u_C3R, "yuv", {"y", "u", "v"});
}

void ycbcrDemo(Demo& d)
{
    roundTrip(d, "zoxiRGBToYCbCr_8u_C3R", zoxiRGBToYCbCr_8u_C3R, "zoxiYCbCrToRGB_8u_C3R", zoxiYCbCrToRGB_8u_C3R, "ycbcr",
              {"y", "cb", "cr"});
}

void gammaDemo(Demo& d)
{
    const Image& in = d.input();
    const ImageSize roi{in.width, in.height};
    Image enc(in.width, in.height, 3), lin(in.width, in.height, 3);
    d.time("zoxiGammaFwd_8u_C3R", pixels(in) * 6,
           [&] { return zoxiGammaFwd_8u_C3R(in.data(), in.step(), enc.data(), enc.step(), roi); });
    d.time("zoxiGammaInv_8u_C3R", pixels(in) * 6,
           [&] { return zoxiGammaInv_8u_C3R(in.data(), in.step(), lin.data(), lin.step(), roi); });
    // 16u through the table path: the picture widened to 16 bits and back.
    std::vector<uint16_t> wide(pixels(in) * 3), out16(wide.size());
    for (std::size_t i = 0; i < wide.size(); ++i)
        wide[i] = static_cast<uint16_t>(in.pixels[i] * 257);
    const int step16 = in.width * 6;
    d.time("zoxiGammaFwd_16u_C3R", pixels(in) * 12,
           [&] { return zoxiGammaFwd_16u_C3R(wide.data(), step16, out16.data(), step16, roi); });
    Image enc16(in.width, in.height, 3);
    for (std::size_t i = 0; i < wide.size(); ++i)
        enc16.pixels[i] = static_cast<uint8_t>(out16[i] >> 8);
    d.write("gamma-encoded.ppm", enc);
    d.write("gamma-linear.ppm", lin);
    d.write("gamma-encoded-16u.ppm", enc16);
}

} // namespace

const std::vector<FamilyDemo>& familyDemos()
{
    static const std::vector<FamilyDemo> demos = {
        {"RGB <-> YUV", yuvDemo},
        {"RGB <-> YCbCr", ycbcrDemo},
        {"Gamma", gammaDemo},
    };
    return demos;
}

} // namespace zt
