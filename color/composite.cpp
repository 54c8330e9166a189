// Bitmap compositing: whole bitmaps, transformed and masked bitmaps,
// premultiplied layers and one colour laid over a destination with the
// per-pixel blend modes.
#include <cstddef>
#include <cstdint>

#include "color/color_internal.h"
#include "core/core_internal.h"
#include "core/simd.h"
#include "proclist/proclist_internal.h"

namespace vorlite::color {
namespace {

using core::k_inv255;
using core::load_pixel;
using core::store_pixel;

// The rows and columns both bitmaps cover, anchored at the top-left corner.
struct CommonArea {
    std::uint32_t width;
    std::uint32_t height;
};

CommonArea common_area(const VorBitmap& dst, const VorBitmap& src) {
    return {dst.width < src.width ? dst.width : src.width,
            dst.height < src.height ? dst.height : src.height};
}

// Every mode but the colour mode blends each channel on its own, so a
// channel's result depends on the destination and source levels alone. On a
// large area the channel-pair table of the mode replaces the per-pixel
// blend with the same bytes.
constexpr std::size_t k_pair_table_threshold = 65536;

inline void blend_channels_through(const std::uint8_t* table, std::uint8_t* d, const std::uint8_t* s) {
    d[0] = table[(s[0] << 8) | d[0]];
    d[1] = table[(s[1] << 8) | d[1]];
    d[2] = table[(s[2] << 8) | d[2]];
}

void blend_row_through_pair_table(std::uint8_t* d, const std::uint8_t* s, std::uint32_t width,
                                  const std::uint8_t* table) {
    for (std::uint32_t x = 0; x < width; ++x, d += 4, s += 4) {
        if (x % 16 == 0) {
            core::prefetch_ahead<true>(d);
            core::prefetch_ahead<false>(s);
        }
        blend_channels_through(table, d, s);
    }
}

void blend_row_per_pixel(std::uint8_t* d, const std::uint8_t* s, std::uint32_t width, std::uint32_t mode,
                         float opacity) {
    for (std::uint32_t x = 0; x < width; ++x, d += 4, s += 4) {
        VorColor out = load_pixel(d);
        const VorColor over = load_pixel(s);
        VorColorBlend(&out, &over, mode, opacity);
        store_pixel(d, out);
    }
}

#if VORLITE_NATIVE_INTEGER_LANES
// Many tables are a plain weighted mean in integers: (w s + (256 - w) b +
// 128) / 256 for one weight w, normal mode at opacity 0.5 among them. When
// that formula gives every one of the table's 65,536 entries, it gives the
// same bytes as the table for any pixels, and sixteen channels at a time;
// when a single entry differs (float rounding near a half), the table is
// used.
constexpr unsigned k_mean_shift = 8;

bool is_weighted_mean(const std::uint8_t* table, unsigned w) {
    bool exact = true;
    for (unsigned s = 0; s < 256; ++s) {
        for (unsigned b = 0; b < 256; ++b) {
            const unsigned mean = (w * s + (256u - w) * b + 128u) >> k_mean_shift;
            exact &= table[(s << 8) | b] == mean;
        }
    }
    return exact;
}

// The weight that makes the table a weighted mean, or -1.
int mean_weight(const std::uint8_t* table, float opacity) {
    if (!(opacity >= 0.0f && opacity <= 1.0f)) return -1;
    const auto w = static_cast<unsigned>(opacity * 256.0f + 0.5f);
    return is_weighted_mean(table, w) ? static_cast<int>(w) : -1;
}

using core::simd::u16x8;
using core::simd::u8x16;

// Eight channels: every product and sum fits 16 bits, at most 256 x 255 + 128.
inline u16x8 weighted_mean(u16x8 over, u16x8 below, std::uint16_t weight) {
    const auto rest = static_cast<std::uint16_t>(256u - weight);
    return (over * weight + below * rest + 128) >> k_mean_shift;
}

// Four pixels of the mean: colour channels mixed, alpha kept from below.
inline u8x16 weighted_mean_quad(u8x16 over, u8x16 below, std::uint16_t weight) {
    using namespace core::simd;
    const u16x8 low = weighted_mean(widen_low(over), widen_low(below), weight);
    const u16x8 high = weighted_mean(widen_high(over), widen_high(below), weight);
    // Every mean is at most 255, so narrowing with a clamp keeps it whole.
    const u8x16 mixed = narrow_clamped(reinterpret_cast<i16x8>(low), reinterpret_cast<i16x8>(high));
    const u8x16 alpha = {0, 0, 0, 255, 0, 0, 0, 255, 0, 0, 0, 255, 0, 0, 0, 255};
    return (mixed & ~alpha) | (below & alpha);
}

// Four pixels at a time through the mean, the last one to three through
// the table it matches.
void blend_row_weighted_mean(std::uint8_t* d, const std::uint8_t* s, std::uint32_t width, unsigned weight,
                             const std::uint8_t* table) {
    const auto w = static_cast<std::uint16_t>(weight);
    std::uint32_t x = 0;
    for (; x + 4 <= width; x += 4, d += 16, s += 16) {
        if (x % 16 == 0) {
            core::prefetch_ahead<true>(d);
            core::prefetch_ahead<false>(s);
        }
        const u8x16 mixed = weighted_mean_quad(core::simd::load<u8x16>(s), core::simd::load<u8x16>(d), w);
        core::simd::store(d, mixed);
    }
    for (; x < width; ++x, d += 4, s += 4) blend_channels_through(table, d, s);
}
#endif

inline std::uint8_t* pixel_at(const VorBitmap& bitmap, std::uint32_t x, std::uint32_t y) {
    return bitmap.data + (static_cast<std::size_t>(y) * bitmap.width + x) * 4;
}

// A destination point mapped back through an inverse transform: each
// coordinate is summed in double precision, then narrowed to single.
struct SourcePoint {
    float x;
    float y;
};

inline SourcePoint map_back(const VorTransform& inverse, std::uint32_t x, std::uint32_t y) {
    const double dx = static_cast<double>(x);
    const double dy = static_cast<double>(y);
    return {static_cast<float>((dy * inverse.b + inverse.tx) + dx * inverse.a),
            static_cast<float>((dy * inverse.d + inverse.ty) + dx * inverse.c)};
}

// A point is sampled while it lies within one pixel outside the top and
// left edges and no further right or down than the far edges. Compared in
// double so that the bound is the exact size even for huge bitmaps.
inline bool outside_sampling_range(SourcePoint p, std::uint32_t width, std::uint32_t height) {
    const double x = p.x;
    const double y = p.y;
    return x < -1.0 || x > static_cast<double>(width) || y < -1.0 || y > static_cast<double>(height);
}

// Toward zero, so a point between -1 and 0 uses pixel 0 with a negative
// fraction. NaN coordinates (a singular transform) read pixel 0 and give
// NaN weights, which the storing rule turns into 0.
inline std::int64_t truncate_coordinate(float v) { return core::truncate_clamped<std::int64_t>(v); }

inline bool inside(std::int64_t x, std::int64_t y, std::uint32_t width, std::uint32_t height) {
    return x >= 0 && y >= 0 && x < static_cast<std::int64_t>(width) &&
           y < static_cast<std::int64_t>(height);
}

// Source pixel for bilinear sampling; neighbours off the source read as
// opaque white so the picture fades into white at its edges.
inline VorColor source_or_white(const VorBitmap& src, std::int64_t x, std::int64_t y) {
    if (!inside(x, y, src.width, src.height)) return VorColor{255, 255, 255, 255};
    return load_pixel(pixel_at(src, static_cast<std::uint32_t>(x), static_cast<std::uint32_t>(y)));
}

inline float bilinear(float p00, float p10, float p01, float p11, float fx, float fy) {
    const float top = p00 * (1.0f - fx) + p10 * fx;
    const float bottom = p01 * (1.0f - fx) + p11 * fx;
    return top * (1.0f - fy) + bottom * fy;
}

VorColor sample_source(const VorBitmap& src, SourcePoint p) {
    const std::int64_t x0 = truncate_coordinate(p.x);
    const std::int64_t y0 = truncate_coordinate(p.y);
    const float fx = p.x - static_cast<float>(x0);
    const float fy = p.y - static_cast<float>(y0);
    const VorColor c00 = source_or_white(src, x0, y0);
    const VorColor c10 = source_or_white(src, x0 + 1, y0);
    const VorColor c01 = source_or_white(src, x0, y0 + 1);
    const VorColor c11 = source_or_white(src, x0 + 1, y0 + 1);
    const auto channel = [&](std::uint8_t VorColor::*ch) {
        return core::store_truncated(bilinear(c00.*ch, c10.*ch, c01.*ch, c11.*ch, fx, fy));
    };
    return VorColor{channel(&VorColor::r), channel(&VorColor::g), channel(&VorColor::b), 255};
}

inline std::int64_t clamp_index(std::int64_t v, std::uint32_t size) {
    if (v < 0) return 0;
    const std::int64_t last = static_cast<std::int64_t>(size) - 1;
    return v > last ? last : v;
}

// The mask's coverage at a point: its alpha bytes interpolated between the
// four nearest mask pixels, with indices held inside the mask.
float mask_coverage(const VorBitmap& mask, SourcePoint p) {
    const std::int64_t tx = truncate_coordinate(p.x);
    const std::int64_t ty = truncate_coordinate(p.y);
    const std::int64_t x0 = clamp_index(tx, mask.width);
    const std::int64_t x1 = clamp_index(tx + 1, mask.width);
    const std::int64_t y0 = clamp_index(ty, mask.height);
    const std::int64_t y1 = clamp_index(ty + 1, mask.height);
    const float fx = p.x - static_cast<float>(x0);
    const float fy = p.y - static_cast<float>(y0);
    const auto alpha = [&](std::int64_t x, std::int64_t y) {
        return static_cast<float>(
            pixel_at(mask, static_cast<std::uint32_t>(x), static_cast<std::uint32_t>(y))[3]);
    };
    return (1.0f - fy) * (alpha(x0, y0) * (1.0f - fx) + alpha(x1, y0) * fx) +
           fy * (alpha(x0, y1) * (1.0f - fx) + alpha(x1, y1) * fx);
}

inline VorColor opaque(const std::uint8_t* p) { return VorColor{p[0], p[1], p[2], 255}; }

inline void store_colour_channels(std::uint8_t* p, const VorColor& c) {
    p[0] = c.r;
    p[1] = c.g;
    p[2] = c.b;
}

// Un-premultiplies one channel by 1/alpha: above 255 saturates, otherwise
// truncates. A fully transparent pixel (1/alpha infinite) saturates every
// channel, a zero channel included.
inline std::uint8_t unpremultiply(std::uint8_t channel, float reciprocal, bool transparent) {
    if (transparent) return 255;
    return core::store_truncated(reciprocal * static_cast<float>(channel));
}

void blend_color_mode(VorBitmap* bitmap, const VorColor& color, float opacity) {
    float hsl[3];
    VorColorRGB2HSL(&color, hsl);
    // Each pixel depends on itself alone, so visiting in memory order gives
    // the same bytes as any other order and walks the rows contiguously.
    const std::size_t n = core::pixel_count(*bitmap);
    std::uint8_t* p = bitmap->data;
    for (std::size_t i = 0; i < n; ++i, p += 4) {
        VorColor c = load_pixel(p);
        VorColorBlendColorMode(&c, hsl, color.a, opacity);
        store_pixel(p, c);
    }
}

}  // namespace

RowBlender::RowBlender(std::uint32_t mode, float opacity, std::size_t pixels) : mode_(mode), opacity_(opacity) {
    // Every mode but the colour mode blends each channel on its own, so on
    // a large job its channel-pair table gives the same bytes as the
    // per-pixel blend for 65,536 blends in all.
    if (mode == VOR_BLEND_COLOR || pixels <= k_pair_table_threshold) return;
    pairs_.emplace(mode, opacity);
    if (!pairs_->valid()) return;
    table_ = pairs_->entries();
#if VORLITE_NATIVE_INTEGER_LANES
    if (mode == VOR_BLEND_NORMAL) mean_weight_ = mean_weight(table_, opacity);
#endif
}

void RowBlender::blend(std::uint8_t* dst, const std::uint8_t* src, std::uint32_t width) const {
    if (table_ == nullptr) {
        blend_row_per_pixel(dst, src, width, mode_, opacity_);
        return;
    }
#if VORLITE_NATIVE_INTEGER_LANES
    if (mean_weight_ >= 0) {
        blend_row_weighted_mean(dst, src, width, static_cast<unsigned>(mean_weight_), table_);
        return;
    }
#endif
    blend_row_through_pair_table(dst, src, width, table_);
}

}  // namespace vorlite::color

using namespace vorlite::color;
using vorlite::core::load_pixel;
using vorlite::core::store_pixel;

extern "C" {

VOR_API void VorBitmapBlendBitmap(VorBitmap* dst, const VorBitmap* src, uint32_t mode,
                                  float opacity) {
    if (dst->height == 0 || src->height == 0) return;
    const CommonArea area = common_area(*dst, *src);
    const RowBlender blender(mode, opacity, static_cast<std::size_t>(area.width) * area.height);
    for (uint32_t y = 0; y < area.height; ++y) blender.blend(pixel_at(*dst, 0, y), pixel_at(*src, 0, y), area.width);
}

VOR_API void VorBitmapBlendBitmapSeparate(VorBitmap* dst, const VorBitmap* src, float dstWeight,
                                          float srcWeight) {
    if (dst->height == 0 || src->height == 0) return;
    const CommonArea area = common_area(*dst, *src);
    for (uint32_t y = 0; y < area.height; ++y) {
        uint8_t* d = pixel_at(*dst, 0, y);
        const uint8_t* s = pixel_at(*src, 0, y);
        for (uint32_t x = 0; x < area.width; ++x, d += 4, s += 4) {
            for (int c = 0; c < 3; ++c) {
                d[c] = vorlite::core::store_truncated(srcWeight * static_cast<float>(s[c]) +
                                                      dstWeight * static_cast<float>(d[c]));
            }
        }
    }
}

VOR_API void VorBitmapBlendBitmapTransform(VorBitmap* dst, const VorBitmap* src, uint32_t mode,
                                           float opacity, const VorTransform* transform) {
    VorTransform inverse;
    VorTransformGetInverse(transform, &inverse);
    for (uint32_t y = 0; y < dst->height; ++y) {
        uint8_t* d = pixel_at(*dst, 0, y);
        for (uint32_t x = 0; x < dst->width; ++x, d += 4) {
            const SourcePoint p = map_back(inverse, x, y);
            // Beyond the transformed source the destination turns opaque
            // white, alpha included, instead of keeping its pixel.
            if (outside_sampling_range(p, src->width, src->height)) {
                store_pixel(d, VorColor{255, 255, 255, 255});
                continue;
            }
            const VorColor sample = sample_source(*src, p);
            VorColor out = load_pixel(d);
            VorColorBlend(&out, &sample, mode, opacity);
            store_pixel(d, out);
        }
    }
}

VOR_API void VorBitmapBlendBitmapMask(VorBitmap* dst, const VorBitmap* base, const VorBitmap* over,
                                      const VorBitmap* mask, uint32_t mode) {
    // A mask without pixels covers no point of the destination.
    if (mask->width == 0 || mask->height == 0) return;
    VorTransform stretch;
    VorTransformSetIdentity(&stretch);
    VorTransformPostScale(&stretch, static_cast<double>(dst->width) / mask->width,
                          static_cast<double>(dst->height) / mask->height);
    VorTransform inverse;
    VorTransformGetInverse(&stretch, &inverse);
    // base and over share the destination's layout: one offset serves all three.
    std::size_t offset = 0;
    for (uint32_t y = 0; y < dst->height; ++y) {
        for (uint32_t x = 0; x < dst->width; ++x, offset += 4) {
            const SourcePoint p = map_back(inverse, x, y);
            if (outside_sampling_range(p, mask->width, mask->height)) continue;
            const float coverage = mask_coverage(*mask, p);
            const float opacity = static_cast<float>(static_cast<double>(coverage) * (1.0 / 255.0));
            VorColor t = opaque(base->data + offset);
            const VorColor u = opaque(over->data + offset);
            VorColorBlend(&t, &u, mode, opacity);
            store_colour_channels(dst->data + offset, t);
        }
    }
}

VOR_API void VorBitmapCompositePremultiplied(VorBitmap* dst, const VorBitmap* base,
                                             const VorBitmap* over, uint32_t mode) {
    const std::size_t n = vorlite::core::pixel_count(*dst);
    uint8_t* d = dst->data;
    const uint8_t* b = base->data;
    const uint8_t* o = over->data;
    for (std::size_t i = 0; i < n; ++i, d += 4, b += 4, o += 4) {
        VorColor t = opaque(b);
        const float alpha = static_cast<float>(o[3]) * k_inv255;
        const float reciprocal = 1.0f / alpha;
        const bool transparent = o[3] == 0;
        // The over colour keeps full saturation in the colour mode: its
        // coverage already acts as the opacity.
        const VorColor u{unpremultiply(o[0], reciprocal, transparent),
                         unpremultiply(o[1], reciprocal, transparent),
                         unpremultiply(o[2], reciprocal, transparent), 255};
        VorColorBlend(&t, &u, mode, alpha);
        store_colour_channels(d, t);
    }
}

VOR_API void VorBitmapBlendWithColor(VorBitmap* bitmap, const VorColor* color, uint32_t mode,
                                     float opacity) {
    if (mode == VOR_BLEND_COLOR) {
        if (bitmap->width < 1) return;
        blend_color_mode(bitmap, *color, opacity);
        return;
    }
    // Every other mode treats the channels independently, so the blend over
    // any pixel is read from the blends over the 256 greys.
    VorHistMap map;
    blend_grey_maps(*color, mode, opacity, map.map[0], map.map[1], map.map[2]);
    VorBitmapHistogramTransform(bitmap, &map);
}

VOR_API void VorBitmapBlend(VorBitmap* bitmap, const VorColor* color, uint32_t mode,
                            float opacity) {
    VorBitmapBlendWithColor(bitmap, color, mode, opacity);
}

VOR_API int VLPLRunBlendWithColorProcessor(const yajl_val parameters, VorBitmap* bitmap,
                                           const VLPLRunOptions* options) {
    using vorlite::proclist::member;
    if (parameters == nullptr || !YAJL_IS_OBJECT(parameters)) return 0;
    const yajl_val color_value = member(parameters, "color", yajl_t_object);
    vorlite::proclist::Layering layering;
    if (color_value == nullptr || !vorlite::proclist::member_layering(parameters, &layering)) {
        return 0;
    }
    VorColor color;
    if (!VLPLColorFromColorVal(color_value, &color)) return 0;
    const float opacity = static_cast<float>(options->strength * layering.alpha);
    VorBitmapBlendWithColor(bitmap, &color, layering.mode, opacity);
    return 1;
}

}  // extern "C"
