// Every export of the family from sampled images to RGB, from its table: the sweep against the scalar
// forms, the validation rows, and every kernel set the processor runs against the scalar forms.
#include "frame/exports.hpp"
#include "support/fromsampled_sweep.hpp"

using namespace zox;

#define ZT_FROM_ROW(Src, Dst, Lim, Block, Rem, Last) FromSampledRow<Src, Dst, Lim, Block, Rem, Last>
#define ZT_FROM_SHAPE(shape) zt::fromShapeOf(#shape)

#define ZT_FROM_SWEEP(name, shape, Src, Dst, Lim, Block, Rem, Last, Rules) \
    TEST(FromSampledSweep, name) { zt::sweepFromSampled<ZT_FROM_ROW(Src, Dst, Lim, Block, Rem, Last), Rules, ZT_FROM_SHAPE(shape)>(#name, &name); }
ZOX_FROM_SAMPLED_OWN_TABLE(ZT_FROM_SWEEP)
ZOX_WORDS_SAMPLED_TABLE(ZT_FROM_SWEEP)

#define ZT_FROM_VALIDATION(name, shape, Src, Dst, Lim, Block, Rem, Last, Rules)                                         \
    TEST(FromSampledValidation, name)                                                                                    \
    {                                                                                                                    \
        zt::checkFromSampledValidation<ZT_FROM_ROW(Src, Dst, Lim, Block, Rem, Last), Rules, ZT_FROM_SHAPE(shape)>(#name, &name); \
    }
ZOX_FROM_SAMPLED_TABLE(ZT_FROM_VALIDATION)
ZOX_WORDS_SAMPLED_TABLE(ZT_FROM_VALIDATION)

#define ZT_FROM_KERNELS(name, shape, Src, Dst, Lim, Block, Rem, Last, Rules)                                \
    TEST(FromSampledKernelsAgainstForms, name)                                                              \
    {                                                                                                       \
        zt::diffFromSampledKernels<ZT_FROM_ROW(Src, Dst, Lim, Block, Rem, Last)::Other>();                  \
        if (ZT_FROM_ROW(Src, Dst, Lim, Block, Rem, Last)::dependsOnAlignment)                               \
            zt::diffFromSampledKernels<ZT_FROM_ROW(Src, Dst, Lim, Block, Rem, Last)::Aligned>();            \
    }
ZOX_FROM_SAMPLED_OWN_TABLE(ZT_FROM_KERNELS)
ZOX_WORDS_SAMPLED_TABLE(ZT_FROM_KERNELS)
