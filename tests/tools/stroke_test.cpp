#include <gtest/gtest.h>

#include <cmath>
#include <cstdlib>
#include <limits>
#include <vector>

#include "zentra_vorlite.h"

namespace {

std::vector<VorPoint> take(VorPoint* points, uint32_t count) {
    std::vector<VorPoint> out(points, points + count);
    std::free(points);
    return out;
}

using Pairs = std::vector<std::pair<float, float>>;
Pairs pairs(const std::vector<VorPoint>& points) {
    Pairs out;
    for (const VorPoint& p : points) out.emplace_back(p.x, p.y);
    return out;
}

TEST(StrokeLegs, StartLegRunsFromNextToTheMidpointBackTowardTheTouch) {
    VorPoint* points = nullptr;
    uint32_t count = 0;
    VorInterpolateFirstPointToMidpoint({0, 0}, {10, 0}, 4.0f, &points, &count, 0);
    // Spacing 2 over length 5: n = 3, t = 1/3 and 2/3, then the midpoint.
    const std::vector<VorPoint> run = take(points, count);
    ASSERT_EQ(run.size(), 3u);
    EXPECT_NEAR(run[0].x, 10.0f / 3.0f, 1e-6f);
    EXPECT_NEAR(run[1].x, 5.0f / 3.0f, 1e-6f);
    EXPECT_EQ(pairs({run[2]}), (Pairs{{5, 0}}));
    VorInterpolateFirstPointToMidpoint({0, 0}, {10, 0}, 4.0f, &points, &count, 1);
    // The paint brush spaces by sqrt(2r + 1) = 3: n = 2.
    EXPECT_EQ(pairs(take(points, count)), (Pairs{{2.5f, 0}, {5, 0}}));
    VorInterpolateFirstPointToMidpoint({7, -3}, {7, -3}, 4.0f, &points, &count, 0);
    EXPECT_EQ(pairs(take(points, count)), (Pairs{{7, -3}}));
}

TEST(StrokeLegs, MidpointToSecondEndsOnTheSecondTouch) {
    VorPoint* points = nullptr;
    uint32_t count = 0;
    VorInterpolateMidpointToSecondPoint({0, 0}, {0, 12}, 2.0f, &points, &count, 0);
    const std::vector<VorPoint> run = take(points, count);
    ASSERT_EQ(run.size(), 7u);
    EXPECT_EQ(run.back().y, 12.0f);
    EXPECT_NEAR(run.front().y, 12.0f - 6.0f / 7.0f, 1e-5f) << "next to the touch, moving toward the midpoint";
}

TEST(StrokeCurves, CurveRunsBetweenMidpointsAndTheFinishReturnsToTheMiddleTouch) {
    const VorPoint a{0, 0}, b{20, 0}, c{20, 20};
    VorPoint* points = nullptr;
    uint32_t count = 0;
    VorInterpolateBetweenPointsWithBezierQuadCurve(a, b, c, 2.0f, &points, &count, 0);
    const std::vector<VorPoint> curve = take(points, count);
    // Control polygon 10 + 10 over spacing 1: n = 21, ending on (20, 10).
    ASSERT_EQ(curve.size(), 21u);
    EXPECT_EQ(pairs({curve.back()}), (Pairs{{20, 10}}));
    for (const VorPoint& p : curve) {
        EXPECT_GE(p.x, 10.0f);
        EXPECT_LE(p.y, 10.0f);
        EXPECT_FALSE(p.x == 10.0f && p.y == 0.0f) << "the first midpoint is the previous run's end";
    }
    VorInterpolateBetweenPointsWithBezierQuadCurveAndFinishToPoint(a, b, c, 2.0f, &points, &count, 0);
    const std::vector<VorPoint> finished = take(points, count);
    ASSERT_EQ(finished.size(), 21u + 11u);
    EXPECT_EQ(pairs(std::vector<VorPoint>(finished.begin(), finished.begin() + 21)), pairs(curve));
    EXPECT_EQ(pairs({finished.back()}), (Pairs{{20, 0}})) << "the stroke ends on b, never reaching c";
}

TEST(StrokeCurves, NoPositionsGiveNoArray) {
    const float bad[] = {std::numeric_limits<float>::quiet_NaN(), -5.0f, 0.0f};
    for (const float radius : bad) {
        VorPoint* points = reinterpret_cast<VorPoint*>(&points);
        uint32_t count = 99;
        VorInterpolateBetweenPointsWithBezierQuadCurve({0, 0}, {50, 0}, {50, 50}, radius, &points, &count, 0);
        if (count == 0) {
            EXPECT_EQ(points, nullptr) << radius;
        }
        std::free(points);
    }
    VorPoint* points = nullptr;
    uint32_t count = 99;
    VorInterpolateFirstPointToMidpoint({0, 0}, {1e30f, 0}, 1e-30f, &points, &count, 0);
    EXPECT_LE(count, 1u << 20) << "a runaway stroke is capped";
    std::free(points);
}

}  // namespace
