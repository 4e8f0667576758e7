// Images of the zoxcc tool: the built-in test picture and PPM/PGM output.
#pragma once

#include <cstdint>
#include <string>
#include <vector>

namespace zt {

// Interleaved 8-bit image of `channels` channels, rows packed.
struct Image {
    int width = 0, height = 0, channels = 3;
    std::vector<uint8_t> pixels;
    Image() = default;
    Image(int w, int h, int c) : width(w), height(h), channels(c), pixels(static_cast<std::size_t>(w) * h * c) {}
    int step() const { return width * channels; }
    uint8_t* data() { return pixels.data(); }
    const uint8_t* data() const { return pixels.data(); }
};

// Colour bars over the top third, grey and colour ramps in the middle, a zone plate below.
Image testPicture(int width, int height);

// Writes an image of 1 channel as PGM, of 3 (or the first 3 of 4) as PPM. False on an I/O error.
bool writePnm(const std::string& path, const Image& img);

} // namespace zt
