// Values that pin the gamma curve: constants, rounding after narrowing, the joint of the two
// segments at each depth, and the 32f range handling.
#include "pointops/gamma_forms.hpp"

#include <gtest/gtest.h>

#include <cmath>
#include <cstdint>

using namespace zox::gamma;

namespace {

// ---- constants ------------------------------------------------------------------------------------

TEST(GammaConstants, InverseGainIsOneUlpBelowTheReciprocal)
{
    EXPECT_EQ(kInvGain, std::nextafter(1.0 / 1.099, 0.0));
}

// ---- rounding: half to even, decided after narrowing to float -------------------------------------

struct RoundCase {
    double v;
    int want;
};

TEST(GammaRounding, HalfToEvenAfterNarrowing)
{
    const RoundCase cases[] = {
        {0.0, 0},
        {-0.2, 0},            // truncation of a positive sum
        {0.5, 0},             // sum 1.0 exact and odd
        {1.5, 2},
        {2.5, 2},
        {4.5, 4},             // sum 5.0 exact and odd
        {4.4, 4},
        {4.6, 5},
        {5.0, 5},             // t odd, but the sum 5.5 is not t
        {4.5 + 1e-9, 4},      // above the half, but the sum narrows onto 5.0
        {4.5 + 1e-6, 5},      // more than half a float ulp above 5.0: stays 5
        {5.5 - 1e-9, 6},      // below the half, but the sum narrows up onto 6.0
        {6.5 - 1e-9, 6},      // narrows onto 7.0, odd: the even integer below
        {65534.5 + 0.001, 65534},  // float ulp at 65535 is 1/256: narrows onto 65535.0
        {65534.5 + 0.003, 65535},  // narrows to 65535.00390625
        {65535.0, 65535},
    };
    for (const auto& c : cases)
        EXPECT_EQ(roundNarrowEven(c.v), c.want) << "v = " << c.v;
}

// ---- the joint: strict comparison, and the foot on the sample value --------------------------------

TEST(GammaCurve, ThresholdComparisonIsStrict)
{
    // At the threshold itself the power segment applies; one ulp below, the linear foot.
    EXPECT_NEAR(curveScaled<Dir::Fwd>(1.0, kFwdThreshold, 1.0), 0.0810, 1e-3);
    EXPECT_EQ(curveScaled<Dir::Fwd>(1.0, std::nextafter(kFwdThreshold, 0.0), 1.0), 4.5);
    EXPECT_NEAR(curveScaled<Dir::Inv>(1.0, kInvThreshold, 1.0), 0.0180, 1e-3);
    EXPECT_EQ(curveScaled<Dir::Inv>(1.0, std::nextafter(kInvThreshold, 0.0), 1.0), kInvSlope);
}

TEST(GammaCurve, LinearFootScalesTheSampleNotTheNormalisedValue)
{
    // s and x deliberately disagree: the foot must ignore x and the scale.
    EXPECT_EQ(curveScaled<Dir::Fwd>(2.0, 0.001, 1000.0), 9.0);
    EXPECT_EQ(curveScaled<Dir::Inv>(9.0, 0.001, 1000.0), 9.0 * kInvSlope);
}

// ---- 8u tables ------------------------------------------------------------------------------------

TEST(Gamma8u, TablesFollowFromTheCurve)
{
    for (int i = 0; i < 256; ++i) {
        EXPECT_EQ(kGammaFwd8u[i], entry8u<Dir::Fwd>(i)) << "forward " << i;
        EXPECT_EQ(kGammaInv8u[i], entry8u<Dir::Inv>(i)) << "inverse " << i;
    }
}

struct Row8 {
    int i;
    int want;
};

TEST(Gamma8u, TellingRows)
{
    const Row8 fwd[] = {{0, 0}, {1, 4}, {2, 9}, {3, 14}, {4, 18}, {5, 23},
                        {6, 27}, {7, 30}, {254, 255}, {255, 255}};
    const Row8 inv[] = {{0, 0}, {1, 0}, {2, 0}, {3, 1}, {252, 249}, {253, 251}, {254, 253}, {255, 255}};
    for (const auto& r : fwd)
        EXPECT_EQ(kGammaFwd8u[r.i], r.want) << "forward " << r.i;
    for (const auto& r : inv)
        EXPECT_EQ(kGammaInv8u[r.i], r.want) << "inverse " << r.i;
}

// ---- 16u ------------------------------------------------------------------------------------------

struct Row16 {
    uint16_t s;
    uint16_t want;
};

TEST(Gamma16u, Forward)
{
    // 1179 / 1180 straddle the joint: the foot ends at 5306, the power segment starts at 5326.
    // 4082 and 7069 land within a float ulp of a half: the narrowing decides, not the double value.
    const Row16 rows[] = {{0, 0},       {1, 4},       {2, 9},         {3, 14},         {1179, 5306},
                          {1180, 5326}, {4082, 14164}, {7069, 19952}, {65535, 65535}};
    for (const auto& r : rows)
        EXPECT_EQ(eval16u<Dir::Fwd>(r.s), r.want) << "s = " << r.s;
}

TEST(Gamma16u, Inverse)
{
    // The inverse falls by 3 across its threshold (0.0812, not the image 0.081 of the forward joint).
    // 12009 (3195.49993) rounds up and 39136 (23760.50085) down, both by the narrowing.
    const Row16 rows[] = {{0, 0},       {1, 0},        {2, 0},         {3, 1},         {5321, 1182},
                          {5322, 1179}, {12009, 3196}, {39136, 23760}, {65535, 65535}};
    for (const auto& r : rows)
        EXPECT_EQ(eval16u<Dir::Inv>(r.s), r.want) << "s = " << r.s;
}

// ---- 32f ------------------------------------------------------------------------------------------

template <Dir D>
float eval32fRange(float s, float lo, float hi)
{
    const float r32 = hi - lo;
    const double r = static_cast<double>(r32);
    return eval32f<D>(s, lo, r32, r, 1.0 / r);
}

// The curve as usually written, in double, with the division by the gain.
double plainFwd(double x)
{
    return x < 0.018 ? 4.5 * x : 1.099 * std::pow(x, 0.45) - 0.099;
}

double plainInv(double x)
{
    return x < 0.0812 ? x / 4.5 : std::pow((x + 0.099) / 1.099, 1.0 / 0.45);
}

TEST(Gamma32f, UnitRangeGivesThePlainCurve)
{
    const float samples[] = {0.0f, 1e-6f, 0.001f, 0.0179f, 0.018f, 0.0181f, 0.05f, 0.0811f,
                             0.0812f, 0.0813f, 0.1f, 0.25f, 0.5f, 0.75f, 0.9f, 0.999f, 1.0f};
    for (float s : samples) {
        EXPECT_EQ(eval32fRange<Dir::Fwd>(s, 0.0f, 1.0f), static_cast<float>(plainFwd(s))) << "fwd " << s;
        EXPECT_EQ(eval32fRange<Dir::Inv>(s, 0.0f, 1.0f), static_cast<float>(plainInv(s))) << "inv " << s;
    }
}

TEST(Gamma32f, RangeEndsMapToThemselves)
{
    const float ranges[][2] = {{0.0f, 1.0f}, {0.0f, 255.0f}, {-3.0f, 5.0f}, {16.0f, 235.0f}};
    for (const auto& rg : ranges) {
        EXPECT_EQ(eval32fRange<Dir::Fwd>(rg[0], rg[0], rg[1]), rg[0]);
        EXPECT_EQ(eval32fRange<Dir::Inv>(rg[0], rg[0], rg[1]), rg[0]);
        EXPECT_FLOAT_EQ(eval32fRange<Dir::Fwd>(rg[1], rg[0], rg[1]), rg[1]);
        EXPECT_FLOAT_EQ(eval32fRange<Dir::Inv>(rg[1], rg[0], rg[1]), rg[1]);
    }
}

TEST(Gamma32f, OutOfRangeSamplesStayOutside)
{
    const float lo = 10.0f, hi = 20.0f;
    // Below the range: negative x, linear foot, result below rangeLow.
    EXPECT_EQ(eval32fRange<Dir::Fwd>(9.0f, lo, hi), 10.0f - 4.5f);
    EXPECT_FLOAT_EQ(eval32fRange<Dir::Inv>(9.0f, lo, hi), static_cast<float>(10.0 - 1.0 / 4.5));
    // Above the range: power segment, result above rangeHigh.
    EXPECT_GT(eval32fRange<Dir::Fwd>(25.0f, lo, hi), hi);
    EXPECT_GT(eval32fRange<Dir::Inv>(25.0f, lo, hi), hi);
    EXPECT_FLOAT_EQ(eval32fRange<Dir::Fwd>(25.0f, lo, hi), static_cast<float>(10.0 + 10.0 * plainFwd(1.5)));
}

}  // namespace
