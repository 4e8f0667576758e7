// The kernel set a build runs: the choice made at load, and the separation of the sets' code.
#include "core/cpu_features.hpp"
#include "frame/kernel_set.hpp"

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

// The "+" version record (feature 128 of the core services) names exactly the processors that run the
// AVX2 kernels: on made-up registers, the decoded word gives both answers alike.
TEST(KernelSets, PlusRecordMeansAvx2Kernels)
{
    using zox::core::CpuidWords;
    const uint32_t avx = bit_SSE4_1 | bit_OSXSAVE | bit_AVX;
    for (uint32_t ecx : {uint32_t{bit_SSE4_1}, avx, avx & ~bit_OSXSAVE, avx & ~bit_AVX})
        for (uint32_t ebx7 : {0u, uint32_t{bit_AVX2}})
            for (uint64_t xcr0 : {0x3ull, 0x7ull}) {
                const uint64_t word = zox::core::featureWordOf(CpuidWords{ecx, bit_SSE2, ebx7, xcr0});
                EXPECT_EQ(zox::kernelSetFor(word) == KernelSet::Avx2, (word & zoxCpuAvx2) != 0)
                    << std::hex << ecx << " " << ebx7 << " " << xcr0;
            }
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
