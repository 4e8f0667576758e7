// Gray conversions and colour twist on the demo picture.
#include "demo.hpp"

#include "zoxcc.h"

#include <vector>

namespace zt {

// The picture to gray with the fixed weights and with equal ones, 8u and 32f, and gray back to colour.
void grayDemo(Demo& d)
{
    const Image& in = d.input();
    const ImageSize roi{in.width, in.height};
    const std::size_t n = static_cast<std::size_t>(in.width) * in.height;
    Image gray(in.width, in.height, 1), even(in.width, in.height, 1), back(in.width, in.height, 3);
    d.time("zoxiRGBToGray_8u_C3C1R", n * 4, [&] { return zoxiRGBToGray_8u_C3C1R(in.data(), in.step(), gray.data(), gray.step(), roi); });
    const float thirds[3] = {1.0f / 3, 1.0f / 3, 1.0f / 3};
    d.time("zoxiColorToGray_8u_C3C1R", n * 4,
           [&] { return zoxiColorToGray_8u_C3C1R(in.data(), in.step(), even.data(), even.step(), roi, thirds); });
    d.time("zoxiGrayToRGB_8u_C1C3R", n * 4, [&] { return zoxiGrayToRGB_8u_C1C3R(gray.data(), gray.step(), back.data(), back.step(), roi); });
    std::vector<float> f(n * 3), g(n);
    for (std::size_t i = 0; i < f.size(); ++i)
        f[i] = in.pixels[i] / 255.0f;
    d.time("zoxiRGBToGray_32f_C3C1R", n * 16,
           [&] { return zoxiRGBToGray_32f_C3C1R(f.data(), in.width * 12, g.data(), in.width * 4, roi); });
    Image gray32(in.width, in.height, 1);
    for (std::size_t i = 0; i < n; ++i)
        gray32.pixels[i] = static_cast<uint8_t>(g[i] * 255.0f + 0.5f);
    d.write("gray.pgm", gray);
    d.write("gray-equal-weights.pgm", even);
    d.write("gray-32f.pgm", gray32);
    d.write("gray-to-rgb.ppm", back);
}

// A sepia tone at 8u (sums above 255 limited), the same in place on planes (timed only), and a warmer, more saturated
// picture at 32f with an offset.
void twistDemo(Demo& d)
{
    const Image& in = d.input();
    const ImageSize roi{in.width, in.height};
    const std::size_t n = static_cast<std::size_t>(in.width) * in.height;
    const float sepia[3][4] = {{0.393f, 0.769f, 0.189f, 0}, {0.349f, 0.686f, 0.168f, 0}, {0.272f, 0.534f, 0.131f, 0}};
    Image out(in.width, in.height, 3);
    d.time("zoxiColorTwist32f_8u_C3R", n * 6,
           [&] { return zoxiColorTwist32f_8u_C3R(in.data(), in.step(), out.data(), out.step(), roi, sepia); });
    d.write("twist-sepia.ppm", out);
    std::vector<uint8_t> planes(n * 3);
    for (std::size_t i = 0; i < n; ++i)
        for (int k = 0; k < 3; ++k)
            planes[k * n + i] = in.pixels[3 * i + k];
    uint8_t* p[3] = {planes.data(), planes.data() + n, planes.data() + 2 * n};
    // In place: each timed call tones the planes again.
    d.time("zoxiColorTwist32f_8u_IP3R", n * 6, [&] { return zoxiColorTwist32f_8u_IP3R(p, in.width, roi, sepia); });
    std::vector<float> f(n * 3), g(n * 3);
    for (std::size_t i = 0; i < f.size(); ++i)
        f[i] = in.pixels[i];
    const float warm[3][4] = {{1.3f, -0.2f, -0.1f, 12}, {-0.1f, 1.2f, -0.1f, 4}, {-0.1f, -0.2f, 1.1f, -8}};
    d.time("zoxiColorTwist_32f_C3R", n * 24,
           [&] { return zoxiColorTwist_32f_C3R(f.data(), in.width * 12, g.data(), in.width * 12, roi, warm); });
    Image warmed(in.width, in.height, 3);
    for (std::size_t i = 0; i < g.size(); ++i)
        warmed.pixels[i] = static_cast<uint8_t>(g[i] < 0 ? 0 : g[i] > 255 ? 255 : g[i] + 0.5f);
    d.write("twist-warm-32f.ppm", warmed);
}

} // namespace zt
