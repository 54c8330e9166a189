#include <gtest/gtest.h>

#include <algorithm>
#include <array>
#include <vector>

#include "zentra_vorlite.h"

namespace {

// One pixel per level: red = blue = level, green = 255 - level, alpha distinctive.
struct Ramp {
    std::vector<uint8_t> bytes = std::vector<uint8_t>(256 * 4);
    VorBitmap bitmap{bytes.data(), 16, 16};
    Ramp() {
        for (int i = 0; i < 256; ++i) {
            const uint8_t pixel[4] = {static_cast<uint8_t>(i), static_cast<uint8_t>(255 - i),
                                      static_cast<uint8_t>(i), static_cast<uint8_t>(i * 13 + 5)};
            std::copy(pixel, pixel + 4, &bytes[4 * i]);
        }
    }
};

// The curve as seen through all three channels, which must agree, with alpha kept.
std::array<int, 256> curve(void (*apply)(VorBitmap*, float), float value) {
    Ramp r;
    apply(&r.bitmap, value);
    std::array<int, 256> out{};
    for (int i = 0; i < 256; ++i) {
        out[i] = r.bytes[4 * i];
        EXPECT_EQ(r.bytes[4 * (255 - i) + 1], out[i]) << "green at level " << i;
        EXPECT_EQ(r.bytes[4 * i + 2], out[i]) << "blue at level " << i;
        EXPECT_EQ(r.bytes[4 * i + 3], static_cast<uint8_t>(i * 13 + 5)) << "alpha";
    }
    return out;
}

TEST(ToneCurves, WorkedLevelsAndEnds) {
    const auto unit = curve(VorBitmapContrastCurve, 1.0f);  // upper half one level low
    for (int i = 0; i < 256; ++i) EXPECT_EQ(unit[i], i <= 127 ? i : i - 1) << i;
    const auto gamma_unit = curve(VorBitmapGamma, 1.0f);
    for (int i = 0; i < 256; ++i) EXPECT_EQ(gamma_unit[i], i);
    for (int level : curve(VorBitmapGamma, 0.0f)) EXPECT_EQ(level, 255);
    const struct {
        void (*apply)(VorBitmap*, float);
        float value;
        int level, expected;
    } cases[] = {
        {VorBitmapContrastCurve, 2.0f, 64, 32}, {VorBitmapContrastCurve, 2.0f, 191, 216},
        {VorBitmapGamma, 2.0f, 128, 64},        {VorBitmapGamma, 0.5f, 64, 128},
        {VorBitmapGamma, -1.0f, 0, 255},  // an infinite power clamps to white
    };
    for (const auto& c : cases) EXPECT_EQ(curve(c.apply, c.value)[c.level], c.expected) << c.value << " " << c.level;
}

using Adapter = int (*)(const yajl_val, VorBitmap*, const VLPLRunOptions*);
const std::pair<Adapter, void (*)(VorBitmap*, float)> kProcessors[] = {
    {VLPLRunContrastProcessor, VorBitmapContrastCurve}, {VLPLRunGammaProcessor, VorBitmapGamma}};

TEST(CurveProcessors, StrengthPullsTheExponentTowardOneAndBadValuesFail) {
    yajl_val three = yajl_tree_parse(R"({"value": 3})", nullptr, 0);
    VLPLRunOptions o;
    VorEffectInitParams(&o);
    for (const auto& [adapter, apply] : kProcessors) {
        for (const auto& [strength, exponent] : {std::pair{1.0, 3.0f}, std::pair{0.5, 2.0f}, std::pair{0.0, 1.0f}}) {
            Ramp got, expected;
            o.strength = strength;
            ASSERT_EQ(adapter(three, &got.bitmap, &o), 1);
            apply(&expected.bitmap, exponent);
            EXPECT_EQ(got.bytes, expected.bytes) << strength;
        }
        // Infinite or negative exponents saturate without undefined conversions.
        for (const auto& [text, ok] : {std::pair{R"({})", 0}, std::pair{R"({"value": "2"})", 0},
                                       std::pair{R"({"value": null})", 0}, std::pair{R"([2])", 0},
                                       std::pair{R"({"value": 1e999})", 1}, std::pair{R"({"value": -1e999})", 1},
                                       std::pair{R"({"value": -5})", 1}}) {
            yajl_val j = yajl_tree_parse(text, nullptr, 0);
            Ramp r;
            EXPECT_EQ(adapter(j, &r.bitmap, &o), ok) << text;
            EXPECT_TRUE(ok || r.bytes == Ramp().bytes) << text;
            yajl_tree_free(j);
        }
    }
    yajl_tree_free(three);
}

}  // namespace
