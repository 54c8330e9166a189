#include <gtest/gtest.h>

#include "tests/test_support.h"

namespace {

using namespace vorlite::test;

TEST(LabCorrect, TakesOutHalfOfAUniformCast) {
    // Packed b* 171 of the first colour is scaled by 127 / (127 + 43.5 / 2)
    // to 146, its a* stays; the second's a* 177 and b* 114 move by the same rule.
    const VorColor cases[][2] = {{{200, 170, 90, 11}, {187, 171, 138, 11}}, {{220, 110, 170, 11}, {178, 134, 159, 11}}};
    for (const auto& [in, out] : cases) {
        TestBitmap b(9, 4, in);
        VorLabCorrect(b.get());
        EXPECT_EQ(b.bytes, TestBitmap(9, 4, out).bytes) << int(in.r);
    }
    TestBitmap mixed(23, 13, 5);
    VorLabCorrect(mixed.get());
    EXPECT_EQ(checksum(mixed), 0x097231a1u);
    EXPECT_TRUE(mixed.alpha_kept());
}

}  // namespace
