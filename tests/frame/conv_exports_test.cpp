// Every export of the generic-conversion families, from their tables: the sweep against the column-rule
// walker, the validation rows, and the SIMD block kernels against their scalar forms.
#include "frame/exports.hpp"
#include "support/conv_sweep.hpp"

using namespace zox;

#define ZT_SWEEP(name, shape, Src, Dst, N, Block, Rem, Chk) \
    TEST(ExportSweep, name) { zt::sweepExport<Conv<Src, Dst, N, Block, Rem, Chk>>(#name, &name); }
ZOX_CONV_TABLES(ZT_SWEEP)

#define ZT_VALIDATION(name, shape, Src, Dst, N, Block, Rem, Chk) \
    TEST(Validation, name) { zt::checkValidation<Conv<Src, Dst, N, Block, Rem, Chk>>(#name, &name); }
ZOX_CONV_TABLES(ZT_VALIDATION)

#if defined(ZOX_ISA_SSE41) || defined(ZOX_ISA_AVX2)
#define ZT_KERNEL(name, shape, Src, Dst, N, Block, Rem, Chk)                 \
    TEST(BlockKernelSimd, name)                                             \
    {                                                                        \
        if (N == 1)                                                          \
            GTEST_SKIP() << "one form in all columns";                       \
        zt::diffKernel<Conv<Src, Dst, N, Block, Rem, Chk>>();                \
    }
ZOX_CONV_TABLES(ZT_KERNEL)
#endif
