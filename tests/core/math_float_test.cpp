#include <gtest/gtest.h>

#include <bit>
#include <cfenv>
#include <cstdint>
#include <cstdio>
#include <span>
#include <string>
#include <vector>

#include "tests/core/math_float_cases.h"

namespace {

using namespace vorlite::test::mathf;

float bits_float(std::uint32_t b) { return std::bit_cast<float>(b); }
std::uint32_t float_word(float f) { return std::bit_cast<std::uint32_t>(f); }

std::string describe(Fn fn, Pair args) {
    char text[64];
    if (fn == Fn::pow) {
        std::snprintf(text, sizeof text, "powf(0x%08X, 0x%08X)", args.x, args.y);
    } else {
        std::snprintf(text, sizeof text, "%s(0x%08X)", name(fn), args.x);
    }
    return text;
}

const std::span<const Case> k_tables[] = {k_known, k_special};

void expect_cases(std::span<const Case> cases) {
    for (const Case& c : cases) {
        const std::uint32_t got = float_word(ours(c.fn, bits_float(c.x), bits_float(c.y)));
        EXPECT_EQ(got, c.expected) << describe(c.fn, {c.x, c.y}) << std::hex << " gave 0x" << got
                                   << ", the reference 0x" << c.expected;
    }
}

#define SKIP_UNLESS_REFERENCE_LIBRARY()                                                \
    do {                                                                               \
        const char* problem = reference_library_problem();                            \
        if (*problem) GTEST_SKIP() << "no comparison with the C library: " << problem; \
    } while (0)

// Compares ours with the running C library on each argument, reporting the
// first few disagreements and the count.
template <typename Arguments>
void expect_reference_agreement(Fn fn, std::uint64_t count, Arguments&& arguments) {
    std::uint64_t differences = 0;
    for (std::uint64_t i = 0; i < count; ++i) {
        const Pair args = arguments(i);
        const float x = bits_float(args.x), y = bits_float(args.y);
        const std::uint32_t mine = float_word(ours(fn, x, y));
        const std::uint32_t theirs = float_word(libc(fn, x, y));
        if (agrees_with_reference(fn, args, mine, theirs)) continue;
        if (++differences <= 5) {
            ADD_FAILURE() << describe(fn, args) << std::hex << ": ours 0x" << mine << ", C library 0x"
                          << theirs;
        }
    }
    EXPECT_EQ(differences, 0u) << name(fn) << ": of " << count << " arguments";
}

TEST(ElementaryFunctions, ArgumentsWhereCLibrariesDisagreeGiveTheReferenceBits) {
    expect_cases(k_known);
}

TEST(ElementaryFunctions, SpecialValuesAndRangeEdgesGiveTheReferenceBits) {
    expect_cases(k_special);
}

std::string function_name(const testing::TestParamInfo<Fn>& info) { return name(info.param); }

// The checksums pin our results over the sample; the musl build of
// scripts/check_math.cpp and the 32-bit ARM suite hold the same values.
class SampleChecksum : public testing::TestWithParam<Fn> {};

TEST_P(SampleChecksum, IsTheSameOnEveryBuild) {
    EXPECT_EQ(sample_checksum(GetParam()), golden_checksum(GetParam())) << std::hex;
}

INSTANTIATE_TEST_SUITE_P(ElementaryFunctions, SampleChecksum, testing::ValuesIn(k_functions), function_name);

// Traps on these exceptions may be enabled around the library; a special
// value must come from bits, not from an operation that overflows or
// divides by zero. (Underflow and inexact are the ordinary results of
// tiny and rounded values.)
TEST(ElementaryFunctions, NoArgumentRaisesInvalidDivideByZeroOrOverflow) {
    std::feclearexcept(FE_ALL_EXCEPT);
    for (const auto table : k_tables) {
        for (const Case& c : table) ours(c.fn, bits_float(c.x), bits_float(c.y));
    }
    for (const Fn fn : k_functions) {
        for (std::uint32_t i = 0; i < (1u << 18); ++i) {
            const Pair p = sample(fn, i);
            ours(fn, bits_float(p.x), bits_float(p.y));
        }
    }
    EXPECT_EQ(std::fetestexcept(FE_INVALID), 0);
    EXPECT_EQ(std::fetestexcept(FE_DIVBYZERO), 0);
    EXPECT_EQ(std::fetestexcept(FE_OVERFLOW), 0);
    // The flags are observable here (an emulator might not keep them).
    volatile float big = 0x1p100f;
    big = big * big;
    EXPECT_NE(std::fetestexcept(FE_OVERFLOW), 0);
}

TEST(ElementaryFunctionsOnTheReference, TablesHoldForTheRunningLibrary) {
    SKIP_UNLESS_REFERENCE_LIBRARY();
    for (const auto table : k_tables) {
        for (const Case& c : table) {
            const std::uint32_t theirs = float_word(libc(c.fn, bits_float(c.x), bits_float(c.y)));
            EXPECT_TRUE(agrees_with_reference(c.fn, {c.x, c.y}, c.expected, theirs))
                << describe(c.fn, {c.x, c.y}) << std::hex << ": table 0x" << c.expected << ", C library 0x"
                << theirs;
        }
    }
}

class SampleAgainstReference : public testing::TestWithParam<Fn> {};

TEST_P(SampleAgainstReference, EveryResultMatchesTheCLibrary) {
    SKIP_UNLESS_REFERENCE_LIBRARY();
    const Fn fn = GetParam();
    expect_reference_agreement(fn, k_sample_size, [fn](std::uint64_t i) {
        return sample(fn, static_cast<std::uint32_t>(i));
    });
}

INSTANTIATE_TEST_SUITE_P(ElementaryFunctionsOnTheReference, SampleAgainstReference,
                         testing::ValuesIn(k_functions), function_name);

// Every stride-th float base from lo to hi (bit patterns) with one exponent:
// the constant exponents of the library over the bases it can pass them.
// scripts/check_math.sh runs the same ranges at stride 1.
TEST(ElementaryFunctionsOnTheReference, PowMatchesOverTheLibrarysConstantExponents) {
    SKIP_UNLESS_REFERENCE_LIBRARY();
    struct Sweep {
        float exponent;
        std::uint32_t lo, hi, stride;
    };
    const Sweep sweeps[] = {
        {2.4f, 0x3D800000, 0x3F800000, 32},         // sRGB linearisation, bases 1/16..1
        {0.33333334f, 0x3C000000, 0x40000000, 32},  // L*a*b* cube root, 1/128..2
        {0.8f, 0x00000000, 0x43800000, 512},        // enhance gains, ratios 0..256
        {0.65f, 0x3F800000, 0x43800000, 32},        // enhance gains above 1
        {0.5f, 0x00000000, 0x43800000, 512},        // enhance gain at level 0
        {0.33f, 0x3F800000, 0x43800000, 32},        // clarity gains above 1
        {2.2f, 0x3B000000, 0x3F800000, 32},         // enhance shade, 1/512..1
    };
    for (const Sweep& s : sweeps) {
        const std::uint32_t y = float_word(s.exponent);
        expect_reference_agreement(Fn::pow, (s.hi - s.lo) / s.stride + 1, [&](std::uint64_t i) {
            return Pair{s.lo + static_cast<std::uint32_t>(i) * s.stride, y};
        });
    }
}

// Curves raise the levels i/255 and i/127 to exponents from effect
// documents, and enhance raises ratios to 0.5 shade^2.2 per level.
TEST(ElementaryFunctionsOnTheReference, PowMatchesOnCurveLevelsAndPerLevelExponents) {
    SKIP_UNLESS_REFERENCE_LIBRARY();
    std::vector<std::uint32_t> levels;
    for (int i = 0; i < 256; ++i) levels.push_back(float_word(static_cast<float>(i) * (1.0f / 255.0f)));
    for (int i = 0; i < 128; ++i) levels.push_back(float_word(static_cast<float>(i) * (1.0f / 127.0f)));
    // Exponents 1/128..128, every 2^14-th float.
    constexpr std::uint32_t lo = 0x3C000000, step = 1u << 14, exponents = (0x43000000 - lo) / step + 1;
    expect_reference_agreement(Fn::pow, levels.size() * exponents, [&](std::uint64_t i) {
        return Pair{levels[i % levels.size()], lo + static_cast<std::uint32_t>(i / levels.size()) * step};
    });

    std::vector<std::uint32_t> per_level;
    for (int level = 0; level < 256; ++level) {
        const float shade = 1.0f - static_cast<float>(level) * (1.0f / 255.0f);
        per_level.push_back(float_word(0.5f * vorlite::core::powf(shade, 2.2f)));
    }
    // Ratios 1/256..256, every 2^13-th float.
    constexpr std::uint32_t ratio_lo = 0x3B800000, ratio_step = 1u << 13;
    constexpr std::uint32_t ratios = (0x43800000 - ratio_lo) / ratio_step + 1;
    expect_reference_agreement(Fn::pow, per_level.size() * ratios, [&](std::uint64_t i) {
        return Pair{ratio_lo + static_cast<std::uint32_t>(i / per_level.size()) * ratio_step,
                    per_level[i % per_level.size()]};
    });
}

}  // namespace
