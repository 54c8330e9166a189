#include <gtest/gtest.h>

#include <array>
#include <cmath>
#include <vector>

#include "tests/test_support.h"
#include "zentra_vorlite.h"

namespace {

using vorlite::test::checksum;
using vorlite::test::kAlpha;
using vorlite::test::rgba;
using vorlite::test::TestBitmap;

using Rgba = std::array<int, 4>;
constexpr VorColor k_colour{200, 0, 50, 7};

// A record with profiles for every edge, as the legacy effects build them.
struct Border {
    VorBorderParams p;
    std::vector<float> left, right, top, bottom;
    Border(const VorBitmap& b, int32_t style) {
        VorBorderInitParams(&p);
        const std::size_t n = b.width > b.height ? b.width : b.height;
        left.resize(n);
        right.resize(n);
        top.resize(n);
        bottom.resize(n);
        p.leftProfile = left.data();
        p.rightProfile = right.data();
        p.topProfile = top.data();
        p.bottomProfile = bottom.data();
        p.style = style;
        p.color = k_colour;
        p.seed = 5;
    }
};

// A 60 x 60 grey picture (S = 120) framed in the given style.
TestBitmap framed(int32_t style, double halftone_scale = 1.0) {
    TestBitmap b(60, 60, VorColor{100, 100, 100, kAlpha});
    Border border(b.bitmap, style);
    border.p.halftoneScale = halftone_scale;
    VorBorders(b.get(), &border.p);
    return b;
}

// Along the middle row (29 rows from the bottom edge) the distance into
// the frame is the column, so each band's profile reads off directly:
// (1 - v) of the colour and v of the grey 100, rounded, alpha kept.
TEST(BandedFrames, BandProfilesAlongTheMiddleRowAndRoundedCorners) {
    struct Case {
        const char* name;
        int32_t style;
        double halftone_scale;
        Rgba at[4];  // columns 0 to 3
    };
    const Case cases[] = {
        // B = 4, v = 1 - 2 w^4 with w = 1 - d/4: 1 - 2 at the edge, 0.3671875
        // at d = 1, 0.875 at 2 (112.5 rounds up), 0.9921875 at 3.
        {"smooth", VOR_BORDER_SMOOTH, 1.0, {{200, 0, 50, kAlpha}, {163, 37, 68, kAlpha}, {113, 88, 94, kAlpha},
                                            {101, 99, 100, kAlpha}}},
        // At the middle row the line phase is 0: v = 1 - 3.2 w^4.
        {"lines", VOR_BORDER_LINES, 1.0, {{200, 0, 50, kAlpha}, {200, 0, 50, kAlpha}, {120, 80, 90, kAlpha},
                                          {101, 99, 99, kAlpha}}},
        // A vanishing halftone frequency makes h = 2 everywhere: v = 1 - 4 w^4.
        {"halftone", VOR_BORDER_HALFTONE, 1e12, {{200, 0, 50, kAlpha}, {200, 0, 50, kAlpha}, {125, 75, 88, kAlpha},
                                                 {102, 98, 99, kAlpha}}},
        // B = 1.5 and v = (d / B)^2; the wide rounded corners stay far away.
        {"fade", VOR_BORDER_FADE, 1.0, {{200, 0, 50, kAlpha}, {156, 44, 72, kAlpha}, {100, 100, 100, kAlpha},
                                        {100, 100, 100, kAlpha}}},
    };
    for (const Case& c : cases) {
        TestBitmap b = framed(c.style, c.halftone_scale);
        for (uint32_t x = 0; x < 4; ++x) {
            EXPECT_EQ(rgba(b.pixel(30 * 60 + x)), c.at[x]) << c.name << " column " << x;
            // The right edge mirrors the left one.
            EXPECT_EQ(rgba(b.pixel(30 * 60 + 59 - x)), c.at[x]) << c.name << " column " << 59 - x;
        }
        EXPECT_EQ(rgba(b.pixel(30 * 60 + 30)), (Rgba{100, 100, 100, kAlpha})) << c.name;
    }
    // Corners are rounded: at (3, 3) the distance is measured from the
    // corner's arc, R' minus the root of 2 (3 - R)^2 with R = 4 sqrt 2,
    // about 1.899 rather than 3.
    const TestBitmap b = framed(VOR_BORDER_SMOOTH);
    for (const std::size_t i : {3 * 60 + 3, 3 * 60 + 56, 56 * 60 + 3}) {
        EXPECT_EQ(rgba(b.pixel(i)), (Rgba{115, 85, 92, kAlpha})) << i;
    }
}

TEST(BandedFrames, ShadowReplacesTheChannelsWithTheDarkenedColour) {
    // 80 x 80, B = 2, no inset; angle 0 shifts the shadow one pixel to the
    // right, so the left edge is lighter than the right. Along the middle
    // row e is the shifted column distance: -1 and 0 at the left band's two
    // pixels, 1 and 2 at the right one's; v = ((e / 2 + 1) / 2)^4 x
    // 0.6000000238: at e = 0 the colour's 192.5 lands a hair below the half
    // and rounds down. The picture's own channels play no part.
    for (const uint8_t grey : {uint8_t{0}, uint8_t{255}}) {
        TestBitmap b(80, 80, VorColor{grey, grey, grey, kAlpha});
        Border border(b.bitmap, VOR_BORDER_SHADOW);
        VorBorders(b.get(), &border.p);
        EXPECT_EQ(rgba(b.pixel(40 * 80 + 0)), (Rgba{200, 0, 50, kAlpha})) << int{grey};
        EXPECT_EQ(rgba(b.pixel(40 * 80 + 1)), (Rgba{192, 0, 48, kAlpha})) << int{grey};
        EXPECT_EQ(rgba(b.pixel(40 * 80 + 79)), (Rgba{162, 0, 41, kAlpha})) << int{grey};
        EXPECT_EQ(rgba(b.pixel(40 * 80 + 78)), (Rgba{80, 0, 20, kAlpha})) << int{grey};
        EXPECT_EQ(b.pixel(40 * 80 + 2).r, grey);
        EXPECT_EQ(b.pixel(40 * 80 + 77).r, grey);
    }
}

TEST(BandedFrames, InsetIsWrittenBackAndOutsideItTheColourTakesAllFourBytes) {
    struct Case {
        int32_t style;
        double width;
        double inset;
        double written;     // the inset left in the record
        bool keeps_alpha;   // halftone and shadow shade; the rest paint
    };
    // S = 120. Halftone: B = 4, trunc(4 x 1); smooth and rough: B = 4 x width,
    // trunc((float)(inset / B) x B); shadow: B = 15, trunc(0.3 B); fade:
    // B = 1.5, trunc(2 B); lines never inset.
    const Case cases[] = {
        {VOR_BORDER_HALFTONE, 1.0, 1.0, 4.0, true}, {VOR_BORDER_LINES, 1.0, 5.0, 0.0, true},
        {VOR_BORDER_SMOOTH, 2.0, 3.0, 3.0, false},  {VOR_BORDER_SHADOW, 10.0, 0.0, 4.0, true},
        {VOR_BORDER_FADE, 1.0, 2.0, 3.0, false},    {VOR_BORDER_ROUGH, 1.0, 3.7, 3.0, false},
    };
    for (const Case& c : cases) {
        TestBitmap b(60, 60);
        Border border(b.bitmap, c.style);
        border.p.width = c.width;
        border.p.inset = c.inset;
        border.p.insetTop = -7.0;
        VorBorders(b.get(), &border.p);
        EXPECT_EQ(border.p.insetLeft, c.written) << c.style;
        EXPECT_EQ(border.p.insetTop, c.written) << c.style;
        EXPECT_EQ(border.p.insetBottom, c.written) << c.style;
        if (c.written == 0.0) continue;
        EXPECT_EQ(b.at(0, 30, 3), c.keeps_alpha ? kAlpha : k_colour.a) << c.style;
        if (!c.keeps_alpha) {
            EXPECT_EQ(rgba(b.pixel(30 * 60)), rgba(k_colour)) << c.style;
        }
    }
    // The viewfinder measures from the caller's insets and keeps them.
    TestBitmap v(60, 60);
    Border viewfinder(v.bitmap, VOR_BORDER_VIEWFINDER);
    viewfinder.p.insetLeft = 2.0;
    VorBorders(v.get(), &viewfinder.p);
    EXPECT_EQ(viewfinder.p.insetLeft, 2.0);
    EXPECT_EQ(viewfinder.p.insetTop, 0.0);
    EXPECT_EQ(rgba(v.pixel(30 * 60 + 1)), rgba(k_colour));
    EXPECT_EQ(v.at(2, 30, 3), kAlpha);
}

TEST(BandedFrames, RoughBandsDrawOnceForEveryBandPixelInRowOrder) {
    // Viewfinder on 60 x 60: B = 2 and no inset, so rows 0 and 1 lie wholly
    // in the band: 60 draws for row 0, then one per pixel of row 1. Away
    // from the corners row 1 has d = 1, w^4 = 1/16, so pixel x of row 1
    // uses draw 60 + x: v = 1 - 2 w^4 (0.4 n + 0.6).
    TestBitmap b(60, 60, VorColor{0, 0, 0, kAlpha});
    Border border(b.bitmap, VOR_BORDER_VIEWFINDER);
    border.p.color = VorColor{255, 255, 255, 255};
    border.p.seed = 77;
    VorBorders(b.get(), &border.p);
    VorRNG rng;
    VorRNGSeed(&rng, VorRNGNextSeedN(77, 60 + 3));
    for (uint32_t x = 3; x < 57; ++x) {
        const float n = VorRNGNextFloat(&rng);
        const float v = 1.0f - 2.0f * 0.0625f * (0.4f * n + 0.6f);
        const auto expected = static_cast<int>(std::floor((1.0 - static_cast<double>(v)) * 255.0 + 0.5));
        EXPECT_EQ(b.at(x, 1, 0), expected) << x;
    }
}

TEST(BandedFrames, RandomStylesAreReproducibleFromTheirSeed) {
    for (const int32_t style : {int32_t{VOR_BORDER_ROUGH}, int32_t{VOR_BORDER_VIEWFINDER},
                                int32_t{VOR_BORDER_HARD_RAND}}) {
        uint32_t sums[3];
        for (int i = 0; i < 3; ++i) {
            TestBitmap b(61, 47);
            Border border(b.bitmap, style);
            border.p.seed = i == 2 ? 6 : 5;
            VorBorders(b.get(), &border.p);
            EXPECT_TRUE(b.alpha_kept()) << style;
            sums[i] = checksum(b);
        }
        EXPECT_EQ(sums[0], sums[1]) << style;
        EXPECT_NE(sums[0], sums[2]) << style;
    }
}

TEST(RoughFrame, EachEdgeIsAProfileSeededFromTheRecordsGenerator) {
    TestBitmap b(64, 48);
    Border border(b.bitmap, VOR_BORDER_HARD_RAND);
    border.p.cornerOffset = 3.0;
    border.p.roughAmplitude = 2.0;
    border.p.mpdMode = VOR_MPD_LAPLACE;
    VorBorders(b.get(), &border.p);
    // The same profiles by hand: pinned ends, then seeds drawn in the order
    // left, right, top, bottom; the side edges' amplitude comes from the
    // width, the top and bottom ones' from the height.
    std::vector<float> left(48), right(48), top(64), bottom(64);
    left[47] = 3.0f;
    bottom[0] = 3.0f;
    VorRNG rng;
    VorRNGSeed(&rng, 5);
    const auto across = static_cast<float>(2.0 * 0.03 * 64.0);
    const auto down = static_cast<float>(2.0 * 0.03 * 48.0);
    VorMPDSeed(left.data(), 0, 47, across, 0.7f, VOR_MPD_LAPLACE, VorRNGNextInt(&rng));
    VorMPDSeed(right.data(), 0, 47, across, 0.7f, VOR_MPD_LAPLACE, VorRNGNextInt(&rng));
    VorMPDSeed(top.data(), 0, 63, down, 0.7f, VOR_MPD_LAPLACE, VorRNGNextInt(&rng));
    VorMPDSeed(bottom.data(), 0, 63, down, 0.7f, VOR_MPD_LAPLACE, VorRNGNextInt(&rng));
    EXPECT_EQ(std::vector<float>(border.left.begin(), border.left.begin() + 48), left);
    EXPECT_EQ(std::vector<float>(border.right.begin(), border.right.begin() + 48), right);
    EXPECT_EQ(border.top, top);
    EXPECT_EQ(border.bottom, bottom);
    EXPECT_TRUE(b.alpha_kept());
}

TEST(RoughFrame, StraightEdgesBlendOutsideAndAtTheEdgeAndLeaveTheMiddle) {
    // No noise and no corner offset: every profile is 0, the frame is the
    // inset rectangle. Outside it the colour is blended at the record's
    // opacity; at d = 0 the band gives v < 0, so the same full blend.
    TestBitmap b(40, 30);
    Border border(b.bitmap, VOR_BORDER_HARD_RAND);
    border.p.mpdMode = 99;
    border.p.inset = 1.0;
    border.p.opacity = 0.6;
    border.p.blendMode = VOR_BLEND_MULTIPLY;
    VorBorders(b.get(), &border.p);
    for (const uint32_t x : {0u, 1u, 38u, 39u}) {
        const std::size_t i = (std::size_t{15} * 40 + x) * 4;
        VorColor expected{b.before[i], b.before[i + 1], b.before[i + 2], kAlpha};
        VorColorBlend(&expected, &border.p.color, VOR_BLEND_MULTIPLY, 0.6f);
        EXPECT_EQ(rgba(b.pixel(std::size_t{15} * 40 + x)), rgba(expected)) << x;
    }
    for (uint32_t x = 5; x < 35; ++x) {
        for (int c = 0; c < 4; ++c) EXPECT_EQ(b.at(x, 15, c), b.before[(15 * 40 + x) * 4 + c]) << x;
    }
}

}  // namespace
