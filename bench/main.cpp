// Runs the benchmarks and closes with each conversion's time against the memcpy of as many bytes.
#include "bench.hpp"

#include <cstdio>
#include <cstring>
#include <map>
#include <random>

namespace zb {

namespace {

struct Entry {
    std::string baseline; // memcpy benchmark of the same byte count
    std::string peerOf;   // for a peer call: our benchmark it compares with
};
std::map<std::string, Entry>& entries()
{
    static std::map<std::string, Entry> e;
    return e;
}

std::string sizeTag(Size s)
{
    return std::to_string(s.width) + "x" + std::to_string(s.height);
}

std::string ensureMemcpy(std::size_t bytes)
{
    const std::string name = "memcpy/" + std::to_string(bytes);
    if (!entries().count(name)) {
        entries()[name] = {};
        benchmark::RegisterBenchmark(name.c_str(), [bytes](benchmark::State& st) {
            std::vector<uint8_t> a = randomBytes(bytes), b(bytes);
            for (auto _ : st) {
                std::memcpy(b.data(), a.data(), bytes);
                benchmark::DoNotOptimize(b.data());
                benchmark::ClobberMemory();
            }
            st.SetBytesProcessed(static_cast<int64_t>(st.iterations()) * static_cast<int64_t>(bytes));
        })->Unit(benchmark::kMicrosecond);
    }
    return name;
}

void add(const std::string& full, std::size_t bytes, std::function<Call(Size)> prepare, Size size)
{
    benchmark::RegisterBenchmark(full.c_str(), [prepare, size, bytes](benchmark::State& st) {
        Call call = prepare(size);
        for (auto _ : st) {
            call();
            benchmark::ClobberMemory();
        }
        st.SetBytesProcessed(static_cast<int64_t>(st.iterations()) * static_cast<int64_t>(bytes));
    })->Unit(benchmark::kMicrosecond);
}

// Collects the mean real time of every run for the closing table.
class Collector : public benchmark::ConsoleReporter {
public:
    std::map<std::string, double> seconds;
    void ReportRuns(const std::vector<Run>& runs) override
    {
        for (const Run& r : runs)
            if (r.run_type == Run::RT_Iteration || r.aggregate_name == "median")
                seconds[r.run_type == Run::RT_Iteration ? r.benchmark_name() : r.run_name.str()] =
                    r.GetAdjustedRealTime();
        ConsoleReporter::ReportRuns(runs);
    }
};

} // namespace

void registerCase(const std::string& name, Size size, std::size_t bytes, std::function<Call(Size)> prepare)
{
    const std::string full = name + "/" + sizeTag(size);
    entries()[full] = {ensureMemcpy(bytes), ""};
    add(full, bytes, std::move(prepare), size);
}

void registerPeer(const std::string& name, const std::string& ours, Size size, std::size_t bytes,
                  std::function<Call(Size)> prepare)
{
    const std::string full = "peer:" + name + "/" + sizeTag(size);
    entries()[full] = {ensureMemcpy(bytes), ours + "/" + sizeTag(size)};
    add(full, bytes, std::move(prepare), size);
}

std::vector<uint8_t> randomBytes(std::size_t n, uint32_t seed)
{
    std::mt19937 rng(seed);
    std::vector<uint8_t> v(n);
    for (auto& b : v)
        b = static_cast<uint8_t>(rng());
    return v;
}

void registerAll(); // from the family files

} // namespace zb

int main(int argc, char** argv)
{
    zb::registerAll();
    benchmark::Initialize(&argc, argv);
    if (benchmark::ReportUnrecognizedArguments(argc, argv))
        return 1;
    zb::Collector collector;
    benchmark::RunSpecifiedBenchmarks(&collector);
    std::printf("\n%-48s %12s %12s %8s\n", "case", "time (us)", "memcpy (us)", "ratio");
    for (const auto& [name, e] : zb::entries()) {
        if (e.baseline.empty())
            continue;
        const auto t = collector.seconds.find(name);
        const auto m = collector.seconds.find(e.baseline);
        if (t == collector.seconds.end() || m == collector.seconds.end())
            continue;
        std::printf("%-48s %12.1f %12.1f %8.2f", name.c_str(), t->second, m->second, t->second / m->second);
        if (!e.peerOf.empty())
            if (const auto o = collector.seconds.find(e.peerOf); o != collector.seconds.end())
                std::printf("   ours/peer %.2f", o->second / t->second);
        std::printf("\n");
    }
    benchmark::Shutdown();
    return 0;
}
