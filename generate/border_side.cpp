// Edge frames drawn from fractal edge profiles: the side styles (bulge,
// torn, rect, round, glimmo), each a band along the four edges whose inner
// boundary a profile roughens, and the double-sided torn strip (torn_2),
// torn along both of its edges, made to be layered at low opacity.
//
// The band is B = width x (width + height) pixels deep; sideTune1 x
// (width + height) is the profiles' amplitude, sideTune2 their roughness,
// sideTune3 the softness of the inner edge as a share of B, and the other
// tunings shape each style as noted where they are read.
#include <algorithm>
#include <cmath>
#include <cstdint>
#include <limits>

#include "color/color_internal.h"
#include "core/core_internal.h"
#include "core/simd.h"
#include "generate/generate_internal.h"

namespace {

constexpr float k_pi = 3.14159265f;

// A tuning field made safe: NaN and infinities give the fallback, and the
// value is held within [low, high] so that no document can make a band
// wider than the picture or a loop longer than its rows.
float tuning(double value, float low, float high, float fallback) {
    if (!(value == value) || value > 1e30 || value < -1e30) return fallback;
    const auto v = static_cast<float>(value);
    return v < low ? low : (v > high ? high : v);
}

// Two profiles along the longer side, each drawn by midpoint displacement
// from a seed that the style's generator gives just before the call.
struct Profiles {
    const float* first;
    const float* second;
    std::uint32_t length;
};

void fill_profile(float* profile, std::uint32_t length, float roughness, std::int32_t mode, VorRNG* rng) {
    profile[0] = 0.0f;
    profile[length - 1] = 0.0f;
    const std::uint32_t seed = VorRNGNextInt(rng);
    VorMPDSeed(profile, 0, static_cast<std::int32_t>(length - 1), 1.0f, roughness, mode, seed);
}

// The band's shape: how deep it reaches at a place along an edge, and how
// soft its inner boundary is there.
class Band {
public:
    Band(const VorBorderParams& p, const Profiles& profiles, std::uint32_t width, std::uint32_t height)
        : style_(p.style), profiles_(profiles), width_(width), height_(height) {
        const auto sum = static_cast<float>(static_cast<std::uint64_t>(width) + height);
        const float shorter = static_cast<float>(std::min(width, height));
        depth_ = std::min(tuning(p.width, 0.0f, 1.0f, 0.0f) * sum, 0.45f * shorter);
        amplitude_ = std::min(tuning(p.sideTune1, 0.0f, 1.0f, 0.0f) * sum, 0.25f * shorter);
        softness_ = std::max(1.0f, tuning(p.sideTune3, 0.0f, 4.0f, 1.0f) * depth_ * 0.5f);
        swell_ = tuning(p.inset, 0.0f, 1.0f, 0.0f);
        fringe_ = tuning(p.sideTune4, 0.0f, 4.0f, 0.28f);
        fringe_power_ = tuning(p.sideTune5, 0.1f, 8.0f, 1.5f);
        streaks_ = tuning(p.sideTune0, 0.0f, 2.0f, 1.0f);
        if (style_ == VOR_BORDER_RECT || style_ == VOR_BORDER_ROUND) {
            // A print mat is cut almost straight: a trace of the profile.
            amplitude_ = std::max(amplitude_, 0.0015f * sum * tuning(p.sideTune6, 0.0f, 4.0f, 1.0f));
        }
        if (style_ == VOR_BORDER_ROUND) corner_ = tuning(p.sideTune5, 0.0f, 4.0f, 1.5f) * depth_;
        if (style_ == VOR_BORDER_GLIMMO) {
            // A wet plate's dark edge is a margin of the plate, never a
            // tunnel: a record left at its full default width still leaves
            // the picture open.
            depth_ = std::min(depth_, 0.1f * shorter);
            softness_ = std::max(1.0f, tuning(p.sideTune3, 0.0f, 4.0f, 1.0f) * depth_ * 0.5f);
            amplitude_ = std::max(amplitude_, 0.35f * depth_);
        }
    }

    // The deepest the band can reach, so rows and columns beyond it are skipped.
    float reach() const { return depth_ + amplitude_ + 2.0f * softness_ + fringe_ * depth_ + 2.0f; }

    // How deep the band reaches at every place along each edge, and the
    // softness of the wet plate's streaks there: formed once for the pass,
    // since a pixel asks for four of them.
    bool build() {
        const std::uint32_t last = profiles_.length - 1;
        for (int e = 0; e < 4; ++e) {
            const bool horizontal = e < 2;
            const std::uint32_t n = horizontal ? width_ : height_;
            if (!reach_[e].build(n) || !soft_[e].build(n)) return false;
            for (std::uint32_t i = 0; i < n; ++i) {
                // Top and left read their profile forward, bottom and right
                // backward, so no two edges share a stretch of it.
                const std::uint32_t along = e % 2 == 0 ? i : last - i;
                const float t = static_cast<float>(i) / static_cast<float>(n);
                const float n1 = (horizontal ? profiles_.first : profiles_.second)[along];
                const float n2 = (horizontal ? profiles_.second : profiles_.first)[along];
                reach_[e][i] = depth_at(t, n1);
                // Streaks: the softness itself wanders along the edge.
                soft_[e][i] = style_ == VOR_BORDER_GLIMMO ? softness_ * (0.4f + streaks_ * std::fabs(n2) * 1.5f) + 1.0f
                                                          : softness_;
            }
        }
        return true;
    }

    // Coverage 0..1 of the colour at a pixel.
    float coverage(std::uint32_t x, std::uint32_t y) const {
        const float depth[4] = {static_cast<float>(y), static_cast<float>(height_ - 1 - y), static_cast<float>(x),
                                static_cast<float>(width_ - 1 - x)};
        const std::uint32_t place[4] = {x, x, y, y};
        float inside = -1e30f;  // how far into the band, pixels
        float soft = softness_;
        for (int e = 0; e < 4; ++e) {
            const float into = reach_[e][place[e]] - depth[e];
            if (into > inside) {
                inside = into;
                soft = soft_[e][place[e]];
            }
        }
        if (corner_ > 0.0f) inside = std::max(inside, rounded_corner(x, y));
        return shape(inside, soft);
    }

    // coverage() of the columns [x0, x1) of row y into c, four columns at
    // a time where the lanes allow: each edge weighed in the same order
    // with the same strict comparison, so the same edge sets the softness;
    // the rounded corner and the soft ramps' cosine and power lane by lane.
    void row_coverage(std::uint32_t y, std::uint32_t x, std::uint32_t x1, float* c, bool lanes) const {
#if VORLITE_EXACT_FLOAT_LANES
        namespace simd = vorlite::core::simd;
        using simd::f32x4;
        if (lanes) {
            const f32x4 step = {0.0f, 1.0f, 2.0f, 3.0f};
            const f32x4 top = simd::splat(static_cast<float>(y));
            const f32x4 bottom = simd::splat(static_cast<float>(height_ - 1 - y));
            const f32x4 left_reach = simd::splat(reach_[2][y]), right_reach = simd::splat(reach_[3][y]);
            const f32x4 left_soft = simd::splat(soft_[2][y]), right_soft = simd::splat(soft_[3][y]);
            const f32x4 last_column = simd::splat(static_cast<float>(width_ - 1));
            for (; x + 4 <= x1; x += 4) {
                const f32x4 column = simd::splat(static_cast<float>(x)) + step;
                f32x4 inside = simd::splat(-1e30f);
                f32x4 soft = simd::splat(softness_);
                const auto weigh = [&](f32x4 into, f32x4 edge_soft) {
                    const auto deeper = into > inside;
                    inside = deeper ? into : inside;
                    soft = deeper ? edge_soft : soft;
                };
                weigh(simd::load<f32x4>(&reach_[0][x]) - top, simd::load<f32x4>(&soft_[0][x]));
                weigh(simd::load<f32x4>(&reach_[1][x]) - bottom, simd::load<f32x4>(&soft_[1][x]));
                weigh(left_reach - column, left_soft);
                weigh(right_reach - (last_column - column), right_soft);
                if (corner_ > 0.0f) {
                    for (int i = 0; i < 4; ++i) inside[i] = std::max(inside[i], rounded_corner(x + i, y));
                }
                if (style_ == VOR_BORDER_TORN || style_ == VOR_BORDER_BULGE || style_ == VOR_BORDER_GLIMMO) {
                    for (int i = 0; i < 4; ++i) c[x + i] = shape(inside[i], soft[i]);
                } else {
                    // std::clamp(inside + 0.5, 0, 1), NaN included.
                    const f32x4 v = inside + simd::splat(0.5f);
                    const f32x4 capped = simd::splat(1.0f) < v ? simd::splat(1.0f) : v;
                    simd::store(c + x, v < simd::splat(0.0f) ? simd::splat(0.0f) : capped);
                }
            }
        }
#else
        (void)lanes;
#endif
        for (; x < x1; ++x) c[x] = coverage(x, y);
    }

private:
    float depth_at(float t, float noise) const {
        switch (style_) {
            case VOR_BORDER_BULGE: {
                // Shallower at the corners, swelling to the full depth at
                // the middle of each side.
                const float swell = 1.0f - swell_ + swell_ * vorlite::core::sinf(k_pi * t);
                return depth_ * swell + amplitude_ * noise;
            }
            case VOR_BORDER_GLIMMO:
                return depth_ * 0.75f + amplitude_ * noise;
            default:
                return depth_ + amplitude_ * noise;
        }
    }

    // Inside a corner square the inner boundary is a quarter circle of
    // radius R, so the opening of the frame has rounded corners.
    float rounded_corner(std::uint32_t x, std::uint32_t y) const {
        const float c = depth_ + corner_;
        const float fx = static_cast<float>(x < width_ / 2 ? x : width_ - 1 - x);
        const float fy = static_cast<float>(y < height_ / 2 ? y : height_ - 1 - y);
        if (fx >= c || fy >= c) return -1e30f;
        const float dx = c - fx;
        const float dy = c - fy;
        return std::sqrt(dx * dx + dy * dy) - corner_;
    }

    // From the distance into the band to a coverage: a one-pixel ramp for
    // crisp edges, a cosine ramp over the softness for soft ones, a fringe
    // of paper fibres beyond a tear.
    float shape(float inside, float soft) const {
        switch (style_) {
            case VOR_BORDER_TORN: {
                if (inside >= 0.5f) return 1.0f;
                const float fringe = fringe_ * 0.25f * depth_ + 1.0f;
                const float u = (0.5f - inside) / fringe;
                if (u >= 1.0f) return 0.0f;
                return 0.6f * vorlite::core::powf(1.0f - u, fringe_power_) + (inside > -0.5f ? 0.4f * (inside + 0.5f) : 0.0f);
            }
            case VOR_BORDER_BULGE:
            case VOR_BORDER_GLIMMO: {
                const float u = std::clamp(inside / soft + 0.5f, 0.0f, 1.0f);
                // The two ends of the ramp, where most pixels lie, without a
                // cosine: cos 0 is 1, and the cosine of the float nearest pi
                // rounds to -1.
                const float eased = u == 0.0f   ? 0.0f
                                    : u == 1.0f ? 1.0f
                                                : 0.5f - 0.5f * vorlite::core::cosf(k_pi * u);
                // The wet-plate edge darkens more steeply than it fades.
                return style_ == VOR_BORDER_GLIMMO ? std::sqrt(eased) : eased;
            }
            default:
                return std::clamp(inside + 0.5f, 0.0f, 1.0f);
        }
    }

    std::int32_t style_;
    Profiles profiles_;
    std::uint32_t width_;
    std::uint32_t height_;
    float depth_ = 0.0f;
    float amplitude_ = 0.0f;
    float softness_ = 1.0f;
    float swell_ = 0.0f;
    float fringe_ = 0.0f;
    float fringe_power_ = 1.5f;
    float streaks_ = 1.0f;
    float corner_ = 0.0f;
    vorlite::core::WorkingArray<float> reach_[4];
    vorlite::core::WorkingArray<float> soft_[4];
};

void lay(std::uint8_t* p, const VorColor& colour, std::uint32_t mode, float opacity) {
    VorColor out = vorlite::core::load_pixel(p);
    VorColorBlend(&out, &colour, mode, opacity);
    vorlite::core::store_pixel(p, out);
}

// Most of a band is covered fully: one colour at one opacity, where each
// channel's result depends on its own level alone, so three tables give
// the blend's bytes. The colour mode mixes channels and has none.
class FullCover {
public:
    FullCover(const VorColor& colour, std::uint32_t mode, float opacity) {
        tabled_ = vorlite::color::blend_channel_row(mode, colour.r, opacity, red_);
        if (!tabled_) return;
        vorlite::color::blend_channel_row(mode, colour.g, opacity, green_);
        vorlite::color::blend_channel_row(mode, colour.b, opacity, blue_);
    }

    bool tabled() const { return tabled_; }
    void lay(std::uint8_t* p) const {
        p[0] = red_[p[0]];
        p[1] = green_[p[1]];
        p[2] = blue_[p[2]];
    }

private:
    bool tabled_ = false;
    std::uint8_t red_[256];
    std::uint8_t green_[256];
    std::uint8_t blue_[256];
};

// Lays the colour over columns x0 to x1 of a row at each column's coverage:
// the full cover's tables where it is whole, nothing where it is none.
void lay_covered(std::uint8_t* row, const float* coverage, std::uint32_t x0, std::uint32_t x1, const FullCover& full,
                 const VorColor& colour, std::uint32_t mode, float opacity) {
    for (std::uint32_t x = x0; x < x1; ++x) {
        if (coverage[x] == 1.0f && full.tabled()) {
            full.lay(row + std::size_t{x} * 4);
        } else if (coverage[x] > 0.0f) {
            lay(row + std::size_t{x} * 4, colour, mode, opacity * coverage[x]);
        }
    }
}

// Visits the pixels within `reach` of an edge, row by row; `cover` gives
// each one's coverage.
template <typename Cover>
void paint_edges(VorBitmap* bitmap, const VorColor& colour, std::uint32_t mode, float reach, Cover cover) {
    const std::uint32_t width = bitmap->width;
    const std::uint32_t height = bitmap->height;
    const float opacity = static_cast<float>(colour.a) * vorlite::core::k_inv255;
    const FullCover full(colour, mode, opacity);
    const auto margin = static_cast<std::uint32_t>(std::min(reach, static_cast<float>(std::max(width, height))));
    for (std::uint32_t y = 0; y < height; ++y) {
        const bool near_row = y < margin || height - 1 - y < margin;
        std::uint8_t* row = bitmap->data + static_cast<std::size_t>(y) * width * 4;
        for (std::uint32_t x = 0; x < width; ++x) {
            if (!near_row && x >= margin && width - 1 - x >= margin) {
                x = width - margin - 1;
                continue;
            }
            const float c = cover(x, y);
            if (c == 1.0f && full.tabled()) {
                full.lay(row + std::size_t{x} * 4);
            } else if (c > 0.0f) {
                lay(row + std::size_t{x} * 4, colour, mode, opacity * c);
            }
        }
    }
}

// paint_edges with the coverage of each visited span of a row formed
// before the span is laid.
template <typename RowCover>
void paint_edge_rows(VorBitmap* bitmap, const VorColor& colour, std::uint32_t mode, float reach, float* coverage,
                     RowCover row_cover) {
    const std::uint32_t width = bitmap->width;
    const std::uint32_t height = bitmap->height;
    const float opacity = static_cast<float>(colour.a) * vorlite::core::k_inv255;
    const FullCover full(colour, mode, opacity);
    const auto margin = static_cast<std::uint32_t>(std::min(reach, static_cast<float>(std::max(width, height))));
    const std::uint32_t left_end = std::min(margin, width);
    const std::uint32_t right_start = std::max(margin >= width ? width : width - margin, left_end);
    const auto lay_span = [&](std::uint32_t y, std::uint32_t x0, std::uint32_t x1) {
        std::uint8_t* row = bitmap->data + static_cast<std::size_t>(y) * width * 4;
        row_cover(y, x0, x1, coverage);
        lay_covered(row, coverage, x0, x1, full, colour, mode, opacity);
    };
    for (std::uint32_t y = 0; y < height; ++y) {
        if (y < margin || height - 1 - y < margin) {
            lay_span(y, 0, width);
        } else {
            lay_span(y, 0, left_end);
            lay_span(y, right_start, width);
        }
    }
}

// A strip torn on both sides: its outer edge wanders just inside the
// picture's edge, its inner edge about the band's depth; between the two
// it covers fully, with a pixel of ramp at each tear. An edge farther than
// the strip can reach adds nothing, so most pixels weigh one edge, not four.
class Strip {
public:
    Strip(const VorBorderParams& p, std::uint32_t width, std::uint32_t height)
        : width_(width), height_(height), last_(std::max(width, height) - 1) {
        const auto sum = static_cast<float>(static_cast<std::uint64_t>(width) + height);
        const float shorter = static_cast<float>(std::min(width, height));
        depth_ = std::min(tuning(p.width, 0.0f, 1.0f, 0.0f) * sum, 0.45f * shorter);
        amplitude_ = std::min(tuning(p.sideTune1, 0.0f, 1.0f, 0.0f) * sum, 0.25f * shorter);
        reach_ = depth_ + amplitude_ * 2.0f + 2.0f;
    }

    float reach() const { return reach_; }
    // Where the strip starts and where it ends, at a place along an edge.
    float from(const float* outer, std::uint32_t along) const { return 0.5f * amplitude_ * std::fabs(outer[along]); }
    float to(const float* inner, std::uint32_t along) const { return depth_ + amplitude_ * inner[along]; }

    // The reference: one pixel's coverage, every edge weighed in turn.
    float coverage(const float* inner, const float* outer, std::uint32_t x, std::uint32_t y) const {
        const float d[4] = {static_cast<float>(y), static_cast<float>(height_ - 1 - y), static_cast<float>(x),
                            static_cast<float>(width_ - 1 - x)};
        const std::uint32_t along[4] = {x, last_ - x, y, last_ - y};
        float best = 0.0f;
        for (int e = 0; e < 4; ++e) {
            if (d[e] >= reach_) continue;
            best = std::max(best, edge_coverage(d[e], from(outer, along[e]), to(inner, along[e])));
        }
        return best;
    }

    static float edge_coverage(float d, float from, float to) {
        return std::min(std::clamp(d - from + 0.5f, 0.0f, 1.0f), std::clamp(to - d + 0.5f, 0.0f, 1.0f));
    }

private:
    std::uint32_t width_;
    std::uint32_t height_;
    std::uint32_t last_;
    float depth_ = 0.0f;
    float amplitude_ = 0.0f;
    float reach_ = 0.0f;
};

// The strip row by row: the top and bottom tears of every column are
// formed once for the pass, a row's coverage is formed before it is laid
// (along the top and bottom rows four columns at a time), and the left and
// right tears join only the columns they reach. The larger of the edges'
// coverages ignores a NaN one, as the reference's std::max does, so the
// order in which the edges are weighed does not matter.
class StripRows {
public:
    StripRows(const Strip& strip, const float* inner, const float* outer, std::uint32_t width,
              std::uint32_t height)
        : strip_(strip), inner_(inner), outer_(outer), width_(width), height_(height),
          last_(std::max(width, height) - 1) {}

    bool build() {
        if (!top_from_.build(width_) || !top_to_.build(width_) || !bottom_from_.build(width_) ||
            !bottom_to_.build(width_) || !coverage_.build(width_)) {
            return false;
        }
        top_limit_ = bottom_limit_ = -1.0;
        for (std::uint32_t x = 0; x < width_; ++x) {
            top_from_[x] = strip_.from(outer_, x);
            top_to_[x] = strip_.to(inner_, x);
            bottom_from_[x] = strip_.from(outer_, last_ - x);
            bottom_to_[x] = strip_.to(inner_, last_ - x);
            top_limit_ = farther(top_limit_, top_to_[x]);
            bottom_limit_ = farther(bottom_limit_, bottom_to_[x]);
        }
        return true;
    }

    // Whether the top (bottom) tear can cover anything in row y: it is
    // within reach, and no column's tear ends more than a pixel above it.
    bool top_reaches(std::uint32_t y) const {
        return !(static_cast<float>(y) >= strip_.reach()) && static_cast<double>(y) <= top_limit_;
    }
    bool bottom_reaches(std::uint32_t y) const {
        const std::uint32_t d = height_ - 1 - y;
        return !(static_cast<float>(d) >= strip_.reach()) && static_cast<double>(d) <= bottom_limit_;
    }

    // The columns of row y that the left and the right tear can cover, in
    // at most two spans (one where they meet); returns how many.
    std::uint32_t side_spans(std::uint32_t y, std::uint32_t (*spans)[2]) const {
        const std::uint32_t within = reach_columns();
        std::uint32_t left[2] = {0, within};
        narrow(left, strip_.from(outer_, y), strip_.to(inner_, y), 0.0, 1.0);
        std::uint32_t right[2] = {width_ - within, width_};
        narrow(right, strip_.from(outer_, last_ - y), strip_.to(inner_, last_ - y), static_cast<double>(width_ - 1),
               -1.0);
        std::uint32_t n = 0;
        if (left[0] < left[1] && right[0] < right[1] && right[0] <= left[1] && left[0] <= right[1]) {
            spans[n][0] = std::min(left[0], right[0]);
            spans[n++][1] = std::max(left[1], right[1]);
            return n;
        }
        for (const std::uint32_t* s : {left, right}) {
            if (s[0] < s[1]) {
                spans[n][0] = s[0];
                spans[n++][1] = s[1];
            }
        }
        return n;
    }

    // Coverage of the columns [x0, x1) of row y, with the top and bottom
    // tears weighed where asked.
    const float* row(std::uint32_t y, std::uint32_t x0, std::uint32_t x1, bool top, bool bottom) {
        float* c = coverage_.get();
        for (std::uint32_t x = x0; x < x1; ++x) c[x] = 0.0f;
        if (top) across(c, x0, x1, static_cast<float>(y), top_from_.get(), top_to_.get());
        if (bottom) across(c, x0, x1, static_cast<float>(height_ - 1 - y), bottom_from_.get(), bottom_to_.get());
        const std::uint32_t within = reach_columns();
        const std::uint32_t left_end = std::min(x1, within);
        const std::uint32_t right_start = std::max(x0, width_ - within);
        if (x0 < left_end) {
            down(c, x0, left_end, 0.0f, 1.0f, strip_.from(outer_, y), strip_.to(inner_, y));
        }
        if (right_start < x1) {
            down(c, right_start, x1, static_cast<float>(width_ - 1), -1.0f, strip_.from(outer_, last_ - y),
                 strip_.to(inner_, last_ - y));
        }
        return c;
    }

private:
    // Column x is reach or more from the left edge from x = ceil(reach) on
    // (whole numbers are exact floats at any bitmap size), and from the
    // right edge up to width - ceil(reach).
    std::uint32_t reach_columns() const {
        return static_cast<std::uint32_t>(std::min(std::ceil(strip_.reach()), static_cast<float>(width_)));
    }

    // A tear covers nothing at distance d when d < from - 1 or d > to + 1:
    // then one of its two ramps is at most -1 before its half pixel is
    // added, whatever the rounding. span, the columns [lo, hi) at distance
    // origin + sign x, is narrowed to those that may be covered.
    void narrow(std::uint32_t* span, float from, float to, double origin, double sign) const {
        if (!std::isfinite(from) || !std::isfinite(to)) return;
        const double nearest = std::ceil(static_cast<double>(from) - 1.0);
        const double farthest = std::floor(static_cast<double>(to) + 1.0);
        const double a = (nearest - origin) * sign, b = (farthest - origin) * sign;
        const double lo = std::min(a, b), hi = std::max(a, b) + 1.0;
        const auto column = [&](double v) {
            return static_cast<std::uint32_t>(std::clamp(v, 0.0, static_cast<double>(width_)));
        };
        span[0] = std::max(span[0], column(lo));
        span[1] = std::min(span[1], column(hi));
    }

    // One vertical edge's coverage across a row: column x lies at distance
    // origin + sign x from it (both exact in float), with the row's tears.
    static void down(float* c, std::uint32_t x, std::uint32_t x1, float origin, float sign, float from, float to) {
#if VORLITE_EXACT_FLOAT_LANES
        namespace simd = vorlite::core::simd;
        const simd::f32x4 step = {0.0f, 1.0f, 2.0f, 3.0f};
        for (; x + 4 <= x1; x += 4) {
            const simd::f32x4 d = simd::splat(origin) + simd::splat(sign) * (simd::splat(static_cast<float>(x)) + step);
            store_larger(c + x, coverage_lanes(d - simd::splat(from) + simd::splat(0.5f),
                                               simd::splat(to) - d + simd::splat(0.5f)));
        }
#endif
        for (; x < x1; ++x) {
            const float d = origin + sign * static_cast<float>(x);
            c[x] = std::max(c[x], Strip::edge_coverage(d, from, to));
        }
    }

    // One horizontal edge's coverage along a row, at distance d from it.
    static void across(float* c, std::uint32_t x, std::uint32_t x1, float d, const float* from, const float* to) {
#if VORLITE_EXACT_FLOAT_LANES
        namespace simd = vorlite::core::simd;
        const simd::f32x4 distance = simd::splat(d), half = simd::splat(0.5f);
        for (; x + 4 <= x1; x += 4) {
            store_larger(c + x, coverage_lanes(distance - simd::load<simd::f32x4>(from + x) + half,
                                               simd::load<simd::f32x4>(to + x) - distance + half));
        }
#endif
        for (; x < x1; ++x) c[x] = std::max(c[x], Strip::edge_coverage(d, from[x], to[x]));
    }

#if VORLITE_EXACT_FLOAT_LANES
    // Strip::edge_coverage lane by lane from its two unclamped ramps, with
    // std::clamp's and std::min's own comparisons, NaN included.
    static vorlite::core::simd::f32x4 coverage_lanes(vorlite::core::simd::f32x4 start,
                                                     vorlite::core::simd::f32x4 end) {
        namespace simd = vorlite::core::simd;
        const simd::f32x4 zero = simd::splat(0.0f), one = simd::splat(1.0f);
        const auto clamp = [&](simd::f32x4 v) {
            const simd::f32x4 capped = one < v ? one : v;
            return v < zero ? zero : capped;
        };
        start = clamp(start);
        end = clamp(end);
        return end < start ? end : start;
    }
    // std::max(best, here) lane by lane: a NaN coverage leaves best.
    static void store_larger(float* c, vorlite::core::simd::f32x4 here) {
        namespace simd = vorlite::core::simd;
        const simd::f32x4 best = simd::load<simd::f32x4>(c);
        simd::store(c, best < here ? here : best);
    }
#endif

    // The farthest distance at which a tear ending at `to` may cover: one
    // pixel beyond it, or everywhere if `to` is not a number.
    static double farther(double limit, float to) {
        if (std::isnan(to)) return std::numeric_limits<double>::infinity();
        return std::max(limit, static_cast<double>(to) + 1.0);
    }

    const Strip& strip_;
    const float* inner_;
    const float* outer_;
    std::uint32_t width_;
    std::uint32_t height_;
    std::uint32_t last_;
    vorlite::core::WorkingArray<float> top_from_, top_to_, bottom_from_, bottom_to_, coverage_;
    double top_limit_ = -1.0;
    double bottom_limit_ = -1.0;
};

// paint_edges for the strip, its coverage taken a row at a time and only
// where a tear may cover: every pixel left out would take coverage 0.
void paint_strip(VorBitmap* bitmap, const VorColor& colour, std::uint32_t mode, StripRows& rows) {
    const std::uint32_t width = bitmap->width;
    const std::uint32_t height = bitmap->height;
    const float opacity = static_cast<float>(colour.a) * vorlite::core::k_inv255;
    const FullCover full(colour, mode, opacity);
    const auto lay_span = [&](std::uint8_t* row, const float* c, std::uint32_t x0, std::uint32_t x1) {
        lay_covered(row, c, x0, x1, full, colour, mode, opacity);
    };
    for (std::uint32_t y = 0; y < height; ++y) {
        std::uint8_t* row = bitmap->data + static_cast<std::size_t>(y) * width * 4;
        const bool top = rows.top_reaches(y), bottom = rows.bottom_reaches(y);
        if (top || bottom) {
            lay_span(row, rows.row(y, 0, width, top, bottom), 0, width);
            continue;
        }
        // Only the side tears reach this row, each over a span of it.
        std::uint32_t spans[2][2];
        const std::uint32_t n = rows.side_spans(y, spans);
        for (std::uint32_t i = 0; i < n; ++i) {
            lay_span(row, rows.row(y, spans[i][0], spans[i][1], false, false), spans[i][0], spans[i][1]);
        }
    }
}

}  // namespace

namespace vorlite::generate {

void draw_side(VorBitmap* bitmap, const VorBorderParams* params, bool lanes) {
    const std::uint32_t width = bitmap->width;
    const std::uint32_t height = bitmap->height;
    // The callers lend one profile of the longer side; the band's second
    // profile is working memory of its own.
    if (width < 2 || height < 2 || params->bottomProfile == nullptr) return;
    const std::uint32_t length = std::max(width, height);
    vorlite::core::WorkingArray<float> second;
    if (!second.build(length)) return;
    VorRNG rng;
    VorRNGSeed(&rng, params->seed);
    const float roughness = tuning(params->sideTune2, -4.0f, 16.0f, 0.5f);
    fill_profile(params->bottomProfile, length, roughness, params->mpdMode, &rng);
    fill_profile(second.get(), length, roughness, params->mpdMode, &rng);
    const Profiles profiles{params->bottomProfile, second.get(), length};
    Band band(*params, profiles, width, height);
    vorlite::core::WorkingArray<float> coverage;
    if (!band.build() || !coverage.build(width)) return;
    paint_edge_rows(bitmap, params->color, static_cast<std::uint32_t>(params->blendMode), band.reach(),
                    coverage.get(), [&](std::uint32_t y, std::uint32_t x0, std::uint32_t x1, float* c) {
                        band.row_coverage(y, x0, x1, c, lanes);
                    });
}

void draw_double_sided(VorBitmap* bitmap, const VorBorderParams* params, bool rows) {
    const std::uint32_t width = bitmap->width;
    const std::uint32_t height = bitmap->height;
    if (width < 2 || height < 2 || params->leftProfile == nullptr || params->rightProfile == nullptr) return;
    const std::uint32_t length = std::max(width, height);
    VorRNG rng;
    VorRNGSeed(&rng, params->seed);
    const float roughness = tuning(params->sideTune2, -4.0f, 16.0f, 0.4f);
    fill_profile(params->leftProfile, length, roughness, params->mpdMode, &rng);
    fill_profile(params->rightProfile, length, roughness, params->mpdMode, &rng);
    const float* inner = params->leftProfile;
    const float* outer = params->rightProfile;
    const Strip strip(*params, width, height);
    const auto mode = static_cast<std::uint32_t>(params->blendMode);
    if (!rows) {
        paint_edges(bitmap, params->color, mode, strip.reach(),
                    [&](std::uint32_t x, std::uint32_t y) { return strip.coverage(inner, outer, x, y); });
        return;
    }
    StripRows strip_rows(strip, inner, outer, width, height);
    if (!strip_rows.build()) return;
    paint_strip(bitmap, params->color, mode, strip_rows);
}

}  // namespace vorlite::generate

extern "C" {

VOR_API void VorBordersSide(VorBitmap* bitmap, const VorBorderParams* params) {
    vorlite::generate::draw_side(bitmap, params, true);
}

VOR_API void VorBordersDoubleSided(VorBitmap* bitmap, const VorBorderParams* params) {
    vorlite::generate::draw_double_sided(bitmap, params, true);
}

}  // extern "C"
