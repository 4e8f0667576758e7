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

void yuvDemo(Demo& d)
{
    const Image& in = d.input();
    const ImageSize roi{in.width, in.height};
    Image yuv(in.width, in.height, 3), back(in.width, in.height, 3);
    d.time("zoxiRGBToYUV_8u_C3R", pixels(in) * 6,
           [&] { return zoxiRGBToYUV_8u_C3R(in.data(), in.step(), yuv.data(), yuv.step(), roi); });
    d.time("zoxiYUVToRGB_8u_C3R", pixels(in) * 6,
           [&] { return zoxiYUVToRGB_8u_C3R(yuv.data(), yuv.step(), back.data(), back.step(), roi); });
    const auto planes = channels(yuv);
    d.write("yuv-y.pgm", planes[0]);
    d.write("yuv-u.pgm", planes[1]);
    d.write("yuv-v.pgm", planes[2]);
    d.write("yuv-roundtrip.ppm", back);
}

} // namespace

const std::vector<FamilyDemo>& familyDemos()
{
    static const std::vector<FamilyDemo> demos = {
        {"RGB <-> YUV", yuvDemo},
    };
    return demos;
}

} // namespace zt
