#include <gtest/gtest.h>

#include <string>
#include <vector>

#include "tests/test_support.h"
#include "zentra_vorlite.h"

namespace {

using vorlite::test::checksum;
using vorlite::test::Json;
using vorlite::test::run;
using vorlite::test::TestBitmap;

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
        p.color = VorColor{30, 60, 90, 200};
        p.seed = 5;
    }
};

TEST(BorderDecoders, StyleAndShapeKeywords) {
    const char* styles[] = {"halftone", "lines", "smooth", "shadow", "fade", "rough", "bulge", "torn",
                            "torn_2", "rect", "round", "glimmo", "hard_rand", "instant", "vignette", "viewfinder"};
    for (int32_t i = 0; i < 16; ++i) {
        const Json j("\"" + std::string(styles[i]) + "\"");
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

TEST(Borders, StylesWithoutARendererLeaveThePicture) {
    for (const int32_t style : {int32_t{VOR_BORDER_NONE}, int32_t{VOR_BORDER_INSTANT}, int32_t{17}, int32_t{-3}}) {
        TestBitmap b(20, 10);
        Border border(b.bitmap, style);
        VorBorders(b.get(), &border.p);
        EXPECT_TRUE(b.unchanged()) << style;
    }
}

// White picture, opaque black vignette in the normal mode, so each byte
// reads as 255 minus the opacity the pixel got.
TestBitmap vignetted(uint32_t w, uint32_t h, double radius, uint8_t stretch = 0) {
    TestBitmap b(w, h, VorColor{255, 255, 255, 255});
    VorBorderParams p;
    VorBorderInitParams(&p);
    p.style = VOR_BORDER_VIGNETTE;
    p.color = VorColor{0, 0, 0, 255};
    p.vignetteScale = radius;
    p.stretch = stretch;
    VorBorders(b.get(), &p);
    return b;
}

TEST(Vignette, ClearCentreSmoothRampAndAJumpToFullAtTheRadius) {
    const TestBitmap b = vignetted(81, 1, 30.0);
    // t = d^2 / (30^2 x 0.8695652): below 0.04 (d <= 5) nothing changes;
    // the ramp reaches about 0.99 at d = 30 and jumps to 1 just beyond.
    EXPECT_EQ(b.pixel(40).r, 255);
    EXPECT_EQ(b.pixel(45).r, 255);
    EXPECT_LT(b.pixel(46).r, 255);
    for (std::size_t x = 41; x < 70; ++x) EXPECT_LE(b.pixel(x + 1).r, b.pixel(x).r) << x;
    EXPECT_GT(b.pixel(70).r, 0);
    EXPECT_EQ(b.pixel(71).r, 0);
    EXPECT_EQ(b.pixel(80).r, 0);
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

TEST(BandedFrames, WriteTheirInsetBackAndPaintAllFourBytesOutside) {
    TestBitmap b(100, 80);
    Border border(b.bitmap, VOR_BORDER_HALFTONE);
    border.p.inset = 2.0;
    VorBorders(b.get(), &border.p);
    // B = 180 x 0.033333335 = 6.0000005; the inset is trunc(2 B) = 12.
    EXPECT_EQ(border.p.insetLeft, 12.0);
    EXPECT_EQ(border.p.insetBottom, 12.0);

    TestBitmap s(100, 80);
    Border smooth(s.bitmap, VOR_BORDER_SMOOTH);
    smooth.p.inset = 3.0;
    VorBorders(s.get(), &smooth.p);
    for (int c = 0; c < 4; ++c) EXPECT_EQ(s.at(1, 40, c), (&smooth.p.color.r)[c]);
    EXPECT_EQ(s.at(50, 40, 3), s.before[(40 * 100 + 50) * 4 + 3]);
    EXPECT_NE(s.at(5, 40, 0), s.before[(40 * 100 + 5) * 4]);
    EXPECT_EQ(s.at(50, 40, 0), s.before[(40 * 100 + 50) * 4]);

    // The viewfinder keeps the caller's insets.
    TestBitmap v(100, 80);
    Border viewfinder(v.bitmap, VOR_BORDER_VIEWFINDER);
    viewfinder.p.insetTop = 9.0;
    VorBorders(v.get(), &viewfinder.p);
    EXPECT_EQ(viewfinder.p.insetTop, 9.0);
    EXPECT_EQ(viewfinder.p.insetLeft, 0.0);
    EXPECT_EQ(v.at(50, 8, 0), viewfinder.p.color.r);
}

TEST(BandedFrames, EachStyleTheSameOnEveryPlatformAndSeeded) {
    const std::pair<int32_t, uint32_t> styles[] = {
        {VOR_BORDER_HALFTONE, 498186788u}, {VOR_BORDER_LINES, 507199619u}, {VOR_BORDER_SMOOTH, 3834591790u}, {VOR_BORDER_SHADOW, 2074940347u},
        {VOR_BORDER_FADE, 3589777004u},     {VOR_BORDER_ROUGH, 589468756u}, {VOR_BORDER_VIEWFINDER, 3243210250u}, {VOR_BORDER_HARD_RAND, 3046902400u},
    };
    for (const auto& [style, sum] : styles) {
        TestBitmap b(61, 47);
        Border border(b.bitmap, style);
        border.p.inset = 0.5;
        border.p.shadowAngle = 30.0;
        VorBorders(b.get(), &border.p);
        EXPECT_EQ(checksum(b), sum) << style;
        EXPECT_TRUE(b.alpha_kept()) << style;
        if (style == VOR_BORDER_ROUGH || style == VOR_BORDER_VIEWFINDER || style == VOR_BORDER_HARD_RAND) {
            TestBitmap other(61, 47);
            Border reseeded(other.bitmap, style);
            reseeded.p.inset = 0.5;
            reseeded.p.seed = 6;
            VorBorders(other.get(), &reseeded.p);
            EXPECT_NE(checksum(other), sum) << style;
        }
    }
}

TEST(RoughFrame, BlendsOutsideItsTornEdgesAndKeepsAlpha) {
    TestBitmap b(64, 48);
    Border border(b.bitmap, VOR_BORDER_HARD_RAND);
    border.p.opacity = 1.0;
    border.p.cornerOffset = 3.0;
    VorBorders(b.get(), &border.p);
    EXPECT_TRUE(b.alpha_kept());
    EXPECT_EQ(border.left[47], 3.0f);
    EXPECT_EQ(border.bottom[0], 3.0f);
    EXPECT_EQ(border.top[63], 0.0f);
    EXPECT_EQ(b.at(0, 0, 1), 60);
    EXPECT_EQ(b.at(32, 24, 1), b.before[(24 * 64 + 32) * 4 + 1]);
}

}  // namespace
