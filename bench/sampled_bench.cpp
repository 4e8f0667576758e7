// The sampled-conversion families, registered from their tables: bytes are the full-resolution source
// plus the luma and the sampled chroma written.
#include "bench.hpp"
#include "frame/exports.hpp"
#include "frame/fromsampled.hpp"
#include "frame/sampled.hpp"
#include "sampling/repack.hpp"

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
            return reinterpret_cast<typename Src::Arg>(ptrs[0]);
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

// A sampled source with its planes at their sizes, and a full-resolution destination.
template <class Src>
struct SampledSourceImage {
    std::vector<uint8_t> bytes[3];
    const uint8_t* ptr[3] = {};
    int step[3] = {};
    std::size_t read = 0;
    explicit SampledSourceImage(Size s)
    {
        constexpr Sampling S = Src::sampling;
        const int rows = S == Sampling::S420 ? s.height / 2 : s.height;
        const int units = s.width / unitWidth(S);
        const int widths[3] = {Src::planes == 1 ? 2 * s.width : s.width, Src::planes == 2 ? 2 * units : units, units};
        for (int p = 0; p < Src::planes; ++p) {
            const int r = p == 0 && Src::planes > 1 ? s.height : rows;
            bytes[p] = randomBytes(static_cast<std::size_t>(widths[p]) * r, 3 + p);
            ptr[p] = bytes[p].data();
            step[p] = widths[p];
            read += bytes[p].size();
        }
    }
};

template <class Dst>
struct PixelImage {
    std::vector<uint8_t> bytes[3];
    uint8_t* ptr[3] = {};
    int step;
    explicit PixelImage(Size s) : step(s.width * Dst::bytesPerPixel)
    {
        for (int p = 0; p < Dst::planes; ++p) {
            bytes[p].assign(static_cast<std::size_t>(step) * s.height, 0);
            ptr[p] = bytes[p].data();
        }
    }
    typename Dst::Arg arg()
    {
        if constexpr (Dst::planes == 1)
            return reinterpret_cast<typename Dst::Arg>(ptr[0]);
        else
            return ptr;
    }
};

template <class Row, class F>
void registerFromSampled(const char* name, F f)
{
    using Src = typename Row::Other::Src;
    using Dst = typename Row::Other::Dst;
    for (Size size : kSizes) {
        const std::size_t bytes = SampledSourceImage<Src>(size).read + static_cast<std::size_t>(size.width) * size.height * Dst::planes * Dst::bytesPerPixel;
        registerCase(name, size, bytes, [f](Size s) -> Call {
            auto src = std::make_shared<SampledSourceImage<Src>>(s);
            auto dst = std::make_shared<PixelImage<Dst>>(s);
            const ImageSize roi{s.width, s.height};
            return [f, src, dst, roi] {
                using D = typename Dst::Arg;
                if constexpr (std::is_invocable_v<F, const uint8_t* const*, const int*, D, int, ImageSize>)
                    f(src->ptr, src->step, dst->arg(), dst->step, roi);
                else if constexpr (std::is_invocable_v<F, const uint8_t* const*, const int*, D, int, ImageSize, uint8_t>)
                    f(src->ptr, src->step, dst->arg(), dst->step, roi, uint8_t{255});
                else if constexpr (std::is_invocable_v<F, const uint8_t*, int, const uint8_t*, int, D, int, ImageSize>)
                    f(src->ptr[0], src->step[0], src->ptr[1], src->step[1], dst->arg(), dst->step, roi);
                else if constexpr (std::is_invocable_v<F, const uint8_t*, int, const uint8_t*, int, D, int, ImageSize, uint8_t>)
                    f(src->ptr[0], src->step[0], src->ptr[1], src->step[1], dst->arg(), dst->step, roi, uint8_t{255});
                else if constexpr (std::is_invocable_v<F, const uint8_t*, int, D, int, ImageSize>)
                    f(src->ptr[0], src->step[0], dst->arg(), dst->step, roi);
                else if constexpr (std::is_invocable_v<F, const uint8_t*, int, D, int, ImageSize, uint8_t>)
                    f(src->ptr[0], src->step[0], dst->arg(), dst->step, roi, uint8_t{255});
                else
                    f(src->ptr, dst->arg(), roi);
            };
        });
    }
}

// One side of a repacking call at its format's sizes; bytes it holds.
template <class F>
struct RepackImageSide {
    std::vector<uint8_t> bytes[3];
    uint8_t* ptr[3] = {};
    int step[3] = {};
    std::size_t size = 0;
    explicit RepackImageSide(Size s)
    {
        const int rows = F::sampling == Sampling::S420 ? s.height / 2 : s.height;
        const int cw = F::sampling == Sampling::S411 ? s.width / 4 : s.width / 2;
        const int widths[3] = {F::planes == 1 ? 2 * s.width : s.width, F::planes == 2 ? 2 * cw : cw, cw};
        for (int p = 0; p < F::planes; ++p) {
            const int r = p == 0 ? s.height : rows;
            bytes[p] = randomBytes(static_cast<std::size_t>(widths[p]) * r, 7 + p);
            ptr[p] = bytes[p].data();
            step[p] = widths[p];
            size += bytes[p].size();
        }
    }
};

template <class C, class F>
void registerRepack(const char* name, F f)
{
    using S = typename C::Src;
    using D = typename C::Dst;
    for (Size size : kSizes) {
        const std::size_t bytes = RepackImageSide<S>(size).size + RepackImageSide<D>(size).size;
        registerCase(name, size, bytes, [f](Size sz) -> Call {
            auto s = std::make_shared<RepackImageSide<S>>(sz);
            auto d = std::make_shared<RepackImageSide<D>>(sz);
            const ImageSize roi{sz.width, sz.height};
            return [f, s, d, roi] {
                auto withDst = [&](auto... a) {
                    if constexpr (D::planes == 3)
                        f(a..., d->ptr, d->step, roi);
                    else if constexpr (D::planes == 2)
                        f(a..., d->ptr[0], d->step[0], d->ptr[1], d->step[1], roi);
                    else
                        f(a..., d->ptr[0], d->step[0], roi);
                };
                const uint8_t* const sp[3] = {s->ptr[0], s->ptr[1], s->ptr[2]};
                if constexpr (S::planes == 3)
                    withDst(sp, s->step);
                else if constexpr (S::planes == 2)
                    withDst(sp[0], s->step[0], sp[1], s->step[1]);
                else
                    withDst(sp[0], s->step[0]);
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
    ZOX_WORDS_TO_SAMPLED_TABLE(ZB_SAMPLED)
#undef ZB_SAMPLED
#define ZB_FROM_SAMPLED(name, shape, Src, Dst, Lim, Block, Rem, Last, Rules) \
    registerFromSampled<FromSampledRow<Src, Dst, Lim, Block, Rem, Last>>(#name, &name);
    ZOX_FROM_SAMPLED_TABLE(ZB_FROM_SAMPLED)
    ZOX_WORDS_SAMPLED_TABLE(ZB_FROM_SAMPLED)
#undef ZB_FROM_SAMPLED
#define ZB_REPACK(name, shape, Src, Dst, Rule, Class, Stream) registerRepack<ZOX_REPACK(Src, Dst, Rule, Class, Stream)>(#name, &name);
    ZOX_REPACK_TABLE(ZB_REPACK)
#undef ZB_REPACK
}

} // namespace zb
