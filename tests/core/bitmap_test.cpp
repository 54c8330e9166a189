#include <gtest/gtest.h>

#include "tests/test_support.h"

namespace {

using namespace vorlite::test;

TEST(BitmapBuild, RejectsSizesAtThePixelLimitButKeepsTheSize) {
    const struct {
        uint32_t width, height;
        bool ok;
    } cases[] = {
        {32768, 32768, false},    // exactly 0x40000000 pixels
        {65536, 65536, false},    // product wraps to 0 in 32 bits
        {0xFFFFFFFFu, 2, false},  // height above 0xFFFFFFFF / width
        {1, 0x40000000u, false},
        {0, 0xFFFFFFFFu, true},  // zero width skips the size test
        {5, 0, true},
        {3, 7, true},
        {32768, 32767, sizeof(void*) == 8},  // nearly 4 GiB: only a 64-bit process gets the block
    };
    for (const auto& c : cases) {
        VorBitmap b{reinterpret_cast<uint8_t*>(&b), 1, 1};
        const int built = VorBitmapBuild(&b, c.width, c.height);
        EXPECT_EQ(built, c.ok ? 1 : 0) << c.width << "x" << c.height;
        EXPECT_EQ(built == 1, b.data != nullptr);
        EXPECT_TRUE(b.width == c.width && b.height == c.height);
        const size_t bytes = size_t{c.width} * c.height * 4;
        if (built && bytes > 0) {
            EXPECT_TRUE(b.data[0] == 0 && b.data[bytes / 2] == 0 && b.data[bytes - 1] == 0);
        }
        VorBitmapFree(&b);
        EXPECT_TRUE(b.data == nullptr && b.width == c.width);
        VorBitmapFree(&b);  // a second free is harmless
    }
}

TEST(BitmapCopy, RefusesItselfOtherSizesAndMissingPixels) {
    TestBitmap a(3, 2, 1), b(3, 2, 2), wide(4, 2), tall(3, 3);
    VorBitmap none{nullptr, 3, 2};
    const std::pair<VorBitmap*, const VorBitmap*> refused[] = {
        {a.get(), a.get()}, {wide.get(), a.get()}, {tall.get(), a.get()}, {&none, a.get()}, {b.get(), &none}};
    for (const auto& [dst, src] : refused) EXPECT_EQ(VorBitmapCopy(dst, src), 0);
    EXPECT_TRUE(a.unchanged() && b.unchanged() && wide.unchanged() && tall.unchanged());
    VorBitmap alias = a.bitmap;  // two records over the same pixels are distinct records
    EXPECT_EQ(VorBitmapCopy(&alias, a.get()), 1);
    EXPECT_EQ(VorBitmapCopy(b.get(), a.get()), 1);
    EXPECT_EQ(b.bytes, a.bytes);
}

TEST(BitmapColorAtPoint, TruncatesTowardZero) {
    TestBitmap b(10, 3);
    for (uint32_t i = 0; i < 30; ++i) b.bytes[4 * i] = static_cast<uint8_t>(i);
    VorColor c{};
    VorBitmapGetColorAtPoint(b.get(), VorPoint{2.9f, 1.2f}, &c);
    EXPECT_EQ(rgba(c), rgba(b.pixel(12)));
    VorBitmapGetColorAtPoint(b.get(), VorPoint{9.99f, 2.999f}, &c);
    EXPECT_EQ(rgba(c), rgba(b.pixel(29)));
}

}  // namespace
