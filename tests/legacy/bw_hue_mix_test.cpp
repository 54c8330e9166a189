#include <gtest/gtest.h>

#include <array>
#include <cstdint>
#include <limits>

#include "tests/test_support.h"
#include "zentra_vorlite.h"

namespace {

using vorlite::test::checksum;
using vorlite::test::rgba;
using vorlite::test::run_options;
using vorlite::test::TestBitmap;

VorBWHueWeights weights(float r, float y, float g, float c, float b, float m) {
    VorBWHueWeights w;
    VorLegacyPhotoshopBWSatWeightsSet(&w, r, y, g, c, b, m);
    return w;
}

TEST(BWHueMix, GreyKeepsItsLevelWhateverTheWeights) {
    const VorBWHueWeights w = weights(-200.0f, 300.0f, 0.0f, 150.0f, 20.0f, 80.0f);
    for (int punch : {0, 1}) {
        TestBitmap b(6, 1);
        const uint8_t levels[] = {0, 1, 127, 128, 254, 255};
        for (int i = 0; i < 6; ++i) b.bytes[4 * i] = b.bytes[4 * i + 1] = b.bytes[4 * i + 2] = levels[i];
        b.snapshot();
        VorLegacyPhotoshopBWSat(b.get(), &w, 1.0f, punch);
        for (int i = 0; i < 6; ++i) {
            const VorColor c = b.pixel(i);
            EXPECT_EQ(c.r, c.g);
            EXPECT_EQ(c.g, c.b);
            if (punch == 0) {
                EXPECT_EQ(c.r, levels[i]);
            }
        }
        // The punch curve leaves black and white where they are.
        EXPECT_EQ(b.bytes[0], 0);
        EXPECT_EQ(b.bytes[20], 255);
        EXPECT_TRUE(b.alpha_kept());
    }
}

// Darkest channel plus chroma times the hue's weight, interpolated between
// sector weights.
TEST(BWHueMix, WeightsSetTheGreyOfEachHue) {
    const VorBWHueWeights w = weights(40.0f, 60.0f, 100.0f, 0.0f, 20.0f, 80.0f);
    const struct {
        VorColor in;
        int grey;
    } cases[] = {
        {{255, 0, 0, 42}, 102},      // red x 0.4
        {{255, 255, 0, 42}, 153},    // yellow x 0.6
        {{0, 255, 0, 42}, 255},      // green x 1.0
        {{0, 255, 255, 42}, 0},      // cyan x 0
        {{0, 0, 255, 42}, 51},       // blue x 0.2
        {{255, 0, 255, 42}, 204},    // magenta x 0.8
        {{100, 50, 50, 42}, 70},     // 50 + 50 x 0.4
        {{255, 0, 127, 42}, 153},    // hue 330, halfway from magenta to red: 0.6
    };
    for (const auto& c : cases) {
        TestBitmap b(1, 1, c.in);
        VorLegacyPhotoshopBWSat(b.get(), &w, 1.0f, 0);
        EXPECT_EQ(rgba(b.pixel(0)), (std::array<int, 4>{c.grey, c.grey, c.grey, 42}))
            << int(c.in.r) << "," << int(c.in.g) << "," << int(c.in.b);
    }
    // Raising the reds' weight moves a red pixel and leaves a blue one.
    const VorBWHueWeights brighter_reds = weights(90.0f, 60.0f, 100.0f, 0.0f, 20.0f, 80.0f);
    TestBitmap red(1, 1, VorColor{255, 0, 0, 42}), blue(1, 1, VorColor{0, 0, 255, 42});
    VorLegacyPhotoshopBWSat(red.get(), &brighter_reds, 1.0f, 0);
    VorLegacyPhotoshopBWSat(blue.get(), &brighter_reds, 1.0f, 0);
    EXPECT_EQ(red.bytes[0], 230);
    EXPECT_EQ(blue.bytes[0], 51);
}

TEST(BWHueMix, WeightsClampToTheirRange) {
    const float nan = std::numeric_limits<float>::quiet_NaN();
    const VorBWHueWeights w = weights(1000.0f, -1000.0f, nan, 300.0f, -200.0f, 55.0f);
    const float expected[] = {3.0f, -2.0f, 0.0f, 3.0f, -2.0f, 0.55f};
    for (int i = 0; i < 6; ++i) EXPECT_FLOAT_EQ(w.weight[i], expected[i]) << i;
}

// The amount is the opacity of the grey laid over the photo: 0 keeps it,
// between it agrees with blending the grey one pixel at a time.
TEST(BWHueMix, AmountBlendsTheGreyOverThePhoto) {
    const VorBWHueWeights w = weights(40.0f, 60.0f, 40.0f, 60.0f, 20.0f, 80.0f);
    for (float amount : {0.0f, -1.0f, std::numeric_limits<float>::quiet_NaN()}) {
        TestBitmap b(17, 5);
        VorLegacyPhotoshopBWSat(b.get(), &w, amount, 1);
        EXPECT_TRUE(b.unchanged()) << amount;
    }
    TestBitmap mono(17, 5), half(17, 5);
    VorLegacyPhotoshopBWSat(mono.get(), &w, 1.0f, 0);
    VorLegacyPhotoshopBWSat(half.get(), &w, 0.35f, 0);
    for (std::size_t i = 0; i < 17 * 5; ++i) {
        const VorColor m = mono.pixel(i);
        ASSERT_TRUE(m.r == m.g && m.g == m.b) << i;
        VorColor expected{half.before[4 * i], half.before[4 * i + 1], half.before[4 * i + 2], half.before[4 * i + 3]};
        VorColorBlend(&expected, &m, VOR_BLEND_NORMAL, 0.35f);
        EXPECT_EQ(rgba(half.pixel(i)), rgba(expected)) << i;
    }
    EXPECT_TRUE(half.alpha_kept());
}

TEST(MurmelLooks, DistinctAndLocked) {
    void (*looks[])(VorBitmap*, const VLPLRunOptions*) = {VorLegacyMurmelGrittyPSSat, VorLegacyMurmelBWPSSat,
                                                          VorLegacyMurmelCinematicPSSat};
    const uint32_t expected[] = {2285426018u, 2052732615u, 693060411u};
    uint32_t sums[3];
    for (int i = 0; i < 3; ++i) {
        TestBitmap b(96, 64, 2);
        const VLPLRunOptions o = run_options(1.0, 5);
        looks[i](b.get(), &o);
        sums[i] = checksum(b);
        EXPECT_EQ(sums[i], expected[i]) << i;
        EXPECT_TRUE(b.alpha_kept());
        TestBitmap none(9, 7, 2);
        const VLPLRunOptions off = run_options(0.0, 5);
        looks[i](none.get(), &off);
        EXPECT_TRUE(none.unchanged()) << i;
    }
    EXPECT_NE(sums[0], sums[2]);
}

}  // namespace
