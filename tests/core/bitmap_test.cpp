#include <gtest/gtest.h>

#include <cstring>

#include "zentra_vorlite.h"

namespace {

TEST(BitmapBuild, RejectsSizesAtThePixelLimitButKeepsTheSize) {
    struct Case {
        uint32_t width, height;
        bool ok;
    };
    const Case cases[] = {
        {32768, 32768, false},      // exactly 0x40000000 pixels
        {65536, 65536, false},      // product wraps to 0 in 32 bits
        {0xFFFFFFFFu, 2, false},    // height above 0xFFFFFFFF / width
        {1, 0x40000000u, false},
        {0, 0xFFFFFFFFu, true},     // zero width skips the size test
        {5, 0, true},
        {3, 7, true},
    };
    for (const Case& c : cases) {
        VorBitmap b{reinterpret_cast<uint8_t*>(&b), 1, 1};
        EXPECT_EQ(VorBitmapBuild(&b, c.width, c.height), c.ok ? 1 : 0) << c.width << "x" << c.height;
        EXPECT_EQ(b.width, c.width);
        EXPECT_EQ(b.height, c.height);
        if (!c.ok) {
            EXPECT_EQ(b.data, nullptr);
        }
        VorBitmapFree(&b);
    }
}

TEST(BitmapBuild, LargestAllowedSizePassesTheSizeTest) {
    VorBitmap b{};
    const int built = VorBitmapBuild(&b, 32768, 32767);
    // Nearly 4 GiB: only a 64-bit process can be expected to get the block.
    if (sizeof(void*) == 8) {
        ASSERT_EQ(built, 1);
    }
    EXPECT_EQ(built == 1, b.data != nullptr);
    if (b.data != nullptr) {
        EXPECT_EQ(b.data[0], 0);
        EXPECT_EQ(b.data[32768ull * 32767 * 4 - 1], 0);
    }
    VorBitmapFree(&b);
    EXPECT_EQ(b.data, nullptr);
    EXPECT_EQ(b.width, 32768u);
    VorBitmapFree(&b);  // a second free is harmless
}

TEST(BitmapCopy, RefusesItselfOtherSizesAndMissingPixels) {
    VorBitmap a{}, b{}, wide{}, tall{};
    ASSERT_EQ(VorBitmapBuild(&a, 3, 2), 1);
    ASSERT_EQ(VorBitmapBuild(&b, 3, 2), 1);
    ASSERT_EQ(VorBitmapBuild(&wide, 4, 2), 1);
    ASSERT_EQ(VorBitmapBuild(&tall, 3, 3), 1);
    for (uint32_t i = 0; i < 24; ++i) a.data[i] = static_cast<uint8_t>(i + 1);

    EXPECT_EQ(VorBitmapCopy(&a, &a), 0);
    EXPECT_EQ(a.data[5], 6);
    EXPECT_EQ(VorBitmapCopy(&wide, &a), 0);
    EXPECT_EQ(VorBitmapCopy(&tall, &a), 0);
    VorBitmap none{nullptr, 3, 2};
    EXPECT_EQ(VorBitmapCopy(&none, &a), 0);
    EXPECT_EQ(VorBitmapCopy(&b, &none), 0);
    EXPECT_EQ(b.data[5], 0);

    // Two records over the same pixels are distinct records: allowed.
    VorBitmap alias = a;
    EXPECT_EQ(VorBitmapCopy(&alias, &a), 1);

    EXPECT_EQ(VorBitmapCopy(&b, &a), 1);
    EXPECT_EQ(std::memcmp(a.data, b.data, 24), 0);
    for (VorBitmap* bm : {&a, &b, &wide, &tall}) VorBitmapFree(bm);
}

TEST(BitmapColorAtPoint, TruncatesTowardZero) {
    VorBitmap b{};
    ASSERT_EQ(VorBitmapBuild(&b, 10, 3), 1);
    for (uint32_t i = 0; i < 30; ++i) b.data[4 * i] = static_cast<uint8_t>(i);
    VorColor c{};
    VorPoint p;
    VorPointMake(&p, 2.9f, 1.2f);
    VorBitmapGetColorAtPoint(&b, p, &c);
    EXPECT_EQ(c.r, 12);
    VorPointMake(&p, 9.99f, 2.999f);
    VorBitmapGetColorAtPoint(&b, p, &c);
    EXPECT_EQ(c.r, 29);
    VorBitmapFree(&b);
}

TEST(Color, SetARGBTakesAlphaFirstAndStoresItLast) {
    VorColor c{};
    VorColorSetARGB(&c, 255, 1, 2, 3);
    const uint8_t expected[4] = {1, 2, 3, 255};
    EXPECT_EQ(std::memcmp(&c, expected, 4), 0);
}

}  // namespace
