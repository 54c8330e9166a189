#include <gtest/gtest.h>

#include <cmath>
#include <set>
#include <vector>

#include "tests/test_support.h"
#include "zentra_vorlite.h"

namespace {

using vorlite::test::TestBitmap;

// A mask whose colour bytes are distinctive, so a write to them shows.
TestBitmap mask_of(uint32_t w, uint32_t h, uint8_t alpha) { return TestBitmap(w, h, VorColor{11, 22, 33, alpha}); }

TEST(MaskBrushes, FullWeightSetsOrClearsAlphaOnlyInsideTheOuterRadius) {
    TestBitmap image(21, 21);
    for (const uint8_t erase : {0, 1}) {
        TestBitmap mask = mask_of(21, 21, erase != 0 ? 255 : 0);
        const VorColor reference{0, 0, 0, 255};
        // radius 4: h = 2, outer radius 4 + 2 * 0.85997 = 5.72.
        VorMaskSimilarColors(image.get(), mask.get(), &reference, 10.0, 10.0, 4.0, kVorToolMaxTolerance, 1.0, 1.0,
                             erase, 0, 1);
        EXPECT_EQ(mask.at(10, 10, 3), erase != 0 ? 0 : 255);
        EXPECT_EQ(mask.at(14, 10, 3), erase != 0 ? 0 : 255) << "on the radius the weight is still 1";
        EXPECT_NE(mask.at(15, 10, 3), mask.before[(10 * 21 + 15) * 4 + 3]) << "the soft edge";
        EXPECT_EQ(mask.at(16, 10, 3), mask.before[(10 * 21 + 16) * 4 + 3]) << "beyond 5.72";
        for (std::size_t i = 0; i < mask.bytes.size(); ++i) {
            if (i % 4 != 3) {
                ASSERT_EQ(mask.bytes[i], mask.before[i]) << "colour byte " << i;
            }
        }
    }
}

TEST(MaskBrushes, TheColourBrushRoundsWhereThePaintBrushTruncates) {
    // Half strength on a transparent mask: 127.5 rounds up to 128 in the
    // colour-aware brush and truncates to 127 in the paint brush.
    TestBitmap image(5, 5);
    TestBitmap similar = mask_of(5, 5, 0);
    const VorColor black{0, 0, 0, 255};
    VorMaskSimilarColors(image.get(), similar.get(), &black, 2.0, 2.0, 1.0, kVorToolMaxTolerance, 1.0, 0.5, 0, 0, 1);
    EXPECT_EQ(similar.at(2, 2, 3), 128);
    TestBitmap paint = mask_of(5, 5, 0);
    const VorColor red{201, 0, 0, 0};
    VorMaskDraw(paint.get(), &red, 2.0, 2.0, 1.0, 0.5, 0);
    EXPECT_EQ(paint.at(2, 2, 3), 127);
    EXPECT_EQ(paint.at(2, 2, 0), 106) << "trunc(0.5 * 11 + 0.5 * 201)";
}

TEST(MaskBrushes, AFarColourKeepsItsAlphaWhateverTheStrength) {
    TestBitmap image(9, 9, VorColor{255, 255, 0, 255});
    TestBitmap mask = mask_of(9, 9, 77);
    const VorColor blue{0, 0, 255, 255};
    VorMaskSimilarColors(image.get(), mask.get(), &blue, 4.0, 4.0, 3.0, 10.0, 1.0, 50.0, 0, 1, 0);
    EXPECT_TRUE(mask.unchanged());
    // The same colour as the reference is weighted 1.
    const VorColor same = image.pixel(0);
    VorMaskSimilarColors(image.get(), mask.get(), &same, 4.0, 4.0, 3.0, 10.0, 1.0, 1.0, 0, 0, 0);
    EXPECT_EQ(mask.at(4, 4, 3), 255);
}

TEST(MaskBrushes, PaintBrushEdgeIsFourPixelsAndStrengthIsClamped) {
    const VorColor paint{200, 100, 50, 0};
    struct Case {
        double strength;
        uint32_t x;
        int red, alpha;
    };
    // Radius 2 at (10, 5): (12, 5) lies on the radius (weight 1); (13, 5)
    // weighs ((2 - 3) * 0.25 + 1)^2 = 0.5625.
    const Case cases[] = {
        {1.0, 12, 200, 255},
        {1.0, 13, static_cast<int>(0.4375 * 11 + 0.5625 * 200), static_cast<int>(0.5625 * 255)},
        {2.0, 10, 200, 255},
        {0.0, 10, 11, 0},
        {-3.0, 10, 11, 0},
        {std::nan(""), 10, 11, 0},
    };
    for (const Case& c : cases) {
        TestBitmap mask = mask_of(21, 11, 0);
        VorMaskDraw(mask.get(), &paint, 10.0, 5.0, 2.0, c.strength, 0);
        EXPECT_EQ(mask.at(c.x, 5, 0), c.red) << c.strength << " at " << c.x;
        EXPECT_EQ(mask.at(c.x, 5, 3), c.alpha) << c.strength << " at " << c.x;
    }
    // Erasing fades all four bytes.
    TestBitmap mask = mask_of(21, 11, 255);
    VorMaskDraw(mask.get(), &paint, 10.0, 5.0, 2.0, 1.0, 1);
    EXPECT_EQ(vorlite::test::rgba(mask.pixel(5 * 21 + 10)), (std::array<int, 4>{0, 0, 0, 0}));
}

TEST(MaskBrushes, DabsAtAndBeyondTheEdgesStayInside) {
    const VorColor paint{1, 2, 3, 4};
    const double centres[][2] = {{-3, -3}, {24, 13}, {-100, 5}, {1e12, -1e12}, {std::nan(""), 3}};
    for (const auto& c : centres) {
        TestBitmap image(23, 12);
        TestBitmap mask = mask_of(23, 12, 0);
        VorMaskDraw(mask.get(), &paint, c[0], c[1], 6.0, 1.0, 0);
        VorMaskSimilarColors(image.get(), mask.get(), &paint, c[0], c[1], 6.0, 10.0, 1.0, 1.0, 0, 1, 0);
        if (c[0] == -3) {
            EXPECT_GT(mask.at(0, 0, 3), 0);
        }
        if (c[0] == -100 || c[0] == 1e12) {
            EXPECT_TRUE(mask.unchanged());
        }
    }
    VorBitmap empty{nullptr, 0, 0};
    VorMaskDraw(&empty, &paint, 0, 0, 3, 1, 0);
    VorMaskSetOpaque(&empty);
}

TEST(MaskShapes, RadiusZeroLeavesOnlyTheCentreBelowOpaque) {
    TestBitmap image(7, 5);
    TestBitmap mask = mask_of(7, 5, 9);
    VorMaskRadial(image.get(), mask.get(), 3.0, 2.0, 0.0);
    for (uint32_t y = 0; y < 5; ++y) {
        for (uint32_t x = 0; x < 7; ++x) EXPECT_EQ(mask.at(x, y, 3), x == 3 && y == 2 ? 252 : 255);
    }
}

TEST(MaskShapes, LevelsAreQuantisedAndGrowWithDistance) {
    TestBitmap image(64, 48);
    TestBitmap mask = mask_of(64, 48, 9);
    VorMaskRadial(image.get(), mask.get(), 20.0, 30.0, 9.0);
    std::set<int> levels;
    int last = -1;
    for (uint32_t x = 20; x < 64; ++x) {
        const int a = mask.at(x, 30, 3);
        EXPECT_GE(a, last);
        last = a;
    }
    for (std::size_t i = 3; i < mask.bytes.size(); i += 4) levels.insert(mask.bytes[i]);
    for (const int a : levels) EXPECT_TRUE(a == 0 || a == 255 || a % 8 == 4) << a;
    EXPECT_TRUE(levels.count(0) && levels.count(255) && levels.size() > 20);
    EXPECT_EQ(mask.at(20, 30, 0), 11) << "colour bytes stay";
}

TEST(MaskShapes, LinearBandFollowsItsAngleInWholePixels) {
    TestBitmap image(40, 30);
    TestBitmap horizontal = mask_of(40, 30, 9);
    VorMaskLinear(image.get(), horizontal.get(), 12.5, 14.5, 3.0, 0.0);
    TestBitmap vertical = mask_of(40, 30, 9);
    VorMaskLinear(image.get(), vertical.get(), 12.5, 14.5, 3.0, 1.5707963267948966);
    for (uint32_t y = 0; y < 30; ++y) {
        for (uint32_t x = 0; x < 40; ++x) {
            // Angle 0 measures y only; |y - 14.5| < 1 truncates to distance 0.
            EXPECT_EQ(horizontal.at(x, y, 3), horizontal.at(0, y, 3));
            EXPECT_EQ(vertical.at(x, y, 3), vertical.at(x, 0, 3));
        }
    }
    EXPECT_EQ(horizontal.at(0, 14, 3), 0);
    EXPECT_EQ(horizontal.at(0, 15, 3), 0);
    EXPECT_EQ(vertical.at(12, 0, 3), 0);
    EXPECT_EQ(horizontal.at(0, 0, 3), 255);
}

}  // namespace
