#include <gtest/gtest.h>

#include <algorithm>
#include <cmath>
#include <vector>

#include "zentra_vorlite.h"

namespace {

// One pixel per level: red = level, green = 255 - level, blue = level / 2,
// alpha distinctive, so a per-channel tone map can be read back.
struct Ramp {
    std::vector<uint8_t> bytes = std::vector<uint8_t>(256 * 4);
    VorBitmap bitmap{bytes.data(), 32, 8};
    Ramp() {
        for (int i = 0; i < 256; ++i) {
            const uint8_t pixel[4] = {static_cast<uint8_t>(i), static_cast<uint8_t>(255 - i),
                                      static_cast<uint8_t>(i / 2), static_cast<uint8_t>(i * 11 + 3)};
            std::copy(pixel, pixel + 4, &bytes[4 * i]);
        }
    }
    int red(int level) const { return bytes[4 * level]; }
    int green(int level) const { return bytes[4 * (255 - level) + 1]; }
    int blue_of_pixel(int index) const { return bytes[4 * index + 2]; }
};

using Tool = void (*)(VorBitmap*, const void*, double);

std::vector<uint8_t> after(Tool tool, double value) {
    Ramp r;
    tool(&r.bitmap, nullptr, value);
    for (int i = 0; i < 256; ++i) EXPECT_EQ(r.bytes[4 * i + 3], static_cast<uint8_t>(i * 11 + 3)) << "alpha";
    return r.bytes;
}

template <typename Apply>
std::vector<uint8_t> ramp_through(Apply apply) {
    Ramp r;
    apply(&r.bitmap);
    return r.bytes;
}

TEST(AdjustmentTools, SlidersClampToTheirEnds) {
    const struct {
        Tool tool;
        double outside, end;
    } cases[] = {
        {VorToolBrightness, 250.0, 100.0},   {VorToolBrightness, -1e9, -100.0},
        {VorToolBrightness, NAN, 100.0},     {VorToolContrast, 180.0, 100.0},
        {VorToolContrast, -101.0, -100.0},  {VorToolSaturation, 1e300, 100.0},
        {VorToolSaturation, -300.0, -100.0}, {VorToolWarmth, 300.0, 100.0},  // folded by the cosine
        {VorToolWarmth, -300.0, -100.0},
    };
    for (const auto& c : cases) EXPECT_EQ(after(c.tool, c.outside), after(c.tool, c.end)) << c.outside;
}

TEST(AdjustmentTools, ZeroIsTheIdentityButForTheContrastCurvesDrop) {
    const Ramp untouched;
    for (Tool tool : {VorToolBrightness, VorToolSaturation, VorToolWarmth, VorToolSharpness}) {
        EXPECT_EQ(after(tool, 0.0), untouched.bytes);
    }
    Ramp r;
    VorToolContrast(&r.bitmap, nullptr, 0.0);
    for (int i = 0; i < 256; ++i) EXPECT_EQ(r.red(i), i <= 127 ? i : i - 1) << i;
}

TEST(AdjustmentTools, ToolsReachTheirCurvesAtTheEnds) {
    EXPECT_EQ(after(VorToolBrightness, -100.0), ramp_through([](VorBitmap* b) { VorBitmapGamma(b, 2.0f); }));
    EXPECT_EQ(after(VorToolContrast, -100.0),
              ramp_through([](VorBitmap* b) { VorBitmapContrastCurve(b, static_cast<float>(1.0 / 3.1)); }));
    EXPECT_EQ(after(VorToolContrast, 100.0), ramp_through([](VorBitmap* b) { VorBitmapContrastCurve(b, 3.1f); }));

    Ramp brighter;  // gain 1.6, no offset
    VorToolBrightness(&brighter.bitmap, nullptr, 100.0);
    const int levels[][2] = {{1, 2}, {100, 160}, {159, 254}, {160, 255}};
    for (const auto& l : levels) EXPECT_EQ(brighter.red(l[0]), l[1]) << l[0];
}

TEST(AdjustmentTools, SaturationRunsFromGreyToDouble) {
    const struct {
        double value;
        VorColor in, out;
    } cases[] = {
        {-100.0, {255, 0, 0, 9}, {54, 54, 54, 9}},  // grey by 0.213, 0.715, 0.072
        {100.0, {100, 50, 0, 9}, {143, 43, 0, 9}},  // pushed twice as far from grey
        {100.0, {80, 80, 80, 9}, {80, 80, 80, 9}},
    };
    for (const auto& c : cases) {
        VorColor pixel = c.in;
        VorBitmap bitmap{&pixel.r, 1, 1};
        VorToolSaturation(&bitmap, nullptr, c.value);
        EXPECT_EQ((std::vector<int>{pixel.r, pixel.g, pixel.b, pixel.a}),
                  (std::vector<int>{c.out.r, c.out.g, c.out.b, c.out.a}))
            << c.value;
    }
}

TEST(AdjustmentTools, WarmthGainsPerChannel) {
    Ramp warm;  // gains 1.356, 0.906, 0.451
    VorToolWarmth(&warm.bitmap, nullptr, 100.0);
    EXPECT_EQ(warm.red(187), 254);
    EXPECT_EQ(warm.red(188), 255);  // red saturates from 188 upward
    EXPECT_EQ(warm.green(255), 231);
    EXPECT_EQ(warm.green(100), 91);
    EXPECT_EQ(warm.blue_of_pixel(254), 57);  // 127 x 0.451

    Ramp cool;  // gains 100/255, 299.625/255, 500.31/255
    VorToolWarmth(&cool.bitmap, nullptr, -100.0);
    EXPECT_EQ(cool.red(255), 100);
    EXPECT_EQ(cool.red(50), 20);
    EXPECT_EQ(cool.green(50), 59);
    EXPECT_EQ(cool.green(255), 255);
    EXPECT_EQ(cool.blue_of_pixel(100), 98);  // 50 x 1.962
}

}  // namespace
