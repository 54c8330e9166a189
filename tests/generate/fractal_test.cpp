#include <gtest/gtest.h>

#include <vector>

#include "tests/test_support.h"
#include "zentra_vorlite.h"

namespace {

using vorlite::test::checksum;
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
    const float left = (VorRNGNextFloat(&rng) - 0.5f) * 0.5f + middle * 0.5f;
    const float right = (VorRNGNextFloat(&rng) - 0.5f) * 0.5f + middle * 0.5f;
    EXPECT_EQ(p[2], middle);
    EXPECT_EQ(p[1], left);
    EXPECT_EQ(p[3], right);
}

TEST(MidpointDisplacement, EverySourceDrawsOncePerMidpoint) {
    for (const int32_t mode : {int32_t{VOR_MPD_UNIFORM}, int32_t{VOR_MPD_NORMAL}, int32_t{VOR_MPD_LAPLACE}}) {
        auto seeded = line(16, 1.0f, 2.0f);
        auto shared = seeded;
        VorMPDSeed(seeded.data(), 0, 16, 3.0f, 0.7f, mode, 11);
        VorRNG rng;
        VorRNGSeed(&rng, 11);
        VorMPDRNG(shared.data(), 0, 16, 3.0f, 0.7f, mode, &rng);
        EXPECT_EQ(seeded, shared) << mode;
        if (mode == VOR_MPD_UNIFORM) {
            EXPECT_EQ(rng.state, VorRNGNextSeedN(11, 15));
        }
    }
}

TEST(DiamondSquare, TwoByTwoIsFourGreyCorners) {
    TestBitmap b(2, 2);
    std::vector<float> a(2), c(2);
    VorBitmapDiamondSquare(b.get(), 50.0f, 0.5f, a.data(), c.data());
    for (std::size_t i = 0; i < 4; ++i) EXPECT_EQ(b.pixel(i).r, 128);
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
            for (int ch = 0; ch < 3; ++ch) {
                if (x <= 4 && y <= 4) {
                    EXPECT_EQ(b.bytes[i + ch], 128) << x << "," << y;
                } else {
                    EXPECT_EQ(b.bytes[i + ch], b.before[i + ch]) << x << "," << y;
                }
            }
        }
    }
    EXPECT_TRUE(b.alpha_kept());
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
