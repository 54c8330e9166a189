#include <gtest/gtest.h>

#include <tuple>
#include <vector>

#include "zentra_vorlite.h"

namespace {

// w x h pixels all of colour c; pixel i's channel k is at px[4 * i + k].
struct Filled {
    std::vector<uint8_t> px;
    VorBitmap bitmap;
    Filled(uint32_t w, uint32_t h, std::vector<uint8_t> c) : px(4 * w * h), bitmap{px.data(), w, h} {
        for (size_t i = 0; i < px.size(); ++i) px[i] = c[i % 4];
    }
};

TEST(Grain, IntensityZeroOnlyMakesPixelsOpaque) {
    for (auto grain : {VorBitmapAddNoise, VorBitmapAddChannelIndependentNoise}) {
        Filled f(7, 3, {10, 200, 255, 42});
        grain(&f.bitmap, 0.0f, 99);
        EXPECT_EQ(f.px, Filled(7, 3, {10, 200, 255, 255}).px);
    }
}

TEST(Grain, OffsetIsTheScaledDrawTruncatedAndClamped) {
    // Seeds two steps before a first draw of 0.75 or 0.25: offsets +-25.5 truncate to +-25.
    const std::tuple<uint32_t, std::vector<uint8_t>, std::vector<uint8_t>> cases[] = {
        {1448202978u, {240, 50, 0, 7}, {255, 75, 25, 255}}, {3595686626u, {100, 50, 0, 7}, {75, 25, 0, 255}}};
    for (const auto& [seed, in, expected] : cases) {
        Filled f(1, 1, in);
        VorBitmapAddNoise(&f.bitmap, 0.2f, seed);
        EXPECT_EQ(f.px, expected) << seed;
    }
}

TEST(Grain, ColourGrainDrawsRedGreenBlueInTurn) {
    // Colour pixel p takes monochrome draws 3p, 3p + 1, 3p + 2; grey 128 never clamps.
    Filled mono(12, 1, {128, 128, 128, 9}), colour(4, 1, {128, 128, 128, 9});
    VorBitmapAddNoise(&mono.bitmap, 0.5f, 31337);
    VorBitmapAddChannelIndependentNoise(&colour.bitmap, 0.5f, 31337);
    for (size_t p = 0; p < 4; ++p)
        for (size_t c = 0; c < 3; ++c) EXPECT_EQ(colour.px[4 * p + c], mono.px[4 * (3 * p + c)]);
}

int run_noise(const char* parameters, Filled* f, double strength) {
    yajl_val json = yajl_tree_parse(parameters, nullptr, 0);
    VLPLRunOptions o;
    VorEffectInitParams(&o);
    o.seed = 8, o.strength = strength;
    const int result = VLPLRunNoiseProcessor(json, &f->bitmap, &o);
    yajl_tree_free(json);
    return result;
}

TEST(NoiseProcessor, ScalesIntensityByStrengthAndRejectsBadIntensity) {
    Filled a(9, 5, {60, 120, 180, 3}), b(9, 5, {60, 120, 180, 3}), direct(9, 5, {60, 120, 180, 3});
    EXPECT_EQ(run_noise(R"({"intensity": 0.4})", &a, 0.5), 1);
    EXPECT_EQ(run_noise(R"({"intensity": 0.4})", &b, 0.5), 1);
    VorBitmapAddNoise(&direct.bitmap, static_cast<float>(0.4 * 0.5), 8);
    EXPECT_EQ(a.px, b.px);
    EXPECT_EQ(a.px, direct.px);
    for (const char* bad : {"{}", R"({"intensity": "1"})", R"({"intensity": [0.4]})"}) {
        EXPECT_EQ(run_noise(bad, &b, 1.0), 0) << bad;
        EXPECT_EQ(b.px, a.px);
    }
}

}  // namespace
