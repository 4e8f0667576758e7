// The plane routines (called inside the library, reached here through the static archive) beside memcpy
// and memset of the same bytes, and the tone maps beside a memcpy of their input plus output bytes.
#include "bench.hpp"
#include "frame/planes.hpp"
#include "zoxcc.h"

#include <cmath>
#include <memory>
#include <utility>

namespace zb {

void registerPlanesAndToneMaps()
{
    for (Size size : {Size{1920, 1080}, Size{3840, 2160}}) {
        const std::size_t n = static_cast<std::size_t>(size.width) * size.height;
        registerCase("copyPlane", size, n, [](Size s) -> Call {
            auto src = std::make_shared<std::vector<uint8_t>>(randomBytes(std::size_t(s.width) * s.height));
            auto dst = std::make_shared<std::vector<uint8_t>>(src->size());
            return [src, dst, s] { zox::copyPlane(src->data(), s.width, dst->data(), s.width, ImageSize{s.width, s.height}); };
        });
        registerCase(
            "fillPlane", size, n,
            [](Size s) -> Call {
                auto dst = std::make_shared<std::vector<uint8_t>>(std::size_t(s.width) * s.height);
                return [dst, s] { zox::fillPlane(0x5A, dst->data(), s.width, s.width, s.height); };
            },
            Baseline::Memset);
    }
    // A synthetic high-dynamic-range picture: an exponential ramp times a pattern, with a few highlights.
    const Size size{1920, 1080};
    const std::size_t n = static_cast<std::size_t>(size.width) * size.height;
    using ToneFn = zoxStatus (*)(const float*, int, uint8_t*, int, ImageSize);
    const std::pair<const char*, ToneFn> toneMaps[] = {{"zoxiToneMapLinear_32f8u_C1R", zoxiToneMapLinear_32f8u_C1R},
                                                       {"zoxiToneMapMean_32f8u_C1R", zoxiToneMapMean_32f8u_C1R}};
    for (auto [name, f] : toneMaps)
        registerCase(name, size, n * 5, [f](Size s) -> Call {
            auto src = std::make_shared<std::vector<float>>(std::size_t(s.width) * s.height);
            for (int y = 0; y < s.height; ++y)
                for (int x = 0; x < s.width; ++x)
                    (*src)[std::size_t(y) * s.width + x] = std::exp(8.0f * x / s.width) * (1.5f + std::sin(0.05f * y));
            auto dst = std::make_shared<std::vector<uint8_t>>(src->size());
            return [f, src, dst, s] { f(src->data(), 4 * s.width, dst->data(), s.width, ImageSize{s.width, s.height}); };
        });
}

} // namespace zb
