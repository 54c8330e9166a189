#include <gtest/gtest.h>

#include <cmath>

#include "zentra_vorlite.h"

namespace {

// Seeds whose next step lands on state 0, 2^31, 2^30, 3 x 2^30 and 4294967168.
constexpr uint32_t kToZero = 1511872763u, kToHalf = 3659356411u, kToQuarter = 2585614587u,
                   kToThreeQuarters = 438130939u, kToOne = 1758058107u;

VorRNG seeded(uint32_t seed) { VorRNG rng; VorRNGSeed(&rng, seed); return rng; }

TEST(Generator, FirstValuesFromSeedOne) {
    VorRNG rng = seeded(1);
    EXPECT_EQ(VorRNGNextInt(&rng), 69070u);
    EXPECT_EQ(VorRNGNextInt(&rng), 475628535u);
    EXPECT_EQ(VorRNGNextInt(&rng), 3277404108u);
    EXPECT_EQ(rng.state, 3277404108u);  // upper half stays 0
    EXPECT_EQ(VorRNGNextSeedN(1, 3), 3277404108u);
    EXPECT_EQ(VorRNGNextSeedN(12345, 0), 12345u);
}

TEST(Generator, FloatReachesZeroAndOneAndLaplaceInvertsItWithOneDraw) {
    VorRNG below = seeded(3269930870u);  // state 4294967167 rounds below 1
    EXPECT_LT(VorRNGNextFloat(&below), 1.0f);
    const std::pair<uint32_t, float> cases[] = {{kToHalf, 0.0f}, {kToQuarter, 0.6931472f},  // -log(0.5)
        {kToThreeQuarters, -0.6931472f}, {kToZero, INFINITY}, {kToOne, -INFINITY}};
    for (const auto& [seed, expected] : cases) {
        VorRNG rng = seeded(seed), plain = seeded(seed);
        EXPECT_FLOAT_EQ(VorRNGNextFloatLaplace(&rng), expected) << seed;
        EXPECT_EQ(rng.state, VorRNGNextSeedN(seed, 1));
        if (std::isinf(expected)) {
            EXPECT_EQ(VorRNGNextFloat(&plain), expected > 0 ? 0.0f : 1.0f);
        }
    }
}

TEST(Generator, NormalTakesTheCosineHalfAndRedrawsZero) {
    VorRNG half = seeded(kToHalf);  // u1 = u2 = 0.5: cos(pi) * sqrt(-2 log 0.5)
    EXPECT_NEAR(VorRNGNextFloatNormal(&half), -std::sqrt(2.0 * std::log(2.0)), 1e-6);
    EXPECT_EQ(half.state, VorRNGNextSeedN(kToHalf, 2));
    VorRNG zero = seeded(kToZero);  // u1 = 0 is redrawn after u2: three draws
    EXPECT_TRUE(std::isfinite(VorRNGNextFloatNormal(&zero)));
    EXPECT_EQ(zero.state, VorRNGNextSeedN(kToZero, 3));
}

}  // namespace
