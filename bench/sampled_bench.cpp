// The sampled-conversion families, registered from their tables: bytes are the full-resolution source
// plus the luma and the sampled chroma written.
#include "bench.hpp"
#include "frame/exports.hpp"
#include "frame/sampled.hpp"

#include <type_traits>

namespace zb {
namespace {

using namespace zox;

template <class Src>
struct SourceImage {
    std::vector<std::vector<uint8_t>> planes;
    std::vector<const uint8_t*> ptrs;
    int step;
    SourceImage(Size s) : step(s.width * Src::bytesPerPixel)
    {
        for (int p = 0; p < Src::planes; ++p) {
            planes.push_back(randomBytes(static_cast<std::size_t>(step) * s.height, 1 + p));
            ptrs.push_back(planes.back().data());
        }
    }
    typename Src::Arg arg()
    {
        if constexpr (Src::planes == 1)
            return ptrs[0];
        else
            return ptrs.data();
    }
};

// The destination planes with their rows and steps; bytes the call writes.
template <class Dst>
struct SampledImage {
    std::vector<uint8_t> bytes[3];
    uint8_t* ptr[3] = {};
    int step[3] = {};
    std::size_t written = 0;
    explicit SampledImage(Size s)
    {
        constexpr Sampling S = Dst::sampling;
        const int uw = unitWidth(S), rows = S == Sampling::S420 ? s.height / 2 : s.height;
        const int units = s.width / uw;
        const int widths[3] = {Dst::planes == 1 ? 4 * units : s.width, Dst::planes == 2 ? 2 * units : units, units};
        for (int p = 0; p < Dst::planes; ++p) {
            const int r = p == 0 && Dst::planes > 1 ? s.height : rows;
            bytes[p].assign(static_cast<std::size_t>(widths[p]) * r, 0);
            ptr[p] = bytes[p].data();
            step[p] = widths[p];
            written += bytes[p].size();
        }
    }
};

template <class Row, class F>
void registerSampled(const char* name, F f)
{
    using Src = typename Row::Other::Src;
    using Dst = typename Row::Other::Dst;
    for (Size size : kSizes) {
        const std::size_t bytes = static_cast<std::size_t>(size.width) * size.height * Src::planes * Src::bytesPerPixel +
                                  SampledImage<Dst>(size).written;
        registerCase(name, size, bytes, [f](Size s) -> Call {
            auto src = std::make_shared<SourceImage<Src>>(s);
            auto dst = std::make_shared<SampledImage<Dst>>(s);
            const ImageSize roi{s.width, s.height};
            return [f, src, dst, roi] {
                if constexpr (std::is_invocable_v<F, typename Src::Arg, int, uint8_t* const*, const int*, ImageSize>)
                    f(src->arg(), src->step, dst->ptr, dst->step, roi);
                else if constexpr (std::is_invocable_v<F, typename Src::Arg, int, uint8_t*, int, uint8_t*, int, ImageSize>)
                    f(src->arg(), src->step, dst->ptr[0], dst->step[0], dst->ptr[1], dst->step[1], roi);
                else if constexpr (std::is_invocable_v<F, typename Src::Arg, int, uint8_t*, int, ImageSize>)
                    f(src->arg(), src->step, dst->ptr[0], dst->step[0], roi);
                else
                    f(src->arg(), dst->ptr, roi);
            };
        });
    }
}

} // namespace

void registerSampledFamilies()
{
#define ZB_SAMPLED(name, shape, Src, Dst, Lim, Block, Rem, Tail, Rules) \
    registerSampled<SampledRow<Src, Dst, Lim, Block, Rem, Tail>>(#name, &name);
    ZOX_TO_SAMPLED_TABLE(ZB_SAMPLED)
#undef ZB_SAMPLED
}

} // namespace zb
