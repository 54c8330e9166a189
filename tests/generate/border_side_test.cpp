#include <gtest/gtest.h>

#include <cmath>
#include <cstdlib>
#include <limits>
#include <vector>

#include "generate/generate_internal.h"
#include "tests/test_support.h"
#include "zentra_vorlite.h"

namespace {

using vorlite::test::checksum;
using vorlite::test::TestBitmap;

// The records the named effects make: one buffer of the longer side as the
// bottom profile for the side styles, left and right for the torn strip.
struct SideBorder {
    VorBorderParams p;
    std::vector<float> a, b;
    SideBorder(const VorBitmap& bitmap, int32_t style, uint32_t seed = 3) {
        VorBorderInitParams(&p);
        const std::size_t n = bitmap.width > bitmap.height ? bitmap.width : bitmap.height;
        a.assign(n, 0.0f);
        b.assign(n, 0.0f);
        p.leftProfile = p.rightProfile = p.topProfile = p.bottomProfile = nullptr;
        p.sideTune0 = 1.0;
        p.style = style;
        p.seed = seed;
        p.color = VorColor{250, 250, 245, 255};
        switch (style) {
            case VOR_BORDER_BULGE: p.width = 0.05; p.inset = 0.5; p.sideTune3 = 0.0; break;
            case VOR_BORDER_TORN: p.width = 0.02; p.sideTune1 = 0.015; break;
            case VOR_BORDER_TORN_2: p.width = 0.04; p.sideTune1 = 0.018; p.sideTune2 = 0.4; break;
            case VOR_BORDER_RECT: p.width = 0.021; break;
            case VOR_BORDER_GLIMMO: p.width = 0.03; p.color = VorColor{0, 0, 0, 255}; break;
            default: p.width = 0.025; break;
        }
        if (style == VOR_BORDER_TORN_2) {
            p.leftProfile = a.data();
            p.rightProfile = b.data();
        } else {
            p.bottomProfile = a.data();
        }
    }
    void draw(VorBitmap* bitmap) {
        if (p.style == VOR_BORDER_INSTANT) {
            VorBordersInstant(bitmap, &p);
        } else {
            VorBorders(bitmap, &p);
        }
    }
};

constexpr int32_t k_styles[] = {VOR_BORDER_BULGE, VOR_BORDER_TORN,  VOR_BORDER_TORN_2, VOR_BORDER_RECT,
                                VOR_BORDER_ROUND, VOR_BORDER_GLIMMO, VOR_BORDER_INSTANT};

TEST(SideBorders, FrameTheEdgesKeepTheMiddleAndAlpha) {
    for (const int32_t style : k_styles) {
        TestBitmap b(160, 120);
        SideBorder border(b.bitmap, style);
        border.draw(b.get());
        EXPECT_TRUE(b.alpha_kept()) << style;
        for (int c = 0; c < 3; ++c) {
            EXPECT_EQ(b.at(80, 60, c), b.before[(60 * 160 + 80) * 4 + c]) << style;
        }
        // Some edge pixel halfway along each side takes the colour.
        const uint32_t probes[4][2] = {{80, 2}, {80, 117}, {2, 60}, {157, 60}};
        for (const auto& probe : probes) {
            bool coloured = false;
            for (uint32_t d = 0; d < 8 && !coloured; ++d) {
                const uint32_t x = probe[0] == 2 ? d : probe[0] == 157 ? 159 - d : probe[0];
                const uint32_t y = probe[1] == 2 ? d : probe[1] == 117 ? 119 - d : probe[1];
                // The instant card carries a grain of a level or two.
                coloured = std::abs(b.at(x, y, 0) - border.p.color.r) <= 2 &&
                           std::abs(b.at(x, y, 1) - border.p.color.g) <= 2;
            }
            EXPECT_TRUE(coloured) << style << " at " << probe[0] << "," << probe[1];
        }
    }
}

TEST(SideBorders, SeededReproducibleAndLockedOnEveryPlatform) {
    const uint32_t sums[] = {1479497524u, 3560239314u, 636471835u, 2986593034u, 1744464680u, 2536680084u, 197582878u};
    for (std::size_t i = 0; i < std::size(k_styles); ++i) {
        TestBitmap one(97, 61), two(97, 61), other(97, 61);
        SideBorder a(one.bitmap, k_styles[i]), b(two.bitmap, k_styles[i]), c(other.bitmap, k_styles[i], 4);
        a.draw(one.get());
        b.draw(two.get());
        c.draw(other.get());
        EXPECT_EQ(one.bytes, two.bytes) << k_styles[i];
        if (k_styles[i] == VOR_BORDER_TORN || k_styles[i] == VOR_BORDER_TORN_2 || k_styles[i] == VOR_BORDER_GLIMMO) {
            EXPECT_NE(one.bytes, other.bytes) << k_styles[i];
        }
        EXPECT_EQ(checksum(one), sums[i]) << k_styles[i];
    }
}

TEST(SideBorders, MissingProfilesOrWildTuningsNeverReachOutside) {
    for (const int32_t style : k_styles) {
        TestBitmap b(40, 30);
        SideBorder border(b.bitmap, style);
        border.p.leftProfile = border.p.rightProfile = border.p.bottomProfile = nullptr;
        if (style != VOR_BORDER_INSTANT) {
            border.draw(b.get());
            EXPECT_TRUE(b.unchanged()) << style;
        }
        const double wild[] = {std::numeric_limits<double>::quiet_NaN(), 1e300, -1e300};
        for (const double v : wild) {
            TestBitmap t(40, 30);
            SideBorder w(t.bitmap, style);
            w.p.width = w.p.sideTune0 = w.p.sideTune1 = w.p.sideTune2 = w.p.sideTune3 = w.p.sideTune5 = v;
            w.p.inset = v;
            w.draw(t.get());
            EXPECT_TRUE(t.alpha_kept()) << style;
        }
    }
    TestBitmap tiny(1, 1);
    SideBorder border(tiny.bitmap, VOR_BORDER_TORN);
    border.draw(tiny.get());
    EXPECT_TRUE(tiny.unchanged());
}

// Side frames with rows formed four columns at a time store what the
// column-by-column reference stores: every side style, odd and tiny sizes,
// tall and wide pictures, wide bands that meet in the middle.
TEST(SideBorders, LanesStoreTheReferenceBytes) {
    const uint32_t sizes[][2] = {{97, 61}, {61, 97}, {5, 3}, {2, 2}, {130, 9}};
    for (const int32_t style : {VOR_BORDER_BULGE, VOR_BORDER_TORN, VOR_BORDER_RECT, VOR_BORDER_ROUND,
                                VOR_BORDER_GLIMMO}) {
        for (const auto& size : sizes) {
            for (const double width : {0.0, 0.05, 0.4}) {
                TestBitmap lanes(size[0], size[1]), reference(size[0], size[1]);
                SideBorder a(lanes.bitmap, style), b(reference.bitmap, style);
                a.p.width = b.p.width = width;
                a.p.color.a = b.p.color.a = 180;
                vorlite::generate::draw_side(lanes.get(), &a.p, true);
                vorlite::generate::draw_side(reference.get(), &b.p, false);
                EXPECT_TRUE(lanes == reference) << style << " " << size[0] << "x" << size[1] << " " << width;
            }
        }
    }
}

// The torn strip laid row by row stores what the pixel-by-pixel reference
// stores: narrow and wide strips, strips that meet in the middle, sizes of
// a few pixels, tall and wide pictures, a blend mode without tables, and a
// profile roughness that makes the tears wild.
TEST(SideBorders, TornStripRowsStoreTheReferenceBytes) {
    struct Case {
        uint32_t w, h;
        double width, amplitude, roughness;
        int32_t mode;
    };
    const Case cases[] = {
        {97, 61, 0.04, 0.018, 0.4, VOR_BLEND_NORMAL},   {61, 97, 0.12, 0.05, 0.4, VOR_BLEND_SCREEN},
        {33, 200, 0.3, 0.2, -4.0, VOR_BLEND_OVERLAY},   {2, 2, 0.5, 0.5, 0.4, VOR_BLEND_NORMAL},
        {5, 3, 0.05, 0.0, 16.0, VOR_BLEND_COLOR},       {130, 9, 1.0, 1.0, 0.4, VOR_BLEND_MULTIPLY},
    };
    for (const Case& c : cases) {
        TestBitmap rows(c.w, c.h), reference(c.w, c.h);
        SideBorder a(rows.bitmap, VOR_BORDER_TORN_2), b(reference.bitmap, VOR_BORDER_TORN_2);
        for (SideBorder* border : {&a, &b}) {
            border->p.width = c.width;
            border->p.sideTune1 = c.amplitude;
            border->p.sideTune2 = c.roughness;
            border->p.blendMode = c.mode;
            border->p.color.a = 51;
        }
        vorlite::generate::draw_double_sided(rows.get(), &a.p, true);
        vorlite::generate::draw_double_sided(reference.get(), &b.p, false);
        EXPECT_TRUE(rows == reference) << c.w << "x" << c.h << " " << c.width;
        EXPECT_FALSE(rows.unchanged()) << c.w << "x" << c.h << " " << c.width;
    }
}

}  // namespace
