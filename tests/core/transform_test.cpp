#include <gtest/gtest.h>

#include <cmath>
#include <cstring>

#include "zentra_vorlite.h"

namespace {

bool same(const VorTransform& x, const VorTransform& y) { return std::memcmp(&x, &y, sizeof x) == 0; }

TEST(Transform, NewestPostOperationAppliesLast) {
    VorTransform t;
    VorTransformSetIdentity(&t);
    VorTransformPostScale(&t, 2, 2);
    VorTransformPostTranslate(&t, 10, 0);  // (1, 1) -> (12, 2)
    EXPECT_TRUE(same(t, VorTransform{2, 0, 10, 0, 2, 0}));
    VorTransformSetIdentity(&t);
    VorTransformPostRotate(&t, M_PI / 2);
    EXPECT_NEAR(t.a, 0.0, 1e-15);
    EXPECT_EQ(t.c, 1.0);  // the positive angle turns x toward y
}

TEST(Transform, ConcatWithIdentityInPlaceAndInTheDocumentedSumOrder) {
    const VorTransform m = {1.5, -2.0, 3.25, 0.5, 4.0, -7.0};
    VorTransform b = m;
    VorTransformConcat(&VorTransformIdentity, &b);
    EXPECT_TRUE(same(b, m));
    VorTransformSetIdentity(&b);
    VorTransformConcat(&m, &b);
    EXPECT_TRUE(same(b, m));
    VorTransform sq = m, expected = m;  // A x A with both arguments the same record
    VorTransformConcat(&sq, &sq);
    VorTransformConcat(&m, &expected);
    EXPECT_TRUE(same(sq, expected));
    // The translation is (1 + 2^-53) + (-1): 0, where 1 + (2^-53 - 1) would give 2^-53.
    VorTransform t = {1, 0, 1, 0, 1, 0x1p-53};
    const VorTransform shear = {1, 1, -1, 0, 1, 0};
    VorTransformConcat(&shear, &t);
    EXPECT_EQ(t.tx, 0.0);
}

TEST(TransformInverse, ScaleWithTranslationAndSingular) {
    const VorTransform t = {2, 0, 6, 0, 4, 8};
    VorTransform inv;
    VorTransformGetInverse(&t, &inv);
    const double expected[6] = {0.5, 0, -3, 0, 0.25, -2};
    for (int k = 0; k < 6; ++k) EXPECT_EQ((&inv.a)[k], expected[k]) << k;
    const VorTransform zero = {0, 0, 0, 0, 0, 0};
    VorTransformGetInverse(&zero, &inv);  // non-finite entries, not the identity
    EXPECT_FALSE(std::isfinite(inv.a) || std::isfinite(inv.d) || std::isfinite(inv.tx));
}

}  // namespace
