#include <gtest/gtest.h>

#include <cstdint>
#include <cstring>
#include <memory>

#include "zentra_vorlite.h"

namespace {

VorColor grey(int v, int alpha = 255) {
    const auto b = static_cast<uint8_t>(v);
    return VorColor{b, b, b, static_cast<uint8_t>(alpha)};
}

// The blended grey level; the destination's alpha must survive every mode.
int blend_level(uint32_t mode, int b, int s, float opacity) {
    VorColor dst = grey(b, 42);
    const VorColor src = grey(s);
    VorColorBlend(&dst, &src, mode, opacity);
    EXPECT_EQ(dst.a, 42) << "mode " << mode;
    return dst.r;
}

TEST(BlendModes, WorkedChannels) {
    // (mode, B, S, opacity) -> level
    const float cases[][5] = {
        {VOR_BLEND_NORMAL, 10, 200, 1, 200},  {VOR_BLEND_NORMAL, 0, 255, 0.5f, 128},
        {VOR_BLEND_DARKEN, 101, 0, 0.5f, 51}, {VOR_BLEND_SOFT_LIGHT, 255, 255, 1, 254},  // divides by 256, truncates
        {VOR_BLEND_OVERLAY, 128, 0, 1, 0},    {VOR_BLEND_OVERLAY, 129, 0, 1, 3},  // multiplies up to 128, then screens
        {VOR_BLEND_NORMAL, 0, 255, 3, 255},   {VOR_BLEND_NORMAL, 255, 0, 3, 0},  // opacity unclamped, result clamped
    };
    for (const auto& c : cases) {
        EXPECT_EQ(blend_level(uint32_t(c[0]), int(c[1]), int(c[2]), c[3]), c[4]) << c[0] << " B " << c[1];
    }
    // Neutral sources and opacity 0 keep every level (the +0.5 turns B + 0.5 back into B).
    const float neutral[][3] = {{VOR_BLEND_MULTIPLY, 255, 1}, {VOR_BLEND_SCREEN, 0, 1}, {VOR_BLEND_SOFT_LIGHT, 200, 0}};
    for (const auto& c : neutral) {
        for (int b = 0; b < 256; ++b) ASSERT_EQ(blend_level(uint32_t(c[0]), b, int(c[1]), c[2]), b) << c[0] << " " << b;
    }
}

TEST(ColorMode, UnsaturatedSourceGivesGreyLuminanceAndMatchesPrecomputedPath) {
    // (200, 100, 50) has a luminance of 117.66 levels; a grey source, or any
    // colour at alpha 0, carries no saturation.
    for (const VorColor& src : {grey(30), VorColor{255, 0, 0, 0}}) {
        VorColor dst{200, 100, 50, 9};
        VorColorBlend(&dst, &src, VOR_BLEND_COLOR, 1.0f);
        EXPECT_TRUE(dst.r == 118 && dst.g == 118 && dst.b == 118 && dst.a == 9);
    }
    const VorColor src{20, 200, 90, 128};
    float hsl[3];
    VorColorRGB2HSL(&src, hsl);
    for (uint32_t i = 0; i < (1u << 24); i += 65537) {
        VorColor direct{uint8_t(i), uint8_t(i >> 8), uint8_t(i >> 16), 77}, precomputed = direct;
        VorColorBlend(&direct, &src, VOR_BLEND_COLOR, 0.7f);
        VorColorBlendColorMode(&precomputed, hsl, src.a, 0.7f);
        ASSERT_EQ(0, std::memcmp(&direct, &precomputed, 4)) << i;
    }
}

// The maps are built from grey destinations, so they reproduce the direct
// blend on greys in every mode, and on any colour in all modes but colour.
TEST(MemoizedBlend, MatchesDirectBlendAndFillsEachLevelOnce) {
    auto table = std::make_unique<VorColorBlendMemoTable>();
    const VorColor src{230, 90, 17, 200};
    for (uint32_t mode = 0; mode <= 6; ++mode) {
        VorColorBlendInitMemozied(table.get(), mode);
        for (uint32_t level : {0u, 100u, 255u}) {
            for (int v = 0; v < 256; ++v) {
                const VorColor colour{uint8_t(v), uint8_t(~v), uint8_t(v * 7), 33};
                VorColor direct = mode == VOR_BLEND_COLOR ? grey(v, 33) : colour;
                VorColor memoized = direct;
                VorColorBlend(&direct, &src, mode, static_cast<float>(level) * (1.0f / 255.0f));
                VorColorBlendMemoized(&memoized, &src, level, table.get());
                ASSERT_EQ(0, std::memcmp(&direct, &memoized, 4)) << mode << " " << level << " " << v;
            }
        }
    }
    // The source is not part of the key: a filled level keeps its maps until reinitialised.
    const VorColor white = grey(255), black = grey(0);
    VorColorBlendInitMemozied(table.get(), VOR_BLEND_NORMAL);
    VorColor dst = grey(0);
    VorColorBlendMemoized(&dst, &white, 255, table.get());
    for (int level = 0; level < 256; ++level) EXPECT_EQ(table->computed[level], level == 255);
    VorColorBlendMemoized(&dst, &black, 255, table.get());
    EXPECT_EQ(dst.r, 255);
    VorColorBlendInitMemozied(table.get(), VOR_BLEND_NORMAL);
    VorColorBlendMemoized(&dst, &black, 255, table.get());
    EXPECT_EQ(dst.r, 0);
}

}  // namespace
