// Every export of the sampled-conversion families, from their tables: the sweep against the scalar
// forms, the validation rows, and every kernel set the processor runs against the scalar forms.
#include "frame/exports.hpp"
#include "support/sampled_sweep.hpp"

using namespace zox;

#define ZT_ROW(Src, Dst, Lim, Block, Rem, Tail) SampledRow<Src, Dst, Lim, Block, Rem, Tail>
#define ZT_SHAPE(shape) zt::sampledShapeOf(#shape)

#define ZT_SWEEP(name, shape, Src, Dst, Lim, Block, Rem, Tail, Rules) \
    TEST(SampledSweep, name) { zt::sweepSampled<ZT_ROW(Src, Dst, Lim, Block, Rem, Tail), Rules, ZT_SHAPE(shape)>(#name, &name); }
ZOX_TO_SAMPLED_OWN_TABLE(ZT_SWEEP)
ZOX_WORDS_TO_SAMPLED_TABLE(ZT_SWEEP)

#define ZT_VALIDATION(name, shape, Src, Dst, Lim, Block, Rem, Tail, Rules) \
    TEST(SampledValidation, name) { zt::checkSampledValidation<ZT_ROW(Src, Dst, Lim, Block, Rem, Tail), Rules, ZT_SHAPE(shape)>(#name, &name); }
ZOX_TO_SAMPLED_TABLE(ZT_VALIDATION)
ZOX_WORDS_TO_SAMPLED_TABLE(ZT_VALIDATION)

#define ZT_KERNELS(name, shape, Src, Dst, Lim, Block, Rem, Tail, Rules)                                     \
    TEST(SampledKernelsAgainstForms, name)                                                                  \
    {                                                                                                       \
        zt::diffSampledKernels<ZT_ROW(Src, Dst, Lim, Block, Rem, Tail)::Other>();                           \
        if (ZT_ROW(Src, Dst, Lim, Block, Rem, Tail)::dependsOnAlignment)                                    \
            zt::diffSampledKernels<ZT_ROW(Src, Dst, Lim, Block, Rem, Tail)::Aligned>();                     \
    }
ZOX_TO_SAMPLED_OWN_TABLE(ZT_KERNELS)
ZOX_WORDS_TO_SAMPLED_OWN(ZT_KERNELS)

