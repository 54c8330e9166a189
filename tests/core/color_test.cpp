#include <gtest/gtest.h>

#include "tests/test_support.h"

namespace {

TEST(Color, SetARGBTakesAlphaFirstAndStoresItLast) {
    VorColor c{};
    VorColorSetARGB(&c, 255, 1, 2, 3);
    EXPECT_EQ(vorlite::test::rgba(c), (std::array<int, 4>{1, 2, 3, 255}));
}

}  // namespace
