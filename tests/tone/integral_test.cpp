#include <gtest/gtest.h>

#include <vector>

#include "tests/test_support.h"

namespace {

using vorlite::test::TestBitmap;

// Red, green, blue and the grey form, whose levels are each pixel's own grey.
TEST(IntegralImage, BoxSumsMatchDirectSumsForEveryRectangle) {
    const uint32_t w = 7, h = 5;
    TestBitmap b(w, h);
    std::vector<std::vector<uint32_t>> sums(4, std::vector<uint32_t>(w * h)), level = sums;
    EXPECT_EQ(VorBuildIntegralImage(&b.bitmap, sums[0].data(), sums[1].data(), sums[2].data()), h);
    VorBuildIntegralImageGray(&b.bitmap, sums[3].data());
    for (uint32_t i = 0; i < w * h; ++i) {
        for (int c = 0; c < 3; ++c) level[c][i] = b.bytes[4 * i + c];
        const VorBitmap one{&b.bytes[4 * i], 1, 1};
        VorBuildIntegralImageGray(&one, &level[3][i]);
    }
    for (int c = 0; c < 4; ++c)
        for (uint32_t y0 = 0; y0 < h; ++y0)
            for (uint32_t y1 = y0; y1 < h; ++y1)
                for (uint32_t x0 = 0; x0 < w; ++x0)
                    for (uint32_t x1 = x0; x1 < w; ++x1) {
                        uint32_t direct = 0;
                        for (uint32_t y = y0; y <= y1; ++y)
                            for (uint32_t x = x0; x <= x1; ++x) direct += level[c][y * w + x];
                        ASSERT_EQ(VorSumBoxFromIntegralImage(sums[c].data(), w, h, x0, y0, x1, y1), direct)
                            << c << ": " << x0 << "," << y0 << " .. " << x1 << "," << y1;
                    }
    const VorBitmap no_rows{nullptr, 4, 0};
    EXPECT_EQ(VorBuildIntegralImage(&no_rows, nullptr, nullptr, nullptr), 0u);
}

TEST(IntegralImage, GreyLevelRoundsTheWeightedSumInFloat) {
    const std::pair<VorColor, uint32_t> cases[] = {{{255, 255, 255, 0}, 255}, {{2, 0, 0, 0}, 0},
        {{3, 0, 0, 0}, 1}, {{0, 0, 4, 0}, 0}, {{0, 0, 5, 0}, 1} /* 0.5 rounds up */, {{200, 100, 50, 9}, 115}};
    for (auto [pixel, grey] : cases) {
        const VorBitmap b{&pixel.r, 1, 1};
        uint32_t sum = 7;
        VorBuildIntegralImageGray(&b, &sum);
        EXPECT_EQ(sum, grey) << int(pixel.r) << "," << int(pixel.g) << "," << int(pixel.b);
    }
}

}  // namespace
