#include <gtest/gtest.h>

#include <cmath>
#include <cstring>

#include "zentra_vorlite.h"

namespace {

void apply(const VorTransform& t, double x, double y, double* ox, double* oy) {
    *ox = t.a * x + t.b * y + t.tx;
    *oy = t.c * x + t.d * y + t.ty;
}

TEST(Transform, NewestPostOperationAppliesLast) {
    VorTransform t;
    VorTransformSetIdentity(&t);
    VorTransformPostScale(&t, 2, 2);
    VorTransformPostTranslate(&t, 10, 0);
    double x, y;
    apply(t, 1, 1, &x, &y);
    EXPECT_EQ(x, 12.0);
    EXPECT_EQ(y, 2.0);

    VorTransformSetIdentity(&t);
    VorTransformPostRotate(&t, M_PI / 2);
    apply(t, 1, 0, &x, &y);
    EXPECT_NEAR(x, 0.0, 1e-15);
    EXPECT_EQ(y, 1.0);  // the positive angle turns x toward y
}

TEST(Transform, ConcatWithIdentityOnEitherSideAndInPlace) {
    const VorTransform m = {1.5, -2.0, 3.25, 0.5, 4.0, -7.0};
    VorTransform b = m;
    VorTransformConcat(&VorTransformIdentity, &b);
    EXPECT_EQ(std::memcmp(&b, &m, sizeof m), 0);
    VorTransformSetIdentity(&b);
    VorTransformConcat(&m, &b);
    EXPECT_EQ(std::memcmp(&b, &m, sizeof m), 0);

    // A x A with both arguments the same record.
    VorTransform sq = m;
    VorTransformConcat(&sq, &sq);
    VorTransform expected = m;
    const VorTransform a = m;
    VorTransformConcat(&a, &expected);
    EXPECT_EQ(std::memcmp(&sq, &expected, sizeof sq), 0);
}

TEST(TransformInverse, ScaleWithTranslation) {
    const VorTransform t = {2, 0, 6, 0, 4, 8};
    VorTransform inv;
    VorTransformGetInverse(&t, &inv);
    const VorTransform expected = {0.5, -0.0, -3, -0.0, 0.25, -2};
    EXPECT_EQ(inv.a, expected.a);
    EXPECT_EQ(inv.b, 0.0);
    EXPECT_EQ(inv.tx, expected.tx);
    EXPECT_EQ(inv.c, 0.0);
    EXPECT_EQ(inv.d, expected.d);
    EXPECT_EQ(inv.ty, expected.ty);

}

TEST(TransformInverse, SingularGivesNonFiniteEntriesNotTheIdentity) {
    const VorTransform zero = {0, 0, 0, 0, 0, 0};
    VorTransform inv;
    VorTransformGetInverse(&zero, &inv);
    EXPECT_FALSE(std::isfinite(inv.a));
    EXPECT_FALSE(std::isfinite(inv.d));
    EXPECT_FALSE(std::isfinite(inv.tx));
}

}  // namespace
