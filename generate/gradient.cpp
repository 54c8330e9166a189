// Colour gradients with their own opacity ramp, sampled once into a
// 1024-entry table and laid over a bitmap in three shapes (linear at an
// angle, radial, linear weighted by a vignette); the JSON form of the stops
// and the "gradient" processor.
#include <algorithm>
#include <cmath>
#include <cstddef>
#include <cstdlib>
#include <cstring>

#include "color/color_internal.h"
#include "core/core_internal.h"
#include "core/simd.h"
#include "generate/generate_internal.h"
#include "proclist/proclist_internal.h"

namespace {

using vorlite::core::WorkingArray;

// A stop count whose byte size would pass 32 bits.
constexpr std::uint32_t k_stop_limit = 0x10000000u;
constexpr std::uint32_t k_table_size = 1024;
constexpr double k_two_pi = 6.283185307179586;
// 1/255 in double: the ease adds at most a few levels' worth of s-curve.
constexpr double k_ease_scale = 0.00392156862745098;
constexpr double k_degrees_to_radians = 0.017453292519943295;

// A stop can be interpolated once the gradient has two of each kind and
// its opacity ramp, measured on the colour stops' locations, finds a colour
// stop for every opacity stop.
bool drawable(const VorGradient& gradient) {
    return gradient.colorStops != nullptr && gradient.opacityStops != nullptr &&
           gradient.colorStopCount >= 2 && gradient.opacityStopCount >= 2 &&
           gradient.opacityStopCount <= gradient.colorStopCount;
}

// The span between the lower and the upper stop that holds p; both passes
// move forward only, since p grows with the entry index. The last stop is
// never the lower one.
struct Span {
    std::uint32_t lower = 0;
    std::uint32_t upper = 1;

    template <typename Location>
    void advance(double p, std::uint32_t count, Location location) {
        while (location(upper) <= p && upper + 1 < count) {
            lower = upper;
            ++upper;
        }
    }
};

double clamp_unit(double t) {
    if (t < 0.0) return 0.0;
    if (t > 1.0) return 1.0;
    return t;
}

// A gentle s-curve over each span, so that colours linger near their stops
// and the middle of a span moves faster, by up to about 12 levels.
double ease(double t) {
    const double s = t - 0.5;
    const double a = (1.5 * std::fabs(s) + 1.0) * 9.0;
    return clamp_unit(t + a * vorlite::core::sin(k_two_pi * s) * k_ease_scale);
}

// 255 above the range, truncation within it; below it and NaN give 0.
std::uint8_t gradient_byte(double c) {
    if (c > 255.0) return 255;
    if (!(c > 0.0)) return 0;
    return static_cast<std::uint8_t>(c);
}

double position_of_entry(std::uint32_t i, std::uint32_t n) {
    const double step = 1.0 / static_cast<double>(n - 1);
    return (1.0 - static_cast<double>(n - 1 - i) * step) * 100.0;
}

void sample_colours(const VorGradient& gradient, VorColor* table, std::uint32_t n) {
    const VorGradientColorStop* stops = gradient.colorStops;
    Span span;
    for (std::uint32_t i = 0; i < n; ++i) {
        const double p = position_of_entry(i, n);
        span.advance(p, gradient.colorStopCount, [&](std::uint32_t k) { return stops[k].location; });
        const VorGradientColorStop& lo = stops[span.lower];
        const VorGradientColorStop& hi = stops[span.upper];
        const double t = ease(clamp_unit((p - lo.location) / (hi.location - lo.location)));
        const auto mix = [&](std::uint8_t a, std::uint8_t b) {
            return gradient_byte((1.0 - t) * static_cast<double>(a) + t * static_cast<double>(b));
        };
        table[i].r = mix(lo.color.r, hi.color.r);
        table[i].g = mix(lo.color.g, hi.color.g);
        table[i].b = mix(lo.color.b, hi.color.b);
    }
}

// The opacity ramp's spans end at the colour stop of the upper index, not
// at the opacity stop: an opacity ramp is laid out on the colour ramp.
void sample_opacities(const VorGradient& gradient, VorColor* table, std::uint32_t n) {
    const VorGradientOpacityStop* stops = gradient.opacityStops;
    const VorGradientColorStop* colours = gradient.colorStops;
    Span span;
    for (std::uint32_t i = 0; i < n; ++i) {
        const double p = position_of_entry(i, n);
        span.advance(p, gradient.opacityStopCount, [&](std::uint32_t k) { return stops[k].location; });
        const VorGradientOpacityStop& lo = stops[span.lower];
        const VorGradientOpacityStop& hi = stops[span.upper];
        const double end = colours[span.upper].location;
        const double t = ease(clamp_unit((p - lo.location) / (end - lo.location)));
        table[i].a = gradient_byte(((1.0 - t) * lo.opacity + t * hi.opacity) * 255.0);
    }
}

// The table index of a gradient coordinate, rounded to float and held in
// 0..1 (NaN, from a degenerate shape, reads the first entry).
std::uint32_t table_index(double coordinate) {
    float g = static_cast<float>(coordinate);
    if (!(g > 0.0f)) g = 0.0f;
    if (g > 1.0f) g = 1.0f;
    // floor(g x 1023 + 0.5); the sum is at least 0.5, so truncation is the
    // floor, without a call into the maths library per pixel.
    return static_cast<std::uint32_t>(static_cast<double>(g * 1023.0f) + 0.5);
}

float entry_opacity(double opacity, const VorColor& entry) {
    return static_cast<float>(opacity * static_cast<double>(entry.a * vorlite::core::k_inv255));
}

// Every mode but the colour mode blends each channel on its own, and a
// linear or radial gradient's opacity depends on the table entry alone: so
// each entry's three channel rows are filled once, when a pixel first
// needs them, and a pixel costs three lookups instead of a blend.
class EntryRows {
public:
    EntryRows(const VorColor* table, std::uint32_t mode, double opacity)
        : table_(table), mode_(mode), opacity_(opacity) {}
    bool build() { return rows_.build(k_table_size * 3, 256) && filled_.build(k_table_size); }
    const std::uint8_t* rows(std::uint32_t index) {
        std::uint8_t* r = &rows_[std::size_t{index} * 768];
        if (!filled_[index]) fill(index, r);
        return r;
    }
    // Fills every entry from lo to hi, so that a row whose indices all lie
    // there reads the rows without asking; [settled_lo_, settled_hi_] is a
    // run known to be filled.
    void settle(std::uint32_t lo, std::uint32_t hi) {
        if (lo >= settled_lo_ && hi <= settled_hi_) return;
        for (std::uint32_t i = lo; i <= hi; ++i) rows(i);
        if (hi + 1 < settled_lo_ || lo > settled_hi_ + 1) {
            settled_lo_ = lo;
            settled_hi_ = hi;
        } else {
            settled_lo_ = std::min(lo, settled_lo_);
            settled_hi_ = std::max(hi, settled_hi_);
        }
    }
    const std::uint8_t* settled_rows(std::uint32_t index) const { return &rows_[std::size_t{index} * 768]; }

private:
    void fill(std::uint32_t index, std::uint8_t* r) {
        filled_[index] = 1;
        const VorColor& entry = table_[index];
        const float opacity = entry_opacity(opacity_, entry);
        vorlite::color::blend_channel_row(mode_, entry.r, opacity, r);
        vorlite::color::blend_channel_row(mode_, entry.g, opacity, r + 256);
        vorlite::color::blend_channel_row(mode_, entry.b, opacity, r + 512);
    }

    const VorColor* table_;
    std::uint32_t mode_;
    double opacity_;
    std::uint32_t settled_lo_ = 1;
    std::uint32_t settled_hi_ = 0;
    WorkingArray<std::uint8_t> rows_;
    WorkingArray<std::uint8_t> filled_;
};

// The table index of every pixel of a row from its column parts and the
// row's part, four at a time where the lanes allow (the same double and
// float operations lane by lane).
VORLITE_AVX2_CLONES
void row_table_indices(const double* columns, double v, bool radial, std::uint32_t width, std::uint16_t* out,
                       bool lanes) {
    std::uint32_t x = 0;
#if VORLITE_EXACT_FLOAT_LANES
    namespace simd = vorlite::core::simd;
    using f64x4 = simd::f64x4;
    if (lanes) {
        const f64x4 row_lanes = {v, v, v, v};
        for (; x + 4 <= width; x += 4) {
            f64x4 column;
            std::memcpy(&column, &columns[x], sizeof column);
            f64x4 coordinate;
            if (radial) {
                coordinate = row_lanes + column;
                for (int i = 0; i < 4; ++i) coordinate[i] = std::sqrt(coordinate[i]);
            } else {
                coordinate = column - row_lanes;
            }
            simd::f32x4 g = __builtin_convertvector(coordinate, simd::f32x4);
            g = simd::min_or_bound(simd::max_or_bound(g, simd::splat(0.0f)), simd::splat(1.0f));
            // trunc(a + 0.5) of a = g x 1023 in 0..1023, with a's whole
            // part and its fraction, both exact in float: no widening.
            const simd::f32x4 a = g * simd::splat(1023.0f);
            const simd::i32x4 whole = __builtin_convertvector(a, simd::i32x4);
            const simd::i32x4 up = (a - __builtin_convertvector(whole, simd::f32x4)) >= simd::splat(0.5f);
            const simd::i32x4 index = whole - up;
            for (int i = 0; i < 4; ++i) out[x + i] = static_cast<std::uint16_t>(index[i]);
        }
    }
#else
    (void)lanes;
#endif
    for (; x < width; ++x) {
        out[x] = static_cast<std::uint16_t>(table_index(radial ? std::sqrt(v + columns[x]) : columns[x] - v));
    }
}

// The pixel's place along the gradient: its offset from the origin in
// units of the gradient's length, projected on the angle or measured as a
// distance. The column's part (u x cos, or u^2) is formed once a column
// and the row's once a row; each pixel then adds them in the same order.
class Coordinates {
public:
    bool build(const VorGradientShapeParams& params, std::uint32_t width, std::uint32_t height) {
        radial_ = params.shape == VOR_GRADIENT_RADIAL;
        inv_ = 1.0 / params.scale;
        sa_ = vorlite::core::sin(params.angle);
        inv_height_ = 1.0 / static_cast<double>(height);
        y_center_ = params.yCenter;
        if (!columns_.build(width)) return false;
        const double inv_width = 1.0 / static_cast<double>(width);
        const double ca = vorlite::core::cos(params.angle);
        extremes_known_ = true;
        for (std::uint32_t x = 0; x < width; ++x) {
            const double u = (static_cast<double>(x) * inv_width - params.xCenter) * inv_;
            columns_[x] = radial_ ? u * u : u * ca;
            if (!std::isfinite(columns_[x])) extremes_known_ = false;
            if (columns_[x] < columns_[lowest_]) lowest_ = x;
            if (columns_[x] > columns_[highest_]) highest_ = x;
        }
        return true;
    }
    // A row's table index grows with its column part (the projection or
    // the square of the offset) whatever the row, so the row's smallest and
    // largest indices lie at the columns where that part is least and
    // greatest. Unknown where a column part is not finite.
    bool index_range(std::uint32_t y, std::uint32_t* lo, std::uint32_t* hi) const {
        if (!extremes_known_) return false;
        const double v = row(y);
        *lo = table_index(at(lowest_, v));
        *hi = table_index(at(highest_, v));
        return true;
    }
    // The row's part: v x sin, or v^2.
    double row(std::uint32_t y) const {
        const double v = (static_cast<double>(y) * inv_height_ - y_center_) * inv_;
        return radial_ ? v * v : v * sa_;
    }
    double at(std::uint32_t x, double row) const {
        return radial_ ? std::sqrt(row + columns_[x]) : columns_[x] - row;
    }
    // The table index of every pixel of a row.
    void row_indices(std::uint32_t y, std::uint32_t width, std::uint16_t* out, bool lanes) const {
        row_table_indices(columns_.get(), row(y), radial_, width, out, lanes);
    }

private:
    bool radial_ = false;
    double inv_ = 0.0;
    double sa_ = 0.0;
    double inv_height_ = 0.0;
    double y_center_ = 0.0;
    bool extremes_known_ = false;
    std::uint32_t lowest_ = 0;
    std::uint32_t highest_ = 0;
    WorkingArray<double> columns_;
};


void blend_pixel(std::uint8_t* p, const VorColor& entry, std::uint32_t mode, float opacity) {
    VorColor out = vorlite::core::load_pixel(p);
    VorColorBlend(&out, &entry, mode, opacity);
    vorlite::core::store_pixel(p, out);
}

void draw_plain(VorBitmap* bitmap, const Coordinates& c, const VorColor* table, std::uint32_t mode,
                double opacity, bool lanes) {
    EntryRows rows(table, mode, opacity);
    const bool by_rows = mode != VOR_BLEND_COLOR && rows.build();
    const std::uint32_t width = bitmap->width;
    WorkingArray<std::uint16_t> indices;
    if (!indices.build(width)) return;
    // A large bitmap uses most entries anyway: filling each row's whole
    // range of entries up front (at most one fill of 768 blends for every
    // 768 pixels) takes the question out of the pixel loop.
    const bool settle = lanes && by_rows && vorlite::core::pixel_count(*bitmap) >= std::size_t{k_table_size} * 768;
    std::uint8_t* row = bitmap->data;
    for (std::uint32_t y = 0; y < bitmap->height; ++y, row += std::size_t{width} * 4) {
        c.row_indices(y, width, indices.get(), lanes);
        const std::uint16_t* index = indices.get();
        std::uint32_t lo = 0, hi = 0;
        if (settle && c.index_range(y, &lo, &hi)) {
            rows.settle(lo, hi);
            vorlite::core::for_each_pixel(row, width, [&](std::uint8_t* p) {
                vorlite::core::map_pixel(p, reinterpret_cast<const std::uint8_t(*)[256]>(rows.settled_rows(*index++)));
            });
            continue;
        }
        vorlite::core::for_each_pixel(row, width, [&](std::uint8_t* p) {
            const std::uint16_t i = *index++;
            if (by_rows) {
                vorlite::core::map_pixel(p, reinterpret_cast<const std::uint8_t(*)[256]>(rows.rows(i)));
            } else {
                const VorColor& entry = table[i];
                blend_pixel(p, entry, mode, entry_opacity(opacity, entry));
            }
        });
    }
}

// Linear, each pixel's opacity further weighted by a stretched vignette:
// the weight changes from pixel to pixel, so every pixel is blended.
void draw_vignetted(VorBitmap* bitmap, const VorGradientShapeParams& params, const Coordinates& c,
                    const VorColor* table, std::uint32_t mode, double opacity) {
    const vorlite::generate::StretchedVignette vignette(bitmap->width, bitmap->height, params.vignetteScale,
                                                        params.shapeMode, params.dx, params.dy);
    std::uint8_t* p = bitmap->data;
    for (std::uint32_t y = 0; y < bitmap->height; ++y) {
        const double v = c.row(y);
        for (std::uint32_t x = 0; x < bitmap->width; ++x, p += 4) {
            const VorColor& entry = table[table_index(c.at(x, v))];
            const double weighted = opacity * static_cast<double>(entry.a * vorlite::core::k_inv255) *
                                    static_cast<double>(vignette.weight(x, y));
            blend_pixel(p, entry, mode, static_cast<float>(weighted));
        }
    }
}

void draw(VorBitmap* bitmap, const VorGradientShapeParams& params, const VorColor* table,
          std::uint32_t mode, double opacity, bool lanes) {
    Coordinates c;
    if (!c.build(params, bitmap->width, bitmap->height)) return;
    if (params.shape == VOR_GRADIENT_LINEAR_VIGNETTE) {
        draw_vignetted(bitmap, params, c, table, mode, opacity);
    } else {
        draw_plain(bitmap, c, table, mode, opacity, lanes);
    }
}

// The stop members of one JSON element: numbers rounded through float.
bool location_of(yajl_val element, double* location) {
    double value = 0.0;
    if (!vorlite::proclist::member_double(element, "location", &value)) return false;
    *location = static_cast<double>(static_cast<float>(value));
    return true;
}

std::uint32_t element_count(yajl_val array, std::uint32_t stops) {
    const std::size_t len = YAJL_GET_ARRAY(array)->len;
    return len < stops ? static_cast<std::uint32_t>(len) : stops;
}

bool shape_from_name(yajl_val value, std::int32_t* shape) {
    const char* name = YAJL_GET_STRING(value);
    if (name == nullptr) return false;
    if (std::strcmp(name, "linear") == 0) {
        *shape = VOR_GRADIENT_LINEAR;
    } else if (std::strcmp(name, "radial") == 0) {
        *shape = VOR_GRADIENT_RADIAL;
    } else if (std::strcmp(name, "linearVignette") == 0) {
        *shape = VOR_GRADIENT_LINEAR_VIGNETTE;
    } else {
        return false;
    }
    return true;
}

// The gradient's storage, released on every path of the processor.
struct OwnedGradient {
    VorGradient gradient{nullptr, nullptr, 0, 0};
    ~OwnedGradient() { VorGradientFree(&gradient); }
};

}  // namespace

namespace vorlite::generate {

void apply_gradient(VorBitmap* bitmap, const VorGradientShapeParams* params, const VorGradient* gradient,
                    std::uint32_t blend_mode, double opacity, bool lanes) {
    if (params->scale == 0.0 || !drawable(*gradient)) return;
    if (bitmap->width == 0 || bitmap->height == 0) return;
    WorkingArray<VorColor> table;
    if (!table.build(k_table_size)) return;
    VorGradientMemoize(gradient, table.get(), k_table_size);
    draw(bitmap, *params, table.get(), blend_mode, opacity, lanes);
}

}  // namespace vorlite::generate

extern "C" {

VOR_API int VorGradientBuild(VorGradient* gradient, uint32_t colorStopCount,
                             uint32_t opacityStopCount) {
    gradient->colorStopCount = colorStopCount;
    gradient->opacityStopCount = opacityStopCount;
    gradient->colorStops = nullptr;
    gradient->opacityStops = nullptr;
    if (colorStopCount >= k_stop_limit || opacityStopCount >= k_stop_limit) return 0;
    void* colours = nullptr;
    void* opacities = nullptr;
    if (!VorArrayBuild(&colours, colorStopCount, sizeof(VorGradientColorStop)) ||
        !VorArrayBuild(&opacities, opacityStopCount, sizeof(VorGradientOpacityStop))) {
        VorArrayFree(&colours);
        VorArrayFree(&opacities);
        return 0;
    }
    gradient->colorStops = static_cast<VorGradientColorStop*>(colours);
    gradient->opacityStops = static_cast<VorGradientOpacityStop*>(opacities);
    return 1;
}

VOR_API void VorGradientFree(VorGradient* gradient) {
    std::free(gradient->colorStops);
    std::free(gradient->opacityStops);
    gradient->colorStops = nullptr;
    gradient->opacityStops = nullptr;
}

VOR_API void VorGradientShapeParamsInit(VorGradientShapeParams* params) {
    params->shape = VOR_GRADIENT_LINEAR;
    params->scale = 1.0;
    params->xCenter = 0.5;
    params->yCenter = 0.5;
    params->angle = 0.0;
    params->shapeMode = VOR_SHAPE_NORMAL;
    params->vignetteScale = 1.0;
    params->dx = 0.0;
    params->dy = 0.0;
}

VOR_API void VorGradientMemoize(const VorGradient* gradient, VorColor* table, uint32_t n) {
    // One entry has no span to sample; a gradient without two stops of each
    // kind has nothing to interpolate.
    if (n < 2 || !drawable(*gradient)) return;
    sample_colours(*gradient, table, n);
    sample_opacities(*gradient, table, n);
}

VOR_API void VorGradientApply(VorBitmap* bitmap, const VorGradientShapeParams* params,
                              const VorGradient* gradient, uint32_t blendMode, double opacity) {
    vorlite::generate::apply_gradient(bitmap, params, gradient, blendMode, opacity, true);
}

VOR_API int VLPLGradientfromColorsValAndOpacitiesVal(const yajl_val colors, const yajl_val opacities,
                                                     VorGradient* gradient) {
    using vorlite::proclist::member;
    if (colors == nullptr || !YAJL_IS_ARRAY(colors)) return 0;
    if (opacities == nullptr || !YAJL_IS_ARRAY(opacities)) return 0;
    const std::uint32_t colour_count = element_count(colors, gradient->colorStopCount);
    for (std::uint32_t i = 0; i < colour_count; ++i) {
        const yajl_val element = YAJL_GET_ARRAY(colors)->values[i];
        const yajl_val colour = member(element, "color", yajl_t_object);
        double location = 0.0;
        if (colour == nullptr || !location_of(element, &location)) return 0;
        if (!VLPLColorFromColorVal(colour, &gradient->colorStops[i].color)) return 0;
        gradient->colorStops[i].location = location;
    }
    const std::uint32_t opacity_count = element_count(opacities, gradient->opacityStopCount);
    for (std::uint32_t i = 0; i < opacity_count; ++i) {
        const yajl_val element = YAJL_GET_ARRAY(opacities)->values[i];
        double opacity = 0.0;
        double location = 0.0;
        if (!vorlite::proclist::member_double(element, "opacity", &opacity) ||
            !location_of(element, &location)) {
            return 0;
        }
        gradient->opacityStops[i].opacity = static_cast<double>(static_cast<float>(opacity));
        gradient->opacityStops[i].location = location;
    }
    return 1;
}

// "gradient": "colors" and "opacities" (stop arrays), "gradientShape"
// ("linear", "radial", "linearVignette"), "scale", "xCenter", "yCenter",
// "angle" (degrees) and "alpha" numbers, "vignetteShape" for the vignette
// shape, "blendMode" optional. The strength scales the opacity.
VOR_API int VLPLRunGradientProcessor(const yajl_val parameters, VorBitmap* bitmap,
                                     const VLPLRunOptions* options) {
    using vorlite::proclist::member;
    using vorlite::proclist::member_double;
    const yajl_val colors = member(parameters, "colors", yajl_t_array);
    const yajl_val opacities = member(parameters, "opacities", yajl_t_array);
    const yajl_val shape_name = member(parameters, "gradientShape", yajl_t_string);
    const yajl_val vignette_shape = member(parameters, "vignetteShape", yajl_t_object);
    double scale = 0.0, x_center = 0.0, y_center = 0.0, angle = 0.0;
    vorlite::proclist::Layering layering;
    if (colors == nullptr || opacities == nullptr || shape_name == nullptr ||
        !member_double(parameters, "scale", &scale) || !member_double(parameters, "xCenter", &x_center) ||
        !member_double(parameters, "yCenter", &y_center) || !member_double(parameters, "angle", &angle) ||
        !vorlite::proclist::member_layering(parameters, &layering)) {
        return 0;
    }
    OwnedGradient owned;
    VorGradient& gradient = owned.gradient;
    const std::size_t colour_stops = YAJL_GET_ARRAY(colors)->len;
    const std::size_t opacity_stops = YAJL_GET_ARRAY(opacities)->len;
    if (colour_stops >= k_stop_limit || opacity_stops >= k_stop_limit) return 0;
    if (!VorGradientBuild(&gradient, static_cast<std::uint32_t>(colour_stops),
                          static_cast<std::uint32_t>(opacity_stops)) ||
        !VLPLGradientfromColorsValAndOpacitiesVal(colors, opacities, &gradient)) {
        return 0;
    }
    // A document cannot make the sampler read past its stops: fewer than
    // two of a kind, or more opacity than colour stops, is refused.
    if (!drawable(gradient)) return 0;
    VorGradientShapeParams shape;
    VorGradientShapeParamsInit(&shape);
    if (!shape_from_name(shape_name, &shape.shape)) return 0;
    shape.scale = static_cast<float>(scale);
    shape.xCenter = static_cast<float>(x_center);
    shape.yCenter = static_cast<float>(y_center);
    shape.angle = static_cast<float>(angle * k_degrees_to_radians);
    if (shape.shape == VOR_GRADIENT_LINEAR_VIGNETTE) {
        VorBorderParams border;
        VorBorderInitParams(&border);
        if (!VLPLBorderPopoulateWithShapeTypeVal(vignette_shape, &border, bitmap, 1.0f, 0)) return 0;
        shape.shapeMode = border.shapeMode;
        shape.vignetteScale = border.vignetteScale;
        shape.dx = border.dx;
        shape.dy = border.dy;
    }
    const double opacity = static_cast<float>(layering.alpha * options->strength);
    VorGradientApply(bitmap, &shape, &gradient, layering.mode, opacity);
    return 1;
}

}  // extern "C"
