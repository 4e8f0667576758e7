// Sixteen-bit RGB words on the demo picture.
#include "demo.hpp"

#include "zoxcc.h"

#include <vector>

namespace zt {

namespace {

// RGB words (red in the low field) of `bits` a field back to 8-bit pixels, each field shifted up.
Image fromRgbWords(const std::vector<uint16_t>& w, int width, int height, int bits)
{
    Image out(width, height, 3);
    const int mask = (1 << bits) - 1, mid = bits == 5 ? 6 : bits;
    for (std::size_t i = 0; i < w.size(); ++i) {
        out.pixels[3 * i] = static_cast<uint8_t>((w[i] & mask) << (8 - bits));
        out.pixels[3 * i + 1] = static_cast<uint8_t>(((w[i] >> bits) & ((1 << mid) - 1)) << (8 - mid));
        out.pixels[3 * i + 2] = static_cast<uint8_t>(((w[i] >> (bits + mid)) & mask) << (8 - bits));
    }
    return out;
}

} // namespace

// The picture to 565 words and back, and its 4:2:0 planes to 565 and 444 words, plain beside dithered.
void wordsDemo(Demo& d)
{
    const Image& in = d.input();
    const ImageSize roi{in.width, in.height};
    const std::size_t n = static_cast<std::size_t>(in.width) * in.height;
    const int wordStep = in.width * 2;
    std::vector<uint16_t> words(n);
    Image back(in.width, in.height, 3);
    d.time("zoxiBGRToBGR565_8u16u_C3R", n * 5,
           [&] { return zoxiBGRToBGR565_8u16u_C3R(in.data(), in.step(), words.data(), wordStep, roi); });
    d.time("zoxiBGR565ToBGR_16u8u_C3R", n * 5,
           [&] { return zoxiBGR565ToBGR_16u8u_C3R(words.data(), wordStep, back.data(), back.step(), roi); });
    d.write("words-565-roundtrip.ppm", back);

    Image y(in.width, in.height, 1), cb((in.width + 1) / 2, (in.height + 1) / 2, 1), cr(cb.width, cb.height, 1);
    uint8_t* p[3] = {y.data(), cb.data(), cr.data()};
    const int steps[3] = {y.step(), cb.step(), cr.step()};
    zoxiRGBToYCbCr420_8u_C3P3R(in.data(), in.step(), p, steps, roi);
    const uint8_t* c[3] = {p[0], p[1], p[2]};
    using FromPlanes = zoxStatus (*)(const uint8_t* const*, const int*, uint16_t*, int, ImageSize);
    struct Run {
        const char* name;
        FromPlanes f;
        const char* file;
        int bits;
    };
    const Run runs[] = {
        {"zoxiYCbCr420ToRGB565_8u16u_P3C3R", zoxiYCbCr420ToRGB565_8u16u_P3C3R, "words-420-565.ppm", 5},
        {"zoxiYCbCr420ToRGB565Dither_8u16u_P3C3R", zoxiYCbCr420ToRGB565Dither_8u16u_P3C3R, "words-420-565-dither.ppm", 5},
        {"zoxiYCbCr420ToRGB444_8u16u_P3C3R", zoxiYCbCr420ToRGB444_8u16u_P3C3R, "words-420-444.ppm", 4},
        {"zoxiYCbCr420ToRGB444Dither_8u16u_P3C3R", zoxiYCbCr420ToRGB444Dither_8u16u_P3C3R, "words-420-444-dither.ppm", 4},
    };
    for (const Run& r : runs) {
        d.time(r.name, n * 3 / 2 + n * 2, [&] { return r.f(c, steps, words.data(), wordStep, roi); });
        d.write(r.file, fromRgbWords(words, in.width, in.height, r.bits));
    }
}

} // namespace zt
