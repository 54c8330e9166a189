#include <gtest/gtest.h>

#include <cstring>

#include "zentra_vorlite.h"

namespace {

TEST(ArrayBuild, FailsOnThirtyTwoBitOverflowAndNullsTheSlot) {
    struct Case {
        uint32_t count, size;
        bool ok;
    };
    const Case cases[] = {
        {0x40000000u, 4, false},  // exactly 2^32 bytes
        {0x55555556u, 3, false},  // one past 0xFFFFFFFF / 3
        {0xFFFFFFFFu, 0, true},  // zero element size skips the test
        {16, 4, true},
    };
    for (const Case& c : cases) {
        void* slot = &slot;
        EXPECT_EQ(VorArrayBuild(&slot, c.count, c.size), c.ok ? 1 : 0) << c.count << " x " << c.size;
        if (!c.ok) {
            EXPECT_EQ(slot, nullptr);
        }
        VorArrayFree(&slot);
        EXPECT_EQ(slot, nullptr);
    }
}

TEST(ArrayBuild2, ChecksBothProducts) {
    void* slot = &slot;
    EXPECT_EQ(VorArrayBuild2(&slot, 65536, 65536, 1), 0);  // countA x countB wraps
    EXPECT_EQ(slot, nullptr);
    slot = &slot;
    EXPECT_EQ(VorArrayBuild2(&slot, 32768, 32768, 4), 0);  // the element size overflows it
    EXPECT_EQ(slot, nullptr);
    ASSERT_EQ(VorArrayBuild2(&slot, 7, 5, 4), 1);
    const auto* bytes = static_cast<const uint8_t*>(slot);
    for (int i = 0; i < 140; ++i) ASSERT_EQ(bytes[i], 0);
    VorArrayFree(&slot);
    VorArrayFree(&slot);
}

TEST(ArrayCopy2, CopiesExactlyTheBlockOrNothing) {
    uint8_t src[24], dst[25];
    for (int i = 0; i < 24; ++i) src[i] = static_cast<uint8_t>(100 + i);
    std::memset(dst, 0xAB, sizeof dst);
    EXPECT_EQ(VorArrayCopy2(dst, src, 65536, 65536, 1), 0);
    EXPECT_EQ(dst[0], 0xAB);
    EXPECT_EQ(VorArrayCopy2(dst, src, 3, 2, 4), 1);
    EXPECT_EQ(std::memcmp(dst, src, 24), 0);
    EXPECT_EQ(dst[24], 0xAB);
}

}  // namespace
