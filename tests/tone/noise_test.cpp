#include <gtest/gtest.h>

#include <string>
#include <vector>

#include "zentra_vorlite.h"

namespace {

// Every pixel starts as one colour; pixel i's channel c is at [4 * i + c].
struct Filled {
    std::vector<uint8_t> px;
    VorBitmap bitmap;
    Filled(uint32_t w, uint32_t h, std::vector<uint8_t> c) : bitmap{nullptr, w, h} {
        px.resize(static_cast<std::size_t>(w) * h * c.size());
        for (std::size_t i = 0; i < px.size(); ++i) px[i] = c[i % c.size()];
        bitmap.data = px.data();
    }
};

TEST(Grain, IntensityZeroOnlyMakesPixelsOpaque) {
    for (auto grain : {VorBitmapAddNoise, VorBitmapAddChannelIndependentNoise}) {
        Filled f(7, 3, {10, 200, 255, 42});
        grain(&f.bitmap, 0.0f, 99);
        EXPECT_EQ(f.px, Filled(7, 3, {10, 200, 255, 255}).px);
    }
}

TEST(Grain, OffsetIsTheScaledUniformDrawTruncated) {
    // Seeds two steps before a first pixel draw of 0.75 or 0.25: offsets of
    // +-(0.5 * 0.2 * 255) = +-25.5 truncate to +-25.
    const std::pair<uint32_t, std::vector<uint8_t>> cases[] = {{1448202978u, {125, 75, 25, 255}},
                                                               {3595686626u, {75, 25, 0, 255}}};
    for (const auto& [seed, expected] : cases) {
        Filled f(1, 1, {100, 50, 0, 7});
        VorBitmapAddNoise(&f.bitmap, 0.2f, seed);
        EXPECT_EQ(f.px, expected) << seed;
    }
}

TEST(Grain, FullIntensitySaturatesBothEndsAlike) {
    Filled f(64, 64, {128, 128, 128, 0});
    VorBitmapAddNoise(&f.bitmap, 1.0f, 5);
    int ends[2] = {0, 0};
    for (size_t i = 0; i < f.px.size(); i += 4) {
        ASSERT_TRUE(f.px[i] == f.px[i + 1] && f.px[i] == f.px[i + 2]);  // monochrome
        if (f.px[i] == 0 || f.px[i] == 255) ++ends[f.px[i] / 255];
    }
    EXPECT_GT(ends[0], 800);
    EXPECT_GT(ends[1], 800);
}

TEST(Grain, ColourGrainDrawsRedGreenBlueInTurn) {
    // Colour pixel p takes monochrome draws 3p, 3p + 1, 3p + 2; half
    // intensity on grey 128 never clamps.
    Filled mono(12, 1, {128, 128, 128, 9}), colour(4, 1, {128, 128, 128, 9});
    VorBitmapAddNoise(&mono.bitmap, 0.5f, 31337);
    VorBitmapAddChannelIndependentNoise(&colour.bitmap, 0.5f, 31337);
    for (size_t p = 0; p < 4; ++p)
        for (size_t c = 0; c < 3; ++c) EXPECT_EQ(colour.px[4 * p + c], mono.px[4 * (3 * p + c)]);
}

int run_noise(const char* parameters, Filled* f, double strength) {
    const std::string json = std::string(R"({"identifier": "n", "processors": [{"name": "noise",)") +
                             R"("parameters": )" + parameters + "}]}";
    VLPLEffectDocument* doc = VLPLLoadEffect(json.c_str());
    VLPLRunOptions o;
    VorEffectInitParams(&o);
    o.seed = 8;
    o.strength = strength;
    const int result = VLPLRunEffect(doc, &f->bitmap, &o);
    VLPLUnloadEffect(&doc);
    return result;
}

TEST(NoiseProcessor, ScalesIntensityByStrengthAndRejectsBadIntensity) {
    Filled a(9, 5, {60, 120, 180, 3}), b(9, 5, {60, 120, 180, 3}), direct(9, 5, {60, 120, 180, 3});
    EXPECT_EQ(run_noise(R"({"intensity": 0.4})", &a, 0.5), 1);
    EXPECT_EQ(run_noise(R"({"intensity": 0.4})", &b, 0.5), 1);
    VorBitmapAddNoise(&direct.bitmap, static_cast<float>(0.4 * 0.5), 8);
    EXPECT_EQ(a.px, b.px);
    EXPECT_EQ(a.px, direct.px);
    for (const char* bad : {"{}", R"({"intensity": "1"})"}) {
        EXPECT_EQ(run_noise(bad, &b, 1.0), 0) << bad;
        EXPECT_EQ(b.px, a.px);
    }
    EXPECT_EQ(run_noise(R"({"intensity": -1e999})", &b, 1e300), 1);
    EXPECT_EQ(run_noise(R"({"intensity": 1e999})", &b, 0.0), 1);  // infinity times 0
}

}  // namespace
