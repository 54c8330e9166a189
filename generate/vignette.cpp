// The vignette (border style 15): the colour laid over the picture with a
// smooth ramp from a clear centre to full strength beyond the radius; and
// the "vignette" processor.
#include "core/core_internal.h"
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
    // picture's proportions); the row's share is formed once a row.
    template <bool Stretch, std::int32_t Mode>
    void draw() const {
        const std::uint32_t width = bitmap->width;
        const std::uint32_t height = bitmap->height;
        const float full_opacity = static_cast<float>(colour.a) * vorlite::core::k_inv255;
        // The memo's level colour.a is that very opacity, and every mode but
        // the colour mode blends channel by channel, so the memo gives the
        // direct blend's bytes beyond the radius too.
        const bool memo_at_full = mode != VOR_BLEND_COLOR;
        const LevelMaps full = level_maps(memo, colour, colour.a);
        // Neighbouring pixels mostly share a level: the last one's maps are
        // kept at hand.
        std::uint32_t last_level = colour.a;
        LevelMaps last_maps = full;
        std::uint8_t* p = bitmap->data;
        for (std::uint32_t y = 0; y < height; ++y) {
            const std::int64_t ey = static_cast<std::int64_t>(y) - cy;
            const std::int64_t ey2 = ey * ey;
            const float row_share = static_cast<float>(ey2) * ih;
            for (std::uint32_t x = 0; x < width; ++x, p += 4) {
                const std::int64_t ex = static_cast<std::int64_t>(x) - cx;
                const std::int64_t ex2 = ex * ex;
                const float distance =
                    Stretch ? (static_cast<float>(ex2) * iw + row_share) * k : static_cast<float>(ex2 + ey2) * k;
                const float t = shaped<Mode>(distance);
                if (!(t >= k_vignette_start)) continue;
                LevelMaps maps = full;
                if (!(t > k_vignette_full)) {
                    const std::uint32_t level = ramp_level(t, colour.a);
                    if (level != last_level) {
                        last_level = level;
                        last_maps = level_maps(memo, colour, level);
                    }
                    maps = last_maps;
                } else if (!memo_at_full) {
                    VorColor out = vorlite::core::load_pixel(p);
                    VorColorBlend(&out, &colour, mode, full_opacity);
                    vorlite::core::store_pixel(p, out);
                    continue;
                }
                p[0] = maps[0][p[0]];
                p[1] = maps[1][p[1]];
                p[2] = maps[2][p[2]];
            }
        }
    }

    template <bool Stretch>
    void draw_shaped(std::int32_t shape_mode) const {
        switch (shape_mode) {
            case VOR_SHAPE_SHARP:
                draw<Stretch, VOR_SHAPE_SHARP>();
                return;
            case VOR_SHAPE_MEDIUM_SHARP:
                draw<Stretch, VOR_SHAPE_MEDIUM_SHARP>();
                return;
            case VOR_SHAPE_ULTRA_SHARP:
                draw<Stretch, VOR_SHAPE_ULTRA_SHARP>();
                return;
            default:
                draw<Stretch, VOR_SHAPE_NORMAL>();
                return;
        }
    }
};

}  // namespace

extern "C" {

VOR_API void VorVignette(VorBitmap* bitmap, const VorBorderParams* params) {
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
                            vorlite::generate::vignette_scale(params->vignetteScale),
                            1.0f / (w * w),
                            1.0f / (h * h),
                            static_cast<std::int64_t>(width / 2) + vorlite::generate::vignette_offset(width, params->dx),
                            static_cast<std::int64_t>(height / 2) + vorlite::generate::vignette_offset(height, params->dy)};
    if (params->stretch != 0) {
        vignette.draw_shaped<true>(params->shapeMode);
    } else {
        vignette.draw_shaped<false>(params->shapeMode);
    }
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
