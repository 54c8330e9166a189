#include <gtest/gtest.h>

#include <limits>
#include <string>

#include "tests/test_support.h"
#include "zentra_vorlite.h"

namespace {

using vorlite::test::checksum;
using vorlite::test::Json;
using vorlite::test::run;
using vorlite::test::TestBitmap;

const VorColor k_warm{255, 210, 160, 230};

bool pixel_unchanged(const TestBitmap& b, uint32_t x, uint32_t y) {
    const std::size_t i = (std::size_t{y} * b.width + x) * 4;
    for (int c = 0; c < 4; ++c) {
        if (b.bytes[i + c] != b.before[i + c]) return false;
    }
    return true;
}

TEST(Flare, NothingWithoutAlphaOrSize) {
    const VorColor clear{255, 255, 255, 0};
    for (int k = 0; k < 4; ++k) {
        TestBitmap b(21, 17);
        const VorColor& c = k == 0 ? clear : k_warm;
        VorFlare(b.get(), k == 1 ? 0.0f : 1.0f, &c, VOR_FLARE_BLOB_2, 0.0f, 0.0f, k == 2 ? 0.0f : 0.5f,
                 k == 3 ? 0.0f : 0.5f, VOR_BLEND_SCREEN);
        EXPECT_TRUE(b.unchanged()) << k;
    }
}

TEST(Flare, OnlyTheWorkBoxChanges) {
    // blob: +-0.71 scaled by 0.5 gives columns floor(((+-0.355 + 1) x 40 + 1) / 2),
    // 13 up to 27 (not included), and rows 9 up to 20 of 30.
    TestBitmap b(40, 30, VorColor{0, 0, 0, 42});
    VorFlare(b.get(), 1.0f, &k_warm, VOR_FLARE_BLOB, 0.0f, 0.0f, 0.5f, 0.5f, VOR_BLEND_NORMAL);
    for (uint32_t y = 0; y < 30; ++y) {
        for (uint32_t x = 0; x < 40; ++x) {
            const bool outside = x < 13 || x >= 27 || y < 9 || y >= 20;
            if (outside) {
                ASSERT_TRUE(pixel_unchanged(b, x, y)) << x << "," << y;
            }
        }
    }
    EXPECT_GT(b.at(20, 15, 0), 200);
    EXPECT_TRUE(b.alpha_kept());
}

TEST(Flare, BoundedShapesFarOutsideDrawNothing) {
    for (const int32_t type : {0, 1, 2, 3, 4, 9, 10, 17, 18}) {
        TestBitmap b(30, 20);
        VorFlare(b.get(), 1.0f, &k_warm, type, 40.0f, -3.0f, 0.4f, 0.4f, VOR_BLEND_SCREEN);
        EXPECT_TRUE(b.unchanged()) << type;
    }
}

TEST(Flare, SincLeavesItsExactCentreClear) {
    TestBitmap b(31, 21, VorColor{10, 10, 10, 42});
    VorFlare(b.get(), 0.2f, &k_warm, VOR_FLARE_SINC, 0.0f, 0.0f, 1.0f, 1.0f, VOR_BLEND_NORMAL);
    EXPECT_TRUE(pixel_unchanged(b, 15, 10));
    EXPECT_FALSE(pixel_unchanged(b, 16, 10));
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
    for (const char* bad : {"\"diamondFlare\"", "\"\"", "11", "null"}) {
        const Json j(bad);
        VorFlareType t = -1;
        EXPECT_EQ(VLPLFlareTypeFromFlareTypeVal(j.value, &t), 0) << bad;
    }
}

std::string flare_document(const std::string& type, const std::string& extra = "") {
    return R"({"color": {"r": 255, "g": 200, "b": 140, "a": 200}, "blendMode": "screen", "type": ")" + type +
           R"(", "dx": 0.2, "dy": -0.1, "dsx": 0.6, "dsy": 0.5, "fScale": 1.2)" + extra + "}";
}

TEST(FlareProcessor, EachExactShapeTheSameOnEveryPlatform) {
    const std::pair<const char*, uint32_t> shapes[] = {
        {"sinc", 1617568533u},  {"gaussianThing", 1676660823u}, {"gaussianThing2", 2155615570u}, {"gaussianThing3", 2829139691u}, {"gaussianThing4", 61054771u},
        {"stripe", 4267128744u}, {"stripe2", 3059741393u},      {"blob", 3072859416u},           {"blob2", 393260032u},
    };
    for (const auto& [type, sum] : shapes) {
        TestBitmap b(41, 31);
        ASSERT_EQ(run(VLPLRunFlareProcessor, flare_document(type), b.get(), 0.9), 1) << type;
        EXPECT_TRUE(b.alpha_kept());
        EXPECT_EQ(checksum(b), sum) << type;
    }
}

TEST(FlareProcessor, EachDesignedShapeIsLockedAndKeepsAlpha) {
    const std::pair<const char*, uint32_t> shapes[] = {
        {"angleGaussian", 464130900u}, {"stardom", 2761628532u},     {"lobes", 689894675u},     {"dimondFlare", 2293481914u}, {"crossFlare", 3939885250u},
        {"cornerFlares", 1761551564u},  {"fingerFlare", 1998663608u}, {"blobFlare", 2939811948u}, {"blah", 593473566u},
    };
    for (const auto& [type, sum] : shapes) {
        TestBitmap b(41, 31);
        ASSERT_EQ(run(VLPLRunFlareProcessor, flare_document(type), b.get()), 1) << type;
        EXPECT_TRUE(b.alpha_kept());
        EXPECT_FALSE(b.unchanged()) << type;
        EXPECT_EQ(checksum(b), sum) << type;
    }
}

TEST(FlareProcessor, StrengthScalesAlphaAndFailuresTouchNothing) {
    // Strength 0 makes alpha 0: nothing is drawn, yet the run succeeds.
    TestBitmap weak(20, 20);
    EXPECT_EQ(run(VLPLRunFlareProcessor, flare_document("blob2"), weak.get(), 0.0), 1);
    EXPECT_TRUE(weak.unchanged());
    const std::string bad[] = {
        flare_document("diamondFlare"),
        R"({"color": {"r": 255, "g": 200, "b": 140, "a": 200}, "type": "blob", "dx": 0, "dy": 0, "dsx": 1,
            "dsy": 1, "fScale": 1})",
        R"({"color": {"r": 255, "g": 200, "b": 140, "a": 300}, "blendMode": "screen", "type": "blob",
            "dx": 0, "dy": 0, "dsx": 1, "dsy": 1, "fScale": 1})",
        R"({"color": {"r": 255, "g": 200, "b": 140, "a": 200}, "blendMode": "screen", "type": "blob",
            "dx": 0, "dy": 0, "dsx": 1, "dsy": 1})",
        "[]",
    };
    for (const std::string& parameters : bad) {
        TestBitmap b(12, 9);
        EXPECT_EQ(run(VLPLRunFlareProcessor, parameters, b.get()), 0) << parameters;
        EXPECT_TRUE(b.unchanged()) << parameters;
    }
}

TEST(FlareProcessor, SurvivesDegenerateNumbers) {
    const char* types[] = {"sinc", "blob", "stripe", "angleGaussian", "cornerFlares", "blah"};
    const char* numbers[] = {R"("dx": 1e308, "dy": -1e308, "dsx": 0.5, "dsy": 0.5, "fScale": 3)",
                             R"("dx": 0, "dy": 0, "dsx": 1e-30, "dsy": 1e30, "fScale": 3)",
                             R"("dx": 0.1, "dy": 0, "dsx": -0.5, "dsy": 0.5, "fScale": 1e38)"};
    for (const char* type : types) {
        for (const char* n : numbers) {
            std::string parameters = R"({"color": {"r": 255, "g": 200, "b": 140, "a": 200}, "blendMode": "screen",
                "type": ")" + std::string(type) + R"(", )" + n + "}";
            TestBitmap b(9, 7);
            EXPECT_EQ(run(VLPLRunFlareProcessor, parameters, b.get()), 1) << parameters;
            EXPECT_TRUE(b.alpha_kept());
        }
    }
}

}  // namespace

namespace {

TEST(RingFlare, LightsOnlyItsBoxAndNothingWithoutRadius) {
    TestBitmap b(60, 40, VorColor{20, 20, 20, 42});
    const VorColor cool{190, 220, 255, 220};
    VorRingFlare(b.get(), 30.0f, 20.0f, 8.0f, &cool, VOR_BLEND_SCREEN);
    for (uint32_t y = 0; y < 40; ++y) {
        for (uint32_t x = 0; x < 60; ++x) {
            const bool outside = x < 18 || x > 42 || y < 8 || y > 32;
            if (outside) {
                ASSERT_TRUE(pixel_unchanged(b, x, y)) << x << "," << y;
            }
        }
    }
    // Brightest on the ring, dimmer at the centre, alpha kept.
    EXPECT_GT(b.at(38, 20, 2), b.at(30, 20, 2));
    EXPECT_GT(b.at(30, 20, 2), 20);
    EXPECT_TRUE(b.alpha_kept());
    for (const float radius : {0.0f, -3.0f, std::numeric_limits<float>::quiet_NaN()}) {
        TestBitmap t(20, 20);
        VorRingFlare(t.get(), 10.0f, 10.0f, radius, &cool, VOR_BLEND_SCREEN);
        EXPECT_TRUE(t.unchanged());
    }
}

TEST(PresetFlares, SeededWeighedByStrengthAndLocked) {
    using Preset = void (*)(VorBitmap*, const VLPLRunOptions*);
    const std::pair<Preset, uint32_t> presets[] = {{VorFlareLegacyCorvale, 3757588115u}, {VorFlareLegacyEmberly, 3558511737u}};
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
    }
}

}  // namespace
