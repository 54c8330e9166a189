#include <gtest/gtest.h>

#include <cstring>
#include <vector>

#include "zentra_vorlite.h"

namespace {

// Red spans 50..200, green the full range, blue the narrow 100..150. With
// two equal halves a channel's 0.5th percentile is low - 0.99 (0.01 for a
// low of 0) and its 99.5th percentile high - 0.01.
constexpr VorColor kLow = {50, 0, 100, 77};
constexpr VorColor kHigh = {200, 255, 150, 77};

struct TwoLevelImage {
    std::vector<VorColor> pixels;
    VorBitmap bitmap{};
    TwoLevelImage() : pixels(8, kLow) {
        pixels.insert(pixels.end(), 8, kHigh);
        bitmap = {reinterpret_cast<uint8_t*>(pixels.data()), 8, 2};
    }
    bool is(VorColor low, VorColor high) const {
        return std::memcmp(&pixels[0], &low, 4) == 0 && std::memcmp(&pixels[7], &low, 4) == 0 &&
               std::memcmp(&pixels[8], &high, 4) == 0;
    }
};

TEST(AutoColors, StretchesEachChannelByItsOwnPercentilesAndCeiling) {
    // Worked by hand. Red at fade 1: lo 49.01, hi 199.99, so 50 -> 1 -> 2
    // and 200 -> 151 -> 255. A red ceiling of 250 widens the span to
    // 200.99 and 200 ends at 192. At fade 0.5 lo is 24.505, hi 227.495 and
    // the span 227.495 x 0.5 - 24.505 + 250 x 0.5.
    struct Case {
        double fade;
        VorColor ceiling, low_out, high_out;
    } const cases[] = {
        {1.0, {0, 0, 0, 255}, {2, 0, 5, 77}, {255, 255, 255, 77}},
        {1.0, {150, 200, 100, 0}, {2, 0, 5, 77}, {255, 255, 255, 77}},
        {1.0, {250, 0, 0, 255}, {1, 0, 5, 77}, {192, 255, 255, 77}},
        {0.5, {250, 0, 0, 255}, {30, 0, 83, 77}, {208, 255, 167, 77}},
        {0.0, {250, 90, 255, 255}, kLow, kHigh},
    };
    for (const Case& c : cases) {
        TwoLevelImage image;
        VorAutoColorsFadeMaxColor(&image.bitmap, c.fade, &c.ceiling);
        EXPECT_TRUE(image.is(c.low_out, c.high_out)) << c.fade << " " << int(c.ceiling.r);
    }
    TwoLevelImage image;
    VorAutoColors(&image.bitmap);
    EXPECT_TRUE(image.is(cases[0].low_out, cases[0].high_out));
}

TEST(AutoColorsProcessor, CeilingFromColorFadeFromStrengthAndFailureTouchesNothing) {
    VLPLRunOptions options;
    VorEffectInitParams(&options);
    options.strength = 0.5;
    struct Case {
        const char* json;
        int result;
    } const cases[] = {
        {R"({"color": {"r": 250, "g": 0, "b": 0, "a": 255}})", 1},
        {R"({"colour": {"r": 250, "g": 0, "b": 0, "a": 255}})", 0},
        {R"({"color": {"r": 250, "g": 0, "b": 0}})", 0},
        {R"({"color": {"r": 256, "g": 0, "b": 0, "a": 255}})", 0},
        {R"({"color": [250, 0, 0, 255]})", 0},
        {R"([{"r": 250, "g": 0, "b": 0, "a": 255}])", 0},
    };
    for (const Case& c : cases) {
        yajl_val params = yajl_tree_parse(c.json, nullptr, 0);
        TwoLevelImage image;
        EXPECT_EQ(VLPLRunAutoColorsFadeMaxProcessor(params, &image.bitmap, &options), c.result);
        if (c.result) {
            EXPECT_TRUE(image.is({30, 0, 83, 77}, {208, 255, 167, 77}));
        } else {
            EXPECT_TRUE(image.is(kLow, kHigh)) << c.json;
        }
        yajl_tree_free(params);
    }
}

}  // namespace
