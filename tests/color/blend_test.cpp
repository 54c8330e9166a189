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

int blend_level(uint32_t mode, int b, int s, float opacity) {
    VorColor dst = grey(b);
    const VorColor src = grey(s);
    VorColorBlend(&dst, &src, mode, opacity);
    return dst.r;
}

TEST(BlendModes, WorkedChannels) {
    const struct {
        uint32_t mode;
        int b, s;
        float opacity;
        int expected;
    } cases[] = {
        {VOR_BLEND_NORMAL, 10, 200, 1.0f, 200},  // 200.5 truncated
        {VOR_BLEND_NORMAL, 0, 255, 0.5f, 128},   // 127.5 + 0.5
        {VOR_BLEND_DARKEN, 101, 0, 0.5f, 51},    // 50.5 + 0.5
        // A black source multiplies at 128 and screens from 129.
        {VOR_BLEND_OVERLAY, 128, 0, 1.0f, 0},
        {VOR_BLEND_OVERLAY, 129, 0, 1.0f, 3},
        // Soft light divides by 256: white over white loses a level, and
        // without a rounding offset 254.5 stays 254.
        {VOR_BLEND_SOFT_LIGHT, 128, 128, 1.0f, 128},
        {VOR_BLEND_SOFT_LIGHT, 255, 255, 1.0f, 254},
        {VOR_BLEND_SOFT_LIGHT, 255, 255, 0.5f, 254},
        // Opacity is not clamped; the result is.
        {VOR_BLEND_NORMAL, 0, 255, 3.0f, 255},
        {VOR_BLEND_NORMAL, 255, 0, 3.0f, 0},
    };
    for (const auto& c : cases) {
        EXPECT_EQ(blend_level(c.mode, c.b, c.s, c.opacity), c.expected)
            << "mode " << c.mode << " B " << c.b << " S " << c.s;
    }
}

// The rounding offset must turn B + 0.5 back into B at every level.
TEST(BlendModes, NeutralSourcesKeepEveryLevel) {
    const struct {
        uint32_t mode;
        int s;
        float opacity;
    } cases[] = {
        {VOR_BLEND_MULTIPLY, 255, 1.0f}, {VOR_BLEND_SCREEN, 0, 1.0f},
        {VOR_BLEND_DARKEN, 255, 1.0f},   {VOR_BLEND_NORMAL, 77, 0.0f},
        {VOR_BLEND_OVERLAY, 13, 0.0f},   {VOR_BLEND_SOFT_LIGHT, 200, 0.0f},
    };
    for (const auto& c : cases) {
        for (int b = 0; b < 256; ++b)
            ASSERT_EQ(blend_level(c.mode, b, c.s, c.opacity), b) << c.mode << " " << b;
    }
}

TEST(BlendModes, DestinationAlphaIsNeverWritten) {
    const VorColor src{250, 40, 90, 0};
    for (uint32_t mode = 0; mode <= 7; ++mode) {
        VorColor dst{30, 140, 220, 42};
        VorColorBlend(&dst, &src, mode, 0.6f);
        EXPECT_EQ(dst.a, 42) << mode;
    }
}

TEST(ColorMode, UnsaturatedSourceLeavesTheLuminanceGrey) {
    // (200, 100, 50) has a luminance of 117.66 levels; a grey source, or any
    // colour at alpha 0, carries no saturation.
    for (const VorColor& src : {grey(30), VorColor{255, 0, 0, 0}}) {
        VorColor dst{200, 100, 50, 9};
        VorColorBlend(&dst, &src, VOR_BLEND_COLOR, 1.0f);
        EXPECT_TRUE(dst.r == 118 && dst.g == 118 && dst.b == 118 && dst.a == 9);
    }
}

TEST(ColorMode, PrecomputedSourceMatchesDirectBlend) {
    for (const VorColor& src : {VorColor{255, 0, 0, 255}, VorColor{20, 200, 90, 128}}) {
        float hsl[3];
        VorColorRGB2HSL(&src, hsl);
        for (float op : {0.0f, 0.25f, 0.7f, 1.0f}) {
            for (uint32_t i = 0; i < (1u << 24); i += 65537) {
                VorColor direct{static_cast<uint8_t>(i), static_cast<uint8_t>(i >> 8),
                                static_cast<uint8_t>(i >> 16), 77};
                VorColor precomputed = direct;
                VorColorBlend(&direct, &src, VOR_BLEND_COLOR, op);
                VorColorBlendColorMode(&precomputed, hsl, src.a, op);
                ASSERT_EQ(0, std::memcmp(&direct, &precomputed, 4)) << i;
            }
        }
    }
}

// The maps are built from grey destinations, so they reproduce the direct
// blend on greys in every mode, and on any colour in the modes whose
// channels are independent (all but colour).
TEST(MemoizedBlend, MatchesDirectBlend) {
    auto table = std::make_unique<VorColorBlendMemoTable>();
    const VorColor src{230, 90, 17, 200};
    for (uint32_t mode = 0; mode <= 6; ++mode) {
        VorColorBlendInitMemozied(table.get(), mode);
        for (uint32_t level : {0u, 1u, 100u, 254u, 255u}) {
            for (int v = 0; v < 256; ++v) {
                VorColor direct = grey(v, 33);
                if (mode != VOR_BLEND_COLOR)
                    direct = VorColor{direct.r, uint8_t(255 - v), uint8_t(v * 7), 33};
                VorColor memoized = direct;
                VorColorBlend(&direct, &src, mode, static_cast<float>(level) * (1.0f / 255.0f));
                VorColorBlendMemoized(&memoized, &src, level, table.get());
                ASSERT_EQ(0, std::memcmp(&direct, &memoized, 4))
                    << mode << " " << level << " " << v;
            }
        }
    }
}

TEST(MemoizedBlend, LevelsFillOnceUntilReinitialised) {
    auto table = std::make_unique<VorColorBlendMemoTable>();
    const VorColor white = grey(255);
    const VorColor black = grey(0);
    VorColorBlendInitMemozied(table.get(), VOR_BLEND_NORMAL);
    VorColor dst = grey(0);
    VorColorBlendMemoized(&dst, &white, 255, table.get());
    EXPECT_EQ(dst.r, 255);
    for (int level = 0; level < 256; ++level) EXPECT_EQ(table->computed[level], level == 255);
    // The source is not part of the key, and levels beyond 255 read the
    // full-opacity maps: both still paint the stored white.
    for (uint32_t level : {255u, 4000u}) {
        dst = grey(0);
        VorColorBlendMemoized(&dst, &black, level, table.get());
        EXPECT_EQ(dst.r, 255);
    }
    VorColorBlendInitMemozied(table.get(), VOR_BLEND_NORMAL);
    dst = grey(40);
    VorColorBlendMemoized(&dst, &black, 255, table.get());
    EXPECT_EQ(dst.r, 0);
}

}  // namespace
