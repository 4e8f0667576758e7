// The test build of the core services: linked into the test program in place of libzoxcore, it counts
// allocations and can be told to fail them or to change the answer of ownGetFeature(128, 0); the feature
// word is the processor's own, so that the library chooses its kernels as it would with the real ones.
#pragma once

#include <atomic>

namespace zt::core {

extern std::atomic<int> mallocCalls;
extern std::atomic<int> freeCalls;
extern std::atomic<int> failAfter;     // allocations still granted before the next ones fail; -1 never fail
extern std::atomic<int> feature128;    // the answer of ownGetFeature(128, 0)
extern std::atomic<int> featureWordCalls;
extern std::atomic<int> cacheSizeCalls;  // calls of zoxGetMaxCacheSizeB
extern std::atomic<int> cacheSizeFails;  // non-zero: zoxGetMaxCacheSizeB reports no size

// Resets the counters and the failure setting for one test.
struct Scope {
    Scope();
    ~Scope();
};

} // namespace zt::core
