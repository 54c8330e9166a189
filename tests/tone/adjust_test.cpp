#include <gtest/gtest.h>

#include <cmath>
#include <vector>

#include "tests/test_support.h"

namespace {

using namespace vorlite::test;

using Tool = void (*)(VorBitmap*, const void*, double);
using Curve = void (*)(VorBitmap*, float);

// One pixel per level: red = level, green = 255 - level, blue = level / 2, alpha 42.
TestBitmap ramp() {
    TestBitmap b(32, 8);
    for (int i = 0; i < 256; ++i) b.bytes[4 * i] = i, b.bytes[4 * i + 1] = 255 - i, b.bytes[4 * i + 2] = i / 2;
    b.snapshot();
    return b;
}

// The ramp after a tool; alpha must come through untouched.
std::vector<uint8_t> ramp_after(Tool tool, double value) {
    TestBitmap b = ramp();
    tool(b.get(), nullptr, value);
    EXPECT_TRUE(b.alpha_kept());
    return b.bytes;
}

TEST(AdjustmentTools, SlidersClampToTheirEndsAndZeroIsIdentity) {
    const struct {
        Tool tool;
        double outside, end;
    } cases[] = {{VorToolBrightness, 250.0, 100.0}, {VorToolBrightness, NAN, 100.0},
                 {VorToolContrast, -101.0, -100.0}, {VorToolSaturation, 1e300, 100.0},
                 {VorToolWarmth, 300.0, 100.0}};  // 300 would fold back through the cosine
    for (const auto& c : cases) EXPECT_EQ(ramp_after(c.tool, c.outside), ramp_after(c.tool, c.end)) << c.outside;
    for (Tool tool : {VorToolBrightness, VorToolSaturation, VorToolWarmth, VorToolSharpness}) {
        EXPECT_EQ(ramp_after(tool, 0.0), ramp().bytes);
    }
    const auto contrast = ramp_after(VorToolContrast, 0.0);  // the contrast curve's upper-half drop
    for (int i = 0; i < 256; ++i) EXPECT_EQ(contrast[4 * i], i <= 127 ? i : i - 1) << i;
}

TEST(AdjustmentTools, SliderEndsAreTheirCurves) {
    const struct {
        Tool tool;
        double value;
        Curve curve;
        float exponent;
    } cases[] = {{VorToolBrightness, -100.0, VorBitmapGamma, 2.0f},  // darkening takes the gamma branch
                 {VorToolContrast, 100.0, VorBitmapContrastCurve, 3.1f},
                 {VorToolContrast, -100.0, VorBitmapContrastCurve, 1.0f / 3.1f}};
    for (const auto& c : cases) {
        TestBitmap expected = ramp();
        c.curve(expected.get(), c.exponent);
        EXPECT_EQ(ramp_after(c.tool, c.value), expected.bytes) << c.value;
    }
}

TEST(AdjustmentTools, WorkedLevelsAtTheEnds) {
    const auto brighter = ramp_after(VorToolBrightness, 100.0);  // gain 1.6
    const auto warm = ramp_after(VorToolWarmth, 100.0), cool = ramp_after(VorToolWarmth, -100.0);
    const struct {
        const std::vector<uint8_t>* ramp;
        int byte, expected;
    } cases[] = {
        {&brighter, 4 * 159, 254}, {&brighter, 4 * 160, 255},
        {&warm, 4 * 187, 254},     {&warm, 4 * 188, 255},  // red saturates from 188 upward
        {&warm, 4 * 155 + 1, 91},  {&warm, 4 * 254 + 2, 57},  // green 100, blue 127
        {&cool, 4 * 255, 100},     {&cool, 4 * 205 + 1, 59},  {&cool, 4 * 100 + 2, 98},
    };
    for (const auto& c : cases) EXPECT_EQ((*c.ramp)[c.byte], c.expected) << c.byte;
    const struct {
        double value;
        VorColor in, out;
    } colours[] = {{-100.0, {255, 0, 0, 9}, {54, 54, 54, 9}}, {100.0, {100, 50, 0, 9}, {143, 43, 0, 9}}};
    for (const auto& c : colours) {
        TestBitmap b(1, 1, c.in);
        VorToolSaturation(b.get(), nullptr, c.value);
        EXPECT_EQ(rgba(b.pixel(0)), rgba(c.out)) << c.value;
    }
}

}  // namespace

TEST(AdjustSliders, OneCallIsTheFourToolsInOrder) {
    const double settings[][4] = {{0, 0, 0, 0}, {35, -20, 60, -45}, {-100, 100, -100, 100}};
    for (const auto& s : settings) {
        vorlite::test::TestBitmap together(37, 11), apart(37, 11);
        VorToolAdjustBrightnessContrastWarmthSaturation(together.get(), s[0], s[1], s[2], s[3]);
        VorToolBrightness(apart.get(), nullptr, s[0]);
        VorToolContrast(apart.get(), nullptr, s[1]);
        VorToolWarmth(apart.get(), nullptr, s[2]);
        VorToolSaturation(apart.get(), nullptr, s[3]);
        EXPECT_TRUE(together == apart) << s[0] << " " << s[1] << " " << s[2] << " " << s[3];
        EXPECT_TRUE(together.alpha_kept());
    }
}
