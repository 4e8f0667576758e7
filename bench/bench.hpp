// Benchmark registration: every case at 1920x1080 and 64x64, reporting bytes of input plus output per
// second. Registrations are held until the filter is known: a selected case always runs with the memcpy
// of as many bytes and with the calls of other libraries timed beside it.
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

// Registers `name` at `size` (as "<name>/<W>x<H>"), moving `bytes` bytes of input plus output per call.
// `prepare` builds the buffers once, outside the timing loop.
// What a case is timed against: a memcpy of its byte count (the usual), or a memset of it.
enum class Baseline { Memcpy, Memset };

void registerCase(const std::string& name, Size size, std::size_t bytes, std::function<Call(Size)> prepare,
                  Baseline baseline = Baseline::Memcpy);

// Registers a call of another library (as "peer:<name>/<W>x<H>"), timed and reported beside each of
// our cases named in `ours` at the same size.
void registerPeer(const std::string& name, const std::vector<std::string>& ours, Size size, std::size_t bytes,
                  std::function<Call(Size)> prepare);

// Seeded bytes for benchmark images.
std::vector<uint8_t> randomBytes(std::size_t n, uint32_t seed = 1);

} // namespace zb
