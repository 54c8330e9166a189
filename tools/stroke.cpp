// Stroke interpolation: sparse touch positions turned into evenly spaced
// brush positions along quadratic curves through the midpoints of
// successive touches, with straight legs at the ends. Each run is a
// malloc'ed array the caller frees.
#include <cmath>
#include <cstdint>
#include <cstdlib>

#include "core/core_internal.h"
#include "zentra_vorlite.h"

namespace {

// A run longer than this is no stroke a finger can make (it is a radius of
// a millionth of a pixel or a coordinate of 1e30): it is cut here rather
// than asking for gigabytes.
constexpr std::int32_t k_max_points = 1 << 20;

float spacing(float radius, std::int32_t paint) {
    if (paint != 0) return static_cast<float>(std::sqrt(static_cast<double>((radius + radius) + 1.0f)));
    return radius * 0.5f;
}

// How many positions a path of the length takes: the quotient plus one,
// truncated. A negative or NaN quotient takes none.
std::uint32_t count_of(float quotient_plus_one) {
    const std::int32_t n = vorlite::core::truncate_clamped<std::int32_t>(quotient_plus_one);
    if (n <= 0) return 0;
    return static_cast<std::uint32_t>(n > k_max_points ? k_max_points : n);
}

float distance(VorPoint p, VorPoint q) {
    const float dx = p.x - q.x;
    const float dy = p.y - q.y;
    return std::sqrt(dy * dy + dx * dx);
}

VorPoint midpoint(VorPoint p, VorPoint q) { return VorPoint{(p.x + q.x) * 0.5f, (p.y + q.y) * 0.5f}; }

// A straight leg between `last` and `far`, emitted starting next to `last`
// and moving toward `far`, with `last` itself at the end; `far` is never
// emitted.
void write_leg(VorPoint* out, std::uint32_t n, VorPoint last, VorPoint far) {
    if (n == 0) return;
    const float step = 1.0f / static_cast<float>(n);
    for (std::uint32_t k = 1; k < n; ++k) {
        const float t = static_cast<float>(k) * step;
        const float u = 1.0f - t;
        out[k - 1] = VorPoint{u * last.x + t * far.x, u * last.y + t * far.y};
    }
    out[n - 1] = last;
}

// The quadratic curve from m1 to m2 with control point b; m1 is not
// emitted (the previous run ended there), m2 comes last.
void write_curve(VorPoint* out, std::uint32_t n, VorPoint m1, VorPoint b, VorPoint m2) {
    if (n == 0) return;
    const float step = 1.0f / static_cast<float>(n);
    const VorPoint b2{b.x + b.x, b.y + b.y};
    for (std::uint32_t k = 1; k < n; ++k) {
        const float t = static_cast<float>(k) * step;
        const float u = 1.0f - t;
        const float uu = u * u;
        const float ut = u * t;
        const float tt = t * t;
        out[k - 1] = VorPoint{(uu * m1.x + ut * b2.x) + tt * m2.x, (uu * m1.y + ut * b2.y) + tt * m2.y};
    }
    out[n - 1] = m2;
}

// Hands a run of n positions to the caller: null and 0 when there are none
// or the memory is not there.
VorPoint* allocate(std::uint32_t n, VorPoint** out_points, std::uint32_t* out_count) {
    VorPoint* points = n == 0 ? nullptr : static_cast<VorPoint*>(std::malloc(std::size_t{n} * sizeof(VorPoint)));
    *out_points = points;
    *out_count = points == nullptr ? 0 : n;
    return points;
}

void straight(VorPoint last, VorPoint far, float radius, VorPoint** out_points, std::uint32_t* out_count,
              std::int32_t paint) {
    const std::uint32_t n = count_of(distance(last, far) / spacing(radius, paint) + 1.0f);
    VorPoint* points = allocate(n, out_points, out_count);
    if (points != nullptr) write_leg(points, n, last, far);
}

struct Curve {
    VorPoint m1, m2;
    float length;
};

Curve curve_of(VorPoint a, VorPoint b, VorPoint c) {
    const VorPoint m1{(b.x + a.x) * 0.5f, (b.y + a.y) * 0.5f};
    const VorPoint m2{(b.x + c.x) * 0.5f, (b.y + c.y) * 0.5f};
    // The control polygon's length, not the curve's: close enough to
    // space the dabs and far cheaper.
    return Curve{m1, m2, distance(m1, b) + distance(m2, b)};
}

}  // namespace

extern "C" {

VOR_API void VorInterpolateFirstPointToMidpoint(VorPoint a, VorPoint b, float radius, VorPoint** outPoints,
                                                uint32_t* outCount, int32_t paintFlag) {
    straight(midpoint(a, b), a, radius, outPoints, outCount, paintFlag);
}

VOR_API void VorInterpolateMidpointToSecondPoint(VorPoint a, VorPoint b, float radius, VorPoint** outPoints,
                                                 uint32_t* outCount, int32_t paintFlag) {
    straight(b, midpoint(a, b), radius, outPoints, outCount, paintFlag);
}

VOR_API void VorInterpolateBetweenPointsWithBezierQuadCurve(VorPoint a, VorPoint b, VorPoint c, float radius,
                                                            VorPoint** outPoints, uint32_t* outCount,
                                                            int32_t paintFlag) {
    const Curve curve = curve_of(a, b, c);
    const std::uint32_t n = count_of(curve.length / spacing(radius, paintFlag) + 1.0f);
    VorPoint* points = allocate(n, outPoints, outCount);
    if (points != nullptr) write_curve(points, n, curve.m1, b, curve.m2);
}

VOR_API void VorInterpolateBetweenPointsWithBezierQuadCurveAndFinishToPoint(VorPoint a, VorPoint b, VorPoint c,
                                                                            float radius, VorPoint** outPoints,
                                                                            uint32_t* outCount,
                                                                            int32_t paintFlag) {
    const Curve curve = curve_of(a, b, c);
    const float inverse = 1.0f / spacing(radius, paintFlag);
    const std::uint32_t n_curve = count_of(inverse * curve.length + 1.0f);
    const std::uint32_t n_leg = count_of(inverse * distance(curve.m2, b) + 1.0f);
    VorPoint* points = allocate(n_curve + n_leg, outPoints, outCount);
    if (points == nullptr) return;
    write_curve(points, n_curve, curve.m1, b, curve.m2);
    // Back from the last midpoint to the middle touch: a finished stroke
    // ends at b, never reaching c.
    write_leg(points + n_curve, n_leg, b, curve.m2);
}

}  // extern "C"
