// Banded frames (halftone, lines, smooth, shadow, fade, rough, viewfinder):
// a band of width B along the four edges with rounded corners, shaded by a
// per-style profile of the distance from the frame's inner edge, and the
// colour filling everything outside the frame.
#include <cmath>
#include <cstdint>

#include "core/core_internal.h"

namespace {

constexpr double k_sqrt2 = 1.4142135623730951;
constexpr float k_sqrt2_f = 1.4142135f;
constexpr double k_degrees_to_radians = 0.017453292519943295;
constexpr double k_line_phase = 439.822971502571;  // 140 pi: 70 line pairs a picture
constexpr double k_shadow_strength = 0.6000000238418579;

// The per-style geometry of the band.
struct Band {
    float width;             // B
    std::int64_t inset = 0;  // I
    double corner = 1.0;     // c
    double halftone = 0.0;   // f, the halftone's angular frequency per pixel
    float shadow_x = 0.0f;   // the shadow's offset
    float shadow_y = 0.0f;
};

std::int64_t truncated(double v) { return vorlite::core::truncate_clamped<std::int64_t>(v); }

float scaled_width(const VorBorderParams& p, double fraction, std::int64_t sum) {
    return static_cast<float>(p.width * fraction * static_cast<double>(sum));
}

// The inset as a whole number of band widths' worth, rounded through float.
std::int64_t inset_of_band(const VorBorderParams& p, float b) {
    return truncated(static_cast<float>(p.inset / static_cast<double>(b)) * b);
}

Band band_of(const VorBorderParams& p, std::int64_t sum) {
    Band band{static_cast<float>(sum) * 0.033333335f};
    switch (p.style) {
        case VOR_BORDER_HALFTONE:
            band.inset = truncated(static_cast<double>(band.width) * p.inset);
            band.halftone = 1000.0 / static_cast<double>(sum);
            if (p.halftoneScale != 0.0) band.halftone /= p.halftoneScale;
            break;
        case VOR_BORDER_LINES:
            band.width = scaled_width(p, 1.0 / 30.0, sum);
            break;
        case VOR_BORDER_SMOOTH:
        case VOR_BORDER_ROUGH:
            band.width = scaled_width(p, 1.0 / 30.0, sum);
            band.inset = inset_of_band(p, band.width);
            break;
        case VOR_BORDER_SHADOW: {
            band.width = scaled_width(p, 0.0125, sum);
            band.inset = truncated(static_cast<double>(band.width) * 0.3);
            const auto a = static_cast<float>(p.shadowAngle * k_degrees_to_radians);
            band.shadow_x = vorlite::core::cosf(a) * (band.width / 2.0f);
            band.shadow_y = vorlite::core::sinf(a) * (band.width / 2.0f);
            break;
        }
        case VOR_BORDER_FADE:
            band.width = scaled_width(p, 0.0125, sum);
            band.inset = truncated(static_cast<double>(band.width) * p.inset);
            band.corner = p.cornerFactor;
            break;
        case VOR_BORDER_VIEWFINDER:
            band.width = scaled_width(p, 1.0 / 60.0, sum);
            break;
        default:
            break;
    }
    return band;
}

// Distance into the frame from its nearest edge; inside a corner square of
// side R it is measured from the corner's arc instead, which rounds the
// frame's inner corners.
float frame_distance(std::int64_t dr, std::int64_t dc, double radius, float radius_f) {
    const double r = static_cast<double>(dr);
    const double c = static_cast<double>(dc);
    if (r < radius && c < radius) {
        const double squares = (r - radius) * (r - radius) + (c - radius) * (c - radius);
        return radius_f - std::sqrt(static_cast<float>(squares));
    }
    return static_cast<float>(dr < dc ? dr : dc);
}

float clamp_unit(float v) {
    if (v > 1.0f) return 1.0f;
    if (v < 0.0f) return 0.0f;
    return v;
}

// floor(x + 0.5) in double, as a byte. From 1 up the floor is the
// truncation; below 1 (and NaN) it is 0 or less.
std::uint8_t rounded(double v) {
    const double r = v + 0.5;
    if (!(r >= 1.0)) return 0;
    if (r >= 255.0) return 255;
    return static_cast<std::uint8_t>(r);
}

// (1 - v) of the colour and v of the pixel; alpha kept.
void mix(std::uint8_t* p, VorColor colour, float v) {
    const double keep = v;
    const double cover = 1.0 - keep;
    const double r = cover * colour.r + keep * p[0];
    const double g = cover * colour.g + keep * p[1];
    const double b = cover * colour.b + keep * p[2];
    p[0] = rounded(r);
    p[1] = rounded(g);
    p[2] = rounded(b);
}

// The halftone's two cosine factors, one per column, in the precision of
// the band (double) and of the area outside the frame (float).
struct HalftoneColumns {
    vorlite::core::WorkingArray<double> inside;
    vorlite::core::WorkingArray<float> outside;

    bool build(std::uint32_t width, double f) {
        if (!inside.build(width) || !outside.build(width)) return false;
        for (std::uint32_t x = 0; x < width; ++x) {
            const double fx = (static_cast<double>(x) - static_cast<double>(width / 2)) * f;
            inside[x] = vorlite::core::cos(fx);
            outside[x] = vorlite::core::cosf(static_cast<float>(fx));
        }
        return true;
    }
};

class ThetaRenderer {
public:
    ThetaRenderer(VorBitmap* bitmap, const VorBorderParams& p, const Band& band)
        : bitmap_(bitmap),
          p_(p),
          band_(band),
          radius_(static_cast<double>(band.width) * band.corner * k_sqrt2),
          radius_f_(band.width * static_cast<float>(band.corner) * k_sqrt2_f),
          shadow_radius_(static_cast<double>(band.width) * k_sqrt2) {
        VorRNGSeed(&rng_, p.seed);
        find_deep_columns();
    }

    // False when the halftone's column table cannot be had.
    bool prepare() { return p_.style != VOR_BORDER_HALFTONE || halftone_.build(bitmap_->width, band_.halftone); }

    void draw() {
        const std::uint32_t width = bitmap_->width;
        const std::uint32_t height = bitmap_->height;
        std::uint8_t* row_pixels = bitmap_->data;
        for (std::uint32_t y = 0; y < height; ++y, row_pixels += static_cast<std::size_t>(width) * 4) {
            const bool upper = y < height / 2;
            const double from_edge_y = upper ? static_cast<double>(y) : static_cast<double>(height - 1 - y);
            const std::int64_t dr = truncated(from_edge_y - (upper ? p_.insetTop : p_.insetBottom));
            start_row(y);
            // Away from the top and bottom bands and the corners, only the
            // columns of the side bands can change.
            const bool deep_row = dr >= 0 && static_cast<double>(dr) >= radius_ && deep(dr);
            const std::uint32_t skip_begin = deep_row ? deep_begin_ : width;
            const std::uint32_t skip_end = deep_row ? deep_end_ : width;
            for (std::uint32_t x = 0; x < skip_begin; ++x) pixel(row_pixels + std::size_t{x} * 4, x, y, dr, upper);
            for (std::uint32_t x = skip_end; x < width; ++x) pixel(row_pixels + std::size_t{x} * 4, x, y, dr, upper);
        }
    }

private:
    std::int64_t column_distance(std::uint32_t x) const {
        const std::uint32_t width = bitmap_->width;
        const bool left = x < width / 2;
        const double from_edge_x = left ? static_cast<double>(x) : static_cast<double>(width - 1 - x);
        return truncated(from_edge_x - (left ? p_.insetLeft : p_.insetRight));
    }

    // Inside the frame and at least a band's width from its edge.
    bool deep(std::int64_t distance) const { return distance >= 0 && !(static_cast<float>(distance) < band_.width); }

    // The columns a deep row leaves alone. The column distance rises over
    // the left half and falls over the right one, so they form one run.
    void find_deep_columns() {
        const std::uint32_t width = bitmap_->width;
        deep_begin_ = width;
        deep_end_ = width;
        for (std::uint32_t x = 0; x < width; ++x) {
            if (!deep(column_distance(x))) continue;
            if (deep_begin_ == width) deep_begin_ = x;
            deep_end_ = x + 1;
        }
    }

    // The terms of the line and halftone patterns that depend on the row alone.
    void start_row(std::uint32_t y) {
        const double from_middle = static_cast<double>(y) - static_cast<double>(bitmap_->height / 2);
        if (p_.style == VOR_BORDER_LINES) {
            const double phi = (from_middle / static_cast<double>(bitmap_->height)) * k_line_phase;
            line_level_ = (vorlite::core::cos(phi / p_.lineSpacing) + 1.0) * 0.8;
        } else if (p_.style == VOR_BORDER_HALFTONE) {
            const double fy = from_middle * band_.halftone;
            halftone_row_ = vorlite::core::cos(fy);
            halftone_row_f_ = vorlite::core::cosf(static_cast<float>(fy));
        }
    }

    void pixel(std::uint8_t* p, std::uint32_t x, std::uint32_t y, std::int64_t dr, bool upper) {
        const bool left = x < bitmap_->width / 2;
        const std::int64_t dc = column_distance(x);
        const float b = band_.width;
        const float d = frame_distance(dr, dc, radius_, radius_f_);
        if (dr < 0 || dc < 0) {
            outside(p, x, y, upper, left);
            return;
        }
        if (!(d < b)) return;
        const float w = 1.0f - d / b;
        const float w4 = (w * w) * (w * w);
        switch (p_.style) {
            case VOR_BORDER_HALFTONE: {
                const double h = halftone_row_ * halftone_.inside[x] + 1.0;
                const double v = d > 0.0f ? 1.0 - static_cast<double>(w4) * 2.0 * h : 1.0 - 2.0 * h;
                mix(p, p_.color, clamp_unit(static_cast<float>(v)));
                return;
            }
            case VOR_BORDER_LINES: {
                const double v = 1.0 - 2.0 * line_level_ * static_cast<double>(w4);
                mix(p, p_.color, clamp_unit(static_cast<float>(v)));
                return;
            }
            case VOR_BORDER_SHADOW:
                if (b <= static_cast<float>(dc) && b <= static_cast<float>(dr)) return;
                shadow(p, y, x, upper, left, true);
                return;
            case VOR_BORDER_FADE: {
                const float share = (d > 0.0f ? d : 0.0f) / b;
                mix(p, p_.color, clamp_unit(share * share));
                return;
            }
            case VOR_BORDER_ROUGH:
            case VOR_BORDER_VIEWFINDER: {
                const float n = VorRNGNextFloat(&rng_);
                mix(p, p_.color, clamp_unit(1.0f - 2.0f * w4 * (0.4f * n + 0.6f)));
                return;
            }
            default:  // smooth
                mix(p, p_.color, clamp_unit(1.0f - 2.0f * w4));
                return;
        }
    }

    void outside(std::uint8_t* p, std::uint32_t x, std::uint32_t y, bool upper, bool left) {
        if (p_.style == VOR_BORDER_HALFTONE) {
            const float h = halftone_row_f_ * halftone_.outside[x] + 1.0f;
            mix(p, p_.color, clamp_unit(1.0f - 2.0f * h));
        } else if (p_.style == VOR_BORDER_SHADOW) {
            shadow(p, y, x, upper, left, false);
        } else {
            vorlite::core::store_pixel(p, p_.color);
        }
    }

    // A soft drop shadow cast by the frame onto the picture: distances from
    // the frame's edge shifted by the shadow's offset, corners rounded by a
    // fourth-power norm. The channels become the darkened colour itself.
    void shadow(std::uint8_t* p, std::uint32_t y, std::uint32_t x, bool upper, bool left, bool in_band) {
        const std::uint32_t width = bitmap_->width;
        const std::uint32_t height = bitmap_->height;
        const double b = band_.width;
        const double inset = static_cast<double>(band_.inset);
        const double row = (upper ? static_cast<double>(y) : static_cast<double>(height - 1 - y)) - inset;
        const double column = (left ? static_cast<double>(x) : static_cast<double>(width - 1 - x)) - inset;
        const double rr = upper ? row - band_.shadow_y : row + band_.shadow_y;
        const double rc = left ? column - band_.shadow_x : column + band_.shadow_x;
        const double rs = shadow_radius_;
        double e;
        if (rr < rs && rc < rs) {
            const double a = (rr - rs) * (rr - rs);
            const double c = (rc - rs) * (rc - rs);
            e = rs - vorlite::core::pow(a * a + c * c, 0.25);
        } else {
            e = rr < rc ? rr : rc;
        }
        if (e < -b) e = -b;
        if (in_band && e > b) e = std::sqrt(e / b) * b;
        const double q = (e / b + 1.0) * 0.5;
        double v = (q * q) * (q * q) * k_shadow_strength;
        if (v > 1.0) v = 1.0;
        if (!(v > 0.0)) v = 0.0;
        const double cover = 1.0 - v;
        p[0] = rounded(cover * p_.color.r);
        p[1] = rounded(cover * p_.color.g);
        p[2] = rounded(cover * p_.color.b);
    }

    VorBitmap* bitmap_;
    const VorBorderParams& p_;
    Band band_;
    double radius_;
    float radius_f_;
    double shadow_radius_;
    VorRNG rng_;
    std::uint32_t deep_begin_ = 0;
    std::uint32_t deep_end_ = 0;
    HalftoneColumns halftone_;
    double halftone_row_ = 0.0;
    float halftone_row_f_ = 0.0f;
    double line_level_ = 0.0;
};

}  // namespace

extern "C" {

VOR_API void VorBordersTheta(VorBitmap* bitmap, VorBorderParams* params) {
    const std::int64_t sum = static_cast<std::int64_t>(bitmap->width) + bitmap->height;
    const Band band = band_of(*params, sum);
    // Every style but the viewfinder measures from one inset on all sides
    // and leaves it in the record.
    if (params->style != VOR_BORDER_VIEWFINDER) {
        const auto inset = static_cast<double>(band.inset);
        params->insetLeft = inset;
        params->insetRight = inset;
        params->insetTop = inset;
        params->insetBottom = inset;
    }
    if (bitmap->height < 1 || bitmap->width < 1) return;
    ThetaRenderer renderer(bitmap, *params, band);
    // Without memory for the halftone's column table nothing is drawn, as
    // with any working buffer that cannot be had.
    if (renderer.prepare()) renderer.draw();
}

}  // extern "C"
