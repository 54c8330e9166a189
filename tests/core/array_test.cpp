#include <gtest/gtest.h>

#include <cstring>

#include "zentra_vorlite.h"

namespace {

TEST(ArrayBuild, FailsOnThirtyTwoBitOverflowAndNullsTheSlot) {
    const struct {
        uint32_t a, b, size;  // b = 0: the one-factor build of a elements
        bool ok;
    } cases[] = {
        {0x40000000u, 0, 4, false},  // exactly 2^32 bytes
        {0x55555556u, 0, 3, false},  // one past 0xFFFFFFFF / 3
        {0xFFFFFFFFu, 0, 0, true},   // zero element size skips the test
        {16, 0, 4, true},
        {65536, 65536, 1, false},    // a x b wraps
        {32768, 32768, 4, false},    // the element size overflows a x b
        {7, 5, 4, true},
    };
    for (const auto& c : cases) {
        void* slot = &slot;
        const int built = c.b == 0 ? VorArrayBuild(&slot, c.a, c.size) : VorArrayBuild2(&slot, c.a, c.b, c.size);
        EXPECT_EQ(built, c.ok ? 1 : 0) << c.a << " x " << c.b << " x " << c.size;
        EXPECT_EQ(slot != nullptr, c.ok);
        const auto* bytes = static_cast<const uint8_t*>(slot);
        for (uint32_t i = 0; c.ok && i < c.a * (c.b ? c.b : 1) * c.size && i < 1024; ++i) ASSERT_EQ(bytes[i], 0);
        VorArrayFree(&slot);
        EXPECT_EQ(slot, nullptr);
        VorArrayFree(&slot);
    }
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
