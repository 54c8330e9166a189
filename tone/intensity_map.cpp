// The intensity map (a gradient map): each pixel's luminance picks a
// colour from a histogram map, and that opaque colour is blended back onto
// the pixel with a blend mode; and the "intensityMap" processor.
#include <array>

#include "color/color_internal.h"
#include "core/core_internal.h"
#include "proclist/proclist_internal.h"
#include "tone/tone_internal.h"

namespace vorlite::tone {
namespace {

using core::load_pixel;
using core::pixel_count;
using core::store_pixel;

// Luminance rounded to the level that indexes the map.
inline std::uint8_t luminance_level(const std::uint8_t* p) {
    const float y = color::luminance(p[0], p[1], p[2]);
    if (y <= 254.5f) return static_cast<std::uint8_t>(static_cast<int>(static_cast<double>(y) + 0.5));
    return 255;
}

VorColor mapped_colour(const VorHistMap& map, std::uint8_t level) {
    return VorColor{map.map[0][level], map.map[1][level], map.map[2][level], 255};
}

// Any mode but the colour mode through the mode's channel-pair table, whose
// rows are filled as levels first need them: a photo costs at most 65,536
// blends instead of one per pixel.
void intensity_map_by_table(VorBitmap* bitmap, const VorHistMap& map, color::ChannelPairTable& table) {
    // Per luminance level, the three result rows of its mapped colour.
    std::array<std::array<const std::uint8_t*, 3>, 256> rows{};
    core::for_each_pixel(bitmap->data, pixel_count(*bitmap), [&](std::uint8_t* p) {
        const std::uint8_t level = luminance_level(p);
        auto& level_rows = rows[level];
        if (level_rows[0] == nullptr) {
            for (int c = 0; c < 3; ++c) level_rows[c] = table.row(map.map[c][level]);
        }
        // All three read before any is stored: the table lies apart from the
        // bitmap, and the stores then merge.
        const std::uint8_t r = level_rows[0][p[0]], g = level_rows[1][p[1]], b = level_rows[2][p[2]];
        p[0] = r;
        p[1] = g;
        p[2] = b;
    });
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

void intensity_map_per_pixel(VorBitmap* bitmap, const VorHistMap& map, std::uint32_t mode, float opacity) {
    std::uint8_t* p = bitmap->data;
    const std::size_t n = pixel_count(*bitmap);
    for (std::size_t i = 0; i < n; ++i, p += 4) {
        const VorColor layer = mapped_colour(map, luminance_level(p));
        VorColor base = load_pixel(p);
        VorColorBlend(&base, &layer, mode, opacity);
        store_pixel(p, base);
    }
}

}  // namespace vorlite::tone

using namespace vorlite::tone;

extern "C" {

VOR_API void VorBitmapIntensityMap(VorBitmap* bitmap, const VorHistMap* map, uint32_t mode,
                                   double alpha) {
    const auto opacity = static_cast<float>(alpha);
    if (mode != VOR_BLEND_COLOR) {
        vorlite::color::ChannelPairTable table(mode, opacity);
        if (table.valid()) {
            intensity_map_by_table(bitmap, *map, table);
            return;
        }
    } else if (opacity >= 0.0f && opacity <= 1.0f) {
        intensity_map_colour(bitmap, *map, opacity);
        return;
    }
    intensity_map_per_pixel(bitmap, *map, mode, opacity);
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
