// Blend modes: one source colour over one destination pixel, directly or
// through per-opacity grey maps memoized in a caller-owned table.
#include <cstdint>

#include "color/color_internal.h"
#include "core/core_internal.h"

namespace vorlite::color {
namespace {

using core::float_bits;
using core::k_inv255;

constexpr float k_2_255 = float_bits(0x3C008081u);  // 2/255

// Hosts allocate the memo as one plain block of this size.
static_assert(sizeof(VorColorBlendMemoTable) == 196868);

// Each per-channel rule returns the value before truncation. Normal,
// overlay, screen, darken and multiply carry a +0.5 so they round;
// soft light and the colour mode truncate.
inline float blend_normal(int b, int s, float op, float a) {
    return (op * static_cast<float>(s) + 0.5f) + a * static_cast<float>(b);
}

// The inverted product is divided by 255 only through the multiplication by
// 2/255 (overlay) or 1/255 (screen), never by an integer division.
inline float blend_overlay(int b, int s, float op, float a) {
    if (b > 128) {
        const float inverted = static_cast<float>((255 - s) * (255 - b));
        return (a * static_cast<float>(b) + 0.5f) + (255.0f - inverted * k_2_255) * op;
    }
    return ((static_cast<float>(s) * k_2_255) * op + a) * static_cast<float>(b) + 0.5f;
}

inline float blend_screen(int b, int s, float op, float a) {
    const float inverted = static_cast<float>((255 - s) * (255 - b));
    return (a * static_cast<float>(b) + 0.5f) + (255.0f - inverted * k_inv255) * op;
}

inline float blend_darken(int b, int s, float op, float a) {
    return (a * static_cast<float>(b) + 0.5f) + static_cast<float>(b < s ? b : s) * op;
}

inline float blend_multiply(int b, int s, float op, float a) {
    return ((static_cast<float>(s) * k_inv255) * op + a) * static_cast<float>(b) + 0.5f;
}

// Integer soft light with shifts by 8: dividing by 256 rather than 255
// darkens by a fraction of a level, which the library's look includes.
inline float blend_soft_light(int b, int s, float op, float a) {
    const unsigned us = static_cast<unsigned>(s);
    const unsigned ub = static_cast<unsigned>(b);
    const unsigned m = ((255u - us) * (255u - ub)) >> 8;
    const unsigned p = (us * ub) >> 8;
    const unsigned t = p + (((255u - m - p) * us) >> 8);
    return static_cast<float>(t) * op + a * static_cast<float>(b);
}

// Modes without a rule of their own blacken the colour channels.
inline float blend_unknown(int, int, float, float) { return 0.0f; }

using ChannelRule = float (*)(int, int, float, float);

// Calls visit.operator()<Rule>() with the channel rule of a mode; false,
// without calling, for the colour mode, which mixes whole colours.
template <typename Visit>
bool visit_channel_rule(std::uint32_t mode, Visit&& visit) {
    switch (mode) {
        case VOR_BLEND_NORMAL:
            visit.template operator()<blend_normal>();
            return true;
        case VOR_BLEND_OVERLAY:
            visit.template operator()<blend_overlay>();
            return true;
        case VOR_BLEND_COLOR:
            return false;
        case VOR_BLEND_SCREEN:
            visit.template operator()<blend_screen>();
            return true;
        case VOR_BLEND_DARKEN:
            visit.template operator()<blend_darken>();
            return true;
        case VOR_BLEND_MULTIPLY:
            visit.template operator()<blend_multiply>();
            return true;
        case VOR_BLEND_SOFT_LIGHT:
            visit.template operator()<blend_soft_light>();
            return true;
        default:
            visit.template operator()<blend_unknown>();
            return true;
    }
}

template <ChannelRule Rule>
inline void blend_channels(VorColor& dst, const VorColor& src, float op) {
    const float a = 1.0f - op;
    dst.r = core::store_truncated(Rule(dst.r, src.r, op, a));
    dst.g = core::store_truncated(Rule(dst.g, src.g, op, a));
    dst.b = core::store_truncated(Rule(dst.b, src.b, op, a));
}

// Hue and saturation of the source (saturation weighted by its alpha),
// lightness from the destination's luminance; returns the opaque colour to
// mix with the destination.
inline VorColor color_mode_target(const VorColor& dst, const float src_hsl[3], int src_alpha) {
    float hsl[3];
    hsl[0] = src_hsl[0];
    hsl[1] = (src_hsl[1] * k_inv255) * static_cast<float>(src_alpha);
    hsl[2] = luminance(dst.r, dst.g, dst.b) * k_inv255;
    VorColor c;
    VorColorHSL2RGB(hsl, &c);
    return c;
}

inline float mix_color_mode(int b, int c, float op, float a) {
    return a * static_cast<float>(b) + op * static_cast<float>(c);
}

}  // namespace

namespace {

template <ChannelRule Rule>
void fill_channel_row(int source_level, float op, std::uint8_t row[256]) {
    const float a = 1.0f - op;
    for (int b = 0; b < 256; ++b) row[b] = core::store_truncated(Rule(b, source_level, op, a));
}

}  // namespace

bool blend_channel_row(std::uint32_t mode, int source_level, float opacity, std::uint8_t row[256]) {
    return visit_channel_rule(
        mode, [&]<ChannelRule Rule>() { fill_channel_row<Rule>(source_level, opacity, row); });
}

ChannelPairTable::ChannelPairTable(std::uint32_t mode, float opacity) : mode_(mode), opacity_(opacity) {
    entries_.build(256, 256);
}

void ChannelPairTable::fill_row(std::uint8_t source) {
    blend_channel_row(mode_, source, opacity_, &entries_[std::size_t{source} << 8]);
    filled_[source] = true;
}

const std::uint8_t* ChannelPairTable::entries() {
    for (int s = 0; s < 256; ++s) row(static_cast<std::uint8_t>(s));
    return entries_.get();
}

void blend_grey_maps(const VorColor& src, std::uint32_t mode, float opacity, std::uint8_t red[256],
                     std::uint8_t green[256], std::uint8_t blue[256]) {
    if (blend_channel_row(mode, src.r, opacity, red)) {
        blend_channel_row(mode, src.g, opacity, green);
        blend_channel_row(mode, src.b, opacity, blue);
        return;
    }
    for (int v = 0; v < 256; ++v) {
        const auto level = static_cast<std::uint8_t>(v);
        VorColor grey{level, level, level, 255};
        VorColorBlend(&grey, &src, mode, opacity);
        red[v] = grey.r;
        green[v] = grey.g;
        blue[v] = grey.b;
    }
}

}  // namespace vorlite::color

using namespace vorlite::color;

extern "C" {

VOR_API void VorColorBlend(VorColor* dst, const VorColor* src, uint32_t mode, float opacity) {
    if (visit_channel_rule(mode, [&]<ChannelRule Rule>() { blend_channels<Rule>(*dst, *src, opacity); })) {
        return;
    }
    float hsl[3];
    VorColorRGB2HSL(src, hsl);
    const VorColor target = color_mode_target(*dst, hsl, src->a);
    blend_channels<mix_color_mode>(*dst, target, opacity);
}

VOR_API void VorColorBlendColorMode(VorColor* dst, const float srcHSL[3], int32_t srcAlpha,
                                    float opacity) {
    const VorColor target = color_mode_target(*dst, srcHSL, srcAlpha);
    const float a = 1.0f - opacity;
    // Stored as the truncated integer's low byte, without the clamp of
    // VorColorBlend; opacities within 0..1 keep every value inside 0..255.
    const auto store = [](float v) {
        return static_cast<std::uint8_t>(vorlite::core::truncate_clamped<int32_t>(v));
    };
    dst->r = store(mix_color_mode(dst->r, target.r, opacity, a));
    dst->g = store(mix_color_mode(dst->g, target.g, opacity, a));
    dst->b = store(mix_color_mode(dst->b, target.b, opacity, a));
}

VOR_API void VorColorBlendInitMemozied(VorColorBlendMemoTable* table, uint32_t mode) {
    table->mode = mode;
    for (std::uint8_t& flag : table->computed) flag = 0;
}

VOR_API void VorColorBlendMemoized(VorColor* dst, const VorColor* src, uint32_t level,
                                   VorColorBlendMemoTable* table) {
    const uint32_t l = level > 255 ? 255 : level;
    std::uint8_t(&maps)[3][256] = table->maps[l];
    if (table->computed[l] == 0) {
        table->computed[l] = 1;
        const float opacity = static_cast<float>(l) * k_inv255;
        blend_grey_maps(*src, table->mode, opacity, maps[0], maps[1], maps[2]);
    }
    dst->r = maps[0][dst->r];
    dst->g = maps[1][dst->g];
    dst->b = maps[2][dst->b];
}

}  // extern "C"
