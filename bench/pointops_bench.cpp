// Gray conversions and colour twist, registered from their tables: every member at both sizes.
#include "bench.hpp"
#include "frame/exports.hpp"

#include <cstring>
#include <type_traits>

namespace zb {
namespace {

using namespace zox;

// Samples of type T for `n` samples: bytes as they come, or 0..1 for float types.
template <class T>
std::shared_ptr<std::vector<T>> samples(std::size_t n, uint32_t seed)
{
    const std::vector<uint8_t> b = randomBytes(n * sizeof(T), seed);
    auto v = std::make_shared<std::vector<T>>(n);
    if constexpr (std::is_floating_point_v<T>)
        for (std::size_t i = 0; i < n; ++i)
            (*v)[i] = static_cast<T>(b[i] / 255.0);
    else
        std::memcpy(v->data(), b.data(), n * sizeof(T));
    return v;
}

template <class M, class F>
void registerGray(const char* name, F f)
{
    using S = typename M::S;
    using D = typename M::D;
    for (Size size : kSizes) {
        const std::size_t px = static_cast<std::size_t>(size.width) * size.height;
        registerCase(name, size, px * (M::stride * sizeof(S) + M::outStride * sizeof(D)), [f](Size s) -> Call {
            const std::size_t px = static_cast<std::size_t>(s.width) * s.height;
            auto src = samples<S>(px * M::stride, 1);
            auto dst = std::make_shared<std::vector<D>>(px * M::outStride);
            const int ss = s.width * M::stride * static_cast<int>(sizeof(S)), ds = s.width * M::outStride * static_cast<int>(sizeof(D));
            return [f, src, dst, ss, ds, s] {
                const ImageSize roi{s.width, s.height};
                if constexpr (std::is_invocable_v<F, const S*, int, D*, int, ImageSize, const float*>) {
                    const float w[3] = {0.25f, 0.5f, 0.25f};
                    f(src->data(), ss, dst->data(), ds, roi, w);
                } else if constexpr (std::is_invocable_v<F, const S*, int, D*, int, ImageSize, const double*>) {
                    const double w[3] = {0.25, 0.5, 0.25};
                    f(src->data(), ss, dst->data(), ds, roi, w);
                } else if constexpr (std::is_invocable_v<F, const S*, int, D*, int, ImageSize, D>) {
                    f(src->data(), ss, dst->data(), ds, roi, D{1});
                } else {
                    f(src->data(), ss, dst->data(), ds, roi);
                }
            };
        });
    }
}

// A twist that mixes the channels a little, with offsets.
constexpr float kTwist[4][4] = {{0.9f, 0.1f, 0.05f, 2}, {0.05f, 0.8f, 0.1f, 1}, {0.1f, 0.05f, 0.9f, -3}, {0, 0, 0, 1}};

template <class M, class T, class F>
void registerTwist(const char* name, F f)
{
    constexpr int planes = M::Layout::planes, stride = M::Layout::stride;
    for (Size size : kSizes) {
        const std::size_t px = static_cast<std::size_t>(size.width) * size.height;
        const bool inPlace = std::is_invocable_v<F, T*, int, ImageSize, const float(*)[4]> ||
                             std::is_invocable_v<F, T* const*, int, ImageSize, const float(*)[4]>;
        const std::size_t bytes = px * planes * stride * sizeof(T) * 2;
        registerCase(name, size, bytes, [f, inPlace](Size s) -> Call {
            const std::size_t n = static_cast<std::size_t>(s.width) * s.height * stride;
            auto src = samples<T>(n * planes, 1);
            auto dst = inPlace ? src : std::make_shared<std::vector<T>>(n * planes);
            const int step = s.width * stride * static_cast<int>(sizeof(T));
            return [f, src, dst, n, step, s] {
                const ImageSize roi{s.width, s.height};
                const T* sp[3] = {src->data(), src->data() + n, src->data() + 2 * n};
                T* dp[3] = {dst->data(), dst->data() + n, dst->data() + 2 * n};
                if constexpr (std::is_invocable_v<F, const T*, int, T*, int, ImageSize, const float(*)[4]>)
                    f(sp[0], step, dp[0], step, roi, kTwist);
                else if constexpr (std::is_invocable_v<F, T*, int, ImageSize, const float(*)[4]>)
                    f(dp[0], step, roi, kTwist);
                else if constexpr (std::is_invocable_v<F, const T* const*, int, T* const*, int, ImageSize, const float(*)[4]>)
                    f(sp, step, dp, step, roi, kTwist);
                else
                    f(dp, step, roi, kTwist);
            };
        });
    }
}

} // namespace

void registerPointOps()
{
#define ZB_GRAY(name, shape, M) registerGray<M>(#name, &name);
    ZOX_GRAY_TABLE(ZB_GRAY)
#undef ZB_GRAY
#define ZB_TWIST(name, shape, T, M) registerTwist<M, T>(#name, &name);
    ZOX_TWIST_TABLE(ZB_TWIST)
#undef ZB_TWIST
}

} // namespace zb
