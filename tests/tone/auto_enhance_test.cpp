#include <gtest/gtest.h>

#include <cstdlib>
#include <cstring>
#include <vector>

#include "zentra_vorlite.h"

namespace {

struct Image {
    uint32_t w;
    std::vector<VorColor> px;
    VorBitmap bitmap() { return {reinterpret_cast<uint8_t*>(px.data()), w, static_cast<uint32_t>(px.size() / w)}; }
    bool operator==(const Image& o) const { return std::memcmp(px.data(), o.px.data(), px.size() * 4) == 0; }
};

Image enhanced(Image img, int mode) {
    VorBitmap b = img.bitmap();
    VorAutoEnhance(&b, mode);
    return img;
}

TEST(AutoEnhance, FixedPointsOfThePixelFormula) {
    // Black lands on (0, 1, 0) whatever the mode; alpha is kept.
    for (int mode : {0, 1, 2, 3, -1})
        EXPECT_TRUE((enhanced({5, std::vector<VorColor>(15, {0, 0, 0, 200})}, mode) ==
                     Image{5, std::vector<VorColor>(15, {0, 1, 0, 200})})) << mode;
    // Half white, half (200, 100, 150): mode 2's gains are all 1, only green moves.
    Image half{4, std::vector<VorColor>(16, {255, 255, 255, 3})}, expected = half;
    for (size_t i = 0; i < 16; i += 2) half.px[i] = {200, 100, 150, 3}, expected.px[i] = {200, 101, 150, 3};
    EXPECT_TRUE(enhanced(half, 2) == expected);
}

TEST(AutoEnhance, ModesAgreeWithTheirDefinitions) {
    // Bytes biased toward both extremes, so clamping is exercised.
    Image original{41, std::vector<VorColor>(41 * 19)};
    for (size_t i = 0; i < original.px.size(); ++i) {
        const auto byte = [](size_t k) {
            const unsigned v = ((k + 1) * 2654435761u) >> 24;
            return static_cast<uint8_t>(v < 16 ? 0 : (v > 240 ? 255 : v));
        };
        original.px[i] = {byte(3 * i), byte(3 * i + 1), byte(3 * i + 2), 42};
    }
    const Image two = enhanced(original, 2);  // mode 2 never darkens
    for (size_t i = 0; i < two.px.size(); ++i) {
        const VorColor &a = original.px[i], &b = two.px[i];
        ASSERT_TRUE(b.r >= a.r && b.g >= a.g && b.b >= a.b) << i;
    }
    Image curved = original;  // mode 3 is the 0.5 curve, then mode 1
    VorBitmap b = curved.bitmap();
    VorBitmapContrastCurve(&b, 0.5f);
    EXPECT_TRUE(enhanced(original, 3) == enhanced(curved, 1));
    for (int mode : {4, -1}) EXPECT_TRUE(enhanced(original, mode) == enhanced(original, 1)) << mode;
}

TEST(LabCorrect, TakesOutAboutHalfOfAUniformCast) {
    // Packed byte with the strong cast: 1 is a*, 2 is b*.
    const std::pair<VorColor, int> cases[] = {{{200, 170, 90, 11}, 2}, {{220, 110, 170, 11}, 1}};
    for (const auto& [colour, channel] : cases) {
        Image img{9, std::vector<VorColor>(36, colour)};
        VorBitmap b = img.bitmap();
        VorLabCorrect(&b);
        VorColor before = colour, after = img.px[5];
        ASSERT_EQ(after.a, 11);
        VorColorRGB2LAB(&before);
        VorColorRGB2LAB(&after);
        const int cast_before = std::abs((&before.r)[channel] - 127);
        const int cast_after = std::abs((&after.r)[channel] - 127);
        EXPECT_LT(cast_after, cast_before * 3 / 4) << channel;
        EXPECT_GT(cast_after, cast_before / 4) << channel;
    }
}

}  // namespace
