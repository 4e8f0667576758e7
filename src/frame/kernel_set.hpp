// The kernel sets a build holds and the one its calls run. A build holds the SSE4.1 set, the AVX2 set,
// both, or neither (portable: the scalar forms alone). A build with both chooses once, while the
// library loads, from the core services' feature word; every call then reads that one choice.
#pragma once

#include "zoxcore.h"

#include <cstdint>
#include <type_traits>

#if !defined(ZOX_HAVE_SSE41)
#define ZOX_HAVE_SSE41 0
#endif
#if !defined(ZOX_HAVE_AVX2)
#define ZOX_HAVE_AVX2 0
#endif

namespace zox {

enum class KernelSet { Portable, Sse41, Avx2 };

inline constexpr bool kHaveSse41 = ZOX_HAVE_SSE41 != 0;
inline constexpr bool kHaveAvx2 = ZOX_HAVE_AVX2 != 0;
inline constexpr bool kChosenAtLoad = kHaveSse41 && kHaveAvx2;
// The one set of a build that holds at most one.
inline constexpr KernelSet kBuiltKernelSet = kHaveAvx2 ? KernelSet::Avx2 : kHaveSse41 ? KernelSet::Sse41 : KernelSet::Portable;

// The choice of a build that holds both sets: AVX2 where the word says that the processor has AVX and
// AVX2 and that the operating system saves their register state (the core services set those bits only
// then), else the SSE4.1 baseline.
constexpr KernelSet kernelSetFor(uint64_t featureWord)
{
    constexpr uint64_t avx2 = zoxCpuAvx | zoxCpuAvx2;
    return (featureWord & avx2) == avx2 ? KernelSet::Avx2 : KernelSet::Sse41;
}

// Set once by the load-time hook (builds that hold both sets).
extern KernelSet gLoadedKernelSet;

inline KernelSet activeKernelSet()
{
    if constexpr (kChosenAtLoad)
        return gLoadedKernelSet;
    else
        return kBuiltKernelSet;
}

template <KernelSet K>
using KernelSetTag = std::integral_constant<KernelSet, K>;

// Calls f(KernelSetTag<K>{}) with the set this call runs, as a constant of the call's code.
template <class F>
inline void withActiveKernelSet(F&& f)
{
    if constexpr (kChosenAtLoad) {
        if (gLoadedKernelSet == KernelSet::Avx2)
            f(KernelSetTag<KernelSet::Avx2>{});
        else
            f(KernelSetTag<KernelSet::Sse41>{});
    } else {
        f(KernelSetTag<kBuiltKernelSet>{});
    }
}

constexpr const char* kernelSetName(KernelSet k)
{
    return k == KernelSet::Avx2 ? "avx2" : k == KernelSet::Sse41 ? "sse41" : "portable";
}

} // namespace zox
