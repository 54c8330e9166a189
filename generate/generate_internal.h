// Internal helpers of the generated effects shared between their files.
#ifndef VORLITE_GENERATE_INTERNAL_H
#define VORLITE_GENERATE_INTERNAL_H

#include <cmath>
#include <cstdint>

#include "core/core_internal.h"
#include "zentra_vorlite.h"

namespace vorlite::generate {

// The vignette's ramp, shared by the plain vignette and the gradient's
// vignette shape. t is the squared distance from the centre over the
// squared radius, scaled so that t = 1.15 falls exactly on the radius:
// q = r^2 x 0.8695652, one unit in the last place above the float nearest
// 1/1.15, so that the ramp ends just inside the radius even when r is large.
inline constexpr float k_vignette_radius_factor = core::float_bits(0x3F5E9BD4u);
inline constexpr float k_vignette_full = core::float_bits(0x3F933333u);   // 1.15
inline constexpr float k_vignette_start = core::float_bits(0x3D23D70Au);  // 0.04

// 1 / (r^2 x 0.8695652), or 1e8 for a zero radius (every pixel but the
// centre then lies beyond the ramp).
inline float vignette_scale(double vignette_scale) {
    const float r = static_cast<float>(vignette_scale);
    const float q = r * r * k_vignette_radius_factor;
    return q == 0.0f ? 1e8f : 1.0f / q;
}

// Sharper modes bend t before the ramp reads it: the ramp then starts
// later and ends more abruptly.
inline float shape_vignette(float t, std::int32_t shape_mode) {
    switch (shape_mode) {
        case VOR_SHAPE_SHARP:
            return t * t;
        case VOR_SHAPE_MEDIUM_SHARP:
            return static_cast<float>(std::sqrt(static_cast<double>(t)) * static_cast<double>(t));
        case VOR_SHAPE_ULTRA_SHARP: {
            const float square = t * t;
            return square * square;
        }
        default:
            return t;
    }
}

// The ramp between t = 0.04 and 1.15: a quintic in u = t^2 rising from
// about 0.003 to about 0.92, evaluated in float in this exact order.
inline float vignette_ramp(float t) {
    const float u = t * t;
    const float u2 = u * u;
    const float u3 = u2 * u;
    const float u4 = u3 * u;
    const float u5 = u4 * u;
    const float p = (((core::float_bits(0x3FD55555u) * u2 - 2.0f * u) + core::float_bits(0x3E534D35u) * u4) -
                     core::float_bits(0x3F416C17u) * u3) -
                    core::float_bits(0x3D148670u) * u5;
    return -p;
}

// The centre offset of a vignette: dx of half the width (or dy of half
// the height), rounded to a whole pixel. Held within +-2^30 so that the
// squared distances stay exact in 64 bits for any document.
inline std::int64_t vignette_offset(std::uint32_t size, double fraction) {
    const double offset = std::floor(static_cast<double>(size / 2) * fraction + 0.5);
    constexpr double limit = 1073741824.0;
    if (!(offset > -limit)) return offset != offset ? 0 : -static_cast<std::int64_t>(limit);
    if (offset > limit) return static_cast<std::int64_t>(limit);
    return static_cast<std::int64_t>(offset);
}

// The vignette (VorVignette) with its rows classified four pixels at a time
// where the lanes allow (lanes = true), or one by one: the reference the
// lanes are held against.
void draw_vignette(VorBitmap* bitmap, const VorBorderParams* params, bool lanes);

// VorBordersSide with each row's coverage formed four columns at a time
// where the lanes allow (lanes = true), or one by one: the reference.
void draw_side(VorBitmap* bitmap, const VorBorderParams* params, bool lanes);

// VorBordersDoubleSided with each row's coverage formed before the row is
// laid (rows = true), or pixel by pixel: the reference.
void draw_double_sided(VorBitmap* bitmap, const VorBorderParams* params, bool rows);

// VorGradientApply with each row's table indices formed four pixels at a
// time where the lanes allow (lanes = true), or one by one: the reference.
void apply_gradient(VorBitmap* bitmap, const VorGradientShapeParams* params, const VorGradient* gradient,
                    std::uint32_t blend_mode, double opacity, bool lanes);

// The vignette measured with x and y normalised by the bitmap's width and
// height, so that the ramp is an ellipse of the bitmap's proportions.
class StretchedVignette {
public:
    StretchedVignette(std::uint32_t width, std::uint32_t height, double vignette_scale_value,
                      std::int32_t shape_mode, double dx, double dy)
        : k_(vignette_scale(vignette_scale_value)),
          shape_mode_(shape_mode),
          cx_(static_cast<std::int64_t>(width / 2) + vignette_offset(width, dx)),
          cy_(static_cast<std::int64_t>(height / 2) + vignette_offset(height, dy)) {
        const float w = static_cast<float>(width);
        const float h = static_cast<float>(height);
        iw_ = 1.0f / (w * w);
        ih_ = 1.0f / (h * h);
    }

    // t at a pixel, shaped by the mode.
    float t(std::int64_t x, std::int64_t y) const {
        const std::int64_t ex = x - cx_;
        const std::int64_t ey = y - cy_;
        const float t = (static_cast<float>(ex * ex) * iw_ + static_cast<float>(ey * ey) * ih_) * k_;
        return shape_vignette(t, shape_mode_);
    }

    // The share of the effect at a pixel: 0 near the centre, the ramp, 1
    // beyond the radius.
    float weight(std::int64_t x, std::int64_t y) const {
        const float shaped = t(x, y);
        if (shaped > k_vignette_full) return 1.0f;
        if (shaped < k_vignette_start) return 0.0f;
        return vignette_ramp(shaped);
    }

private:
    float k_;
    std::int32_t shape_mode_;
    std::int64_t cx_;
    std::int64_t cy_;
    float iw_ = 0.0f;
    float ih_ = 0.0f;
};

// Flares: what a shape needs of its colour. a = alpha / 255 is the light
// at full strength; limit = ln(1 / alpha) is the exponent below which a
// Gaussian's light stays under one level of the colour.
struct FlareLight {
    float a;
    float limit;
};

// Flares: the transmission (1 = no light, 0 = the full colour) of a shape
// whose light is exp(e) with e <= 0: nothing below one level, the full
// colour at or above the centre's. Real is float or double, as the shape
// forms its exponent; expf rounds the exponent to float.
template <typename Real>
inline float flare_from_exponent(Real e, const FlareLight& light) {
    if (e < static_cast<Real>(light.limit)) return 1.0f;
    if (e > static_cast<Real>(0)) return 1.0f - light.a;
    return 1.0f - core::expf(static_cast<float>(e)) * light.a;
}

// Flares: the blend level for a transmission v, trunc((1 - v) x 255). A
// transmission above 1 (the sinc's negative lobes, or the dark sides of a
// shape whose sines go negative) asks for less than no light: a flare
// adds light and never darkens, so it gets level 0. One below 0 asks for
// more than the full colour and gets level 255; NaN gets level 0.
inline std::uint32_t flare_level(float v) {
    if (!(v < 1.0f)) return 0;
    if (v < 0.0f) return 255;
    return static_cast<std::uint32_t>((1.0f - v) * 255.0f);
}

// Flares: the pixels a flare visits, its work box [x0, x1) x [y0, y1), and
// how they map to the shape's coordinates: X of each column of the box
// (formed once a call) and Y = ((y - hh) - hh x dy) x ky (once a row).
struct FlareRaster {
    VorBitmap* bitmap;
    const VorColor* colour;
    VorColorBlendMemoTable* memo;
    std::uint32_t x0, x1, y0, y1;
    const float* column_x;
    std::int64_t hh;
    float dy;
    float ky;
    // Level 0 returns the pixel in every mode with a rule, so such pixels
    // are skipped; a mode without a rule still writes at level 0.
    bool level_zero_is_identity;
};

// Flares: paints one shape over the work box, rows top to bottom. A shape
// forms its own terms of a row once (row(Y)) and gives the transmission
// at a pixel from X and those terms (operator()).
template <typename Shape>
void paint_flare(const FlareRaster& raster, const Shape& shape) {
    const std::uint32_t width = raster.bitmap->width;
    const float hh_shift = static_cast<float>(raster.hh) * raster.dy;
    for (std::uint32_t y = raster.y0; y < raster.y1; ++y) {
        const float row_y = (static_cast<float>(static_cast<std::int64_t>(y) - raster.hh) - hh_shift) * raster.ky;
        const auto terms = shape.row(row_y);
        std::uint8_t* p = raster.bitmap->data + (static_cast<std::size_t>(y) * width + raster.x0) * 4;
        const float* column_x = raster.column_x;
        for (std::uint32_t x = raster.x0; x < raster.x1; ++x, p += 4, ++column_x) {
            const std::uint32_t level = flare_level(shape(*column_x, terms));
            if (level == 0 && raster.level_zero_is_identity) continue;
            VorColor out = core::load_pixel(p);
            VorColorBlendMemoized(&out, raster.colour, level, raster.memo);
            core::store_pixel(p, out);
        }
    }
}

// Flares: paints the shapes built from angles, petals and crossed
// Gaussians (types 5, 6, 7 and 11 to 16); false for any other type.
bool paint_designed_flare(VorFlareType type, const FlareRaster& raster, const FlareLight& light);

}  // namespace vorlite::generate

#endif
