// Gamma correction: the C3R member of each depth and direction (16u at this size takes the table path).
#include "bench.hpp"
#include "zoxcc.h"

#include <cstring>
#include <memory>

namespace zb {
namespace {

template <class T, class F, class... Range>
void registerGamma(const char* name, F f, Range... range)
{
    for (Size size : kSizes) {
        const std::size_t samples = static_cast<std::size_t>(size.width) * size.height * 3;
        registerCase(name, size, 2 * samples * sizeof(T), [f, samples, range...](Size s) -> Call {
            auto bytes = randomBytes(samples * sizeof(T));
            auto src = std::make_shared<std::vector<T>>(samples);
            if constexpr (std::is_same_v<T, float>)
                for (std::size_t i = 0; i < samples; ++i)
                    (*src)[i] = bytes[i] / 255.0f;
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
    registerGamma<uint8_t>("zoxiGammaFwd_8u_C3R", zoxiGammaFwd_8u_C3R);
    registerGamma<uint8_t>("zoxiGammaInv_8u_C3R", zoxiGammaInv_8u_C3R);
    registerGamma<uint16_t>("zoxiGammaFwd_16u_C3R", zoxiGammaFwd_16u_C3R);
    registerGamma<uint16_t>("zoxiGammaInv_16u_C3R", zoxiGammaInv_16u_C3R);
    registerGamma<float>("zoxiGammaFwd_32f_C3R", zoxiGammaFwd_32f_C3R, 0.0f, 1.0f);
    registerGamma<float>("zoxiGammaInv_32f_C3R", zoxiGammaInv_32f_C3R, 0.0f, 1.0f);
}

} // namespace zb
