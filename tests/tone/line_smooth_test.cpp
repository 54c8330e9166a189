#include <gtest/gtest.h>

#include <vector>

#include "zentra_vorlite.h"

namespace {

TEST(LineSmooth, KeepsConstantsAndSpreadsAnImpulseAsAGaussian) {
    std::vector<float> flat(256, 1.0f), impulse(256, 0.0f);
    impulse[128] = 1.0f;
    VorLineSmooth1D(flat.data(), 256, 15);
    VorLineSmooth1D(impulse.data(), 256, 15);
    EXPECT_EQ(flat, std::vector<float>(256, 1.0f));
    EXPECT_NEAR(impulse[128], 1.0 / (15 * 2.5066283), 2e-6);    // 1 / (sigma sqrt(2 pi))
    EXPECT_NEAR(impulse[143] / impulse[128], 0.6065307, 1e-5);  // exp(-1/2) one sigma away
}

}  // namespace
