// The kernel set a build runs: the choice made at load, and the separation of the sets' code.
#include "frame/byte_table.hpp"
#include "frame/kernel_set.hpp"
#include "support/conv_sweep.hpp"

#include <gtest/gtest.h>

#include <cstdio>
#include <string>

using zox::KernelSet;

TEST(KernelSets, ChoiceFromFeatureWord)
{
    const uint64_t base = zoxCpuSse2 | zoxCpuSse3 | zoxCpuSsse3 | zoxCpuSse41 | zoxCpuSse42;
    struct Row {
        uint64_t word;
        KernelSet want;
    } rows[] = {
        {0, KernelSet::Sse41},
        {base, KernelSet::Sse41},
        {base | zoxCpuAvx, KernelSet::Sse41},
        {base | zoxCpuAvx2, KernelSet::Sse41}, // AVX2 without AVX state is not usable
        {base | zoxCpuAvx | zoxCpuAvx2, KernelSet::Avx2},
        {base | zoxCpuAvx | zoxCpuAvx2 | zoxCpuAvx512f, KernelSet::Avx2},
    };
    for (const Row& r : rows)
        EXPECT_EQ(zox::kernelSetFor(r.word), r.want) << "word " << r.word;
}
TEST(KernelSets, ChosenSetMatchesProcessor)
{
    KernelSet want = zox::kBuiltKernelSet;
    if (zox::kChosenAtLoad)
        want = __builtin_cpu_supports("avx2") ? KernelSet::Avx2 : KernelSet::Sse41;
    EXPECT_EQ(zox::activeKernelSet(), want) << zox::kernelSetName(zox::activeKernelSet());
}

// Every global function that an AVX2 file defines lies in the AVX2 namespace, so that the linker never
// picks an AVX2-compiled copy of an inline function for code that runs on the baseline.
TEST(KernelSets, Avx2CodeStaysInItsNamespace)
{
    if (!zox::kHaveAvx2)
        GTEST_SKIP() << "no AVX2 kernels in this build";
    const std::string cmd = std::string("nm -A --defined-only --format=posix '") + ZT_ARCHIVE_PATH + "'";
    FILE* pipe = popen(cmd.c_str(), "r");
    ASSERT_NE(pipe, nullptr);
    char where[1024], name[4096], type[8];
    int avx2Functions = 0;
    while (std::fscanf(pipe, "%1023s %4095s %7s %*[^\n]", where, name, type) == 3) {
        const std::string file = where, sym = name;
        if (file.find("_avx2.cpp.o") == std::string::npos || (type[0] != 'T' && type[0] != 'W'))
            continue;
        const bool inSet = sym.rfind("_ZN3zox4avx2", 0) == 0 || sym.rfind("_ZNK3zox4avx2", 0) == 0 ||
                           sym.rfind("_ZZN3zox4avx2", 0) == 0;
        EXPECT_TRUE(inSet) << file << ": " << sym;
        ++avx2Functions;
    }
    pclose(pipe);
    EXPECT_GT(avx2Functions, 0);
}

// The byte-shuffle lookup of every kernel set the processor runs against the table itself: every byte
// value at every position of the vector, runs of 0..100 bytes from each of 32 offsets, in place too.
TEST(KernelSets, ByteTableLookup)
{
    uint8_t table[256];
    for (int i = 0; i < 256; ++i)
        table[i] = static_cast<uint8_t>((i * 167 + 13) ^ (i >> 3));
    const zox::ShuffleTable shuffled = zox::shuffleTableOf(table);
    zt::Rng rng(5);
    std::vector<uint8_t> src(256 + 32 + 100), want, got;
    for (std::size_t i = 0; i < src.size(); ++i)
        src[i] = static_cast<uint8_t>(i < 256 ? i : rng());
    for (KernelSet k : zt::runnableKernelSets())
        for (int offset = 0; offset < 32; ++offset)
            for (int n : {0, 1, 15, 16, 17, 31, 32, 33, 63, 64, 65, 100, 256}) {
                const uint8_t* s = src.data() + (n == 256 ? 0 : offset);
                want.assign(n, 0);
                for (int i = 0; i < n; ++i)
                    want[i] = table[s[i]];
                got.assign(s, s + n);
                if constexpr (zox::kHaveAvx2)
                    if (k == KernelSet::Avx2)
                        zox::lookupBytesWith<KernelSet::Avx2>(got.data(), got.data(), n, table, shuffled);
                if constexpr (zox::kHaveSse41)
                    if (k == KernelSet::Sse41)
                        zox::lookupBytesWith<KernelSet::Sse41>(got.data(), got.data(), n, table, shuffled);
                ASSERT_EQ(got, want) << zox::kernelSetName(k) << " offset " << offset << " n " << n;
            }
}
