#include <gtest/gtest.h>

#include <cstdlib>
#include <cstring>
#include <vector>

#include "zentra_vorlite.h"

namespace {

struct Image {
    std::vector<VorColor> pixels;
    VorBitmap bitmap;
    Image(uint32_t width, uint32_t height, VorColor (*pixel)(size_t))
        : pixels(static_cast<size_t>(width) * height),
          bitmap{reinterpret_cast<uint8_t*>(pixels.data()), width, height} {
        for (size_t i = 0; i < pixels.size(); ++i) pixels[i] = pixel(i);
    }
    Image(const Image& o)
        : pixels(o.pixels),
          bitmap{reinterpret_cast<uint8_t*>(pixels.data()), o.bitmap.width, o.bitmap.height} {}
    bool operator==(const Image& o) const {
        return std::memcmp(pixels.data(), o.pixels.data(), pixels.size() * 4) == 0;
    }
};

// Bytes scattered over 0..255 and biased toward both extremes; alpha 42.
VorColor noisy(size_t i) {
    const auto byte = [](size_t k) {
        const unsigned v = ((k + 1) * 2654435761u) >> 24;
        return static_cast<uint8_t>(v < 16 ? 0 : (v > 240 ? 255 : v));
    };
    return {byte(3 * i), byte(3 * i + 1), byte(3 * i + 2), 42};
}

const int kModes[] = {0, 1, 2, 3, 7, -1};

TEST(AutoEnhance, FixedPointsOfThePixelFormula) {
    // Black has t = 0.5 whatever its gain: green is stored from 1.0, red
    // and blue from 0.6, the levels stage being neutral.
    for (int mode : kModes) {
        Image black(5, 3, [](size_t) { return VorColor{0, 0, 0, 200}; });
        VorAutoEnhance(&black.bitmap, mode);
        EXPECT_TRUE(black == Image(5, 3, [](size_t) { return VorColor{0, 1, 0, 200}; }));
    }
    // Half white, half (200, 100, 150): no level holds more of the image
    // than an even spread, so mode 2's gains are all exactly 1 and only
    // green's two half-level offsets act.
    Image image(4, 4, [](size_t i) {
        return i % 2 ? VorColor{255, 255, 255, 3} : VorColor{200, 100, 150, 3};
    });
    VorAutoEnhance(&image.bitmap, 2);
    EXPECT_TRUE(image == Image(4, 4, [](size_t i) {
                    return i % 2 ? VorColor{255, 255, 255, 3} : VorColor{200, 101, 150, 3};
                }));
}

TEST(AutoEnhance, GreyStaysGreyWithGreenAtMostOneLevelAbove) {
    // For R = G = B = v the formulas reduce to red = blue = gain x v + 0.6
    // and green = gain x v + 1.0, whatever the gain.
    for (int mode : kModes) {
        Image image(61, 7, [](size_t i) {
            const uint8_t v = static_cast<uint8_t>((i * 37) % 200);
            return VorColor{v, v, v, 17};
        });
        VorAutoEnhance(&image.bitmap, mode);
        for (const VorColor& p : image.pixels) {
            ASSERT_TRUE(p.r == p.b && (p.g == p.r || p.g == p.r + 1) && p.a == 17) << mode;
        }
    }
}

TEST(AutoEnhance, ModesAgreeWithTheirDefinitions) {
    const Image original(41, 19, noisy);
    Image mode_one = original, mode_two = original, mode_three = original;
    VorAutoEnhance(&mode_one.bitmap, 1);
    VorAutoEnhance(&mode_two.bitmap, 2);
    VorAutoEnhance(&mode_three.bitmap, 3);
    for (size_t i = 0; i < original.pixels.size(); ++i) {
        const VorColor &before = original.pixels[i], &after = mode_two.pixels[i];
        ASSERT_TRUE(after.r >= before.r && after.g >= before.g && after.b >= before.b) << i;
    }
    // Mode 3 is the contrast curve 0.5 followed by mode 1.
    Image curve_then_one = original;
    VorBitmapContrastCurve(&curve_then_one.bitmap, 0.5f);
    VorAutoEnhance(&curve_then_one.bitmap, 1);
    EXPECT_TRUE(mode_three == curve_then_one);
    for (int mode : {4, 99, -1}) {
        Image other = original;
        VorAutoEnhance(&other.bitmap, mode);
        EXPECT_TRUE(other == mode_one) << mode;
    }
    VorBitmap empty{nullptr, 7, 0};
    VorAutoEnhance(&empty, 0);
    VorLabCorrect(&empty);
}

TEST(LabCorrect, TakesOutAboutHalfOfAUniformCast) {
    struct Case {
        VorColor colour;
        int channel;  // the packed byte with the strong cast: 1 a*, 2 b*
    } const cases[] = {
        {{200, 170, 90, 11}, 2},   // yellow
        {{110, 140, 230, 11}, 2},  // blue
        {{220, 110, 170, 11}, 1},  // magenta
        {{90, 190, 110, 11}, 1},   // green
    };
    for (const Case& c : cases) {
        Image image(9, 4, [](size_t) { return VorColor{}; });
        for (VorColor& p : image.pixels) p = c.colour;
        VorLabCorrect(&image.bitmap);
        VorColor before = c.colour, after = image.pixels[5];
        EXPECT_EQ(after.a, 11);
        VorColorRGB2LAB(&before);
        VorColorRGB2LAB(&after);
        const int cast_before = std::abs((&before.r)[c.channel] - 127);
        const int cast_after = std::abs((&after.r)[c.channel] - 127);
        EXPECT_GT(cast_before, 20);
        EXPECT_LT(cast_after, cast_before * 3 / 4) << int(c.colour.r);
        EXPECT_GT(cast_after, cast_before / 4) << int(c.colour.r);
    }
}

}  // namespace
