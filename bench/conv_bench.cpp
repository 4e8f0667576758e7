// The generic-conversion families, registered from their tables.
#include "bench.hpp"
#include "frame/conv.hpp"
#include "frame/exports.hpp"

#include <type_traits>

namespace zb {
namespace {

using namespace zox;

template <class L>
struct Buffers {
    using T = typename L::Sample;
    std::vector<std::vector<uint8_t>> planes;
    std::vector<T*> ptrs;
    int step;
    Buffers(Size s, uint32_t seed) : step(s.width * L::bytesPerPixel)
    {
        for (int p = 0; p < L::planes; ++p) {
            planes.push_back(randomBytes(static_cast<std::size_t>(step) * s.height, seed + p));
            ptrs.push_back(reinterpret_cast<T*>(planes.back().data()));
        }
    }
    typename L::Arg arg()
    {
        if constexpr (std::is_pointer_v<std::remove_pointer_t<typename L::Arg>>)
            return ptrs.data();
        else
            return ptrs[0];
    }
};

template <class C, class F>
void registerConv(const char* name, F f)
{
    using Src = typename C::Src;
    using Dst = typename C::Dst;
    for (Size size : kSizes) {
        const std::size_t px = static_cast<std::size_t>(size.width) * size.height;
        const std::size_t bytes = px * (Src::planes * Src::bytesPerPixel + Dst::planes * Dst::bytesPerPixel);
        registerCase(name, size, bytes, [f](Size s) -> Call {
            auto src = std::make_shared<Buffers<Src>>(s, 1);
            auto dst = std::make_shared<Buffers<Dst>>(s, 9);
            return [f, src, dst, s] {
                if constexpr (std::is_invocable_v<F, typename Src::Arg, int, typename Dst::Arg, int, ImageSize, uint8_t>)
                    f(src->arg(), src->step, dst->arg(), dst->step, ImageSize{s.width, s.height}, typename Dst::Sample{127});
                else
                    f(src->arg(), src->step, dst->arg(), dst->step, ImageSize{s.width, s.height});
            };
        });
    }
}

} // namespace

void registerConvFamilies()
{
#define ZB_CONV(name, shape, Src, Dst, N, Block, Rem, Chk) registerConv<Conv<Src, Dst, N, Block, Rem, Chk>>(#name, &name);
    ZOX_CONV_TABLES(ZB_CONV)
#undef ZB_CONV
}

} // namespace zb
