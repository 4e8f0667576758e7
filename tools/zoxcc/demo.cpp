#include "demo.hpp"

#include "zoxcc.h"

#include <algorithm>
#include <cmath>
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
    std::printf("%-40s %10s %12s\n", "conversion", "best ms", "MB/s in+out");
    for (const Row& r : rows_)
        std::printf("%-40s %10.3f %12.0f\n", r.name.c_str(), r.ms, r.mbps);
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

void xyzDemo(Demo& d)
{
    roundTrip(d, "zoxiRGBToXYZ_8u_C3R", zoxiRGBToXYZ_8u_C3R, "zoxiXYZToRGB_8u_C3R", zoxiXYZToRGB_8u_C3R, "xyz", {"x", "y", "z"});
    roundTrip(d, "zoxiRGBToYCC_8u_C3R", zoxiRGBToYCC_8u_C3R, "zoxiYCCToRGB_8u_C3R", zoxiYCCToRGB_8u_C3R, "ycc", {"y", "c1", "c2"});
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

// The 8u pair with chroma biased by 128, and the reversible pair through 16-bit planes (the picture's
// bytes taken as B, G, R), which must give the picture back bit for bit.
void ycocgDemo(Demo& d)
{
    const Image& in = d.input();
    const ImageSize roi{in.width, in.height};
    const std::size_t n = pixels(in);
    std::vector<Image> planes(3, Image(in.width, in.height, 1));
    uint8_t* p8[3] = {planes[0].data(), planes[1].data(), planes[2].data()};
    const uint8_t* c8[3] = {p8[0], p8[1], p8[2]};
    Image out(in.width, in.height, 3);
    d.time("zoxiRGBToYCoCg_8u_C3P3R", n * 6, [&] { return zoxiRGBToYCoCg_8u_C3P3R(in.data(), in.step(), p8, in.width, roi); });
    d.time("zoxiYCoCgToRGB_8u_P3C3R", n * 6, [&] { return zoxiYCoCgToRGB_8u_P3C3R(c8, in.width, out.data(), out.step(), roi); });
    const char* names[3] = {"y", "co", "cg"};
    for (int k = 0; k < 3; ++k)
        d.write(std::string("ycocg-") + names[k] + ".pgm", planes[k]);
    d.write("ycocg-roundtrip.ppm", out);

    std::vector<int16_t> wide(n * 3);
    int16_t* p16[3] = {wide.data(), wide.data() + n, wide.data() + 2 * n};
    const int16_t* c16[3] = {p16[0], p16[1], p16[2]};
    Image back(in.width, in.height, 3);
    const int step16 = in.width * 2;
    d.time("zoxiBGRToYCoCg_Rev_8u16s_C3P3R", n * 9,
           [&] { return zoxiBGRToYCoCg_Rev_8u16s_C3P3R(in.data(), in.step(), p16, step16, roi); });
    d.time("zoxiYCoCgToBGR_Rev_16s8u_P3C3R", n * 9,
           [&] { return zoxiYCoCgToBGR_Rev_16s8u_P3C3R(c16, step16, back.data(), back.step(), roi); });
    std::size_t differ = 0;
    for (std::size_t i = 0; i < back.pixels.size(); ++i)
        differ += back.pixels[i] != in.pixels[i];
    if (differ == 0)
        std::printf("ycocg: the reversible round trip is bit-exact (%zu pixels)\n", n);
    else
        std::printf("ycocg: the reversible round trip changed %zu samples\n", differ);
    // Co and Cg of the reversible form span -255..255: shown halved around 128.
    Image co(in.width, in.height, 1), cg(in.width, in.height, 1);
    for (std::size_t i = 0; i < n; ++i) {
        co.pixels[i] = static_cast<uint8_t>((p16[1][i] + 256) / 2);
        cg.pixels[i] = static_cast<uint8_t>((p16[2][i] + 256) / 2);
    }
    d.write("ycocg-rev-co.pgm", co);
    d.write("ycocg-rev-cg.pgm", cg);
}

// A synthetic high-dynamic-range luminance: the picture's gray levels raised to an exponential ramp
// across the width (about 11 stops), with a few highlights a hundred times brighter; both tone maps.
void toneMapDemo(Demo& d)
{
    const Image& in = d.input();
    const ImageSize roi{in.width, in.height};
    std::vector<float> hdr(pixels(in));
    for (int y = 0; y < in.height; ++y)
        for (int x = 0; x < in.width; ++x) {
            const uint8_t* p = &in.pixels[(std::size_t(y) * in.width + x) * 3];
            float v = (p[0] + 2.0f * p[1] + p[2]) / 1020.0f * std::exp2(11.0f * x / in.width);
            if ((x / 64 + y / 64) % 17 == 0 && x % 64 < 8 && y % 64 < 8)
                v *= 100.0f;
            hdr[std::size_t(y) * in.width + x] = v;
        }
    Image linear(in.width, in.height, 1), mean(in.width, in.height, 1);
    d.time("zoxiToneMapLinear_32f8u_C1R", pixels(in) * 5, [&] {
        return zoxiToneMapLinear_32f8u_C1R(hdr.data(), in.width * 4, linear.data(), linear.step(), roi);
    });
    d.time("zoxiToneMapMean_32f8u_C1R", pixels(in) * 5, [&] {
        return zoxiToneMapMean_32f8u_C1R(hdr.data(), in.width * 4, mean.data(), mean.step(), roi);
    });
    d.write("tonemap-linear.pgm", linear);
    d.write("tonemap-mean.pgm", mean);
}

// The picture as 4:2:0 planes (chroma at half width and height) and as packed 4:2:2 groups (shown as
// bytes, two a pixel: the luma with the chroma interleaved between).
void sampledDemo(Demo& d)
{
    const Image& in = d.input();
    const ImageSize roi{in.width, in.height};
    const std::size_t n = pixels(in);
    Image y(in.width, in.height, 1), cb(in.width / 2, in.height / 2, 1), cr(in.width / 2, in.height / 2, 1);
    uint8_t* p[3] = {y.data(), cb.data(), cr.data()};
    const int steps[3] = {in.width, in.width / 2, in.width / 2};
    d.time("zoxiRGBToYCbCr420_8u_C3P3R", n * 3 + n * 3 / 2,
           [&] { return zoxiRGBToYCbCr420_8u_C3P3R(in.data(), in.step(), p, steps, roi); });
    d.write("ycbcr420-y.pgm", y);
    d.write("ycbcr420-cb.pgm", cb);
    d.write("ycbcr420-cr.pgm", cr);
    Image packed(in.width * 2, in.height, 1);
    d.time("zoxiRGBToYCbCr422_8u_C3C2R", n * 5,
           [&] { return zoxiRGBToYCbCr422_8u_C3C2R(in.data(), in.step(), packed.data(), packed.step(), roi); });
    d.write("ycbcr422-packed.pgm", packed);
    Image u411(in.width / 4, in.height, 1), v411(in.width / 4, in.height, 1), y411(in.width, in.height, 1);
    Image bgra(in.width, in.height, 4);
    for (std::size_t i = 0; i < n; ++i)
        for (int k = 0; k < 3; ++k)
            bgra.pixels[4 * i + k] = in.pixels[3 * i + 2 - k];
    uint8_t* q[3] = {y411.data(), u411.data(), v411.data()};
    const int steps411[3] = {in.width, in.width / 4, in.width / 4};
    d.time("zoxiBGRToYCbCr411_8u_AC4P3R", n * 4 + n * 3 / 2,
           [&] { return zoxiBGRToYCbCr411_8u_AC4P3R(bgra.data(), bgra.step(), q, steps411, roi); });
    d.write("ycbcr411-cb.pgm", u411);

    // And back: each sampled image to RGB again, its chroma shared by the pixels of a unit.
    Image back420(in.width, in.height, 3), back422(in.width, in.height, 3), back411(in.width, in.height, 4);
    const uint8_t* c420[3] = {p[0], p[1], p[2]};
    d.time("zoxiYCbCr420ToRGB_8u_P3C3R", n * 3 + n * 3 / 2,
           [&] { return zoxiYCbCr420ToRGB_8u_P3C3R(c420, steps, back420.data(), back420.step(), roi); });
    d.write("ycbcr420-roundtrip.ppm", back420);
    d.time("zoxiYCbCr422ToRGB_8u_C2C3R", n * 5,
           [&] { return zoxiYCbCr422ToRGB_8u_C2C3R(packed.data(), packed.step(), back422.data(), back422.step(), roi); });
    d.write("ycbcr422-roundtrip.ppm", back422);
    const uint8_t* c411[3] = {q[0], q[1], q[2]};
    d.time("zoxiYCbCr411ToBGR_8u_P3C4R", n * 4 + n * 3 / 2,
           [&] { return zoxiYCbCr411ToBGR_8u_P3C4R(c411, steps411, back411.data(), back411.step(), roi, 255); });
    Image rgb411(in.width, in.height, 3);
    for (std::size_t i = 0; i < n; ++i)
        for (int k = 0; k < 3; ++k)
            rgb411.pixels[3 * i + k] = back411.pixels[4 * i + 2 - k];
    d.write("ycbcr411-roundtrip.ppm", rgb411);
}

// Repacking: the 4:2:0 planes as 4:2:2 groups (each chroma row twice, the planes named Cr first), the
// picture from those groups, and the 4:2:0 chroma unfolded into 4:1:1 pairs.
void repackDemo(Demo& d)
{
    const Image& in = d.input();
    const ImageSize roi{in.width, in.height};
    const std::size_t n = pixels(in);
    Image y(in.width, in.height, 1), cb(in.width / 2, in.height / 2, 1), cr(in.width / 2, in.height / 2, 1);
    uint8_t* p[3] = {y.data(), cb.data(), cr.data()};
    const int steps[3] = {in.width, in.width / 2, in.width / 2};
    zoxiRGBToYCbCr420_8u_C3P3R(in.data(), in.step(), p, steps, roi);
    const uint8_t* c[3] = {p[0], p[1], p[2]};
    Image groups(in.width * 2, in.height, 1);
    d.time("zoxiYCrCb420ToYCbCr422_8u_P3C2R", n * 3 / 2 + n * 2, [&] {
        const uint8_t* crFirst[3] = {c[0], c[2], c[1]};
        const int stepsCrFirst[3] = {steps[0], steps[2], steps[1]};
        return zoxiYCrCb420ToYCbCr422_8u_P3C2R(crFirst, stepsCrFirst, groups.data(), groups.step(), roi);
    });
    d.write("repack-422-groups.pgm", groups);
    Image back(in.width, in.height, 3);
    zoxiYCbCr422ToRGB_8u_C2C3R(groups.data(), groups.step(), back.data(), back.step(), roi);
    d.write("repack-422-rgb.ppm", back);
    Image y411(in.width, in.height, 1), pairs411(in.width / 2, in.height, 1);
    d.time("zoxiYCbCr420ToYCbCr411_8u_P3P2R", n * 3, [&] {
        return zoxiYCbCr420ToYCbCr411_8u_P3P2R(c, steps, y411.data(), y411.step(), pairs411.data(), pairs411.step(), roi);
    });
    d.write("repack-411-pairs.pgm", pairs411);
}

} // namespace

const std::vector<FamilyDemo>& familyDemos()
{
    static const std::vector<FamilyDemo> demos = {
        {"RGB <-> YUV", yuvDemo},
        {"RGB <-> YCbCr", ycbcrDemo},
        {"RGB <-> XYZ and YCC", xyzDemo},
        {"Gamma", gammaDemo},
        {"RGB <-> YCoCg", ycocgDemo},
        {"Tone mapping", toneMapDemo},
        {"RGB to 4:2:0, 4:2:2 and 4:1:1 and back", sampledDemo},
        {"Repacking among samplings and layouts", repackDemo},
        {"Gray conversions", grayDemo},
        {"Colour twist", twistDemo},
        {"Sixteen-bit RGB words, plain and dithered", wordsDemo},
    };
    return demos;
}

} // namespace zt
