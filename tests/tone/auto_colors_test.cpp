#include <gtest/gtest.h>

#include <cstring>
#include <vector>

#include "zentra_vorlite.h"

namespace {

// Two equal halves: red spans 50..200, green the full range, blue 100..150.
constexpr VorColor kLow = {50, 0, 100, 77}, kHigh = {200, 255, 150, 77};

struct TwoLevelImage {
    std::vector<VorColor> px{kLow, kLow, kLow, kLow, kLow, kLow, kLow, kLow,
                             kHigh, kHigh, kHigh, kHigh, kHigh, kHigh, kHigh, kHigh};
    VorBitmap bitmap{reinterpret_cast<uint8_t*>(px.data()), 8, 2};
    bool is(VorColor low, VorColor high) const {
        return std::memcmp(&px[0], &low, 4) == 0 && std::memcmp(&px[7], &low, 4) == 0 &&
               std::memcmp(&px[8], &high, 4) == 0;
    }
};

TEST(AutoColors, StretchesEachChannelByItsOwnPercentilesAndCeiling) {
    const struct { double fade; VorColor ceiling, low_out, high_out; } cases[] = {
        {1.0, {0, 0, 0, 255}, {2, 0, 5, 77}, {255, 255, 255, 77}},
        {1.0, {150, 200, 100, 0}, {2, 0, 5, 77}, {255, 255, 255, 77}},  // ceilings below the top
        {1.0, {250, 0, 0, 255}, {1, 0, 5, 77}, {192, 255, 255, 77}},    // red ceiling above it
        {0.5, {250, 0, 0, 255}, {30, 0, 83, 77}, {208, 255, 167, 77}},
        {0.0, {250, 90, 255, 255}, kLow, kHigh},
    };
    for (const auto& c : cases) {
        TwoLevelImage image;
        VorAutoColorsFadeMaxColor(&image.bitmap, c.fade, &c.ceiling);
        EXPECT_TRUE(image.is(c.low_out, c.high_out)) << c.fade << " " << int(c.ceiling.r);
    }
}

TEST(AutoColorsProcessor, CeilingFromColorFadeFromStrengthAndFailureTouchesNothing) {
    VLPLRunOptions options;
    VorEffectInitParams(&options);
    options.strength = 0.5;
    const std::pair<const char*, int> cases[] = {
        {R"({"color": {"r": 250, "g": 0, "b": 0, "a": 255}})", 1},
        {R"({"colour": {"r": 250, "g": 0, "b": 0, "a": 255}})", 0},
        {R"({"color": {"r": 250, "g": 0, "b": 0}})", 0},
        {R"({"color": {"r": 256, "g": 0, "b": 0, "a": 255}})", 0},
        {R"({"color": [250, 0, 0, 255]})", 0},
    };
    for (const auto& [json, result] : cases) {
        yajl_val params = yajl_tree_parse(json, nullptr, 0);
        TwoLevelImage image;
        EXPECT_EQ(VLPLRunAutoColorsFadeMaxProcessor(params, &image.bitmap, &options), result);
        EXPECT_TRUE(result ? image.is({30, 0, 83, 77}, {208, 255, 167, 77}) : image.is(kLow, kHigh)) << json;
        yajl_tree_free(params);
    }
}

}  // namespace
