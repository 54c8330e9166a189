// The intensity map (a gradient map): each pixel's luminance picks a
// colour from a histogram map, and that opaque colour is blended back onto
// the pixel with a blend mode; and the "intensityMap" processor.
#include <array>

#include "color/color_internal.h"
#include "core/core_internal.h"
#include "proclist/proclist_internal.h"
#include "tone/tone_internal.h"

namespace {

using vorlite::core::load_pixel;
using vorlite::core::pixel_count;
using vorlite::core::store_pixel;

// Luminance rounded to the level that indexes the map.
inline std::uint8_t luminance_level(const std::uint8_t* p) {
    const float y = (p[1] * 0.71516f + p[0] * 0.212671f) + p[2] * 0.072169f;
    if (y <= 254.5f) return static_cast<std::uint8_t>(static_cast<int>(static_cast<double>(y) + 0.5));
    return 255;
}

VorColor mapped_colour(const VorHistMap& map, std::uint8_t level) {
    return VorColor{map.map[0][level], map.map[1][level], map.map[2][level], 255};
}

// result[S][B] of blending source byte S over destination byte B, for any
// mode but the colour mode (whose channels depend on each other), each row
// filled when a pixel first needs it, so a photo costs at most 65536 blends
// instead of one per pixel.
class BlendTable {
public:
    BlendTable(std::uint32_t mode, float opacity) : mode_(mode), opacity_(opacity) {}

    const std::uint8_t* row(std::uint8_t source) {
        auto& r = rows_[source];
        if (!filled_[source]) {
            filled_[source] = true;
            vorlite::color::blend_channel_row(mode_, source, opacity_, r.data());
        }
        return r.data();
    }

private:
    std::uint32_t mode_;
    float opacity_;
    std::array<bool, 256> filled_{};
    std::array<std::array<std::uint8_t, 256>, 256> rows_;
};

void intensity_map_by_table(VorBitmap* bitmap, const VorHistMap& map, std::uint32_t mode,
                            float opacity) {
    BlendTable table(mode, opacity);
    // Per luminance level, the three result rows of its mapped colour.
    std::array<std::array<const std::uint8_t*, 3>, 256> rows{};
    vorlite::core::for_each_pixel(bitmap->data, pixel_count(*bitmap), [&](std::uint8_t* p) {
        const std::uint8_t level = luminance_level(p);
        auto& level_rows = rows[level];
        if (level_rows[0] == nullptr) {
            for (int c = 0; c < 3; ++c) level_rows[c] = table.row(map.map[c][level]);
        }
        p[0] = level_rows[0][p[0]];
        p[1] = level_rows[1][p[1]];
        p[2] = level_rows[2][p[2]];
    });
}

void intensity_map_per_pixel(VorBitmap* bitmap, const VorHistMap& map, std::uint32_t mode,
                             float opacity) {
    std::uint8_t* p = bitmap->data;
    const std::size_t n = pixel_count(*bitmap);
    for (std::size_t i = 0; i < n; ++i, p += 4) {
        const VorColor layer = mapped_colour(map, luminance_level(p));
        VorColor base = load_pixel(p);
        VorColorBlend(&base, &layer, mode, opacity);
        store_pixel(p, base);
    }
}

// The colour mode through VorColorBlendColorMode, with each level's mapped
// colour converted to hue, saturation and lightness once. Only for
// opacities within 0..1, where its unclamped store equals the clamped one.
void intensity_map_colour(VorBitmap* bitmap, const VorHistMap& map, float opacity) {
    std::array<std::array<float, 3>, 256> hsl;
    std::array<bool, 256> converted{};
    std::uint8_t* p = bitmap->data;
    const std::size_t n = pixel_count(*bitmap);
    for (std::size_t i = 0; i < n; ++i, p += 4) {
        const std::uint8_t level = luminance_level(p);
        if (!converted[level]) {
            converted[level] = true;
            const VorColor layer = mapped_colour(map, level);
            VorColorRGB2HSL(&layer, hsl[level].data());
        }
        VorColor base = load_pixel(p);
        VorColorBlendColorMode(&base, hsl[level].data(), 255, opacity);
        store_pixel(p, base);
    }
}

}  // namespace

extern "C" {

VOR_API void VorBitmapIntensityMap(VorBitmap* bitmap, const VorHistMap* map, uint32_t mode,
                                   double alpha) {
    const auto opacity = static_cast<float>(alpha);
    if (mode != VOR_BLEND_COLOR) {
        intensity_map_by_table(bitmap, *map, mode, opacity);
    } else if (mode == VOR_BLEND_COLOR && opacity >= 0.0f && opacity <= 1.0f) {
        intensity_map_colour(bitmap, *map, opacity);
    } else {
        intensity_map_per_pixel(bitmap, *map, mode, opacity);
    }
}

VOR_API int VLPLRunIntensityMapProcessor(const yajl_val parameters, VorBitmap* bitmap,
                                         const VLPLRunOptions* options) {
    using vorlite::proclist::member;
    if (parameters == nullptr || !YAJL_IS_OBJECT(parameters)) return 0;
    const yajl_val json_map = member(parameters, "histMap", yajl_t_object);
    vorlite::proclist::Layering layering;
    if (json_map == nullptr || !vorlite::proclist::member_layering(parameters, &layering)) return 0;
    VorHistMap map;
    if (!VLPLHistMapfromHistMapVal(json_map, &map)) return 0;
    // The strength both pulls the map toward identity and scales the
    // opacity, so a weak run is weaker than either alone.
    VorHistMapFade(&map, options->strength);
    VorBitmapIntensityMap(bitmap, &map, layering.mode, layering.alpha * options->strength);
    return 1;
}

}  // extern "C"
