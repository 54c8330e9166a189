#include <gtest/gtest.h>

#include "core/core_internal.h"
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

TEST(HistMaps, WholePixelTablesGiveTheByteLookupsOnEveryLevelAndSize) {
    // Tables that send every level somewhere different in each channel, on
    // every level of every channel (a 256 x 256 picture holds each byte in
    // each channel position), and on sizes either side of where the
    // whole-pixel path takes over.
    VorHistMap m;
    for (int i = 0; i < 256; ++i) {
        m.map[0][i] = uint8_t(i * 37 + 11);
        m.map[1][i] = uint8_t(255 - i);
        m.map[2][i] = uint8_t((i * i) >> 3);
    }
    const std::pair<uint32_t, uint32_t> sizes[] = {{256, 256}, {1023, 1}, {1, 1024}, {1025, 1}, {37, 41}};
    for (const auto& [w, h] : sizes) {
        TestBitmap fast(w, h, 3);
        if (w == 256)
            for (size_t i = 0; i < fast.bytes.size(); ++i) fast.bytes[i] = uint8_t(i / 4 + i % 4 * 85);
        fast.snapshot();
        TestBitmap reference = fast;
        VorBitmapHistogramTransform(fast.get(), &m);
        vorlite::core::histogram_transform_reference(reference.get(), m);
        EXPECT_TRUE(fast == reference) << w << "x" << h;
        EXPECT_TRUE(fast.alpha_kept()) << w << "x" << h;
    }
}

}  // namespace
