// Runs the benchmarks and closes with a table: each conversion's time against a memcpy of as many bytes
// and against the nearest calls of other libraries built in.
//
// The cases are registered only once the filter is known: those whose full name the filter finds, each
// with the memcpy of its byte count and with its peers, so no filter can leave a case without its
// baseline. A peer call the filter finds brings in the cases it is timed beside.
#include "bench.hpp"
#include "zoxcc.h"

#include <algorithm>
#include <cstdio>
#include <cstdlib>
#include <cstring>
#include <fstream>
#include <map>
#include <random>
#include <regex>
#include <set>

#ifndef ZOX_BENCH_ISA
#define ZOX_BENCH_ISA "unknown"
#endif

namespace zb {

namespace {

// A registration held back until the filter is known.
struct Pending {
    std::string name; // full benchmark name
    Size size;
    std::size_t bytes;
    std::function<Call(Size)> prepare;
    std::vector<std::string> peerOf; // for another library's call: the full names of our cases beside it
    Baseline baseline = Baseline::Memcpy;
};
std::vector<Pending>& pending()
{
    static std::vector<Pending> p;
    return p;
}

std::string sizeTag(Size s)
{
    return std::to_string(s.width) + "x" + std::to_string(s.height);
}

std::string baselineName(Baseline k, std::size_t bytes)
{
    return (k == Baseline::Memset ? "memset/" : "memcpy/") + std::to_string(bytes);
}

void registerBaseline(Baseline k, std::size_t bytes)
{
    benchmark::RegisterBenchmark(baselineName(k, bytes).c_str(), [k, bytes](benchmark::State& st) {
        std::vector<uint8_t> a = randomBytes(bytes), b(bytes);
        for (auto _ : st) {
            if (k == Baseline::Memset)
                std::memset(b.data(), 0x5A, bytes);
            else
                std::memcpy(b.data(), a.data(), bytes);
            benchmark::DoNotOptimize(b.data());
            benchmark::ClobberMemory();
        }
        st.SetBytesProcessed(static_cast<int64_t>(st.iterations()) * static_cast<int64_t>(bytes));
    })->Unit(benchmark::kMicrosecond);
}

void registerCall(const Pending& p)
{
    benchmark::RegisterBenchmark(p.name.c_str(), [prepare = p.prepare, size = p.size, bytes = p.bytes](benchmark::State& st) {
        Call call = prepare(size);
        for (auto _ : st) {
            call();
            benchmark::ClobberMemory();
        }
        st.SetBytesProcessed(static_cast<int64_t>(st.iterations()) * static_cast<int64_t>(bytes));
    })->Unit(benchmark::kMicrosecond);
}

// One line of the closing table: a case of ours, its baseline and its peers (full benchmark names).
struct Row {
    std::string name, baseline;
    std::vector<std::string> peers;
};

// Registers what `filter` selects, with Google Benchmark's reading of it (ECMAScript, found anywhere
// in the name; empty or "all" takes everything, a leading '-' takes what does not match).
std::vector<Row> registerSelected(const std::string& filter)
{
    std::string pattern = filter.empty() || filter == "all" ? "." : filter;
    const bool negative = pattern[0] == '-';
    if (negative)
        pattern.erase(0, 1);
    const std::regex re(pattern, std::regex::ECMAScript);
    const auto selected = [&](const std::string& name) { return std::regex_search(name, re) != negative; };

    std::set<std::string> ours, chosen;
    for (const Pending& p : pending())
        if (p.peerOf.empty())
            ours.insert(p.name);
    for (const Pending& p : pending()) {
        for (const std::string& o : p.peerOf)
            if (!ours.count(o))
                std::fprintf(stderr, "zoxcc_bench: %s is timed beside %s, which is not registered\n", p.name.c_str(), o.c_str());
        if (!selected(p.name))
            continue;
        if (p.peerOf.empty())
            chosen.insert(p.name);
        else
            chosen.insert(p.peerOf.begin(), p.peerOf.end());
    }

    std::vector<Row> rows;
    std::set<std::string> registered;
    for (const Pending& p : pending()) {
        if (!p.peerOf.empty() || !chosen.count(p.name))
            continue;
        Row row{p.name, baselineName(p.baseline, p.bytes), {}};
        if (registered.insert(row.baseline).second)
            registerBaseline(p.baseline, p.bytes);
        registerCall(p);
        for (const Pending& q : pending())
            if (std::find(q.peerOf.begin(), q.peerOf.end(), p.name) != q.peerOf.end()) {
                if (registered.insert(q.name).second)
                    registerCall(q);
                row.peers.push_back(q.name);
            }
        rows.push_back(std::move(row));
    }
    return rows;
}

// Collects each run's real time in microseconds, the median where runs repeat.
class Collector : public benchmark::ConsoleReporter {
public:
    std::map<std::string, double> us;
    void ReportRuns(const std::vector<Run>& runs) override
    {
        for (const Run& r : runs)
            if (r.run_type == Run::RT_Iteration || r.aggregate_name == "median")
                us[r.run_type == Run::RT_Iteration ? r.benchmark_name() : r.run_name.str()] = r.GetAdjustedRealTime();
        ConsoleReporter::ReportRuns(runs);
    }
};

std::string cpuModel()
{
    std::ifstream in("/proc/cpuinfo");
    for (std::string line; std::getline(in, line);)
        if (line.rfind("model name", 0) == 0 && line.find(':') != std::string::npos)
            return line.substr(line.find_first_not_of(" \t", line.find(':') + 1));
    return "unknown";
}

std::string compiler()
{
#if defined(__clang__)
    return __VERSION__;
#else
    return "GCC " __VERSION__;
#endif
}

// The block kernels that ran: the set the library was built with, or, for a build that leaves the
// choice to load time, the one its version record reports.
std::string kernelSet()
{
    const std::string isa = ZOX_BENCH_ISA;
    if (isa != "auto")
        return isa;
    const std::string name = zoxccGetLibVersion()->name;
    return std::string(!name.empty() && name.back() == '+' ? "avx2" : "sse41") + " (chosen at load)";
}

// "peer:libyuv I444ToARGB/1920x1080" -> "libyuv I444ToARGB"
std::string peerLabel(const std::string& full)
{
    const std::size_t from = full.rfind("peer:", 0) == 0 ? 5 : 0;
    return full.substr(from, full.rfind('/') - from);
}

void printTable(const std::vector<Row>& rows, const std::map<std::string, double>& us, bool markdown)
{
    const auto time = [&](const std::string& name) {
        const auto t = us.find(name);
        return t == us.end() ? -1.0 : t->second;
    };
    const std::string cpu = cpuModel(), cc = compiler(), isa = kernelSet();

    std::printf("\nCPU       %s\ncompiler  %s\nkernels   %s\n\n", cpu.c_str(), cc.c_str(), isa.c_str());
    std::printf("%-46s %11s %11s %9s %10s\n", "case", "time (us)", "base (us)", "x base", "ours/peer");
    for (const Row& r : rows) {
        const double t = time(r.name), m = time(r.baseline);
        if (t < 0 || m < 0)
            continue;
        std::printf("%-46s %11.1f %11.1f %9.2f\n", r.name.c_str(), t, m, t / m);
        for (const std::string& p : r.peers)
            if (const double pt = time(p); pt > 0)
                std::printf("  %-44s %11.1f %11s %9s %10.2f\n", peerLabel(p).c_str(), pt, "", "", t / pt);
    }

    if (!markdown)
        return;
    std::printf("\n- CPU: %s\n- Compiler: %s\n- Kernels: %s\n\n", cpu.c_str(), cc.c_str(), isa.c_str());
    std::printf("| Case | Time (us) | baseline (us) | x baseline | Peers: time (us), ours/peer |\n");
    std::printf("|---|---:|---:|---:|---|\n");
    for (const Row& r : rows) {
        const double t = time(r.name), m = time(r.baseline);
        if (t < 0 || m < 0)
            continue;
        std::string peers;
        for (const std::string& p : r.peers)
            if (const double pt = time(p); pt > 0) {
                char cell[160];
                std::snprintf(cell, sizeof cell, "%s%s %.1f, %.2f", peers.empty() ? "" : "; ", peerLabel(p).c_str(), pt, t / pt);
                peers += cell;
            }
        std::printf("| `%s` | %.1f | %.1f | %.2f | %s |\n", r.name.c_str(), t, m, t / m, peers.c_str());
    }
}

} // namespace

void registerCase(const std::string& name, Size size, std::size_t bytes, std::function<Call(Size)> prepare, Baseline baseline)
{
    pending().push_back({name + "/" + sizeTag(size), size, bytes, std::move(prepare), {}, baseline});
}

void registerPeer(const std::string& name, const std::vector<std::string>& ours, Size size, std::size_t bytes,
                  std::function<Call(Size)> prepare)
{
    std::vector<std::string> peerOf;
    for (const std::string& o : ours)
        peerOf.push_back(o + "/" + sizeTag(size));
    pending().push_back({"peer:" + name + "/" + sizeTag(size), size, bytes, std::move(prepare), std::move(peerOf)});
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
    // --zoxcc_markdown (or ZOXCC_MARKDOWN=1) adds the closing table in Markdown; the flag is ours, so it
    // leaves argv before Google Benchmark reads it.
    const char* env = std::getenv("ZOXCC_MARKDOWN");
    bool markdown = env && *env && std::strcmp(env, "0") != 0;
    int kept = 1;
    for (int i = 1; i < argc; ++i)
        if (std::strcmp(argv[i], "--zoxcc_markdown") == 0)
            markdown = true;
        else
            argv[kept++] = argv[i];
    argc = kept;
    argv[argc] = nullptr;

    benchmark::Initialize(&argc, argv);
    if (benchmark::ReportUnrecognizedArguments(argc, argv))
        return 1;
    zb::registerAll();
    const std::string filter = benchmark::GetBenchmarkFilter();
    std::vector<zb::Row> rows;
    try {
        rows = zb::registerSelected(filter);
    } catch (const std::regex_error& e) {
        std::fprintf(stderr, "zoxcc_bench: bad --benchmark_filter '%s': %s\n", filter.c_str(), e.what());
        return 1;
    }
    if (rows.empty()) {
        std::fprintf(stderr, "zoxcc_bench: no case matches --benchmark_filter '%s'\n", filter.c_str());
        return 1;
    }
    zb::Collector collector;
    benchmark::RunSpecifiedBenchmarks(&collector, "."); // the selection is made above
    if (!collector.us.empty())
        zb::printTable(rows, collector.us, markdown);
    benchmark::Shutdown();
    return 0;
}
