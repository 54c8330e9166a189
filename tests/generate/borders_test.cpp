#include <gtest/gtest.h>

#include <array>
#include <bit>
#include <cmath>
#include <cstring>
#include <string>
#include <vector>

#include "generate/generate_internal.h"
#include "tests/test_support.h"
#include "zentra_vorlite.h"

namespace {

using vorlite::test::checksum;
using vorlite::test::Json;
using vorlite::test::kAlpha;
using vorlite::test::rgba;
using vorlite::test::run;
using vorlite::test::TestBitmap;

TEST(BorderDecoders, StyleAndShapeKeywords) {
    const char* styles[] = {"halftone", "lines", "smooth", "shadow", "fade", "rough", "bulge", "torn",
                            "torn_2", "rect", "round", "glimmo", "hard_rand", "instant", "vignette", "viewfinder"};
    for (int32_t i = 0; i < 16; ++i) {
        const std::string text = std::string(1, '"') + styles[i] + '"';
        const Json j(text);
        VorBorderStyle s = -1;
        EXPECT_EQ(VLPLBorderStyleFromBorderStyleTypeVal(j.value, &s), 1);
        EXPECT_EQ(s, i + 1);
    }
    for (const char* bad : {"\"Vignette\"", "7", "null"}) {
        const Json j(bad);
        VorBorderStyle s = -1;
        EXPECT_EQ(VLPLBorderStyleFromBorderStyleTypeVal(j.value, &s), 0) << bad;
        EXPECT_EQ(s, -1);
    }
    const std::pair<const char*, int32_t> modes[] = {
        {"\"normal\"", 0}, {"\"sharp\"", 1}, {"\"mediumSharp\"", 2}, {"\"ultraSharp\"", 3}, {"\"Sharp\"", 0}, {"3", 0}};
    for (const auto& [text, mode] : modes) {
        const Json j(text);
        VorBorderShapeMode m = -1;
        EXPECT_EQ(VLPLBorderShapeModeFromBorderShapeModeVal(j.value, &m), 1);
        EXPECT_EQ(m, mode) << text;
    }
}

TEST(BorderDecoders, ShapeScalesTheRadiusByTheBitmapAndTheStrength) {
    TestBitmap b(300, 100);
    struct Case {
        const char* shape;
        float strength;
        uint8_t epsilon;
        double scale;
        uint8_t stretch;
    };
    const Case cases[] = {
        {R"({"vignetteScale": 0.5, "scaling": "average"})", 2.0f, 0, 0.5 * 0.5 * 400.0 / 2.0, 0},
        {R"({"vignetteScale": 0.5, "scaling": "max", "dx": 0.25})", 0.5f, 0, 300.0 * 0.5 / 0.5, 0},
        {R"({"vignetteScale": 0.5, "scaling": "stretch"})", 0.0f, 1, 0.5 / 1e-8, 1},
    };
    for (const Case& c : cases) {
        const Json j(c.shape);
        VorBorderParams p;
        VorBorderInitParams(&p);
        ASSERT_EQ(VLPLBorderPopoulateWithShapeTypeVal(j.value, &p, b.get(), c.strength, c.epsilon), 1) << c.shape;
        EXPECT_DOUBLE_EQ(p.vignetteScale, c.scale) << c.shape;
        EXPECT_EQ(p.stretch, c.stretch);
    }
    // An unknown scaling fails after the mode and offsets are written.
    const Json bad(R"({"vignetteScale": 1, "scaling": "huge", "shapeMode": "sharp", "dy": 0.5})");
    VorBorderParams p;
    VorBorderInitParams(&p);
    EXPECT_EQ(VLPLBorderPopoulateWithShapeTypeVal(bad.value, &p, b.get(), 1.0f, 0), 0);
    EXPECT_EQ(p.shapeMode, VOR_SHAPE_SHARP);
    EXPECT_EQ(p.dy, 0.5);
    EXPECT_EQ(p.vignetteScale, 1.0);
}

TEST(Borders, DefaultsLeaveTheSideTuneAndTheProfilesAlone) {
    VorBorderParams p;
    std::memset(&p, 0xAB, sizeof p);
    VorBorderParams untouched = p;
    VorBorderInitParams(&p);
    EXPECT_EQ(std::memcmp(&p.sideTune0, &untouched.sideTune0, sizeof p.sideTune0), 0);
    EXPECT_EQ(p.leftProfile, untouched.leftProfile);
    EXPECT_EQ(p.topProfile, untouched.topProfile);
    EXPECT_EQ(p.cornerFactor, 2.222);
    EXPECT_EQ(p.sideTune4, 0.28);
    EXPECT_EQ(rgba(p.color), (std::array<int, 4>{255, 255, 255, 255}));
    EXPECT_EQ(p.style, VOR_BORDER_NONE);
}

TEST(Borders, StylesWithoutARendererLeaveThePicture) {
    for (const int32_t style : {int32_t{VOR_BORDER_NONE}, int32_t{VOR_BORDER_INSTANT}, int32_t{17}, int32_t{-3}}) {
        TestBitmap b(20, 10);
        VorBorderParams p;
        VorBorderInitParams(&p);
        p.style = style;
        VorBorders(b.get(), &p);
        EXPECT_TRUE(b.unchanged()) << style;
    }
}

// White picture, opaque black vignette (normal mode unless said), so each
// byte reads as 255 minus the opacity the pixel got.
TestBitmap vignetted(uint32_t w, uint32_t h, double radius, uint8_t stretch = 0, int32_t mode = VOR_BLEND_NORMAL) {
    TestBitmap b(w, h, VorColor{255, 255, 255, kAlpha});
    VorBorderParams p;
    VorBorderInitParams(&p);
    p.style = VOR_BORDER_VIGNETTE;
    p.color = VorColor{0, 0, 0, 255};
    p.blendMode = mode;
    p.vignetteScale = radius;
    p.stretch = stretch;
    VorBorders(b.get(), &p);
    EXPECT_TRUE(b.alpha_kept());
    return b;
}

TEST(Vignette, RampStartsAtExactlyPointZeroFourAndJumpsToFullAbove1Point15) {
    struct Case {
        const char* name;
        float radius;
        uint32_t mode;
        int neighbour;  // the four pixels at distance 1
        int diagonal;   // the four at distance sqrt 2
    };
    const float q25 = std::bit_cast<float>(0x40AB94B5u);  // r^2 x 0.8695652 is exactly 25
    const Case cases[] = {
        // Radius 1 makes k = 1.15 itself: the neighbours sit on the ramp's
        // end (level 253 of black over white leaves 2), the diagonals are
        // beyond it and get the full colour.
        {"at 1.15", 1.0f, VOR_BLEND_NORMAL, 2, 0},
        // k = 0.04 exactly: the neighbours take the ramp at level 0, which
        // only a mode without a rule shows (it blackens whatever it blends);
        // one float more radius puts them below the ramp.
        {"at 0.04", q25, 7, 0, 0},
        {"below 0.04", std::nextafter(q25, 10.0f), 7, 255, 0},
    };
    for (const Case& c : cases) {
        const TestBitmap b = vignetted(3, 3, c.radius, 0, static_cast<int32_t>(c.mode));
        EXPECT_EQ(b.pixel(4).r, 255) << c.name;
        for (const std::size_t i : {1, 3, 5, 7}) EXPECT_EQ(b.pixel(i).r, c.neighbour) << c.name << " " << i;
        for (const std::size_t i : {0, 2, 6, 8}) EXPECT_EQ(b.pixel(i).r, c.diagonal) << c.name << " " << i;
    }
}

TEST(Vignette, ZeroRadiusCoversEverythingButTheCentre) {
    const TestBitmap b = vignetted(7, 5, 0.0);
    for (std::size_t i = 0; i < 35; ++i) EXPECT_EQ(b.pixel(i).g, i == 2 * 7 + 3 ? 255 : 0) << i;
}

TEST(Vignette, StretchMakesAnEllipseOfThePicturesProportions) {
    const TestBitmap b = vignetted(200, 50, 0.8, 1);
    // Equal fractions of the half-width and half-height darken equally.
    EXPECT_EQ(b.pixel(25 * 200 + 100 + 60).r, b.pixel((25 + 15) * 200 + 100).r);
}

TEST(VignetteProcessor, DrawsOrRefusesWithoutTouching) {
    const std::string good =
        R"({"color": {"r": 0, "g": 0, "b": 40, "a": 220}, "blendMode": "multiply",
            "shape": {"vignetteScale": 0.4, "scaling": "average", "shapeMode": "mediumSharp", "dx": 0.2}})";
    TestBitmap b(45, 31);
    ASSERT_EQ(run(VLPLRunVignetteProcessor, good, b.get(), 0.7), 1);
    EXPECT_TRUE(b.alpha_kept());
    EXPECT_EQ(checksum(b), 2318714011u);
    // Strength 0 makes the radius enormous: nothing darkens.
    TestBitmap weak(45, 31);
    EXPECT_EQ(run(VLPLRunVignetteProcessor, good, weak.get(), 0.0), 1);
    EXPECT_TRUE(weak.unchanged());
    const std::string bad[] = {
        R"({"shape": {"vignetteScale": 1, "scaling": "max"}})",
        R"({"color": {"r": 0, "g": 0, "b": 0, "a": 255}})",
        R"({"color": {"r": 0, "g": 0, "b": 0, "a": 256}, "shape": {"vignetteScale": 1, "scaling": "max"}})",
        R"({"color": {"r": 0, "g": 0, "b": 0, "a": 255}, "shape": {"vignetteScale": 1, "scaling": "min"}})",
        R"({"color": {"r": 0, "g": 0, "b": 0, "a": 255}, "shape": {"scaling": "max"}})",
        "[1]",
    };
    for (const std::string& parameters : bad) {
        TestBitmap t(9, 7);
        EXPECT_EQ(run(VLPLRunVignetteProcessor, parameters, t.get()), 0) << parameters;
        EXPECT_TRUE(t.unchanged()) << parameters;
    }
}

}  // namespace

// Rows classified four pixels at a time, the half left of the centre
// copied from the half right of it, the ramp's levels made up front on a
// large bitmap, store what the pixel-by-pixel reference stores: every shape mode, stretched or not, centres moved off
// the picture, a radius that puts most pixels on the ramp or beyond it,
// and the colour mode's direct blend beyond the ramp.
TEST(Vignette, LanesStoreTheReferenceBytes) {
    struct Case {
        int32_t shape_mode;
        uint8_t stretch;
        double radius, dx, dy;
        int32_t mode;
    };
    const Case cases[] = {
        {VOR_SHAPE_NORMAL, 1, 0.6, 0.0, 0.0, VOR_BLEND_MULTIPLY},
        {VOR_SHAPE_SHARP, 0, 21.0, 0.3, -0.2, VOR_BLEND_NORMAL},
        {VOR_SHAPE_MEDIUM_SHARP, 1, 0.45, -1.5, 0.7, VOR_BLEND_OVERLAY},
        {VOR_SHAPE_ULTRA_SHARP, 0, 33.0, 4.0, 0.0, VOR_BLEND_SCREEN},
        {VOR_SHAPE_NORMAL, 0, 9.0, 0.0, 0.1, VOR_BLEND_COLOR},
        {VOR_SHAPE_MEDIUM_SHARP, 0, 1e5, 3e9, -3e9, VOR_BLEND_NORMAL},
    };
    for (const Case& c : cases) {
        VorBorderParams p;
        VorBorderInitParams(&p);
        p.style = VOR_BORDER_VIGNETTE;
        p.color = VorColor{30, 60, 200, 210};
        p.blendMode = c.mode;
        p.vignetteScale = c.radius;
        p.stretch = c.stretch;
        p.shapeMode = c.shape_mode;
        p.dx = c.dx;
        p.dy = c.dy;
        TestBitmap lanes(61, 37), reference(61, 37);
        vorlite::generate::draw_vignette(lanes.get(), &p, true);
        vorlite::generate::draw_vignette(reference.get(), &p, false);
        EXPECT_TRUE(lanes == reference) << c.shape_mode << " " << c.radius;
        EXPECT_FALSE(lanes.unchanged()) << c.shape_mode << " " << c.radius;
    }
    // Large enough for every ramp level to be made before the first row.
    VorBorderParams p;
    VorBorderInitParams(&p);
    p.style = VOR_BORDER_VIGNETTE;
    p.color = VorColor{30, 60, 200, 210};
    p.blendMode = VOR_BLEND_OVERLAY;
    p.vignetteScale = 0.55;
    p.stretch = 1;
    TestBitmap lanes(2048, 1536), reference(2048, 1536);
    vorlite::generate::draw_vignette(lanes.get(), &p, true);
    vorlite::generate::draw_vignette(reference.get(), &p, false);
    EXPECT_TRUE(lanes == reference);
}
