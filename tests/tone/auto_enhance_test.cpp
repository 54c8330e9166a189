#include <gtest/gtest.h>

#include "tests/test_support.h"

namespace {

using namespace vorlite::test;

TestBitmap enhanced(TestBitmap b, int mode) {
    VorAutoEnhance(b.get(), mode);
    return b;
}

TEST(AutoEnhance, FixedPointsOfThePixelFormula) {
    // Black lands on (0, 1, 0) whatever the mode: green carries two half levels.
    for (int mode : {0, 1, 2, 3, -1})
        EXPECT_EQ(enhanced(TestBitmap(5, 3, VorColor{0, 0, 0, 200}), mode).bytes, TestBitmap(5, 3, VorColor{0, 1, 0, 200}).bytes) << mode;
    // Half white, half (200, 100, 150): mode 2's gains are all 1, only green moves.
    TestBitmap half(4, 4, VorColor{255, 255, 255, 3});
    for (size_t i = 0; i < 64; i += 8) half.bytes[i] = 200, half.bytes[i + 1] = 100, half.bytes[i + 2] = 150;
    TestBitmap expected = half;
    for (size_t i = 1; i < 64; i += 8) expected.bytes[i] = 101;
    EXPECT_EQ(enhanced(half, 2).bytes, expected.bytes);
}

TEST(AutoEnhance, ModesAgreeWithTheirDefinitionsAndKeepTheirBytes) {
    const TestBitmap original(41, 19, 7);
    const TestBitmap two = enhanced(original, 2);  // mode 2 never darkens
    for (size_t i = 0; i < two.bytes.size(); ++i) ASSERT_GE(two.bytes[i], original.bytes[i]) << i;
    TestBitmap curved = original;  // mode 3 is the 0.5 curve, then mode 1
    VorBitmapContrastCurve(curved.get(), 0.5f);
    EXPECT_EQ(enhanced(original, 3).bytes, enhanced(curved, 1).bytes);
    for (int mode : {4, -1}) EXPECT_EQ(enhanced(original, mode).bytes, enhanced(original, 1).bytes) << mode;
    const uint32_t golden[] = {0x18e25088u, 0x282afedau, 0xc546a703u, 0x14405a00u};
    for (int mode = 0; mode < 4; ++mode) {
        const TestBitmap b = enhanced(original, mode);
        EXPECT_EQ(checksum(b), golden[mode]) << mode;
        EXPECT_TRUE(b.alpha_kept()) << mode;
    }
}

}  // namespace
