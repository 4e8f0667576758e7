// Nearest calls of libyuv, where its development package is installed: timed beside ours only.
#include "bench.hpp"

#if defined(ZOX_BENCH_LIBYUV)
#include <libyuv.h>

#include <memory>

namespace zb {
void registerPeers()
{
    for (Size size : kSizes) {
        const std::size_t px = static_cast<std::size_t>(size.width) * size.height;
        // 4:4:4 from ARGB (4 bytes in, 3 out) beside our RGB -> YUV.
        registerPeer("libyuv ARGBToI444", "zoxiRGBToYUV_8u_C3R", size, px * 7, [](Size s) -> Call {
            auto argb = std::make_shared<std::vector<uint8_t>>(randomBytes(std::size_t(s.width) * s.height * 4));
            auto out = std::make_shared<std::vector<uint8_t>>(std::size_t(s.width) * s.height * 3);
            return [argb, out, s] {
                uint8_t* y = out->data();
                uint8_t* u = y + std::size_t(s.width) * s.height;
                uint8_t* v = u + std::size_t(s.width) * s.height;
                libyuv::ARGBToI444(argb->data(), s.width * 4, y, s.width, u, s.width, v, s.width, s.width, s.height);
            };
        });
        // ARGB from 4:4:4 planes beside our YUV -> RGB.
        registerPeer("libyuv I444ToARGB", "zoxiYUVToRGB_8u_C3R", size, px * 7, [](Size s) -> Call {
            auto yuv = std::make_shared<std::vector<uint8_t>>(randomBytes(std::size_t(s.width) * s.height * 3));
            auto argb = std::make_shared<std::vector<uint8_t>>(std::size_t(s.width) * s.height * 4);
            return [yuv, argb, s] {
                const uint8_t* y = yuv->data();
                const uint8_t* u = y + std::size_t(s.width) * s.height;
                const uint8_t* v = u + std::size_t(s.width) * s.height;
                libyuv::I444ToARGB(y, s.width, u, s.width, v, s.width, argb->data(), s.width * 4, s.width, s.height);
            };
        });
    }
}
} // namespace zb
#else
namespace zb {
void registerPeers() {}
} // namespace zb
#endif
