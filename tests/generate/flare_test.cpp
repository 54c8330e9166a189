#include <gtest/gtest.h>

#include <algorithm>
#include <limits>
#include <string>
#include <vector>

#include "tests/test_support.h"
#include "zentra_vorlite.h"

namespace {

using vorlite::test::checksum;
using vorlite::test::Json;
using vorlite::test::run;
using vorlite::test::TestBitmap;

const VorColor k_warm{255, 210, 160, 230};
const VorColor k_white{255, 255, 255, 255};
const VorColor k_black{0, 0, 0, 42};
// A mode without a rule writes 0 into every pixel it blends, whatever the
// level: it shows exactly which pixels a flare visits.
constexpr uint32_t k_probe_mode = 7;

bool pixel_unchanged(const TestBitmap& b, uint32_t x, uint32_t y) {
    const std::size_t i = (std::size_t{y} * b.width + x) * 4;
    return std::equal(&b.bytes[i], &b.bytes[i + 4], &b.before[i]);
}

struct Box {
    uint32_t x0, x1, y0, y1;  // [x0, x1) x [y0, y1)
    bool operator==(const Box&) const = default;
};

// The changed pixels' bounding box; {0, 0, 0, 0} when none changed.
Box changed_box(const TestBitmap& b) {
    Box box{b.width, 0, b.height, 0};
    for (uint32_t y = 0; y < b.height; ++y) {
        for (uint32_t x = 0; x < b.width; ++x) {
            if (pixel_unchanged(b, x, y)) continue;
            box = {std::min(box.x0, x), std::max(box.x1, x + 1), std::min(box.y0, y), std::max(box.y1, y + 1)};
        }
    }
    return box.x1 == 0 ? Box{0, 0, 0, 0} : box;
}

TEST(Flare, NothingWithoutAlphaOrSize) {
    const VorColor clear{255, 255, 255, 0};
    for (int k = 0; k < 4; ++k) {
        TestBitmap b(21, 17);
        const VorColor& c = k == 0 ? clear : k_warm;
        VorFlare(b.get(), k == 1 ? 0.0f : 1.0f, &c, VOR_FLARE_BLOB_2, 0.0f, 0.0f, k == 2 ? 0.0f : 0.5f,
                 k == 3 ? 0.0f : 0.5f, k_probe_mode);
        EXPECT_TRUE(b.unchanged()) << k;
    }
}

TEST(Flare, WorkBoxesScaleShiftAndClampTheTypeRanges) {
    // On 40 x 30 a bound b becomes floor(((b + 1) x size + 1) / 2), e.g.
    // blob's +-0.71 x 0.5 gives columns 13 (13.4) up to 27 (27.6).
    struct Case {
        int32_t type;
        float dx, dy, dsx, dsy;
        Box box;
    };
    const Case cases[] = {
        {VOR_FLARE_BLOB, 0.0f, 0.0f, 0.5f, 0.5f, {13, 27, 10, 20}},
        {VOR_FLARE_BLOB, 0.9f, 0.0f, 0.5f, 0.5f, {31, 40, 10, 20}},   // 45.6 clamped to the width
        {VOR_FLARE_BLOB, 0.9f, 0.0f, -0.5f, 0.5f, {31, 40, 10, 20}},  // a reversed range is swapped
        {VOR_FLARE_STRIPE_2, 0.0f, 0.7f, 0.5f, 0.25f, {0, 40, 17, 30}},
        {VOR_FLARE_GAUSSIAN_THING_3, 0.13f, -0.8f, 0.5f, 0.5f, {13, 36, 0, 13}},  // -8.5 clamped to 0
    };
    for (const Case& c : cases) {
        TestBitmap b(40, 30, VorColor{90, 90, 90, 42});
        VorFlare(b.get(), 1.0f, &k_warm, c.type, c.dx, c.dy, c.dsx, c.dsy, k_probe_mode);
        EXPECT_EQ(changed_box(b), c.box) << c.type << " " << c.dx;
        EXPECT_TRUE(b.alpha_kept());
    }
}

TEST(Flare, CentreFarOutsideVisitsNothingForBoundedTypes) {
    for (const int32_t type : {0, 1, 2, 3, 4, 7, 9, 10, 11, 12, 15, 17, 18}) {
        TestBitmap b(30, 20);
        VorFlare(b.get(), 1.0f, &k_warm, type, 60.0f, -3.0f, 0.4f, 0.4f, k_probe_mode);
        EXPECT_TRUE(b.unchanged()) << type;
    }
    // The whole-image boxes are visited wherever the centre lies; a shape
    // without light changes nothing in a mode with a rule.
    for (const int32_t type : {5, 6, 8, 13, 14, 16, 19, -1}) {
        TestBitmap probed(30, 20), screened(30, 20);
        VorFlare(probed.get(), 1.0f, &k_warm, type, 60.0f, -3.0f, 0.4f, 0.4f, k_probe_mode);
        EXPECT_EQ(changed_box(probed), (Box{0, 30, 0, 20})) << type;
        if (type == 8 || type == 19 || type == -1) {
            VorFlare(screened.get(), 1.0f, &k_warm, type, 0.0f, 0.0f, 0.4f, 0.4f, VOR_BLEND_SCREEN);
            EXPECT_TRUE(screened.unchanged()) << type;
        }
    }
}

TEST(Flare, ExactShapesAtPixelsWorkedByHand) {
    // White at full alpha over black in normal mode leaves the blend level
    // in each channel. On 9 x 9 with unit sizes X = (x - 4) / 4 and
    // Y = (y - 4) / 4; a level is trunc(255 exp(e)).
    struct Case {
        int32_t type;
        float scale;
        uint32_t x, y;
        int level;
    };
    const Case cases[] = {
        {VOR_FLARE_BLOB_2, 1.0f, 4, 4, 255},            // e = 0: the full colour
        {VOR_FLARE_BLOB_2, 1.0f, 6, 4, 136},            // e = -10 / 16
        {VOR_FLARE_BLOB, 1.0f, 5, 4, 254},              // e = -100 / 16^4
        {VOR_FLARE_BLOB, 1.0f, 6, 4, 172},              // e = -100 / 4^4
        {VOR_FLARE_STRIPE, 1.0f, 6, 4, 198},            // e = -1/4
        {VOR_FLARE_STRIPE, 1.0f, 4, 0, 251},            // e = -1/64
        {VOR_FLARE_STRIPE_2, 1.0f, 4, 6, 198},          // e = -1/4
        {VOR_FLARE_STRIPE_2, 1.0f, 0, 4, 251},          // e = -1/64
        {VOR_FLARE_GAUSSIAN_THING, 1.0f, 4, 4, 93},     // e = -16 x 0.5^2 x 0.5^2 = -1
        {VOR_FLARE_GAUSSIAN_THING, 1.0f, 2, 4, 154},    // on the line X = -0.5: e = -2r = -1/2
        {VOR_FLARE_GAUSSIAN_THING_2, 1.0f, 4, 0, 34},   // on the line Y = -1: e = -2
        {VOR_FLARE_GAUSSIAN_THING_2, 1.0f, 4, 4, 4},    // e = -16 x 1 x 0.25 = -4
        {VOR_FLARE_GAUSSIAN_THING_3, 1.0f, 6, 4, 150},  // e = -0.5 - 0.01 x 2.89
        {VOR_FLARE_GAUSSIAN_THING_3, 1.0f, 4, 4, 90},   // e = -0.36 x 2.89
        {VOR_FLARE_GAUSSIAN_THING_4, 1.0f, 4, 4, 90},   // e = -0.5 (2 x 0.36 x 2.89)
        {VOR_FLARE_GAUSSIAN_THING_4, 1.0f, 6, 2, 13},   // e = -0.5 (0.01 x 1.44 + 1.21 x 4.84)
        {VOR_FLARE_SINC, 1.0f, 4, 4, 0},                // q = 0: the centre stays clear
        {VOR_FLARE_SINC, 2.0f, 5, 4, 86},               // q = 1.25: 255 x 0.4 sin q / sqrt q
        {VOR_FLARE_SINC, 1.0f, 5, 4, 0},                // q = 5, a negative lobe: no light
    };
    for (const Case& c : cases) {
        TestBitmap b(9, 9, k_black);
        VorFlare(b.get(), c.scale, &k_white, c.type, 0.0f, 0.0f, 1.0f, 1.0f, VOR_BLEND_NORMAL);
        EXPECT_EQ(b.at(c.x, c.y, 0), c.level) << c.type << " at " << c.x << "," << c.y;
        EXPECT_EQ(b.at(c.x, c.y, 2), c.level) << c.type;
        EXPECT_TRUE(b.alpha_kept());
    }
    // The colour's alpha scales the light: 128/255 x exp(-10 x 0.75^4) x 255.
    TestBitmap half(9, 9, k_black);
    const VorColor faint{255, 255, 255, 128};
    VorFlare(half.get(), 1.0f, &faint, VOR_FLARE_BLOB_2, 0.0f, 0.0f, 1.0f, 1.0f, VOR_BLEND_NORMAL);
    EXPECT_EQ(half.at(7, 4, 0), 5);
    EXPECT_EQ(half.at(4, 4, 0), 128);
}

TEST(Flare, DesignedShapesFadeOutInsideTheirWorkBoxes) {
    // The box a shape visits (shown by the probe) has no light on its rim.
    for (const int32_t type : {VOR_FLARE_LOBES, VOR_FLARE_DIAMOND, VOR_FLARE_CROSS, VOR_FLARE_BLOB_FLARE}) {
        const float size = type == VOR_FLARE_CROSS ? 0.04f : 0.5f;
        TestBitmap probed(81, 61), lit(81, 61, k_black);
        VorFlare(probed.get(), 1.0f, &k_white, type, 0.05f, -0.1f, size, size, k_probe_mode);
        VorFlare(lit.get(), 1.0f, &k_white, type, 0.05f, -0.1f, size, size, VOR_BLEND_SCREEN);
        const Box box = changed_box(probed);
        ASSERT_TRUE(box.x0 > 0 && box.x1 < 81 && box.y0 > 0 && box.y1 < 61) << type;
        for (uint32_t x = box.x0; x < box.x1; ++x) {
            EXPECT_TRUE(pixel_unchanged(lit, x, box.y0) && pixel_unchanged(lit, x, box.y1 - 1)) << type;
        }
        for (uint32_t y = box.y0; y < box.y1; ++y) {
            EXPECT_TRUE(pixel_unchanged(lit, box.x0, y) && pixel_unchanged(lit, box.x1 - 1, y)) << type;
        }
        EXPECT_FALSE(lit.unchanged()) << type;
    }
}

TEST(Flare, TypeKeywords) {
    const char* names[] = {"sinc", "gaussianThing", "gaussianThing2", "gaussianThing3", "gaussianThing4",
                           "angleGaussian", "stardom", "lobes", "", "stripe", "stripe2", "dimondFlare",
                           "crossFlare", "cornerFlares", "fingerFlare", "blobFlare", "blah", "blob", "blob2"};
    for (int32_t i = 0; i < 19; ++i) {
        if (i == VOR_FLARE_NONE) continue;
        const Json j(std::string("\"") + names[i] + "\"");
        VorFlareType t = -1;
        EXPECT_EQ(VLPLFlareTypeFromFlareTypeVal(j.value, &t), 1) << names[i];
        EXPECT_EQ(t, i);
    }
    for (const char* bad : {"\"diamondFlare\"", "\"Sinc\"", "\"\"", "11", "null", "[\"blob\"]"}) {
        const Json j(bad);
        VorFlareType t = -1;
        EXPECT_EQ(VLPLFlareTypeFromFlareTypeVal(j.value, &t), 0) << bad;
    }
    EXPECT_EQ(VLPLFlareTypeFromFlareTypeVal(nullptr, nullptr), 0);
}

const char* const k_keys[] = {R"("color": {"r": 201, "g": 180, "b": 140, "a": 201})", R"("blendMode": "screen")",
                              R"("type": "gaussianThing")", R"("dx": 0.2)", R"("dy": -0.1)", R"("dsx": 0.6)",
                              R"("dsy": 0.5)", R"("fScale": 1.2)"};

// The parameters with every key, one of them left out or replaced.
std::string flare_document(int skip = -1, const std::string& replacement = "") {
    std::string text = "{";
    for (int k = 0; k < 8; ++k) {
        const std::string entry = k == skip ? replacement : k_keys[k];
        if (entry.empty()) continue;
        text += (text.size() > 1 ? ", " : "") + entry;
    }
    return text + "}";
}

TEST(FlareProcessor, DrawsTheFlareWithAlphaScaledByStrength) {
    // trunc(201 x 0.5) = 100, and beyond 255 the alpha stays 255.
    for (const auto& [strength, alpha] : {std::pair{0.5, 100}, std::pair{1.0, 201}, std::pair{2.0, 255}}) {
        TestBitmap run_by_document(33, 25), drawn(33, 25);
        ASSERT_EQ(run(VLPLRunFlareProcessor, flare_document(), run_by_document.get(), strength), 1);
        const VorColor c{201, 180, 140, static_cast<uint8_t>(alpha)};
        VorFlare(drawn.get(), 1.2f, &c, VOR_FLARE_GAUSSIAN_THING, 0.2f, -0.1f, 0.6f, 0.5f, VOR_BLEND_SCREEN);
        EXPECT_FALSE(drawn.unchanged());
        EXPECT_EQ(run_by_document.bytes, drawn.bytes) << strength;
    }
    TestBitmap weak(20, 20);
    EXPECT_EQ(run(VLPLRunFlareProcessor, flare_document(), weak.get(), 0.0), 1);
    EXPECT_TRUE(weak.unchanged());
    // An unknown mode name means normal, as everywhere in documents.
    TestBitmap named(20, 20);
    EXPECT_EQ(run(VLPLRunFlareProcessor, flare_document(1, R"("blendMode": "lighten")"), named.get()), 1);
}

TEST(FlareProcessor, FailuresLeaveThePixelsAlone) {
    std::vector<std::string> bad = {"[]", "3", flare_document(2, R"("type": "diamondFlare")"),
                                    flare_document(0, R"("color": {"r": 1, "g": 2, "b": 3, "a": 300})"),
                                    flare_document(1, R"("blendMode": 3)"), flare_document(3, R"("dx": "0.2")"),
                                    flare_document(7, R"("fScale": null)")};
    for (int k = 0; k < 8; ++k) bad.push_back(flare_document(k));
    for (const std::string& parameters : bad) {
        TestBitmap b(12, 9);
        EXPECT_EQ(run(VLPLRunFlareProcessor, parameters, b.get()), 0) << parameters;
        EXPECT_TRUE(b.unchanged()) << parameters;
    }
}

TEST(FlareShapes, EachDesignedShapeIsLockedAndKeepsAlpha) {
    const std::pair<int32_t, uint32_t> shapes[] = {
        {VOR_FLARE_ANGLE_GAUSSIAN, 4068225927u}, {VOR_FLARE_STARDOM, 3544525254u}, {VOR_FLARE_LOBES, 1038005606u},
        {VOR_FLARE_DIAMOND, 660766849u},         {VOR_FLARE_CROSS, 4225318997u},   {VOR_FLARE_CORNERS, 2690887241u},
        {VOR_FLARE_FINGER, 1175603805u},         {VOR_FLARE_BLOB_FLARE, 4242477054u}, {VOR_FLARE_BLAH, 371794988u},
    };
    for (const auto& [type, sum] : shapes) {
        TestBitmap b(41, 31);
        VorFlare(b.get(), 1.2f, &k_warm, type, 0.2f, -0.1f, 0.6f, 0.5f, VOR_BLEND_SCREEN);
        EXPECT_TRUE(b.alpha_kept());
        EXPECT_FALSE(b.unchanged()) << type;
        EXPECT_EQ(checksum(b), sum) << type;
    }
}

TEST(Flare, SurvivesDegenerateNumbersAndSizes) {
    const float inf = std::numeric_limits<float>::infinity();
    const float nan = std::numeric_limits<float>::quiet_NaN();
    const float values[][5] = {
        // fScale, dx, dy, dsx, dsy
        {1.0f, nan, 0.0f, 0.5f, 0.5f}, {nan, 0.0f, 0.0f, 0.5f, 0.5f},  {1.0f, 0.0f, 0.0f, inf, 0.5f},
        {inf, 0.0f, 0.0f, 0.5f, 0.5f}, {1.0f, -inf, inf, 0.5f, 0.5f},  {1.0f, 0.0f, 0.0f, 1e-30f, 1e30f},
        {3e38f, 0.1f, 0.0f, -0.5f, 0.5f}, {1.0f, 1e30f, -1e30f, 0.5f, 0.5f}, {1e-38f, 0.0f, 0.0f, 1e-38f, 1e-38f},
    };
    const uint32_t sizes[][2] = {{9, 7}, {1, 1}, {1, 6}, {6, 1}};
    for (int32_t type = -1; type <= 19; ++type) {
        for (const auto& v : values) {
            for (const auto& s : sizes) {
                TestBitmap b(s[0], s[1]);
                VorFlare(b.get(), v[0], &k_warm, type, v[1], v[2], v[3], v[4], VOR_BLEND_SCREEN);
                EXPECT_TRUE(b.alpha_kept());
            }
        }
    }
}

TEST(RingFlare, LightsOnlyItsBoundingBox) {
    TestBitmap b(60, 40, VorColor{20, 20, 20, 42});
    const VorColor cool{190, 220, 255, 220};
    VorRingFlare(b.get(), 30.0f, 20.0f, 8.0f, &cool, VOR_BLEND_SCREEN);
    // The box reaches 1.4 radii: 30 +- 11.2 and 20 +- 11.2.
    const Box box = changed_box(b);
    EXPECT_TRUE(box.x0 >= 18 && box.x1 <= 43 && box.y0 >= 8 && box.y1 <= 33);
    // Brightest on the ring, a dimmer glow at the centre.
    EXPECT_GT(b.at(38, 20, 2), b.at(30, 20, 2));
    EXPECT_GT(b.at(30, 20, 2), 20);
    EXPECT_TRUE(b.alpha_kept());
    // A ring a few pixels wide keeps its band inside its box too.
    TestBitmap small(30, 30, VorColor{20, 20, 20, 42});
    VorRingFlare(small.get(), 15.0f, 15.0f, 2.0f, &cool, VOR_BLEND_SCREEN);
    const Box around = changed_box(small);
    EXPECT_TRUE(around.x0 >= 10 && around.x1 <= 21 && around.y0 >= 10 && around.y1 <= 21);
    const float nan = std::numeric_limits<float>::quiet_NaN();
    const float rings[][3] = {{10, 10, 0}, {10, 10, -3}, {10, 10, nan}, {nan, 10, 5}, {10, 1e30f, 5}, {-500, 10, 5}};
    for (const auto& r : rings) {
        TestBitmap t(20, 20);
        VorRingFlare(t.get(), r[0], r[1], r[2], &cool, VOR_BLEND_SCREEN);
        EXPECT_TRUE(t.unchanged());
    }
}

TEST(PresetFlares, SeededWeighedByStrengthAndLocked) {
    using Preset = void (*)(VorBitmap*, const VLPLRunOptions*);
    const std::pair<Preset, uint32_t> presets[] = {{VorFlareLegacyCorvale, 4270743521u},
                                                   {VorFlareLegacyEmberly, 3796315579u}};
    for (const auto& [preset, sum] : presets) {
        TestBitmap one(64, 48), two(64, 48), none(64, 48);
        const VLPLRunOptions o = vorlite::test::run_options(0.8, 12);
        preset(one.get(), &o);
        preset(two.get(), &o);
        EXPECT_EQ(one.bytes, two.bytes);
        EXPECT_TRUE(one.alpha_kept());
        EXPECT_EQ(checksum(one), sum);
        const VLPLRunOptions off = vorlite::test::run_options(0.0, 12);
        preset(none.get(), &off);
        EXPECT_TRUE(none.unchanged());
        // The seed places the light: some seed puts it elsewhere.
        bool moved = false;
        for (uint32_t seed = 0; seed < 8 && !moved; ++seed) {
            TestBitmap other(64, 48);
            const VLPLRunOptions s = vorlite::test::run_options(0.8, seed);
            preset(other.get(), &s);
            moved = other.bytes != one.bytes;
        }
        EXPECT_TRUE(moved);
    }
}

}  // namespace
