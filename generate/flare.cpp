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

using vorlite::generate::FlareRow;

// The shape's own coordinates: the flare's centre at the origin, the
// flare's size along each axis one unit (type 0 is isotropic instead, its
// unit set by the overall scale alone).
class FlareFrame {
public:
    FlareFrame(std::uint32_t width, std::uint32_t height, float scale, const VorColor& colour, VorFlareType type,
               float dx, float dy, float dsx, float dsy)
        : type_(type),
          hw_(static_cast<std::int64_t>(std::floor(static_cast<float>(width) * 0.5f))),
          hh_(static_cast<std::int64_t>(std::floor(static_cast<float>(height) * 0.5f))),
          dx_(dx),
          dy_(dy),
          a_(static_cast<float>(colour.a) * vorlite::core::k_inv255),
          limit_(vorlite::core::logf(1.0f / static_cast<float>(colour.a))),
          sx(dsx * scale),
          sy(dsy * scale) {
        const auto hw = static_cast<float>(hw_);
        const auto hh = static_cast<float>(hh_);
        if (type == VOR_FLARE_SINC) {
            kx_ = 2.0f / ((hw + hh) * scale);
            ky_ = kx_;
        } else {
            kx_ = 1.0f / (hw * sx);
            ky_ = 1.0f / (hh * sy);
        }
    }

    FlareRow row(std::uint32_t y) const {
        const float v = (static_cast<float>(static_cast<std::int64_t>(y) - hh_) - static_cast<float>(hh_) * dy_) * ky_;
        return {v, v - 1.0f, (v - 1.0f) * (v - 1.0f)};
    }

    // The blend level at a pixel of the row: trunc((1 - v) x 255) for the
    // shape's transmission v, held in 0..1 — a sinc's negative lobes
    // would ask for less than no light, and a blend cannot darken by light.
    std::uint32_t opacity(const FlareRow& row, std::uint32_t x) const {
        const float xs = (static_cast<float>(static_cast<std::int64_t>(x) - hw_) - static_cast<float>(hw_) * dx_) * kx_;
        float v = transmission(xs, row);
        if (!(v < 1.0f)) return 0;
        if (v < 0.0f) v = 0.0f;
        return static_cast<std::uint32_t>((1.0f - v) * 255.0f);
    }

private:
    // Shapes from a Gaussian exponent e <= 0: invisible where the light
    // would stay below one level of the colour's alpha (e < ln(1/alpha)).
    float from_exponent(double e) const {
        if (e < static_cast<double>(limit_)) return 1.0f;
        if (e > 0.0) return 1.0f - a_;
        return 1.0f - vorlite::core::expf(static_cast<float>(e)) * a_;
    }

    float transmission(float x, const FlareRow& row) const {
        const float y = row.y;
        const float r = x * x + y * y;
        switch (type_) {
            case VOR_FLARE_SINC: {
                // Rings of light falling off as 1/sqrt(q); the exact centre
                // (q = 0) stays clear.
                const float q = 80.0f * r;
                if (q == 0.0f) return 1.0f;
                return 1.0f - (vorlite::core::sinf(q) / std::sqrt(q)) * (0.4f * a_);
            }
            case VOR_FLARE_GAUSSIAN_THING: {
                const double u = static_cast<double>(x) + 0.5;
                const double w = static_cast<double>(y) + 0.5;
                return from_exponent(static_cast<double>(-2.0f * r) - 16.0 * (u * u) * (w * w));
            }
            case VOR_FLARE_GAUSSIAN_THING_2: {
                const double w = static_cast<double>(y) + 1.0;
                const double u = static_cast<double>(x) - 0.5;
                return from_exponent(static_cast<double>(-2.0f * r) - 16.0 * (w * w) * (u * u));
            }
            case VOR_FLARE_GAUSSIAN_THING_3: {
                const double u = static_cast<double>(x) - 0.6;
                const double w = static_cast<double>(y) + 1.7;
                return from_exponent(static_cast<double>(-2.0f * r) - (u * u) * (w * w));
            }
            case VOR_FLARE_GAUSSIAN_THING_4: {
                const double u1 = static_cast<double>(x) - 0.6;
                const double w1 = static_cast<double>(y) + 1.7;
                const double u2 = static_cast<double>(x) + 0.6;
                const double w2 = static_cast<double>(y) - 1.7;
                return from_exponent(-0.5 * ((u1 * u1) * (w1 * w1) + (u2 * u2) * (w2 * w2)));
            }
            case VOR_FLARE_STRIPE:
                return from_exponent(-(x * x + y * y * 0.015625f));
            case VOR_FLARE_STRIPE_2:
                return from_exponent(-(x * x * 0.015625f + y * y));
            case VOR_FLARE_BLOB:
                return from_exponent(-100.0f * ((r * r) * (r * r)));
            case VOR_FLARE_BLOB_2:
                return from_exponent(-10.0f * (r * r));
            case VOR_FLARE_NONE:
                return 1.0f;
            default:
                return vorlite::generate::designed_flare_transmission(type_, x, row, r, a_, limit_);
        }
    }

    VorFlareType type_;
    std::int64_t hw_;
    std::int64_t hh_;
    float dx_;
    float dy_;
    float a_;
    float limit_;
    float kx_ = 0.0f;
    float ky_ = 0.0f;

public:
    const float sx;
    const float sy;
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
    vorlite::core::WorkingArray<VorColorBlendMemoTable> memo;
    if (!memo.build(1)) return;
    VorColorBlendInitMemozied(memo.get(), blendMode);

    const FlareFrame frame(bitmap->width, bitmap->height, fScale, *color, type, dx, dy, dsx, dsy);
    const WorkBox box = work_box_of(type);
    const Span columns = span_of(box.x, frame.sx, dx, bitmap->width);
    const Span rows = span_of(box.y, frame.sy, dy, bitmap->height);
    const bool skip_clear = blendMode != VOR_BLEND_COLOR;
    for (std::uint32_t y = rows.first; y < rows.end; ++y) {
        const FlareRow row = frame.row(y);
        std::uint8_t* p = bitmap->data + (static_cast<std::size_t>(y) * bitmap->width + columns.first) * 4;
        for (std::uint32_t x = columns.first; x < columns.end; ++x, p += 4) {
            const std::uint32_t level = frame.opacity(row, x);
            // At level 0 every mode but the colour mode returns the pixel.
            if (level == 0 && skip_clear) continue;
            VorColor out = vorlite::core::load_pixel(p);
            VorColorBlendMemoized(&out, color, level, memo.get());
            vorlite::core::store_pixel(p, out);
        }
    }
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
