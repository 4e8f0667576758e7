// The version record, and the one call made to the core services when the library loads: the feature
// word that chooses the kernel set of a build holding more than one.
#include "frame/kernel_set.hpp"
#include "frame/planes.hpp"
#include "zoxcc.h"
#include "zoxcore.h"

namespace zox {
// The baseline until the load-time hook has run.
KernelSet gLoadedKernelSet = KernelSet::Sse41;
} // namespace zox

namespace {

constexpr const char* kVersionText = "8.2.1 (r44077)";
constexpr const char* kBuildDate = "Oct  9 2014";

// Two records, equal in all but the name.
constexpr LibraryVersion kPlain{8, 2, 1, 44077, {'p', '8', 0, 0}, "zoxCC SSE4.1/4.2 (p8)", kVersionText, kBuildDate};
constexpr LibraryVersion kPlus{8, 2, 1, 44077, {'p', '8', 0, 0}, "zoxCC SSE4.1/4.2 (p8)+", kVersionText, kBuildDate};

// The feature word is asked for once while the library loads, and the cache descriptors read; no call
// asks again.
[[gnu::constructor]] void chooseKernelsOnLoad()
{
    zox::gLoadedKernelSet = zox::kernelSetFor(zoxGetEnabledCpuFeatures());
    zox::probeCacheDescriptors();
}

} // namespace

extern "C" ZOXCC_API const LibraryVersion* zoxccGetLibVersion(void)
{
    return ownGetFeature(128, 0) != 0 ? &kPlus : &kPlain;
}
