#include <gtest/gtest.h>

#include <algorithm>
#include <cstdint>
#include <cstring>
#include <string>
#include <vector>

#include "tests/test_support.h"
#include "zentra_vorlite.h"

namespace {

VorColor rgba(int r, int g, int b, int a) { return VorColor{uint8_t(r), uint8_t(g), uint8_t(b), uint8_t(a)}; }

std::vector<int> channels(const VorColor& c) { return {c.r, c.g, c.b, c.a}; }

// White's L* is 100, and 100 x 2.55 lands just below 255 in double. Its Z
// ratio is a hair above 1: the tabled cube root caps it at 1, the exact one
// does not, and b* then truncates to one level lower.
TEST(PackedLab, WhiteAndBlackPackByTruncation) {
    float linear[256];
    VorColorRGB2LABInitMapping(linear);
    VorColor white = rgba(255, 255, 255, 42), black = rgba(0, 0, 0, 42), exact_white = white;
    VorColorRGB2LAB(&white);
    VorColorRGB2LAB(&black);
    VorColorRGB2LABWithMapping(&exact_white, linear);
    EXPECT_EQ(channels(white), (std::vector<int>{254, 127, 127, 42}));
    EXPECT_EQ(channels(black), (std::vector<int>{0, 127, 127, 42}));
    EXPECT_EQ(channels(exact_white), (std::vector<int>{254, 127, 126, 42}));
}

// Packing truncates L* to a byte and b* lands one level low, so greys
// come back up to five levels off and the darkest tinted; the whole round
// trip is pinned, alpha included, so that a one-level change shows.
TEST(PackedLab, BitmapRoundTripOfEveryGrey) {
    std::vector<VorColor> pixels;
    for (int v = 0; v < 256; ++v) pixels.push_back(rgba(v, v, v, 255 - v));
    VorBitmap bitmap{reinterpret_cast<uint8_t*>(pixels.data()), 1, 256};
    VorBitmapConvertRGBToLAB(&bitmap);
    VorBitmapConvertLABToRBG(&bitmap, 1.0f, 1.0f);
    const int cases[][4] = {{0, 0, 0, 0},         {2, 0, 0, 3},         {17, 13, 15, 18},
                            {128, 127, 127, 127}, {250, 248, 249, 251}, {255, 254, 254, 254}};  // grey -> r, g, b
    for (const auto& c : cases) EXPECT_EQ(channels(pixels[c[0]]), (std::vector<int>{c[1], c[2], c[3], 255 - c[0]}));
    EXPECT_EQ(vorlite::test::checksum(reinterpret_cast<const uint8_t*>(pixels.data()), 4 * pixels.size()), 0xde48ceffu);
}

// The bitmap conversion tables its sums and cube roots; it must store what
// the per-pixel conversion stores for every colour, dark ones taking the
// linear segment included. The prime width leaves a ragged last row, and
// the alpha, varying with position, must come through untouched.
TEST(PackedLab, BitmapMatchesPerPixelConversionForEveryColour) {
    const struct {
        uint32_t width, height;
    } shapes[] = {{4093, 4100}, {1, 257}, {257, 1}, {3, 5}};
    for (const auto& shape : shapes) {
        const uint32_t n = shape.width * shape.height;
        std::vector<VorColor> pixels(n), expected(n);
        for (uint32_t i = 0; i < n; ++i) {
            const uint32_t rgb = (i * 2654435761u) & 0xFFFFFFu;  // odd multiplier: every colour once per 2^24
            pixels[i] = rgba(rgb & 255, (rgb >> 8) & 255, rgb >> 16, (i * 37 + 42) & 255);
            expected[i] = pixels[i];
            VorColorRGB2LAB(&expected[i]);
        }
        VorBitmap bitmap{reinterpret_cast<uint8_t*>(pixels.data()), shape.width, shape.height};
        VorBitmapConvertRGBToLAB(&bitmap);
        const auto same = [](const VorColor& x, const VorColor& y) { return std::memcmp(&x, &y, 4) == 0; };
        const auto first = std::mismatch(pixels.begin(), pixels.end(), expected.begin(), same);
        ASSERT_TRUE(first.first == pixels.end())
            << shape.width << " x " << shape.height << " at " << (first.first - pixels.begin()) << ": got "
            << testing::PrintToString(channels(*first.first)) << ", expected "
            << testing::PrintToString(channels(*first.second));
    }
}

// The way back, four pixels at a time, must store what the per-pixel
// conversion stores for any packed triple and chroma scale, the alpha
// untouched; a ragged last group takes the per-pixel path.
TEST(PackedLab, BitmapBackMatchesPerPixelConversion) {
    const struct {
        uint32_t width, height;
        float scale_a, scale_b;
    } cases[] = {{2053, 4099, 1.0f, 1.0f}, {1021, 1031, 1.35f, 0.6f}, {7, 3, 0.0f, 2.0f}, {1, 3, 1.0f, 1.0f}};
    for (const auto& c : cases) {
        const uint32_t n = c.width * c.height;
        std::vector<VorColor> pixels(n), expected(n);
        for (uint32_t i = 0; i < n; ++i) {
            const uint32_t lab = (i * 2654435761u) & 0xFFFFFFu;
            pixels[i] = expected[i] = rgba(lab & 255, (lab >> 8) & 255, lab >> 16, (i * 37 + 42) & 255);
            VorColorLAB2RGBScaled(&expected[i], 1.0, c.scale_a, c.scale_b);
        }
        VorBitmap bitmap{reinterpret_cast<uint8_t*>(pixels.data()), c.width, c.height};
        VorBitmapConvertLABToRBG(&bitmap, c.scale_a, c.scale_b);
        const auto same = [](const VorColor& x, const VorColor& y) { return std::memcmp(&x, &y, 4) == 0; };
        const auto first = std::mismatch(pixels.begin(), pixels.end(), expected.begin(), same);
        ASSERT_TRUE(first.first == pixels.end())
            << c.width << " x " << c.height << " at " << (first.first - pixels.begin()) << ": got "
            << testing::PrintToString(channels(*first.first)) << ", expected "
            << testing::PrintToString(channels(*first.second));
    }
}

TEST(Hsv, WorkedColours) {
    // (red, green, blue) -> (h, s, v); a red maximum with blue above green
    // wraps below 360: -1/255 x 60 + 360 in float is 359.764709.
    const float cases[][6] = {{0, 0, 0, 0, 0, 0}, {10, 10, 10, 0, 0, 10}, {0, 0, 255, 240, 1, 255},
                              {255, 0, 1, 0x1.67c3c4p+8f, 1, 255}};
    for (const auto& c : cases) {
        const VorColor in = rgba(int(c[0]), int(c[1]), int(c[2]), 9);
        float hsv[3];
        VorColorRGB2HSV(&in, hsv);
        EXPECT_EQ((std::vector<float>(hsv, hsv + 3)), (std::vector<float>(c + 3, c + 6))) << c[0] << " " << c[2];
    }
}

TEST(Hsl, EveryColourSurvivesTheRoundTrip) {
    const VorColor red = rgba(255, 0, 0, 7);
    float hsl[3];
    VorColorRGB2HSL(&red, hsl);
    EXPECT_TRUE(hsl[0] == 0.0f && hsl[1] == 1.0f && hsl[2] == 0.5f);
    VorColor out;
    for (uint32_t i = 0; i < (1u << 24); i += 7) {
        const VorColor c = rgba(i & 255, (i >> 8) & 255, i >> 16, 0);
        VorColorRGB2HSL(&c, hsl);
        VorColorHSL2RGB(hsl, &out);
        ASSERT_TRUE(out.r == c.r && out.g == c.g && out.b == c.b) << i;
    }
}

TEST(Hsl, HueOfOneIsTheLastSectorAndAboveIsAnError) {
    const std::string error = "There was an error in VorColorHSL2RGB...The hPrime value was more than 6 somehow.";
    const struct {
        float hsl[3];
        bool error;
        std::vector<int> out;
    } cases[] = {{{1.0f, 1.0f, 0.5f}, false, {255, 0, 0, 255}},
                 {{-0.1f, 1.0f, 0.5f}, false, {255, 0, 0, 255}},  // negative hues fall in the first sector
                 {{1.5f, 0.5f, 0.25f}, true, {32, 32, 32, 255}}};  // C = 0.25, m = 0.125: the grey m is left
    for (const auto& c : cases) {
        VorColor out = rgba(0, 0, 0, 0);
        testing::internal::CaptureStdout();
        VorColorHSL2RGB(c.hsl, &out);
        EXPECT_EQ(testing::internal::GetCapturedStdout(), c.error ? error : "");
        EXPECT_EQ(channels(out), c.out);
    }
}

}  // namespace
