#include <gtest/gtest.h>

#include <algorithm>

#include "tests/test_support.h"

namespace {

using namespace vorlite::test;

// Two equal halves: red spans 50..200, green the full range, blue 100..150.
constexpr VorColor kLow = {50, 0, 100, 77}, kHigh = {200, 255, 150, 77};

TestBitmap two_levels(VorColor low = kLow, VorColor high = kHigh) {
    TestBitmap b(8, 2, low);
    for (size_t i = 8; i < 16; ++i) std::copy(&high.r, &high.r + 4, &b.bytes[4 * i]);
    return b;
}

TEST(AutoColors, StretchesEachChannelByItsOwnPercentilesAndCeiling) {
    const struct { double fade; VorColor ceiling, low_out, high_out; } cases[] = {
        {1.0, {0, 0, 0, 255}, {2, 0, 5, 77}, {255, 255, 255, 77}},
        {1.0, {150, 200, 100, 0}, {2, 0, 5, 77}, {255, 255, 255, 77}},  // ceilings below the top
        {1.0, {250, 0, 0, 255}, {1, 0, 5, 77}, {192, 255, 255, 77}},    // red ceiling above it
        {0.5, {250, 0, 0, 255}, {30, 0, 83, 77}, {208, 255, 167, 77}},
        {0.0, {250, 90, 255, 255}, kLow, kHigh},
    };
    for (const auto& c : cases) {
        TestBitmap b = two_levels();
        VorAutoColorsFadeMaxColor(b.get(), c.fade, &c.ceiling);
        EXPECT_EQ(b.bytes, two_levels(c.low_out, c.high_out).bytes) << c.fade << " " << int(c.ceiling.r);
    }
}

TEST(AutoColorsProcessor, CeilingFromColorFadeFromStrengthAndFailureTouchesNothing) {
    const std::pair<const char*, int> cases[] = {
        {R"({"color": {"r": 250, "g": 0, "b": 0, "a": 255}})", 1},
        {R"({"colour": {"r": 250, "g": 0, "b": 0, "a": 255}})", 0},
        {R"({"color": {"r": 250, "g": 0, "b": 0}})", 0},
        {R"({"color": {"r": 256, "g": 0, "b": 0, "a": 255}})", 0},
        {R"({"color": [250, 0, 0, 255]})", 0},
    };
    for (const auto& [json, result] : cases) {
        TestBitmap b = two_levels();
        EXPECT_EQ(run(VLPLRunAutoColorsFadeMaxProcessor, json, b.get(), 0.5), result) << json;
        EXPECT_EQ(b.bytes, (result ? two_levels({30, 0, 83, 77}, {208, 255, 167, 77}) : two_levels()).bytes) << json;
    }
}

}  // namespace
