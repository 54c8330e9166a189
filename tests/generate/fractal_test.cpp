#include <gtest/gtest.h>

#include <array>
#include <cstdlib>
#include <vector>

#include "tests/test_support.h"
#include "zentra_vorlite.h"

namespace {

using vorlite::test::checksum;
using vorlite::test::rgba;
using vorlite::test::TestBitmap;

constexpr int32_t k_no_noise = 99;

std::vector<float> line(int32_t last, float start, float end) {
    std::vector<float> p(static_cast<std::size_t>(last) + 2, -1.0f);
    p[0] = start;
    p[static_cast<std::size_t>(last)] = end;
    return p;
}

TEST(MidpointDisplacement, WithoutNoiseIsAStraightLineAtAnyLength) {
    // 8 is a power of two; 3 and 6 need the stretch, which keeps a
    // straight line straight.
    for (const int32_t last : {1, 3, 6, 8}) {
        auto p = line(last, 0.0f, static_cast<float>(last));
        VorMPDSeed(p.data(), 0, last, 10.0f, 0.5f, k_no_noise, 1);
        for (int32_t i = 0; i <= last; ++i) EXPECT_FLOAT_EQ(p[static_cast<std::size_t>(i)], static_cast<float>(i)) << last;
    }
}

TEST(MidpointDisplacement, FirstEqualToLastOnlyCopiesTheEndOnward) {
    auto p = line(2, 5.0f, 7.0f);
    VorRNG rng;
    VorRNGSeed(&rng, 3);
    VorMPDRNG(p.data(), 2, 2, 1.0f, 1.0f, VOR_MPD_UNIFORM, &rng);
    EXPECT_EQ(p[3], 7.0f);
    EXPECT_EQ(p[1], -1.0f);
    EXPECT_EQ(rng.state, 3u);
}

TEST(MidpointDisplacement, DrawsCoarseToFineAndLeftToRight) {
    auto p = line(4, 0.0f, 0.0f);
    VorMPDSeed(p.data(), 0, 4, 1.0f, 1.0f, VOR_MPD_UNIFORM, 7);
    VorRNG rng;
    VorRNGSeed(&rng, 7);
    const float middle = VorRNGNextFloat(&rng) - 0.5f;
    EXPECT_EQ(p[2], middle);
    EXPECT_EQ(p[1], (VorRNGNextFloat(&rng) - 0.5f) * 0.5f + middle * 0.5f);
    EXPECT_EQ(p[3], (VorRNGNextFloat(&rng) - 0.5f) * 0.5f + middle * 0.5f);
}

TEST(MidpointDisplacement, ThreeStepsDisplaceOneMidpointThenStretchTwoOverThree) {
    std::vector<float> p{10.0f, -1.0f, -1.0f, 4.0f};
    VorMPDSeed(p.data(), 0, 3, 8.0f, 1.0f, VOR_MPD_UNIFORM, 21);
    // P = 2: the end moves to index 2 and index 1 gets the one draw...
    VorRNG rng;
    VorRNGSeed(&rng, 21);
    const float mid = (VorRNGNextFloat(&rng) - 0.5f) * 8.0f + (4.0f + 10.0f) * 0.5f;
    // ...then index j reads x = j x (2 / 3) of the two-step line.
    const double q = 1.0 / (3.0 / 2.0);
    const double t2 = 2.0 * q - 1.0;
    EXPECT_EQ(p[0], 10.0f);
    EXPECT_EQ(p[1], static_cast<float>(static_cast<double>(mid) * q + 10.0 * (1.0 - q)));
    EXPECT_EQ(p[2], static_cast<float>(4.0 * t2 + static_cast<double>(mid) * (1.0 - t2)));
    EXPECT_EQ(p[3], 4.0f);
}

TEST(MidpointDisplacement, ThreeSourcesAgreeOnTheSameSequence) {
    for (const int32_t mode : {int32_t{VOR_MPD_UNIFORM}, int32_t{VOR_MPD_NORMAL}, int32_t{VOR_MPD_LAPLACE}}) {
        auto seeded = line(16, 1.0f, 2.0f);
        auto shared = seeded;
        auto unseeded = seeded;
        VorMPDSeed(seeded.data(), 0, 16, 3.0f, 0.7f, mode, 11);
        VorRNG rng;
        VorRNGSeed(&rng, 11);
        VorMPDRNG(shared.data(), 0, 16, 3.0f, 0.7f, mode, &rng);
        EXPECT_EQ(seeded, shared) << mode;
        // 15 midpoints, one uniform draw each.
        if (mode == VOR_MPD_UNIFORM) {
            EXPECT_EQ(rng.state, VorRNGNextSeedN(11, 15));
        }
        // The unseeded source is VorRNGInit's generator.
        srand48(99);
        VorMPD(unseeded.data(), 0, 16, 3.0f, 0.7f, mode);
        srand48(99);
        VorRNGInit(&rng);
        VorMPDRNG(shared.data(), 0, 16, 3.0f, 0.7f, mode, &rng);
        EXPECT_EQ(unseeded, shared) << mode;
    }
}

TEST(DiamondSquare, TwoByTwoIsFourGreyCorners) {
    TestBitmap b(2, 2);
    std::vector<float> a(2), c(2);
    VorBitmapDiamondSquare(b.get(), 50.0f, 0.5f, a.data(), c.data());
    for (std::size_t i = 0; i < 4; ++i) EXPECT_EQ(rgba(b.pixel(i)), (std::array<int, 4>{128, 128, 128, 42}));
}

// The grey of an interior point: a quarter of its neighbours plus the
// next draw times the level's amplitude, truncated and held to a byte.
int grey(int sum, float a, VorRNG* rng) {
    const int g = static_cast<int>(0.25f * static_cast<float>(sum) + VorRNGNextFloat(rng) * a);
    return g > 255 ? 255 : g < 0 ? 0 : g;
}

TEST(DiamondSquare, EachLevelDrawsCentresThenEdgeMidpointsRowByRow) {
    TestBitmap b(5, 5);
    std::vector<float> a(5), c(5);
    VorBitmapDiamondSquare(b.get(), 200.0f, 1.0f, a.data(), c.data());
    // The edges as the profiles give them, from the fixed seed.
    VorRNG rng;
    VorRNGSeed(&rng, 1234);
    std::vector<float> ea(5, 0.0f), eb(5, 0.0f);
    ea[0] = ea[4] = eb[0] = eb[4] = 128.0f;
    VorMPDRNG(ea.data(), 0, 4, 200.0f, 1.0f, VOR_MPD_UNIFORM, &rng);
    VorMPDRNG(eb.data(), 0, 4, 200.0f, 1.0f, VOR_MPD_UNIFORM, &rng);
    int g[5][5] = {};
    for (std::size_t i = 0; i <= 4; ++i) {
        g[i][0] = g[i][4] = static_cast<int>(ea[i]);
        g[0][i] = g[4][i] = static_cast<int>(eb[i]);
    }
    // Step 4: the centre only (its edge midpoints are all on the border);
    // step 2: four centres, then the four inner edge midpoints in row
    // order. The amplitude halves before each level. {x, y, diagonal}:
    g[2][2] = grey(g[0][0] + g[0][4] + g[4][0] + g[4][4], 100.0f, &rng);
    const int order[8][3] = {{1, 1, 1}, {3, 1, 1}, {1, 3, 1}, {3, 3, 1}, {2, 1, 0}, {1, 2, 0}, {3, 2, 0}, {2, 3, 0}};
    for (const auto& [x, y, diagonal] : order) {
        const int sum = diagonal ? g[y - 1][x - 1] + g[y - 1][x + 1] + g[y + 1][x - 1] + g[y + 1][x + 1]
                                 : g[y - 1][x] + g[y][x - 1] + g[y][x + 1] + g[y + 1][x];
        g[y][x] = grey(sum, 50.0f, &rng);
    }
    for (uint32_t y = 0; y < 5; ++y) {
        for (uint32_t x = 0; x < 5; ++x) EXPECT_EQ(b.at(x, y, 1), g[y][x]) << x << "," << y;
    }
    EXPECT_TRUE(b.alpha_kept());
}

TEST(DiamondSquare, FlatWithoutAmplitudeAndOnlyInsideItsSquare) {
    // 9 x 6: the square is 5 x 5 (P = 4); the rest is untouched.
    TestBitmap b(9, 6);
    std::vector<float> a(5), c(5);
    VorBitmapDiamondSquare(b.get(), 0.0f, 1.0f, a.data(), c.data());
    for (uint32_t y = 0; y < 6; ++y) {
        for (uint32_t x = 0; x < 9; ++x) {
            const std::size_t i = (std::size_t{y} * 9 + x) * 4;
            for (std::size_t ch = 0; ch < 4; ++ch) {
                const int expected = x <= 4 && y <= 4 && ch < 3 ? 128 : b.before[i + ch];
                EXPECT_EQ(b.bytes[i + ch], expected) << x << "," << y;
            }
        }
    }
}

TEST(DiamondSquare, TextureDependsOnSizeAmplitudeAndRoughnessAlone) {
    TestBitmap b(33, 40, 5);
    TestBitmap again(33, 40, 9);
    std::vector<float> a(33), c(33);
    VorBitmapDiamondSquare(b.get(), 60.0f, 0.8f, a.data(), c.data());
    VorBitmapDiamondSquare(again.get(), 60.0f, 0.8f, a.data(), c.data());
    for (uint32_t y = 0; y <= 32; ++y) {
        for (uint32_t x = 0; x <= 32; ++x) ASSERT_EQ(b.at(x, y, 0), again.at(x, y, 0));
    }
    EXPECT_EQ(checksum(b.bytes.data(), 33 * 33 * 4), 4042823877u);
}

}  // namespace
