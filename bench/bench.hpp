// Benchmark registration: every case at 1920x1080 and 64x64, reporting bytes of input plus output per
// second, with a memcpy of as many bytes registered once per byte count as the baseline.
#pragma once

#include <benchmark/benchmark.h>

#include <cstddef>
#include <cstdint>
#include <functional>
#include <memory>
#include <string>
#include <vector>

namespace zb {

struct Size {
    int width, height;
};
inline constexpr Size kSizes[] = {{1920, 1080}, {64, 64}};

// A prepared call: owns its buffers, runs the conversion once per invocation.
using Call = std::function<void()>;

// Registers `name` at `size`, moving `bytes` bytes of input plus output per call, and the memcpy of
// `bytes` bytes beside it. `prepare` builds the buffers once, outside the timing loop.
void registerCase(const std::string& name, Size size, std::size_t bytes, std::function<Call(Size)> prepare);

// Registers a comparison call of another library, reported as a ratio to `ours`.
void registerPeer(const std::string& name, const std::string& ours, Size size, std::size_t bytes,
                  std::function<Call(Size)> prepare);

// Seeded bytes for benchmark images.
std::vector<uint8_t> randomBytes(std::size_t n, uint32_t seed = 1);

} // namespace zb
