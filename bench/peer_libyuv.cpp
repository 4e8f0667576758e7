// Nearest calls of libyuv, where its development package is installed: timed beside ours only.
// libyuv has no packed three-byte YUV, so its 4:4:4 planes stand in for our packed and planar forms.
#include "bench.hpp"

#if defined(ZOX_BENCH_LIBYUV)
#include <libyuv.h>

namespace zb {
namespace {

// Three planes of one image in one buffer.
struct Planes {
    std::vector<uint8_t> bytes;
    std::size_t plane;
    Planes(Size s, bool random)
        : bytes(random ? randomBytes(std::size_t(s.width) * s.height * 3) : std::vector<uint8_t>(std::size_t(s.width) * s.height * 3)),
          plane(std::size_t(s.width) * s.height)
    {
    }
    uint8_t* operator[](int p) { return bytes.data() + p * plane; }
};

} // namespace

void registerLibyuvPeers()
{
    for (Size size : kSizes) {
        const std::size_t px = static_cast<std::size_t>(size.width) * size.height;
        // 4:4:4 planes from ARGB (4 bytes in, 3 out).
        registerPeer("libyuv ARGBToI444", {"zoxiRGBToYUV_8u_C3R", "zoxiRGBToYCbCr_8u_C3P3R"}, size, px * 7, [](Size s) -> Call {
            auto argb = std::make_shared<std::vector<uint8_t>>(randomBytes(std::size_t(s.width) * s.height * 4));
            auto out = std::make_shared<Planes>(s, false);
            return [argb, out, s] {
                libyuv::ARGBToI444(argb->data(), s.width * 4, (*out)[0], s.width, (*out)[1], s.width, (*out)[2], s.width,
                                   s.width, s.height);
            };
        });
        // ARGB from 4:4:4 planes.
        registerPeer("libyuv I444ToARGB", {"zoxiYUVToRGB_8u_C3R", "zoxiYCbCrToRGB_8u_P3C4R"}, size, px * 7, [](Size s) -> Call {
            auto in = std::make_shared<Planes>(s, true);
            auto argb = std::make_shared<std::vector<uint8_t>>(std::size_t(s.width) * s.height * 4);
            return [in, argb, s] {
                libyuv::I444ToARGB((*in)[0], s.width, (*in)[1], s.width, (*in)[2], s.width, argb->data(), s.width * 4,
                                   s.width, s.height);
            };
        });
        // Three-byte RGB from 4:4:4 planes.
        registerPeer("libyuv I444ToRGB24", {"zoxiYUVToRGB_8u_P3C3R"}, size, px * 6, [](Size s) -> Call {
            auto in = std::make_shared<Planes>(s, true);
            auto rgb = std::make_shared<std::vector<uint8_t>>(std::size_t(s.width) * s.height * 3);
            return [in, rgb, s] {
                libyuv::I444ToRGB24((*in)[0], s.width, (*in)[1], s.width, (*in)[2], s.width, rgb->data(), s.width * 3,
                                    s.width, s.height);
            };
        });
    }
}
} // namespace zb
#else
namespace zb {
void registerLibyuvPeers() {}
} // namespace zb
#endif
