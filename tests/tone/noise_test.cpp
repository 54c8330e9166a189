#include <gtest/gtest.h>

#include <limits>
#include <tuple>

#include "tests/test_support.h"
#include "tone/tone_internal.h"

namespace {

using namespace vorlite::test;

TEST(Grain, IntensityZeroOnlyMakesPixelsOpaque) {
    for (auto grain : {VorBitmapAddNoise, VorBitmapAddChannelIndependentNoise}) {
        TestBitmap b(7, 3, VorColor{10, 200, 255, 42});
        grain(b.get(), 0.0f, 99);
        EXPECT_EQ(b.bytes, TestBitmap(7, 3, VorColor{10, 200, 255, 255}).bytes);
    }
}

TEST(Grain, OffsetIsTheScaledDrawTruncatedAndClamped) {
    // Seeds two steps before a first draw of 0.75 or 0.25: offsets +-25.5 truncate to +-25.
    const std::tuple<uint32_t, VorColor, VorColor> cases[] = {
        {1448202978u, {240, 50, 0, 7}, {255, 75, 25, 255}}, {3595686626u, {100, 50, 0, 7}, {75, 25, 0, 255}}};
    for (const auto& [seed, in, expected] : cases) {
        TestBitmap b(1, 1, in);
        VorBitmapAddNoise(b.get(), 0.2f, seed);
        EXPECT_EQ(rgba(b.pixel(0)), rgba(expected)) << seed;
    }
}

TEST(Grain, ColourGrainDrawsRedGreenBlueInTurn) {
    // Colour pixel p takes monochrome draws 3p, 3p + 1, 3p + 2; grey 128 never clamps.
    TestBitmap mono(12, 1, VorColor{128, 128, 128, 9}), colour(4, 1, VorColor{128, 128, 128, 9});
    VorBitmapAddNoise(mono.get(), 0.5f, 31337);
    VorBitmapAddChannelIndependentNoise(colour.get(), 0.5f, 31337);
    for (size_t p = 0; p < 4; ++p)
        for (size_t c = 0; c < 3; ++c) EXPECT_EQ(colour.bytes[4 * p + c], mono.bytes[4 * (3 * p + c)]);
}

TEST(NoiseProcessor, ScalesIntensityByStrengthSameSeedSamePixelsAndRejectsBadIntensity) {
    TestBitmap a(9, 5), b(9, 5), direct(9, 5);
    EXPECT_EQ(run(VLPLRunNoiseProcessor, R"({"intensity": 0.4})", a.get(), 0.5, 8), 1);
    EXPECT_EQ(run(VLPLRunNoiseProcessor, R"({"intensity": 0.4})", b.get(), 0.5, 8), 1);
    VorBitmapAddNoise(direct.get(), static_cast<float>(0.4 * 0.5), 8);
    EXPECT_EQ(a.bytes, b.bytes);
    EXPECT_EQ(a.bytes, direct.bytes);
    EXPECT_FALSE(a.unchanged());
    for (const char* bad : {"{}", R"({"intensity": "1"})", R"({"intensity": [0.4]})"}) {
        EXPECT_EQ(run(VLPLRunNoiseProcessor, bad, b.get(), 1.0, 8), 0) << bad;
        EXPECT_EQ(b.bytes, a.bytes);
    }
}

}  // namespace

TEST(Grain, LanesReplayTheSerialDrawsExactly) {
    const float intensities[] = {0.1f, 1.0f, -0.37f, 4000.0f, 1e30f, std::numeric_limits<float>::quiet_NaN()};
    const std::pair<uint32_t, uint32_t> sizes[] = {{1, 1}, {7, 1}, {1, 9}, {13, 11}, {97, 61}};
    for (const float intensity : intensities) {
        for (const auto& [w, h] : sizes) {
            for (const uint32_t seed : {0u, 1u, 0xFFFFFFFFu}) {
                vorlite::test::TestBitmap lanes(w, h, seed), reference(w, h, seed);
                vorlite::tone::add_noise(lanes.get(), intensity, seed, true);
                vorlite::tone::add_noise(reference.get(), intensity, seed, false);
                EXPECT_TRUE(lanes == reference) << intensity << " " << w << "x" << h << " " << seed;
                vorlite::test::TestBitmap colour_lanes(w, h, seed), colour_reference(w, h, seed);
                vorlite::tone::add_channel_noise(colour_lanes.get(), intensity, seed, true);
                vorlite::tone::add_channel_noise(colour_reference.get(), intensity, seed, false);
                EXPECT_TRUE(colour_lanes == colour_reference) << intensity << " " << w << "x" << h << " " << seed;
            }
        }
    }
}
