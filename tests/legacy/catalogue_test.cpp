#include <gtest/gtest.h>

#include <cmath>
#include <limits>
#include <string>
#include <vector>

#include "tests/test_support.h"
#include "zentra_vorlite.h"

namespace {

using vorlite::test::Json;
using vorlite::test::run_options;
using vorlite::test::TestBitmap;

const char* const k_names[] = {
    "mar_tessaBorder", "kip_coolBorder", "veskBorder", "skarnBorder", "nerioBorder", "kvantBorder",
    "holmvaleBorder", "duskoBorder", "rubraBorder", "bi_chromeBorder", "pallorBorder", "corvaleBorder",
    "emberlyBorder", "terrowBorder", "zenitBorder", "old_kvantBorder", "lira_griffinBorder", "tawnetBorder",
    "narwBorder", "kairoBorder", "colosBorder", "lanaiBorder", "claretBorder", "umbraBorder",
    "corvaleFlare", "emberlyFlare", "soft_focus", "mar_tessaAutoColors", "glimmoBWBorder",
    "glimmoTintypeBorder", "glimmoTintypeColorMatrixTransform", "glimmoTintypeDiamondSquare",
    "glimmoVintageColorMatrixTransform", "murmelGrittyPSSat", "murmelGrittyDots", "murmelBWPSSat",
    "murmelCinematicPSSat", "clarityEnhance"};

int run_named(const std::string& name, VorBitmap* bitmap, const VLPLRunOptions& options) {
    const Json json("{\"legacyName\": \"" + name + "\"}");
    return VLPLRunLegacyProcessor(json.value, bitmap, &options);
}

// A bitmap whose middle is what a frame never touches, its levels held
// within 40..200 like a dull photo, so the auto colours have a range to stretch.
TestBitmap photo() {
    TestBitmap image(96, 64, 5);
    for (std::size_t i = 0; i < image.bytes.size(); ++i)
        if (i % 4 != 3) image.bytes[i] = static_cast<uint8_t>(40 + image.bytes[i] * 160 / 255);
    image.snapshot();
    return image;
}

TEST(LegacyCatalogue, EveryNameRunsAndOnlyBordersWaitForBordersEnabled) {
    for (std::size_t i = 0; i < 38; ++i) {
        const bool gated = i < 24;
        VLPLRunOptions off = run_options(1.0, 3);
        off.bordersEnabled = 0;
        TestBitmap image = photo();
        EXPECT_EQ(run_named(k_names[i], image.get(), off), 1) << k_names[i];
        EXPECT_EQ(image.unchanged(), gated) << k_names[i];
        VLPLRunOptions on = run_options(1.0, 3);
        on.bordersEnabled = 1;
        TestBitmap drawn = photo();
        EXPECT_EQ(run_named(k_names[i], drawn.get(), on), 1) << k_names[i];
        EXPECT_FALSE(drawn.unchanged()) << k_names[i];
    }
}

TEST(LegacyCatalogue, UnknownMistypedOrMissingNamesAreRefused) {
    const VLPLRunOptions options = run_options();
    const char* const refused[] = {"{\"legacyName\": \"kip_coolborder\"}", "{\"legacyName\": \"\"}",
                                   "{\"legacyName\": 2}", "{\"legacyName\": [\"soft_focus\"]}",
                                   "{\"name\": \"soft_focus\"}", "[\"soft_focus\"]", "\"soft_focus\""};
    for (const char* text : refused) {
        const Json json(text);
        TestBitmap image = photo();
        EXPECT_EQ(VLPLRunLegacyProcessor(json.value, image.get(), &options), 0) << text;
        EXPECT_TRUE(image.unchanged()) << text;
    }
    TestBitmap image = photo();
    EXPECT_EQ(VLPLRunLegacyProcessor(nullptr, image.get(), &options), 0);
}

TEST(LegacyCatalogue, TheSameSeedGivesTheSamePixels) {
    for (const char* name : {"mar_tessaBorder", "pallorBorder", "bi_chromeBorder", "umbraBorder", "murmelGrittyDots"}) {
        VLPLRunOptions options = run_options(1.0, 1234);
        options.bordersEnabled = 1;
        TestBitmap a = photo(), b = photo();
        run_named(name, a.get(), options);
        run_named(name, b.get(), options);
        EXPECT_TRUE(a == b) << name;
    }
}

TEST(LegacyCatalogue, AnyRunOptionsOnAnySizeStayInsideTheBitmap) {
    const double strengths[] = {0.0, -1.0, 1e300, std::numeric_limits<double>::quiet_NaN(), 0.5};
    const uint32_t seeds[] = {0u, 0xFFFFFFFFu};
    const std::pair<uint32_t, uint32_t> sizes[] = {{1, 1}, {2, 3}, {3, 2}, {1, 17}, {23, 9}};
    for (const char* name : k_names) {
        for (const auto& [w, h] : sizes) {
            for (const double strength : strengths) {
                for (const uint32_t seed : seeds) {
                    VLPLRunOptions options = run_options(strength, seed);
                    options.bordersEnabled = 1;
                    TestBitmap image(w, h);
                    ASSERT_EQ(run_named(name, image.get(), options), 1) << name;
                    // Clarity alone sets alpha opaque; everything else carries it through.
                    if (std::string(name) == "clarityEnhance")
                        EXPECT_EQ(image.bytes[3], 255);
                    else
                        EXPECT_TRUE(image.alpha_kept()) << name << " " << w << "x" << h << " " << strength;
                }
            }
        }
    }
}

// The frames spelled out pass by pass: each must draw what its passes
// through VorBorders draw.
struct Buffers {
    std::vector<float> a, b, c;
    explicit Buffers(const TestBitmap& image)
        : a(std::max(image.width, image.height)), b(a.size()), c(a.size()) {}
};

VorBorderParams fresh() {
    VorBorderParams p;
    VorBorderInitParams(&p);
    return p;
}

TEST(LegacyFrames, MarTessaIsARoundPassAndSixSeededTornPasses) {
    const VLPLRunOptions options = run_options(0.8, 77);
    TestBitmap frame = photo(), by_hand = photo();
    VorEffectMarTessaBorder(frame.get(), &options);
    Buffers profiles(by_hand);
    VorBorderParams p = fresh();
    p.color = VorColor{225, 225, 200, 255};
    p.style = VOR_BORDER_ROUND;
    p.width = 0.025;
    p.bottomProfile = profiles.a.data();
    VorBorders(by_hand.get(), &p);
    VorRNG rng;
    VorRNGSeed(&rng, 77);
    const double widths[] = {0.03, 0.035, 0.04, 0.045, 0.05, 0.055};
    for (int k = 1; k <= 6; ++k) {
        VorBorderParams t = fresh();
        t.color = VorColor{225, 225, 200, 51};
        t.style = VOR_BORDER_TORN_2;
        t.sideTune1 = 0.8 * 0.006 * (7 - k);
        t.width = widths[k - 1];
        t.sideTune2 = 0.4;
        t.leftProfile = profiles.b.data();
        t.rightProfile = profiles.c.data();
        t.seed = VorRNGNextInt(&rng);
        VorBorders(by_hand.get(), &t);
    }
    EXPECT_TRUE(frame == by_hand);
}

TEST(LegacyFrames, DuskoDrawsTornThenRoundFromOneRecord) {
    const VLPLRunOptions options = run_options(0.6, 9);
    TestBitmap frame = photo(), by_hand = photo();
    VorEffectDuskoBorder(frame.get(), &options);
    Buffers profiles(by_hand);
    VorBorderParams p = fresh();
    p.bottomProfile = profiles.a.data();
    p.color = VorColor{0, 0, 0, 255};
    p.vignetteScale = 96 * 0.85 / (0.6 + 1e-8);
    p.seed = 9;
    p.style = VOR_BORDER_TORN;
    p.sideTune1 = 0.6 * 0.02;
    p.width = 0.02;
    p.sideTune2 = 0.5;
    VorBorders(by_hand.get(), &p);
    p.style = VOR_BORDER_ROUND;
    VorBorders(by_hand.get(), &p);
    EXPECT_TRUE(frame == by_hand);
}

TEST(LegacyFrames, SinglePassFramesSetOnlyTheirFields) {
    struct Case {
        void (*effect)(VorBitmap*, const VLPLRunOptions*);
        void (*fill)(VorBorderParams&, float*);
        const char* name;
    };
    const Case cases[] = {
        {VorEffectKipCoolBorder,
         [](VorBorderParams& p, float* f) {
             p.bottomProfile = f;
             p.style = VOR_BORDER_BULGE;
             p.color = VorColor{255, 255, 255, 255};
             p.width = 0.05;
             p.inset = 0.5;
             p.sideTune3 = 0.0;
         },
         "kip_cool"},
        {VorEffectKvantBorder,
         [](VorBorderParams& p, float* f) {
             p.bottomProfile = f;
             p.style = VOR_BORDER_ROUND;
             p.color = VorColor{0, 0, 0, 255};
             p.width = 0.025;
         },
         "kvant"},
        {VorEffectSkarnBorder,
         [](VorBorderParams& p, float*) {
             p.style = VOR_BORDER_FADE;
             p.inset = 1.0;
             p.cornerFactor = 1.0;
             p.color = VorColor{0, 0, 0, 255};
         },
         "skarn"},
        {VorEffectBichromeBorder,
         [](VorBorderParams& p, float* f) {
             p.bottomProfile = f;
             p.seed = 31;
             p.style = VOR_BORDER_TORN;
             p.color = VorColor{255, 255, 255, 255};
             p.sideTune1 = 1.5 * 0.015;
             p.width = 0.02;
             p.sideTune2 = 0.5;
         },
         "bichrome"},
        {VorEffectGlimmoTintypeBorder,
         [](VorBorderParams& p, float* f) {
             p.bottomProfile = f;
             p.style = VOR_BORDER_GLIMMO;
             p.color = VorColor{0, 0, 0, 255};
             p.sideTune0 = 1.0;
         },
         "glimmo tintype"},
    };
    const VLPLRunOptions options = run_options(1.5, 31);
    for (const Case& c : cases) {
        TestBitmap frame = photo(), by_hand = photo();
        c.effect(frame.get(), &options);
        Buffers profiles(by_hand);
        VorBorderParams p = fresh();
        c.fill(p, profiles.a.data());
        VorBorders(by_hand.get(), &p);
        EXPECT_TRUE(frame == by_hand) << c.name;
    }
}

TEST(LegacyTones, TintypeMatrixAndTheCreamCeiling) {
    TestBitmap grey(1, 1, VorColor{100, 100, 100, 9});
    const VLPLRunOptions options = run_options();
    VorLegacyGlimmoTintypeColorMatrixTransform(grey.get(), &options);
    // Row sums 1.1755, 1.1015, 0.9685 of 100, rounded.
    EXPECT_EQ(vorlite::test::rgba(grey.pixel(0)), (std::array<int, 4>{118, 110, 97, 9}));
    TestBitmap image = photo(), by_hand = photo();
    const VLPLRunOptions half = run_options(0.5);
    VorLegacyMarTessaAutoColors(image.get(), &half);
    const VorColor ceiling{251, 233, 194, 255};
    VorAutoColorsFadeMaxColor(by_hand.get(), 0.5, &ceiling);
    EXPECT_TRUE(image == by_hand);
}

}  // namespace
