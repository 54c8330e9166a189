#include <gtest/gtest.h>

#include "tests/test_support.h"

namespace {

using namespace vorlite::test;

TEST(HistMaps, FadeMovesTowardIdentityRoundingHalfUpAndClamping) {
    const struct {
        double amount;
        uint8_t entry, level, expected;
    } cases[] = {{0.5, 255, 0, 128}, {0.5, 10, 11, 11}, {0.0, 0, 200, 200}, {2.0, 255, 0, 255}, {2.0, 0, 255, 0}};
    for (const auto& c : cases) {
        VorHistMap m;
        VorHistMapSetIdentity(&m);
        m.map[1][c.level] = c.entry;
        VorHistMapFade(&m, c.amount);
        EXPECT_EQ(m.map[1][c.level], c.expected) << c.amount << " " << int{c.entry};
    }
}

TEST(HistMaps, ComposedMapTransformsEachColourChannelByItsOwnTable) {
    VorHistMap m, invert;
    for (int i = 0; i < 256; ++i) {
        const uint8_t own[3] = {uint8_t(255 - i), uint8_t(i / 2), uint8_t(i * 7 + 3)}, inverted[3] = {uint8_t(255 - i), uint8_t(255 - i), uint8_t(255 - i)};
        for (int c = 0; c < 3; ++c) m.map[c][i] = own[c], invert.map[c][i] = inverted[c];
    }
    VorHistMap composed = m;
    VorHistMapMap(&composed, &invert);  // m first, then invert
    TestBitmap b(7, 13);
    VorBitmapHistogramTransform(b.get(), &composed);
    for (size_t i = 0; i < b.bytes.size(); i += 4)
        for (int c = 0; c < 3; ++c) ASSERT_EQ(b.bytes[i + c], 255 - m.map[c][b.before[i + c]]) << i << " " << c;
    EXPECT_TRUE(b.alpha_kept());
}

}  // namespace
