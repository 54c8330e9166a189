#include <gtest/gtest.h>

#include <string>
#include <vector>

#include "generate/generate_internal.h"
#include "tests/test_support.h"
#include "zentra_vorlite.h"

namespace {

using vorlite::test::checksum;
using vorlite::test::run;
using vorlite::test::TestBitmap;

// A gradient that frees itself, with colour stops (r = g = b = level) and
// opacity stops given as {value, location} pairs.
struct Gradient {
    VorGradient g{};
    Gradient(std::vector<std::pair<int, double>> colours, std::vector<std::pair<double, double>> opacities) {
        EXPECT_EQ(VorGradientBuild(&g, static_cast<uint32_t>(colours.size()),
                                   static_cast<uint32_t>(opacities.size())),
                  1);
        for (std::size_t i = 0; i < colours.size(); ++i) {
            const auto level = static_cast<uint8_t>(colours[i].first);
            g.colorStops[i] = {{level, level, level, 255}, colours[i].second};
        }
        for (std::size_t i = 0; i < opacities.size(); ++i) g.opacityStops[i] = {opacities[i].first, opacities[i].second};
    }
    ~Gradient() { VorGradientFree(&g); }
    std::vector<VorColor> table(uint32_t n = 1024) const {
        std::vector<VorColor> t(n);
        VorGradientMemoize(&g, t.data(), n);
        return t;
    }
};

TEST(GradientMemoize, RampsFromFirstToLastStopEasedTowardTheStops) {
    const Gradient ramp({{0, 0.0}, {255, 100.0}}, {{0.0, 0.0}, {1.0, 100.0}});
    const auto t = ramp.table();
    EXPECT_EQ(t[0].r, 0);
    EXPECT_EQ(t[1023].r, 255);
    EXPECT_EQ(t[0].a, 0);
    EXPECT_EQ(t[1023].a, 255);
    for (uint32_t i = 1; i < 1024; ++i) ASSERT_GE(t[i].r, t[i - 1].r) << i;
    // The ease holds colours near their stops: a quarter of the way along
    // (t = 0.25), sin(-pi/2) takes 12.375/255 off t, giving 51, not 63.
    EXPECT_EQ(t[256].r, 51);
    EXPECT_EQ(t[512].r, 127);
}

TEST(GradientMemoize, OpacityRampEndsAtTheColourStopOfItsUpperIndex) {
    // Three colour stops, two opacity stops: the opacity span 0..100 is
    // measured against colour stop 1 at 25, so full opacity arrives at 25.
    const Gradient g({{0, 0.0}, {100, 25.0}, {255, 100.0}}, {{0.0, 0.0}, {1.0, 100.0}});
    const auto t = g.table();
    EXPECT_EQ(t[0].a, 0);
    EXPECT_EQ(t[300].a, 255);
    EXPECT_EQ(t[700].a, 255);
    EXPECT_LT(t[100].a, 200);
    EXPECT_GT(t[100].a, 0);
}

TEST(GradientMemoize, TooFewStopsLeaveTheTableAlone) {
    const Gradient one({{255, 0.0}}, {{1.0, 0.0}, {1.0, 100.0}});
    std::vector<VorColor> t(1024, VorColor{1, 2, 3, 4});
    VorGradientMemoize(&one.g, t.data(), 1024);
    EXPECT_EQ(t[500].r, 1);
    EXPECT_EQ(t[500].a, 4);
}

TEST(GradientBuild, RefusesCountsWhoseBytesPass32Bits) {
    VorGradient g{};
    EXPECT_EQ(VorGradientBuild(&g, 0x10000000u, 2), 0);
    EXPECT_EQ(g.colorStops, nullptr);
    EXPECT_EQ(g.opacityStops, nullptr);
    EXPECT_EQ(g.colorStopCount, 0x10000000u);
    EXPECT_EQ(VorGradientBuild(&g, 3, 0x0FFFFFFFu / 64), 1);
    VorGradientFree(&g);
    VorGradientFree(&g);
}

VorGradientShapeParams shape(int32_t kind, double x_center = 0.0, double scale = 1.0) {
    VorGradientShapeParams p;
    VorGradientShapeParamsInit(&p);
    p.shape = kind;
    p.xCenter = x_center;
    p.yCenter = 0.0;
    p.scale = scale;
    return p;
}

TEST(GradientApply, LinearPixelsTakeTheEntryOfTheirRoundedCoordinate) {
    const Gradient ramp({{0, 0.0}, {255, 100.0}}, {{1.0, 0.0}, {1.0, 100.0}});
    const auto t = ramp.table();
    TestBitmap b(4, 2);
    const auto p = shape(VOR_GRADIENT_LINEAR);
    VorGradientApply(b.get(), &p, &ramp.g, VOR_BLEND_NORMAL, 1.0);
    // u = x / 4: indices floor(g * 1023 + 0.5) are 0, 256, 512 and 767.
    const uint32_t index[4] = {0, 256, 512, 767};
    for (uint32_t x = 0; x < 4; ++x) EXPECT_EQ(b.at(x, 0, 0), t[index[x]].r) << x;
    EXPECT_TRUE(b.alpha_kept());
}

TEST(GradientApply, RadialClampsToTheLastEntryBeyondItsScale) {
    const Gradient ramp({{10, 0.0}, {200, 100.0}}, {{1.0, 0.0}, {1.0, 100.0}});
    TestBitmap b(9, 9);
    const auto p = shape(VOR_GRADIENT_RADIAL, 0.0, 0.5);
    VorGradientApply(b.get(), &p, &ramp.g, VOR_BLEND_NORMAL, 1.0);
    EXPECT_EQ(b.at(0, 0, 1), 10);
    EXPECT_EQ(b.at(8, 8, 1), 200);
    EXPECT_EQ(b.at(5, 0, 1), 200);
}

TEST(GradientApply, ZeroScaleOrZeroOpacityLeavesThePixels) {
    const Gradient ramp({{0, 0.0}, {255, 100.0}}, {{1.0, 0.0}, {1.0, 100.0}});
    TestBitmap b(7, 5);
    auto p = shape(VOR_GRADIENT_LINEAR, 0.0, 0.0);
    VorGradientApply(b.get(), &p, &ramp.g, VOR_BLEND_NORMAL, 1.0);
    EXPECT_TRUE(b.unchanged());
    p.scale = 1.0;
    VorGradientApply(b.get(), &p, &ramp.g, VOR_BLEND_NORMAL, 0.0);
    EXPECT_TRUE(b.unchanged());
}

const std::string k_stops =
    R"("colors": [{"color": {"r": 20, "g": 40, "b": 200, "a": 255}, "location": 0},
                  {"color": {"r": 250, "g": 180, "b": 20, "a": 255}, "location": 100}],
       "opacities": [{"opacity": 0.9, "location": 0}, {"opacity": 0.2, "location": 100}])";

std::string document(const std::string& shape_name, const std::string& extra = "") {
    return "{" + k_stops + R"(, "gradientShape": ")" + shape_name +
           R"(", "scale": 0.8, "xCenter": 0.3, "yCenter": 0.6, "angle": 30, "alpha": 0.9)" + extra + "}";
}

const std::string k_vignette = R"(, "vignetteShape": {"vignetteScale": 0.6, "scaling": "stretch"})";

TEST(GradientProcessor, DrawsEachShapeTheSameOnEveryPlatform) {
    struct Case {
        std::string parameters;
        uint32_t sum;
    };
    const Case cases[] = {
        {document("linear"), 3705395921u},
        {document("radial", R"(, "blendMode": "multiply")"), 1421793604u},
        {document("linearVignette", k_vignette + R"(, "blendMode": "screen")"), 3132402165u},
    };
    for (const Case& c : cases) {
        TestBitmap b(37, 23);
        ASSERT_EQ(run(VLPLRunGradientProcessor, c.parameters, b.get(), 0.8), 1) << c.parameters;
        EXPECT_TRUE(b.alpha_kept());
        EXPECT_EQ(checksum(b), c.sum) << c.parameters;
    }
}

TEST(GradientProcessor, VignetteShapeLeavesTheCentreAndColoursTheCorners) {
    // Weight 0 near the centre (t < 0.04), 1 in the corners (t > 1.15),
    // where the pixel is exactly the plain linear gradient's.
    TestBitmap b(41, 31);
    TestBitmap linear(b);
    ASSERT_EQ(run(VLPLRunGradientProcessor, document("linearVignette", k_vignette), b.get()), 1);
    ASSERT_EQ(run(VLPLRunGradientProcessor, document("linear"), linear.get()), 1);
    for (int c = 0; c < 4; ++c) {
        EXPECT_EQ(b.at(20, 15, c), b.before[(15 * 41 + 20) * 4 + c]);
        EXPECT_EQ(b.at(0, 0, c), linear.at(0, 0, c));
        EXPECT_EQ(b.at(40, 30, c), linear.at(40, 30, c));
    }
}

TEST(GradientProcessor, RefusesUnusableDocumentsWithoutTouchingPixels) {
    const std::string one_colour =
        R"({"colors": [{"color": {"r": 1, "g": 2, "b": 3, "a": 255}, "location": 0}],
            "opacities": [{"opacity": 1, "location": 0}, {"opacity": 1, "location": 100}],
            "gradientShape": "linear", "scale": 1, "xCenter": 0, "yCenter": 0, "angle": 0, "alpha": 1})";
    std::string more_opacities = "{";
    more_opacities += k_stops.substr(0, k_stops.find("\"opacities\""));
    more_opacities +=
        R"("opacities": [{"opacity": 1, "location": 0}, {"opacity": 1, "location": 50},
                         {"opacity": 1, "location": 100}],
           "gradientShape": "linear", "scale": 1, "xCenter": 0, "yCenter": 0, "angle": 0, "alpha": 1})";
    const std::string bad[] = {
        document("conic"),
        document("linearVignette"),
        document("linearVignette", R"(, "vignetteShape": {"vignetteScale": 1, "scaling": "huge"})"),
        R"({"gradientShape": "linear", "scale": 1, "xCenter": 0, "yCenter": 0, "angle": 0, "alpha": 1})",
        "{" + k_stops + R"(, "gradientShape": "linear", "scale": "1", "xCenter": 0, "yCenter": 0,
                           "angle": 0, "alpha": 1})",
        one_colour,
        more_opacities,
        R"({"colors": [1, 2], "opacities": [3, 4], "gradientShape": "linear", "scale": 1,
            "xCenter": 0, "yCenter": 0, "angle": 0, "alpha": 1})",
        "[]",
    };
    for (const std::string& parameters : bad) {
        TestBitmap b(9, 7);
        EXPECT_EQ(run(VLPLRunGradientProcessor, parameters, b.get()), 0) << parameters;
        EXPECT_TRUE(b.unchanged()) << parameters;
    }
}

TEST(GradientProcessor, SurvivesDegenerateNumbers) {
    const std::string extremes[] = {
        R"(, "scale": 1e-300)", R"(, "xCenter": 1e300)", R"(, "angle": 1e308)", R"(, "alpha": -5)",
    };
    for (const std::string& extreme : extremes) {
        std::string parameters = document("radial");
        const std::string key = extreme.substr(3, extreme.find('"', 3) - 3);
        const auto at = parameters.find("\"" + key + "\"");
        const auto end = parameters.find_first_of(",}", at);
        parameters.replace(at, end - at, extreme.substr(2));
        TestBitmap b(6, 4);
        EXPECT_EQ(run(VLPLRunGradientProcessor, parameters, b.get()), 1) << parameters;
        EXPECT_TRUE(b.alpha_kept());
    }
    TestBitmap empty(0, 0);
    EXPECT_EQ(run(VLPLRunGradientProcessor, document("linear"), empty.get()), 1);
}

}  // namespace

// The row indices formed four at a time store what the pixel-by-pixel
// reference stores, for every shape, angles that make the coordinate fall
// and rise, centres and scales that clamp, a scale whose inverse
// overflows, and the colour mode's own path; on a small bitmap and on one
// large enough for each row's entries to be filled before its pixels.
TEST(GradientApply, LanesStoreTheReferenceBytes) {
    struct Case {
        int32_t shape;
        double scale, x, y, angle;
        uint32_t mode;
    };
    const Case cases[] = {
        {VOR_GRADIENT_LINEAR, 1.0, 0.0, 0.0, 0.5, VOR_BLEND_OVERLAY},
        {VOR_GRADIENT_LINEAR, -0.7, 0.3, 0.9, 2.9, VOR_BLEND_MULTIPLY},
        {VOR_GRADIENT_LINEAR, 0.01, 0.5, 0.5, -1.2, VOR_BLEND_COLOR},
        {VOR_GRADIENT_RADIAL, 0.6, 0.4, 0.6, 0.0, VOR_BLEND_SCREEN},
        {VOR_GRADIENT_RADIAL, 3e5, -2.0, 7.0, 0.0, VOR_BLEND_NORMAL},
        {VOR_GRADIENT_LINEAR, 1e-310, 0.5, 0.5, 0.3, VOR_BLEND_OVERLAY},
    };
    Gradient g({{20, 0.0}, {240, 40.0}, {90, 100.0}}, {{1.0, 0.0}, {0.3, 60.0}, {0.8, 100.0}});
    for (const Case& c : cases) {
        VorGradientShapeParams p;
        VorGradientShapeParamsInit(&p);
        p.shape = c.shape;
        p.scale = c.scale;
        p.xCenter = c.x;
        p.yCenter = c.y;
        p.angle = c.angle;
        for (const uint32_t width : {67u, 1031u}) {
            const uint32_t height = width == 67 ? 23 : 769;
            TestBitmap lanes(width, height, 5), reference(width, height, 5);
            vorlite::generate::apply_gradient(&lanes.bitmap, &p, &g.g, c.mode, 0.9, true);
            vorlite::generate::apply_gradient(&reference.bitmap, &p, &g.g, c.mode, 0.9, false);
            EXPECT_TRUE(lanes.bytes == reference.bytes) << c.shape << " " << c.angle << " " << width;
            EXPECT_FALSE(lanes.bytes == lanes.before) << c.shape << " " << c.angle << " " << width;
        }
    }
}
