#include <gtest/gtest.h>

#include <vector>

#include "zentra_vorlite.h"

namespace {

TEST(IntegralImage, BoxSumsMatchDirectSumsForEveryRectangle) {
    const uint32_t w = 7, h = 5;
    std::vector<uint8_t> px(w * h * 4);
    for (uint32_t i = 0; i < px.size(); ++i) px[i] = static_cast<uint8_t>(i * 97 + 13);
    const VorBitmap b{px.data(), w, h};
    std::vector<std::vector<uint32_t>> sums(3, std::vector<uint32_t>(w * h));
    EXPECT_EQ(VorBuildIntegralImage(&b, sums[0].data(), sums[1].data(), sums[2].data()), h);
    for (int c = 0; c < 3; ++c)
        for (uint32_t y0 = 0; y0 < h; ++y0)
            for (uint32_t y1 = y0; y1 < h; ++y1)
                for (uint32_t x0 = 0; x0 < w; ++x0)
                    for (uint32_t x1 = x0; x1 < w; ++x1) {
                        uint32_t direct = 0;
                        for (uint32_t y = y0; y <= y1; ++y)
                            for (uint32_t x = x0; x <= x1; ++x) direct += px[4 * (y * w + x) + c];
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
