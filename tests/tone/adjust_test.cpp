#include <gtest/gtest.h>

#include <algorithm>
#include <cmath>
#include <vector>

#include "zentra_vorlite.h"

namespace {

using Tool = void (*)(VorBitmap*, const void*, double);

// A ramp (red = level, green = 255 - level, blue = level / 2, alpha distinctive)
// after a tool; alpha must come through untouched.
std::vector<uint8_t> ramp_after(Tool tool, double value) {
    std::vector<uint8_t> bytes(256 * 4);
    for (int i = 0; i < 256; ++i) {
        const uint8_t pixel[4] = {static_cast<uint8_t>(i), static_cast<uint8_t>(255 - i), static_cast<uint8_t>(i / 2),
                                  static_cast<uint8_t>(i * 11 + 3)};
        std::copy(pixel, pixel + 4, &bytes[4 * i]);
    }
    VorBitmap bitmap{bytes.data(), 32, 8};
    if (tool) tool(&bitmap, nullptr, value);
    for (int i = 0; i < 256; ++i) EXPECT_EQ(bytes[4 * i + 3], static_cast<uint8_t>(i * 11 + 3)) << "alpha";
    return bytes;
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
        EXPECT_EQ(ramp_after(tool, 0.0), ramp_after(nullptr, 0.0));
    }
    const auto contrast = ramp_after(VorToolContrast, 0.0);  // the contrast curve's upper-half drop
    for (int i = 0; i < 256; ++i) EXPECT_EQ(contrast[4 * i], i <= 127 ? i : i - 1) << i;
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
        VorColor pixel = c.in;
        VorBitmap bitmap{&pixel.r, 1, 1};
        VorToolSaturation(&bitmap, nullptr, c.value);
        EXPECT_EQ((std::vector<int>{pixel.r, pixel.g, pixel.b, pixel.a}),
                  (std::vector<int>{c.out.r, c.out.g, c.out.b, c.out.a}));
    }
}

}  // namespace
