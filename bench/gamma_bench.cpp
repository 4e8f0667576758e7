// Gamma correction: the C3R member of each depth and direction (16u at this size takes the table path).
#include "bench.hpp"
#include "zoxcc.h"

#include <cstring>
#include <string>
#include <memory>

namespace zb {
namespace {

// Random samples; or, with `smooth`, a picture of horizontal ramps whose neighbouring samples are close,
// as in real 16-bit images (a table lookup then stays in the nearest cache).
template <class T, class F, class... Range>
void registerGamma(const std::string& name, bool smooth, F f, Range... range)
{
    for (Size size : kSizes) {
        const std::size_t samples = static_cast<std::size_t>(size.width) * size.height * 3;
        registerCase(name, size, 2 * samples * sizeof(T), [f, samples, smooth, range...](Size s) -> Call {
            auto bytes = randomBytes(samples * sizeof(T));
            auto src = std::make_shared<std::vector<T>>(samples);
            if constexpr (std::is_same_v<T, float>)
                for (std::size_t i = 0; i < samples; ++i)
                    (*src)[i] = bytes[i] / 255.0f;
            else if (smooth)
                for (std::size_t i = 0; i < samples; ++i)
                    (*src)[i] = static_cast<T>((i / 3 % s.width) * 65535 / s.width + (i % 3) * 97 + (bytes[i] & 15));
            else
                std::memcpy(src->data(), bytes.data(), samples * sizeof(T));
            auto dst = std::make_shared<std::vector<T>>(samples);
            const int step = s.width * 3 * static_cast<int>(sizeof(T));
            return [f, src, dst, step, s, range...] { f(src->data(), step, dst->data(), step, ImageSize{s.width, s.height}, range...); };
        });
    }
}

} // namespace

void registerGammaFamily()
{
    registerGamma<uint8_t>("zoxiGammaFwd_8u_C3R", false, zoxiGammaFwd_8u_C3R);
    registerGamma<uint8_t>("zoxiGammaInv_8u_C3R", false, zoxiGammaInv_8u_C3R);
    registerGamma<uint16_t>("zoxiGammaFwd_16u_C3R", false, zoxiGammaFwd_16u_C3R);
    registerGamma<uint16_t>("zoxiGammaFwd_16u_C3R:ramps", true, zoxiGammaFwd_16u_C3R);
    registerGamma<uint16_t>("zoxiGammaInv_16u_C3R", false, zoxiGammaInv_16u_C3R);
    registerGamma<float>("zoxiGammaFwd_32f_C3R", false, zoxiGammaFwd_32f_C3R, 0.0f, 1.0f);
    registerGamma<float>("zoxiGammaInv_32f_C3R", false, zoxiGammaInv_32f_C3R, 0.0f, 1.0f);
}

} // namespace zb
