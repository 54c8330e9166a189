#include <gtest/gtest.h>

#include <cmath>

#include "tests/test_support.h"
#include "zentra_vorlite.h"

namespace {

using vorlite::test::rgba;
using vorlite::test::TestBitmap;

TEST(RedEye, RedAtLeastGreenPlusBlueTakesTheirMeanRoundedUp) {
    struct Case {
        VorColor in;
        int red;
    };
    const Case cases[] = {
        {{200, 50, 60, 9}, 55}, {{100, 50, 60, 9}, 100}, {{110, 50, 60, 9}, 55},
        {{0, 0, 0, 9}, 0},      {{255, 255, 0, 9}, 128}, {{255, 128, 128, 9}, 255},
    };
    for (const Case& c : cases) {
        TestBitmap image(1, 1, c.in);
        VorRedEye(image.get(), image.get());
        EXPECT_EQ(rgba(image.pixel(0)), (std::array<int, 4>{c.red, c.in.g, c.in.b, c.in.a})) << int(c.in.r);
    }
}

TEST(RedEye, ReadsTheSourceAndRefusesAnotherSize) {
    TestBitmap source(3, 2, VorColor{200, 50, 60, 255});
    TestBitmap destination(3, 2, VorColor{1, 2, 3, 4});
    VorRedEye(destination.get(), source.get());
    EXPECT_EQ(rgba(destination.pixel(5)), (std::array<int, 4>{55, 2, 3, 4}));
    TestBitmap other(2, 3);
    VorRedEye(other.get(), source.get());
    EXPECT_TRUE(other.unchanged());
}

double lab_b(const VorColor& c) {
    double l, a, b;
    VorColorRGB2LABDoublesWithCbrtMapping(&c, &l, &a, &b);
    return b;
}

double lab_l(const VorColor& c) {
    double l, a, b;
    VorColorRGB2LABDoublesWithCbrtMapping(&c, &l, &a, &b);
    return l;
}

TEST(Whiten, YellowedWhiteBrightensAndNeutralisesWhileOtherHuesStay) {
    // A warm tooth colour: a at 132, b well above 127, so k is 0.65.
    const VorColor ivory{220, 195, 170, 77};
    TestBitmap tooth(1, 1, ivory);
    VorWhiten(tooth.get(), nullptr);
    EXPECT_GT(lab_l(tooth.pixel(0)), lab_l(ivory));
    EXPECT_LT(std::fabs(lab_b(tooth.pixel(0)) - 127.0), std::fabs(lab_b(ivory) - 127.0) * 0.6);
    EXPECT_EQ(tooth.pixel(0).a, 77);
    // Saturated green is far from the tooth hue: only the truncating round
    // trip through packed L*a*b* moves it.
    const VorColor green{20, 200, 30, 5};
    TestBitmap leaf(1, 1, green);
    VorWhiten(leaf.get(), nullptr);
    double l, a, b;
    VorColorRGB2LABDoublesWithCbrtMapping(&green, &l, &a, &b);
    VorColor round_trip{static_cast<uint8_t>(l), static_cast<uint8_t>(a), static_cast<uint8_t>(b), 5};
    VorColorLAB2RGB(&round_trip);
    EXPECT_EQ(rgba(leaf.pixel(0)), rgba(round_trip));
}

// Pixels are whitened in blocks: every pixel of a bitmap whose size is
// not a whole number of blocks comes out as it does alone.
TEST(Whiten, EveryPixelOfABitmapAsOnItsOwn) {
    TestBitmap image(131, 3, 7u);
    const TestBitmap original(image);
    VorWhiten(image.get(), image.get());
    for (std::size_t i = 0; i < std::size_t{image.width} * image.height; ++i) {
        TestBitmap alone(1, 1, original.pixel(i));
        VorWhiten(alone.get(), nullptr);
        ASSERT_EQ(rgba(image.pixel(i)), rgba(alone.pixel(0))) << i;
    }
}

}  // namespace
