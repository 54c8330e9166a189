#include <gtest/gtest.h>

#include <array>

#include "tests/test_support.h"

namespace {

using namespace vorlite::test;

using Curve = void (*)(VorBitmap*, float);

// One pixel per level: red = blue = level, green = 255 - level, alpha 42.
TestBitmap ramp() {
    TestBitmap b(16, 16);
    for (int i = 0; i < 256; ++i) b.bytes[4 * i] = b.bytes[4 * i + 2] = i, b.bytes[4 * i + 1] = 255 - i;
    b.snapshot();
    return b;
}

// The curve as seen through all three channels, which must agree, with alpha kept.
std::array<int, 256> curve(const TestBitmap& b) {
    std::array<int, 256> out{};
    for (int i = 0; i < 256; ++i) {
        out[i] = b.bytes[4 * i];
        EXPECT_EQ(b.bytes[4 * (255 - i) + 1], out[i]) << "green at level " << i;
        EXPECT_EQ(b.bytes[4 * i + 2], out[i]) << "blue at level " << i;
    }
    EXPECT_TRUE(b.alpha_kept());
    return out;
}

std::array<int, 256> curve(Curve apply, float value) {
    TestBitmap b = ramp();
    apply(b.get(), value);
    return curve(b);
}

TEST(ToneCurves, WorkedLevelsAndEnds) {
    const auto unit = curve(VorBitmapContrastCurve, 1.0f);  // upper half one level low
    const auto flat = curve(VorBitmapContrastCurve, 0.0f);  // 1e-8 instead: all mid-grey but the ends
    const auto gamma_unit = curve(VorBitmapGamma, 1.0f);
    for (int i = 0; i < 256; ++i) {
        EXPECT_EQ(unit[i], i <= 127 ? i : i - 1) << i;
        EXPECT_EQ(flat[i], i == 0 ? 0 : i == 255 ? 254 : 127) << i;
        EXPECT_EQ(gamma_unit[i], i);
    }
    for (int level : curve(VorBitmapGamma, 0.0f)) EXPECT_EQ(level, 255);
    const struct {
        Curve apply;
        float value;
        int level, expected;
    } cases[] = {
        {VorBitmapContrastCurve, 2.0f, 64, 32}, {VorBitmapContrastCurve, 2.0f, 191, 216},
        {VorBitmapGamma, 2.0f, 128, 64},        {VorBitmapGamma, 0.5f, 64, 128},
        {VorBitmapGamma, -1.0f, 0, 255},  // an infinite power clamps to white
    };
    for (const auto& c : cases) EXPECT_EQ(curve(c.apply, c.value)[c.level], c.expected) << c.value << " " << c.level;
}

TEST(CurveProcessors, StrengthPullsTheExponentTowardOneAndBadValuesFail) {
    const std::pair<Adapter, Curve> processors[] = {{VLPLRunContrastProcessor, VorBitmapContrastCurve},
                                                    {VLPLRunGammaProcessor, VorBitmapGamma}};
    for (const auto& [adapter, apply] : processors) {
        for (const auto& [strength, exponent] : {std::pair{1.0, 3.0f}, std::pair{0.5, 2.0f}, std::pair{0.0, 1.0f}}) {
            TestBitmap got = ramp();
            ASSERT_EQ(run(adapter, R"({"value": 3})", got.get(), strength), 1);
            EXPECT_EQ(curve(got), curve(apply, exponent)) << strength;
        }
        // Infinite or negative exponents saturate without undefined conversions.
        for (const auto& [json, ok] : {std::pair{"{}", 0}, std::pair{R"({"value": "2"})", 0}, std::pair{R"({"value": null})", 0},
                                       std::pair{"[2]", 0}, std::pair{R"({"value": 1e999})", 1},
                                       std::pair{R"({"value": -1e999})", 1}, std::pair{R"({"value": -5})", 1}}) {
            TestBitmap b = ramp();
            EXPECT_EQ(run(adapter, json, b.get()), ok) << json;
            EXPECT_TRUE(ok || b.unchanged()) << json;
        }
    }
}

}  // namespace
