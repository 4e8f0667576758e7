// Every export of the generic-conversion families, from their tables: the sweep against the column-rule
// walker, the validation rows, and every kernel set the processor runs against the scalar forms.
#include "frame/exports.hpp"
#include "support/conv_sweep.hpp"

#include <string_view>

using namespace zox;

#define ZT_SWEEP(name, shape, Src, Dst, N, Block, Rem, Chk) \
    TEST(ExportSweep, name)                                                                         \
    {                                                                                                \
        zt::sweepExport<Conv<Src, Dst, N, Block, Rem, Chk>>(#name, &name,                            \
                                                            std::string_view(#shape) == "ZOX_SHAPE_SD_SAMPLES"); \
    }
ZOX_CONV_TABLES(ZT_SWEEP)

#define ZT_VALIDATION(name, shape, Src, Dst, N, Block, Rem, Chk) \
    TEST(Validation, name) { zt::checkValidation<Conv<Src, Dst, N, Block, Rem, Chk>>(#name, &name); }
ZOX_CONV_TABLES(ZT_VALIDATION)

#define ZT_KERNELS(name, shape, Src, Dst, N, Block, Rem, Chk) \
    TEST(KernelsAgainstForms, name) { zt::diffKernels<Conv<Src, Dst, N, Block, Rem, Chk>>(); }
ZOX_CONV_TABLES(ZT_KERNELS)
