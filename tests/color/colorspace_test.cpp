#include <gtest/gtest.h>

#include <cmath>
#include <cstdint>
#include <cstdlib>
#include <string>
#include <vector>

#include "zentra_vorlite.h"

namespace {

VorColor rgba(int r, int g, int b, int a) {
    return VorColor{static_cast<uint8_t>(r), static_cast<uint8_t>(g), static_cast<uint8_t>(b),
                    static_cast<uint8_t>(a)};
}

void expect_rgba(const VorColor& c, int r, int g, int b, int a) {
    EXPECT_EQ(c.r, r);
    EXPECT_EQ(c.g, g);
    EXPECT_EQ(c.b, b);
    EXPECT_EQ(c.a, a);
}

TEST(PackedLab, WhiteAndBlackPackByTruncation) {
    float linear[256];
    VorColorRGB2LABInitMapping(linear);
    // White's L* is 100, and 100 x 2.55 lands just below 255 in double.
    // Its Z ratio is a hair above 1: the tabled cube root caps it at 1,
    // the exact one does not, and b* then truncates to one level lower.
    const struct {
        VorColor in;
        int L, a, b, b_exact;
    } cases[] = {{rgba(255, 255, 255, 42), 254, 127, 127, 126},
                 {rgba(0, 0, 0, 42), 0, 127, 127, 127}};
    for (const auto& c : cases) {
        VorColor tabled = c.in;
        VorColorRGB2LAB(&tabled);
        expect_rgba(tabled, c.L, c.a, c.b, 42);
        VorColor exact = c.in;
        VorColorRGB2LABWithMapping(&exact, linear);
        expect_rgba(exact, c.L, c.a, c.b_exact, 42);
    }
}

// The table-driven cube root is a coarse stand-in for powf: the two agree
// to a few units of the packed scale, never more.
TEST(PackedLab, TabledCubeRootTracksExactOne) {
    float linear[256];
    VorColorRGB2LABInitMapping(linear);
    double worst = 0.0;
    for (uint32_t i = 0; i < (1u << 24); i += 4099) {
        const VorColor c = rgba(i & 255, (i >> 8) & 255, i >> 16, 255);
        double L1, a1, b1, L2, a2, b2;
        VorColorRGB2LABDoublesWithMapping(&c, &L1, &a1, &b1, linear);
        VorColorRGB2LABDoublesWithCbrtMapping(&c, &L2, &a2, &b2);
        worst = std::fmax(worst, std::fabs(L1 - L2));
        worst = std::fmax(worst, std::fabs(a1 - a2));
        worst = std::fmax(worst, std::fabs(b1 - b2));
    }
    EXPECT_LT(worst, 4.0);
}

// Packing truncates, so saturated colours can drift far; greys stay close.
TEST(PackedLab, BitmapRoundTripKeepsGreysCloseAndAlphaExact) {
    std::vector<VorColor> pixels;
    for (int v = 0; v < 256; ++v) pixels.push_back(rgba(v, v, v, 255 - v));
    VorBitmap bitmap{reinterpret_cast<uint8_t*>(pixels.data()), 1, 256};
    VorBitmapConvertRGBToLAB(&bitmap);
    for (int v = 0; v < 256; ++v) ASSERT_EQ(pixels[v].a, 255 - v);
    VorBitmapConvertLABToRBG(&bitmap, 1.0f, 1.0f);
    for (int v = 0; v < 256; ++v) {
        const VorColor& c = pixels[v];
        EXPECT_TRUE(std::abs(c.r - v) <= 6 && std::abs(c.g - v) <= 6 && std::abs(c.b - v) <= 6)
            << v;
        EXPECT_EQ(c.a, 255 - v);
    }
}

TEST(Hsv, WorkedColours) {
    const struct {
        VorColor in;
        float h, s, v;
    } cases[] = {
        {rgba(0, 0, 0, 9), 0.0f, 0.0f, 0.0f},
        {rgba(10, 10, 10, 9), 0.0f, 0.0f, 10.0f},
        {rgba(0, 0, 255, 9), 240.0f, 1.0f, 255.0f},
        // A red maximum with blue above green wraps below 360.
        {rgba(255, 0, 1, 9), 360.0f - 60.0f / 255.0f, 1.0f, 255.0f},
    };
    for (const auto& c : cases) {
        float hsv[3];
        VorColorRGB2HSV(&c.in, hsv);
        EXPECT_NEAR(hsv[0], c.h, 1e-4f);
        EXPECT_FLOAT_EQ(hsv[1], c.s);
        EXPECT_FLOAT_EQ(hsv[2], c.v);
    }
}

TEST(Hsl, EveryColourSurvivesTheRoundTrip) {
    const VorColor red = rgba(255, 0, 0, 7);
    float red_hsl[3];
    VorColorRGB2HSL(&red, red_hsl);
    EXPECT_TRUE(red_hsl[0] == 0.0f && red_hsl[1] == 1.0f && red_hsl[2] == 0.5f);
    for (uint32_t i = 0; i < (1u << 24); i += 7) {
        const VorColor c = rgba(i & 255, (i >> 8) & 255, i >> 16, 0);
        float hsl[3];
        VorColorRGB2HSL(&c, hsl);
        VorColor out;
        VorColorHSL2RGB(hsl, &out);
        ASSERT_TRUE(out.r == c.r && out.g == c.g && out.b == c.b) << i;
    }
}

TEST(Hsl, HueOfOneIsTheLastSectorAndAboveIsAnError) {
    const struct {
        float hsl[3];
        bool error;
        int r, g, b;
    } cases[] = {
        {{0.0f, 1.0f, 0.5f}, false, 255, 0, 0},
        {{1.0f, 1.0f, 0.5f}, false, 255, 0, 0},
        // Negative hues fall in the first sector.
        {{-0.1f, 0.0f, 0.5f}, false, 128, 128, 128},
        // C = 0.25 and m = 0.125: the error leaves the grey m alone.
        {{1.5f, 0.5f, 0.25f}, true, 32, 32, 32},
    };
    for (const auto& c : cases) {
        VorColor out = rgba(0, 0, 0, 0);
        testing::internal::CaptureStdout();
        VorColorHSL2RGB(c.hsl, &out);
        const std::string printed = testing::internal::GetCapturedStdout();
        EXPECT_EQ(printed, c.error ? "There was an error in VorColorHSL2RGB...The hPrime value was "
                                     "more than 6 somehow."
                                   : "");
        expect_rgba(out, c.r, c.g, c.b, 255);
    }
}

}  // namespace
