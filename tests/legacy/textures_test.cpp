#include <gtest/gtest.h>

#include <cstdint>
#include <limits>

#include "tests/test_support.h"
#include "zentra_vorlite.h"

namespace {

using vorlite::test::checksum;
using vorlite::test::rgba;
using vorlite::test::run_options;
using vorlite::test::TestBitmap;

using Entry = void (*)(VorBitmap*, const VLPLRunOptions*);

const struct {
    const char* name;
    Entry run;
} k_entries[] = {
    {"gritty dots", VorLegacyMurmelGrittyDots},
    {"tintype plate", VorLegacyGlimmoTintypeDiamondSquare},
    {"vintage", VorLegacyGlimmoVintageColorMatrixTransform},
};

TEST(LegacyTextures, AnySizeAlphaKeptAndNoStrengthNoChange) {
    const std::pair<uint32_t, uint32_t> sizes[] = {{1, 1}, {2, 2}, {1, 9}, {9, 1}, {3, 300}, {96, 64}};
    for (const auto& e : k_entries) {
        for (auto [w, h] : sizes) {
            TestBitmap b(w, h, 4);
            const VLPLRunOptions o = run_options(1.0, 3);
            e.run(b.get(), &o);
            EXPECT_TRUE(b.alpha_kept()) << e.name << " " << w << "x" << h;
        }
        for (double k : {0.0, -0.5, std::numeric_limits<double>::quiet_NaN()}) {
            TestBitmap b(20, 10);
            const VLPLRunOptions o = run_options(k, 3);
            e.run(b.get(), &o);
            EXPECT_TRUE(b.unchanged()) << e.name << " " << k;
        }
        VorBitmap empty{nullptr, 0, 0};
        const VLPLRunOptions o = run_options();
        e.run(&empty, &o);
    }
}

TEST(LegacyTextures, GoldenChecksums) {
    const uint32_t expected[] = {2344920164u, 3250024780u, 4209239487u};
    for (std::size_t i = 0; i < std::size(k_entries); ++i) {
        TestBitmap b(96, 64, 2);
        const VLPLRunOptions o = run_options(1.0, 5);
        k_entries[i].run(b.get(), &o);
        EXPECT_EQ(checksum(b), expected[i]) << k_entries[i].name;
    }
}

TEST(GrittyDots, SeededCoverageFollowsDensity) {
    const VorColor grey{128, 128, 128, 42};
    TestBitmap a(200, 150, grey), b(a), c(a), dense(a);
    VorLegacyGrittyDots(a.get(), 0.05f, 1, 8);
    VorLegacyGrittyDots(b.get(), 0.05f, 1, 8);
    VorLegacyGrittyDots(c.get(), 0.05f, 1, 9);
    VorLegacyGrittyDots(dense.get(), 0.2f, 1, 8);
    EXPECT_TRUE(a == b);
    EXPECT_FALSE(a == c);
    const auto changed = [](const TestBitmap& t) {
        std::size_t n = 0;
        for (std::size_t i = 0; i < t.bytes.size(); i += 4) n += t.bytes[i] != t.before[i];
        return n;
    };
    const std::size_t pixels = 200 * 150;
    EXPECT_GT(changed(a), pixels / 50);
    EXPECT_LT(changed(a), pixels / 4);
    EXPECT_GT(changed(dense), 2 * changed(a));
    // Monochrome specks on a grey stay grey.
    for (std::size_t i = 0; i < pixels; ++i) {
        const VorColor p = a.pixel(i);
        ASSERT_TRUE(p.r == p.g && p.g == p.b) << i;
    }
}

TEST(TintypePlate, SeedPicksOneOfEightOrientations) {
    const auto render = [](uint32_t seed) {
        TestBitmap b(64, 48, VorColor{128, 100, 80, 42});
        const VLPLRunOptions o = run_options(1.0, seed);
        VorLegacyGlimmoTintypeDiamondSquare(b.get(), &o);
        return b;
    };
    const TestBitmap base = render(0);
    EXPECT_FALSE(base.unchanged());
    EXPECT_TRUE(render(8) == base);
    for (uint32_t seed = 1; seed < 8; ++seed) EXPECT_FALSE(render(seed) == base) << seed;
}

TEST(VintageMatrix, FadedWarmBlacksAndWhites) {
    TestBitmap b(3, 1, VorColor{0, 0, 0, 42});
    b.bytes[4] = b.bytes[5] = b.bytes[6] = 255;
    b.bytes[8] = 255;  // pure red
    b.snapshot();
    const VLPLRunOptions o = run_options(1.0, 0);
    VorLegacyGlimmoVintageColorMatrixTransform(b.get(), &o);
    const VorColor black = b.pixel(0), white = b.pixel(1), red = b.pixel(2);
    // Black lifts to a warm dark brown; white dims and warms.
    EXPECT_GT(black.r, 10);
    EXPECT_GT(black.r, black.g);
    EXPECT_LT(white.r, 255);
    EXPECT_GT(white.r, white.b + 20);
    // Red loses saturation: green and blue rise toward it.
    EXPECT_GT(red.g, 20);
    EXPECT_LT(red.r, 255);
    // Half strength lies between the photo and the full look.
    TestBitmap h(1, 1, VorColor{0, 0, 0, 42});
    const VLPLRunOptions half = run_options(0.5, 0);
    VorLegacyGlimmoVintageColorMatrixTransform(h.get(), &half);
    EXPECT_GT(h.bytes[0], 0);
    EXPECT_LT(h.bytes[0], black.r);
}

}  // namespace
