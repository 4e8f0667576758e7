#include "image.hpp"

#include <cmath>
#include <cstdio>

namespace zt {

Image testPicture(int width, int height)
{
    Image img(width, height, 3);
    static const uint8_t bars[8][3] = {{235, 235, 235}, {235, 235, 16}, {16, 235, 235}, {16, 235, 16},
                                       {235, 16, 235},  {235, 16, 16},  {16, 16, 235},  {16, 16, 16}};
    const int third = height / 3;
    const double cx = width / 2.0, cy = third * 2.5, k = M_PI / (2.0 * width);
    for (int y = 0; y < height; ++y)
        for (int x = 0; x < width; ++x) {
            uint8_t* p = img.data() + static_cast<std::size_t>(y) * img.step() + 3 * x;
            if (y < third) {
                const auto& b = bars[x * 8 / width];
                p[0] = b[0], p[1] = b[1], p[2] = b[2];
            } else if (y < 2 * third) {
                const int v = x * 255 / (width - 1);
                const int band = (y - third) * 4 / third; // grey, red, green, blue ramps
                p[0] = static_cast<uint8_t>(band == 0 || band == 1 ? v : 0);
                p[1] = static_cast<uint8_t>(band == 0 || band == 2 ? v : 0);
                p[2] = static_cast<uint8_t>(band == 0 || band == 3 ? v : 0);
            } else {
                const double r2 = (x - cx) * (x - cx) + (y - cy) * (y - cy);
                const auto z = static_cast<uint8_t>(std::lround(127.5 + 127.5 * std::cos(k * r2)));
                p[0] = z, p[1] = static_cast<uint8_t>(255 - z), p[2] = static_cast<uint8_t>(x * 255 / width);
            }
        }
    return img;
}

bool writePnm(const std::string& path, const Image& img)
{
    FILE* f = std::fopen(path.c_str(), "wb");
    if (!f)
        return false;
    const bool gray = img.channels == 1;
    std::fprintf(f, "P%d\n%d %d\n255\n", gray ? 5 : 6, img.width, img.height);
    bool ok = true;
    for (int y = 0; y < img.height && ok; ++y)
        for (int x = 0; x < img.width && ok; ++x) {
            const uint8_t* p = img.data() + static_cast<std::size_t>(y) * img.step() + img.channels * x;
            ok = std::fwrite(p, 1, gray ? 1 : 3, f) == (gray ? 1u : 3u);
        }
    return std::fclose(f) == 0 && ok;
}

} // namespace zt
