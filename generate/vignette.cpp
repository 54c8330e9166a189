// The vignette (border style 15): the colour laid over the picture with a
// smooth ramp from a clear centre to full strength beyond the radius; and
// the "vignette" processor.
#include <algorithm>

#include "core/core_internal.h"
#include "core/simd.h"
#include "generate/generate_internal.h"
#include "proclist/proclist_internal.h"

namespace {

using vorlite::generate::k_vignette_full;
using vorlite::generate::k_vignette_start;

// The memo's three channel maps at a level, filled on first use: a
// memoized blend is exactly these three lookups.
using LevelMaps = const std::uint8_t (*)[256];
LevelMaps level_maps(VorColorBlendMemoTable* memo, const VorColor& colour, std::uint32_t level) {
    if (memo->computed[level] == 0) {
        VorColor scratch{0, 0, 0, 0};
        VorColorBlendMemoized(&scratch, &colour, level, memo);
    }
    return memo->maps[level];
}

// The ramp's opacity level for the memoized blend.
std::uint32_t ramp_level(float t, std::uint8_t alpha) {
    const auto level = vorlite::core::truncate_clamped<std::int32_t>(
        vorlite::generate::vignette_ramp(t) * static_cast<float>(alpha));
    return static_cast<std::uint32_t>(vorlite::core::clamp_byte(level));
}

// Sharper modes bend t before the ramp reads it; a compile-time copy per
// mode keeps the choice out of the pixel loop.
template <std::int32_t Mode>
float shaped(float t) {
    return vorlite::generate::shape_vignette(t, Mode);
}

// What the vignette does at a pixel: a ramp level 0..255, the full colour,
// or nothing (the clear centre).
constexpr std::uint16_t k_code_full = 256;
constexpr std::uint16_t k_code_clear = 257;

template <std::int32_t Mode>
std::uint16_t code_of(float distance, std::uint8_t alpha) {
    const float t = shaped<Mode>(distance);
    if (!(t >= k_vignette_start)) return k_code_clear;
    if (t > k_vignette_full) return k_code_full;
    return static_cast<std::uint16_t>(ramp_level(t, alpha));
}

#if VORLITE_EXACT_FLOAT_LANES
namespace simd = vorlite::core::simd;

template <std::int32_t Mode>
simd::f32x4 shaped_lanes(simd::f32x4 t) {
    if constexpr (Mode == VOR_SHAPE_SHARP) {
        return t * t;
    } else if constexpr (Mode == VOR_SHAPE_ULTRA_SHARP) {
        const simd::f32x4 square = t * t;
        return square * square;
    } else if constexpr (Mode == VOR_SHAPE_MEDIUM_SHARP) {
        for (int i = 0; i < 4; ++i) t[i] = shaped<Mode>(t[i]);
        return t;
    } else {
        return t;
    }
}

// code_of on four pixels at once: the same float operations lane by lane.
// The ramp's product is clamped to 0..255 before truncating, which is the
// scalar's truncate-then-clamp for every finite value (NaN cannot reach
// the ramp: it fails the first test).
template <std::int32_t Mode>
void codes_of_lanes(simd::f32x4 distance, std::uint8_t alpha, std::uint16_t* out) {
    const simd::f32x4 t = shaped_lanes<Mode>(distance);
    const simd::f32x4 u = t * t;
    const simd::f32x4 u2 = u * u;
    const simd::f32x4 u3 = u2 * u;
    const simd::f32x4 u4 = u3 * u;
    const simd::f32x4 u5 = u4 * u;
    using vorlite::core::float_bits;
    const simd::f32x4 p = (((simd::splat(float_bits(0x3FD55555u)) * u2 - simd::splat(2.0f) * u) +
                            simd::splat(float_bits(0x3E534D35u)) * u4) -
                           simd::splat(float_bits(0x3F416C17u)) * u3) -
                          simd::splat(float_bits(0x3D148670u)) * u5;
    simd::f32x4 level = -p * simd::splat(static_cast<float>(alpha));
    level = simd::min_or_bound(simd::max_or_bound(level, simd::splat(0.0f)), simd::splat(255.0f));
    simd::i32x4 code = __builtin_convertvector(level, simd::i32x4);
    const simd::i32x4 full = t > simd::splat(k_vignette_full);
    const simd::i32x4 started = t >= simd::splat(k_vignette_start);
    code = full ? simd::i32x4{k_code_full, k_code_full, k_code_full, k_code_full} : code;
    code = started ? code : simd::i32x4{k_code_clear, k_code_clear, k_code_clear, k_code_clear};
    for (int i = 0; i < 4; ++i) out[i] = static_cast<std::uint16_t>(code[i]);
}
#endif

struct Vignette {
    VorBitmap* bitmap;
    VorColorBlendMemoTable* memo;
    VorColor colour;
    std::uint32_t mode;
    float k;
    float iw;
    float ih;
    std::int64_t cx;
    std::int64_t cy;

    // Squared distance from the centre on the vignette's scale: in pixels,
    // or with x and y normalised by the width and height (an ellipse of the
    // picture's proportions). The column's share is formed once per column
    // and the row's once a row; a pixel adds them in the same order.
    template <bool Stretch, std::int32_t Mode>
    void span_codes(std::uint32_t y, std::uint32_t x, std::uint32_t end, const float* column_share,
                    const std::int64_t* column_square, std::uint16_t* codes, bool lanes) const {
        const std::uint32_t width = bitmap->width;
        const std::int64_t ey = static_cast<std::int64_t>(y) - cy;
        const std::int64_t ey2 = ey * ey;
        const float row_share = static_cast<float>(ey2) * ih;
#if VORLITE_EXACT_FLOAT_LANES
        // Without the stretch the pixel's squared distance is converted as a
        // whole: 32-bit lanes hold it exactly while it stays below 2^31.
        if (lanes && (Stretch || column_square[width] + ey2 < (std::int64_t{1} << 31))) {
            for (; x + 4 <= end; x += 4) {
                simd::f32x4 distance;
                if constexpr (Stretch) {
                    distance = (simd::load<simd::f32x4>(column_share + x) + simd::splat(row_share)) * simd::splat(k);
                } else {
                    const auto e = static_cast<std::int32_t>(ey2);
                    const simd::i32x4 sum = simd::i32x4{static_cast<std::int32_t>(column_square[x]),
                                                        static_cast<std::int32_t>(column_square[x + 1]),
                                                        static_cast<std::int32_t>(column_square[x + 2]),
                                                        static_cast<std::int32_t>(column_square[x + 3])} +
                                            simd::i32x4{e, e, e, e};
                    distance = __builtin_convertvector(sum, simd::f32x4) * simd::splat(k);
                }
                codes_of_lanes<Mode>(distance, colour.a, codes + x);
            }
        }
#else
        (void)lanes;
#endif
        for (; x < end; ++x) {
            const float distance = Stretch ? (column_share[x] + row_share) * k
                                           : static_cast<float>(column_square[x] + ey2) * k;
            codes[x] = code_of<Mode>(distance, colour.a);
        }
    }

    // A column and its mirror about the centre lie at the same distance
    // too: the half right of the centre is classified, the half left of it
    // copies, and only columns whose mirror falls outside are computed.
    template <bool Stretch, std::int32_t Mode>
    void row_codes(std::uint32_t y, const float* column_share, const std::int64_t* column_square,
                   std::uint16_t* codes, bool lanes) const {
        const std::int64_t width = bitmap->width;
        if (!lanes) {
            span_codes<Stretch, Mode>(y, 0, static_cast<std::uint32_t>(width), column_share, column_square, codes,
                                      false);
            return;
        }
        const auto middle = static_cast<std::uint32_t>(std::clamp<std::int64_t>(cx, 0, width));
        const auto mirrored = static_cast<std::uint32_t>(std::clamp<std::int64_t>(2 * cx - width + 1, 0, middle));
        span_codes<Stretch, Mode>(y, middle, static_cast<std::uint32_t>(width), column_share, column_square, codes,
                                  lanes);
        span_codes<Stretch, Mode>(y, 0, mirrored, column_share, column_square, codes, lanes);
        for (std::uint32_t x = mirrored; x < middle; ++x) codes[x] = codes[2 * cx - x];
    }

    template <bool Stretch, std::int32_t Mode>
    void draw(bool lanes) const {
        const std::uint32_t width = bitmap->width;
        const std::uint32_t height = bitmap->height;
        // Per column: ex^2 (and after the last column, the largest of them)
        // and its stretched share; per row: what each pixel takes.
        vorlite::core::WorkingArray<std::int64_t> column_square;
        vorlite::core::WorkingArray<float> column_share;
        vorlite::core::WorkingArray<std::uint16_t> codes;
        if (!column_square.build(width + 1) || !column_share.build(width) || !codes.build(width)) return;
        std::int64_t largest = 0;
        for (std::uint32_t x = 0; x < width; ++x) {
            const std::int64_t ex = static_cast<std::int64_t>(x) - cx;
            column_square[x] = ex * ex;
            column_share[x] = static_cast<float>(column_square[x]) * iw;
            if (column_square[x] > largest) largest = column_square[x];
        }
        column_square[width] = largest;
        const float full_opacity = static_cast<float>(colour.a) * vorlite::core::k_inv255;
        // The memo's level colour.a is that very opacity, and every mode but
        // the colour mode blends channel by channel, so the memo gives the
        // direct blend's bytes beyond the radius too.
        const std::uint16_t full_code =
            mode != VOR_BLEND_COLOR ? static_cast<std::uint16_t>(colour.a) : k_code_full;
        if (full_code != k_code_full) level_maps(memo, colour, full_code);
        // A large bitmap asks for most of the ramp's levels anyway: filling
        // all 256 up front (at most one blend for every 16 pixels) takes the
        // question out of the rows.
        const bool every_level =
            lanes && vorlite::core::pixel_count(*bitmap) >= std::size_t{256} * 768 * 16;
        if (every_level) {
            for (std::uint32_t level = 0; level < 256; ++level) level_maps(memo, colour, level);
        }
        const auto draw_row = [&](std::uint8_t* row) {
            const std::uint16_t* code = codes.get();
            vorlite::core::for_each_pixel(row, width, [&](std::uint8_t* p) {
                std::uint16_t c = *code++;
                if (c == k_code_full) c = full_code;
                if (c < k_code_full) {
                    vorlite::core::map_pixel(p, memo->maps[c]);
                } else if (c == k_code_full) {
                    VorColor out = vorlite::core::load_pixel(p);
                    VorColorBlend(&out, &colour, mode, full_opacity);
                    vorlite::core::store_pixel(p, out);
                }
            });
        };
        // A row and its mirror about the centre lie at the same distances,
        // so one classification serves both.
        const std::size_t stride = std::size_t{width} * 4;
        for (std::uint32_t y = 0; y < height; ++y) {
            const std::int64_t ey = static_cast<std::int64_t>(y) - cy;
            const std::int64_t mirror = cy - ey;
            if (ey > 0 && mirror >= 0) continue;
            row_codes<Stretch, Mode>(y, column_share.get(), column_square.get(), codes.get(), lanes);
            if (!every_level) settle_levels(codes.get(), width);
            draw_row(bitmap->data + y * stride);
            if (ey < 0 && mirror < static_cast<std::int64_t>(height)) {
                draw_row(bitmap->data + static_cast<std::size_t>(mirror) * stride);
            }
        }
    }

    // Fills every ramp level a row uses before the row is drawn, so the
    // pixel loop reads the memo's maps without asking. Neighbouring codes
    // differ every few pixels, so the memo's own flag is asked rather than
    // whether the code changed: that answer is nearly always the same, and
    // the branch predicts.
    void settle_levels(const std::uint16_t* codes, std::uint32_t width) const {
        for (std::uint32_t x = 0; x < width; ++x) {
            const std::uint16_t c = codes[x];
            if (c < k_code_full && memo->computed[c] == 0) level_maps(memo, colour, c);
        }
    }

    template <bool Stretch>
    void draw_shaped(std::int32_t shape_mode, bool lanes) const {
        switch (shape_mode) {
            case VOR_SHAPE_SHARP:
                draw<Stretch, VOR_SHAPE_SHARP>(lanes);
                return;
            case VOR_SHAPE_MEDIUM_SHARP:
                draw<Stretch, VOR_SHAPE_MEDIUM_SHARP>(lanes);
                return;
            case VOR_SHAPE_ULTRA_SHARP:
                draw<Stretch, VOR_SHAPE_ULTRA_SHARP>(lanes);
                return;
            default:
                draw<Stretch, VOR_SHAPE_NORMAL>(lanes);
                return;
        }
    }
};

}  // namespace

namespace vorlite::generate {

void draw_vignette(VorBitmap* bitmap, const VorBorderParams* params, bool lanes) {
    const std::uint32_t width = bitmap->width;
    const std::uint32_t height = bitmap->height;
    if (width == 0 || height < 1) return;
    vorlite::core::WorkingArray<VorColorBlendMemoTable> memo;
    if (!memo.build(1)) return;
    const auto mode = static_cast<std::uint32_t>(params->blendMode);
    VorColorBlendInitMemozied(memo.get(), mode);
    const float w = static_cast<float>(width);
    const float h = static_cast<float>(height);
    const Vignette vignette{bitmap,
                            memo.get(),
                            params->color,
                            mode,
                            vignette_scale(params->vignetteScale),
                            1.0f / (w * w),
                            1.0f / (h * h),
                            static_cast<std::int64_t>(width / 2) + vignette_offset(width, params->dx),
                            static_cast<std::int64_t>(height / 2) + vignette_offset(height, params->dy)};
    if (params->stretch != 0) {
        vignette.draw_shaped<true>(params->shapeMode, lanes);
    } else {
        vignette.draw_shaped<false>(params->shapeMode, lanes);
    }
}

}  // namespace vorlite::generate


extern "C" {

VOR_API void VorVignette(VorBitmap* bitmap, const VorBorderParams* params) {
    vorlite::generate::draw_vignette(bitmap, params, true);
}

// "vignette": "color" (colour), "shape" (the vignette's shape object),
// "blendMode" optional. The strength divides the radius.
VOR_API int VLPLRunVignetteProcessor(const yajl_val parameters, VorBitmap* bitmap,
                                     const VLPLRunOptions* options) {
    using vorlite::proclist::member;
    if (parameters == nullptr || !YAJL_IS_OBJECT(parameters)) return 0;
    const yajl_val colour_value = member(parameters, "color", yajl_t_object);
    const yajl_val shape = member(parameters, "shape", yajl_t_object);
    if (colour_value == nullptr || shape == nullptr) return 0;
    int mode = 0;
    VorColor colour;
    VLPLBlendModeFromBlendModeVal(member(parameters, "blendMode", yajl_t_any), &mode);
    if (!VLPLColorFromColorVal(colour_value, &colour)) return 0;
    VorBorderParams border;
    VorBorderInitParams(&border);
    border.style = VOR_BORDER_VIGNETTE;
    border.color = colour;
    border.blendMode = mode;
    if (!VLPLBorderPopoulateWithShapeTypeVal(shape, &border, bitmap, static_cast<float>(options->strength), 1)) {
        return 0;
    }
    VorBorders(bitmap, &border);
    return 1;
}

}  // extern "C"
