// Light flares: an analytic light shape of one colour laid over the picture
// through the memoized blend, only inside the shape's work box; the flare
// type keywords and the "flare" processor.
#include <cmath>
#include <cstdint>
#include <cstring>
#include <iterator>

#include "core/core_internal.h"
#include "generate/generate_internal.h"
#include "proclist/proclist_internal.h"

namespace {

using vorlite::generate::FlareLight;
using vorlite::generate::FlareRaster;
using vorlite::generate::flare_from_exponent;
using vorlite::generate::paint_flare;

// The closed-form shapes. Each forms the terms that depend on Y alone once
// a row; r = X^2 + Y^2 in float. Offsets carrying 0.5, 0.6 or 1.7 and the
// products they enter are double; everything else is float.

// Rings of light falling off as 1/sqrt(q); the exact centre (q = 0) stays
// clear.
struct Sinc {
    float faint;  // 0.4a
    float row(float y) const { return y * y; }
    float operator()(float x, float y2) const {
        const float q = 80.0f * (x * x + y2);
        if (q == 0.0f) return 1.0f;
        return 1.0f - (vorlite::core::sinf(q) / std::sqrt(q)) * faint;
    }
};

struct GaussianThingTerms {
    float y2;
    double w2;
};

// e = -2r - 16 (X + 0.5)^2 (Y + 0.5)^2
struct GaussianThing {
    FlareLight light;
    GaussianThingTerms row(float y) const {
        const double w = static_cast<double>(y) + 0.5;
        return {y * y, w * w};
    }
    float operator()(float x, const GaussianThingTerms& t) const {
        const double u = static_cast<double>(x) + 0.5;
        const float r = x * x + t.y2;
        return flare_from_exponent(static_cast<double>(-2.0f * r) - 16.0 * (u * u) * t.w2, light);
    }
};

// e = -2r - 16 (Y + 1)^2 (X - 0.5)^2; (Y + 1) carries no fraction and
// stays float until it meets (X - 0.5).
struct GaussianThing2 {
    FlareLight light;
    GaussianThingTerms row(float y) const {
        const float w = y + 1.0f;
        return {y * y, static_cast<double>(16.0f * (w * w))};
    }
    float operator()(float x, const GaussianThingTerms& t) const {
        const double u = static_cast<double>(x) - 0.5;
        const float r = x * x + t.y2;
        return flare_from_exponent(static_cast<double>(-2.0f * r) - t.w2 * (u * u), light);
    }
};

// e = -2r - (X - 0.6)^2 (Y + 1.7)^2
struct GaussianThing3 {
    FlareLight light;
    GaussianThingTerms row(float y) const {
        const double w = static_cast<double>(y) + 1.7;
        return {y * y, w * w};
    }
    float operator()(float x, const GaussianThingTerms& t) const {
        const double u = static_cast<double>(x) - 0.6;
        const float r = x * x + t.y2;
        return flare_from_exponent(static_cast<double>(-2.0f * r) - (u * u) * t.w2, light);
    }
};

struct GaussianThing4Terms {
    double w1_2;
    double w2_2;
};

// e = -0.5 ((X - 0.6)^2 (Y + 1.7)^2 + (X + 0.6)^2 (Y - 1.7)^2): two
// crossed streaks through opposite corners.
struct GaussianThing4 {
    FlareLight light;
    GaussianThing4Terms row(float y) const {
        const double w1 = static_cast<double>(y) + 1.7;
        const double w2 = static_cast<double>(y) - 1.7;
        return {w1 * w1, w2 * w2};
    }
    float operator()(float x, const GaussianThing4Terms& t) const {
        const double u1 = static_cast<double>(x) - 0.6;
        const double u2 = static_cast<double>(x) + 0.6;
        return flare_from_exponent(-0.5 * ((u1 * u1) * t.w1_2 + (u2 * u2) * t.w2_2), light);
    }
};

// e = -(X^2 + Y^2 / 64): a vertical streak.
struct Stripe {
    FlareLight light;
    float row(float y) const { return y * y * 0.015625f; }
    float operator()(float x, float y_term) const { return flare_from_exponent(-(x * x + y_term), light); }
};

// e = -(X^2 / 64 + Y^2): a horizontal streak.
struct Stripe2 {
    FlareLight light;
    float row(float y) const { return y * y; }
    float operator()(float x, float y2) const { return flare_from_exponent(-(x * x * 0.015625f + y2), light); }
};

// e = -100 r^4: a disc with a flat top and a short soft edge.
struct Blob {
    FlareLight light;
    float row(float y) const { return y * y; }
    float operator()(float x, float y2) const {
        const float r = x * x + y2;
        return flare_from_exponent(-100.0f * ((r * r) * (r * r)), light);
    }
};

// e = -10 r^2
struct Blob2 {
    FlareLight light;
    float row(float y) const { return y * y; }
    float operator()(float x, float y2) const {
        const float r = x * x + y2;
        return flare_from_exponent(-10.0f * (r * r), light);
    }
};

// No light: type 8 and the types without a shape.
struct NoLight {
    int row(float) const { return 0; }
    float operator()(float, int) const { return 1.0f; }
};

struct Range {
    double low;
    double high;
};

// Beyond the work box a shape's light is below a level's worth, so only
// the box is visited. Whole-image boxes are +-99999.
struct WorkBox {
    Range x;
    Range y;
};

constexpr Range k_whole{-99999.0, 99999.0};

WorkBox work_box_of(VorFlareType type) {
    switch (type) {
        case VOR_FLARE_SINC: return {{-15.0, 15.0}, {-15.0, 15.0}};
        case VOR_FLARE_GAUSSIAN_THING: return {{-1.4, 1.35}, {-1.4, 1.45}};
        case VOR_FLARE_GAUSSIAN_THING_2: return {{-1.3, 1.35}, {-1.4, 1.4}};
        case VOR_FLARE_GAUSSIAN_THING_3: return {{-0.95, 1.35}, {-1.6, 1.35}};
        case VOR_FLARE_GAUSSIAN_THING_4: return {{-1.6, 1.6}, {-5.0, 5.0}};
        case VOR_FLARE_LOBES: return {{-1.6, 1.6}, {-1.6, 1.6}};
        case VOR_FLARE_STRIPE: return {{-2.15, 2.15}, {-15.0, 15.0}};
        case VOR_FLARE_STRIPE_2: return {{-15.0, 15.0}, {-2.15, 2.15}};
        case VOR_FLARE_DIAMOND: return {{-1.4, 1.4}, {-1.4, 1.4}};
        case VOR_FLARE_CROSS: return {{-20.0, 20.0}, {-20.0, 20.0}};
        case VOR_FLARE_BLOB_FLARE: return {{-1.55, 1.35}, {-1.6, 1.35}};
        case VOR_FLARE_BLOB: return {{-0.71, 0.71}, {-0.71, 0.71}};
        case VOR_FLARE_BLOB_2: return {{-0.85, 0.85}, {-0.85, 0.85}};
        default: return {k_whole, k_whole};
    }
}

// A range in the shape's coordinates to the pixel indices [first, end)
// that cover it along an axis of the given size: scaled by the flare's
// size, shifted by its centre offset, then from -1..1 to 0..size.
struct Span {
    std::uint32_t first;
    std::uint32_t end;
};

std::uint32_t pixel_bound(double b, std::uint32_t size) {
    const double index = std::floor(((b + 1.0) * static_cast<double>(size) + 1.0) * 0.5);
    if (!(index > 0.0)) return 0;
    if (index >= static_cast<double>(size)) return size;
    return static_cast<std::uint32_t>(index);
}

Span span_of(Range range, float scale, float offset, std::uint32_t size) {
    double low = range.low * static_cast<double>(scale) + static_cast<double>(offset);
    double high = range.high * static_cast<double>(scale) + static_cast<double>(offset);
    if (low > high) {
        const double t = low;
        low = high;
        high = t;
    }
    return {pixel_bound(low, size), pixel_bound(high, size)};
}

bool has_shape(VorFlareType type) {
    return type >= VOR_FLARE_SINC && type <= VOR_FLARE_BLOB_2 && type != VOR_FLARE_NONE;
}

void paint_shape(VorFlareType type, const FlareRaster& raster, const FlareLight& light) {
    switch (type) {
        case VOR_FLARE_SINC: return paint_flare(raster, Sinc{0.4f * light.a});
        case VOR_FLARE_GAUSSIAN_THING: return paint_flare(raster, GaussianThing{light});
        case VOR_FLARE_GAUSSIAN_THING_2: return paint_flare(raster, GaussianThing2{light});
        case VOR_FLARE_GAUSSIAN_THING_3: return paint_flare(raster, GaussianThing3{light});
        case VOR_FLARE_GAUSSIAN_THING_4: return paint_flare(raster, GaussianThing4{light});
        case VOR_FLARE_STRIPE: return paint_flare(raster, Stripe{light});
        case VOR_FLARE_STRIPE_2: return paint_flare(raster, Stripe2{light});
        case VOR_FLARE_BLOB: return paint_flare(raster, Blob{light});
        case VOR_FLARE_BLOB_2: return paint_flare(raster, Blob2{light});
        default:
            if (!vorlite::generate::paint_designed_flare(type, raster, light)) paint_flare(raster, NoLight{});
    }
}

const char* const k_type_names[] = {
    "sinc", "gaussianThing", "gaussianThing2", "gaussianThing3", "gaussianThing4", "angleGaussian", "stardom",
    "lobes", nullptr, "stripe", "stripe2", "dimondFlare", "crossFlare", "cornerFlares", "fingerFlare",
    "blobFlare", "blah", "blob", "blob2",
};

}  // namespace

extern "C" {

VOR_API void VorFlare(VorBitmap* bitmap, float fScale, const VorColor* color, VorFlareType type, float dx,
                      float dy, float dsx, float dsy, uint32_t blendMode) {
    if (color->a == 0 || dsx == 0.0f || dsy == 0.0f || fScale == 0.0f) return;
    if (bitmap->width == 0 || bitmap->height == 0) return;
    // Level 0 gives back the pixel in the modes with a rule, so a shape
    // without light changes nothing there.
    const bool level_zero_is_identity = blendMode <= VOR_BLEND_SOFT_LIGHT;
    if (!has_shape(type) && level_zero_is_identity) return;

    const auto hw = static_cast<std::int64_t>(std::floor(static_cast<float>(bitmap->width) * 0.5f));
    const auto hh = static_cast<std::int64_t>(std::floor(static_cast<float>(bitmap->height) * 0.5f));
    const FlareLight light{static_cast<float>(color->a) * vorlite::core::k_inv255,
                           vorlite::core::logf(1.0f / static_cast<float>(color->a))};
    const float sx = dsx * fScale;
    const float sy = dsy * fScale;
    // The sinc is round whatever the picture's proportions, its unit set by
    // the overall scale alone; the other shapes fill dsx by dsy.
    float kx;
    float ky;
    if (type == VOR_FLARE_SINC) {
        kx = 2.0f / (static_cast<float>(hw + hh) * fScale);
        ky = kx;
    } else {
        kx = 1.0f / (static_cast<float>(hw) * sx);
        ky = 1.0f / (static_cast<float>(hh) * sy);
    }

    const WorkBox box = work_box_of(type);
    const Span columns = span_of(box.x, sx, dx, bitmap->width);
    const Span rows = span_of(box.y, sy, dy, bitmap->height);
    if (columns.first >= columns.end || rows.first >= rows.end) return;

    vorlite::core::WorkingArray<float> column_x;
    vorlite::core::WorkingArray<VorColorBlendMemoTable> memo;
    if (!column_x.build(columns.end - columns.first) || !memo.build(1)) return;
    VorColorBlendInitMemozied(memo.get(), blendMode);
    const float hw_shift = static_cast<float>(hw) * dx;
    for (std::uint32_t x = columns.first; x < columns.end; ++x) {
        column_x[x - columns.first] = (static_cast<float>(static_cast<std::int64_t>(x) - hw) - hw_shift) * kx;
    }
    const FlareRaster raster{.bitmap = bitmap,
                             .colour = color,
                             .memo = memo.get(),
                             .x0 = columns.first,
                             .x1 = columns.end,
                             .y0 = rows.first,
                             .y1 = rows.end,
                             .column_x = column_x.get(),
                             .hh = hh,
                             .dy = dy,
                             .ky = ky,
                             .level_zero_is_identity = level_zero_is_identity};
    paint_shape(type, raster, light);
}

VOR_API int VLPLFlareTypeFromFlareTypeVal(const yajl_val value, VorFlareType* outType) {
    if (value == nullptr || !YAJL_IS_STRING(value)) return 0;
    const char* name = YAJL_GET_STRING(value);
    for (std::int32_t i = 0; i < static_cast<std::int32_t>(std::size(k_type_names)); ++i) {
        if (k_type_names[i] != nullptr && std::strcmp(name, k_type_names[i]) == 0) {
            *outType = i;
            return 1;
        }
    }
    return 0;
}

// "flare": "color" (colour), "blendMode", "type" (a flare keyword), and the
// numbers "dx", "dy" (centre offset), "dsx", "dsy" (size) and "fScale",
// all required. The strength scales the colour's alpha.
VOR_API int VLPLRunFlareProcessor(const yajl_val parameters, VorBitmap* bitmap, const VLPLRunOptions* options) {
    using vorlite::proclist::member;
    using vorlite::proclist::member_double;
    if (parameters == nullptr || !YAJL_IS_OBJECT(parameters)) return 0;
    const yajl_val colour_value = member(parameters, "color", yajl_t_object);
    const yajl_val mode_value = member(parameters, "blendMode", yajl_t_string);
    const yajl_val type_value = member(parameters, "type", yajl_t_string);
    double dx = 0.0, dy = 0.0, dsx = 0.0, dsy = 0.0, scale = 0.0;
    if (colour_value == nullptr || mode_value == nullptr || type_value == nullptr ||
        !member_double(parameters, "dx", &dx) || !member_double(parameters, "dy", &dy) ||
        !member_double(parameters, "dsx", &dsx) || !member_double(parameters, "dsy", &dsy) ||
        !member_double(parameters, "fScale", &scale)) {
        return 0;
    }
    VorColor colour;
    if (!VLPLColorFromColorVal(colour_value, &colour)) return 0;
    const double alpha = static_cast<double>(colour.a) * options->strength;
    colour.a = vorlite::core::clamp_byte(vorlite::core::truncate_clamped<std::int32_t>(alpha));
    int mode = 0;
    VorFlareType type = 0;
    VLPLBlendModeFromBlendModeVal(mode_value, &mode);
    if (!VLPLFlareTypeFromFlareTypeVal(type_value, &type)) return 0;
    VorFlare(bitmap, static_cast<float>(scale), &colour, type, static_cast<float>(dx), static_cast<float>(dy),
             static_cast<float>(dsx), static_cast<float>(dsy), static_cast<std::uint32_t>(mode));
    return 1;
}

}  // extern "C"
