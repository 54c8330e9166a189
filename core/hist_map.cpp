// Histogram maps: three 256-level lookup tables, one per colour channel,
// their composition and fade, and their application to a bitmap. Every
// table-driven pass of the library ends here.
#include <bit>
#include <cstring>

#include "core_internal.h"

namespace {

constexpr int k_levels = 256;

// Below this many pixels, building the word tables costs more than it saves.
constexpr std::size_t k_word_table_pixels = 1024;

// The three maps as whole-pixel words: each entry holds the mapped level
// already in its channel's byte of a little-endian pixel, so a pixel is one
// load, three table reads OR-ed with its own alpha, and one store, instead
// of three byte loads, three table reads and three byte stores. The bytes
// are the per-channel lookups' exactly.
struct WordTables {
    std::uint32_t channel[3][k_levels];

    explicit WordTables(const VorHistMap& map) {
        for (int c = 0; c < 3; ++c)
            for (int i = 0; i < k_levels; ++i)
                channel[c][i] = static_cast<std::uint32_t>(map.map[c][i]) << (8 * c);
    }

    std::uint32_t apply(std::uint32_t pixel) const {
        return channel[0][pixel & 0xFFu] | channel[1][(pixel >> 8) & 0xFFu] | channel[2][(pixel >> 16) & 0xFFu] |
               (pixel & 0xFF000000u);
    }
};

void transform_words(std::uint8_t* data, std::size_t n, const VorHistMap& map) {
    const WordTables tables(map);
    vorlite::core::for_each_pixel(data, n, [&tables](std::uint8_t* p) {
        std::uint32_t pixel;
        std::memcpy(&pixel, p, 4);
        pixel = tables.apply(pixel);
        std::memcpy(p, &pixel, 4);
    });
}

}  // namespace

namespace vorlite::core {

void histogram_transform_reference(VorBitmap* bitmap, const VorHistMap& map) {
    const std::uint8_t* red = map.map[0];
    const std::uint8_t* green = map.map[1];
    const std::uint8_t* blue = map.map[2];
    for_each_pixel(bitmap->data, pixel_count(*bitmap), [&](std::uint8_t* p) {
        p[0] = red[p[0]];
        p[1] = green[p[1]];
        p[2] = blue[p[2]];
    });
}

void apply_curve(VorBitmap* bitmap, const Curve& curve) {
    VorHistMap map;
    VorHistMapSet(&map, curve.data(), curve.data(), curve.data());
    VorBitmapHistogramTransform(bitmap, &map);
}

}  // namespace vorlite::core

extern "C" {

VOR_API void VorHistMapSetIdentity(VorHistMap* map) {
    for (auto& table : map->map) {
        for (int i = 0; i < k_levels; ++i) table[i] = static_cast<std::uint8_t>(i);
    }
}

VOR_API void VorHistMapSet(VorHistMap* map, const uint8_t red[256], const uint8_t green[256],
                           const uint8_t blue[256]) {
    // memmove: a caller may hand in tables of the map itself.
    std::memmove(map->map[0], red, k_levels);
    std::memmove(map->map[1], green, k_levels);
    std::memmove(map->map[2], blue, k_levels);
}

VOR_API void VorHistMapMap(VorHistMap* map, const VorHistMap* second) {
    for (int c = 0; c < 3; ++c) {
        std::uint8_t* table = map->map[c];
        const std::uint8_t* then = second->map[c];
        for (int i = 0; i < k_levels; ++i) table[i] = then[table[i]];
    }
}

VOR_API void VorHistMapFade(VorHistMap* map, double amount) {
    if (amount == 1.0) return;
    const double keep = 1.0 - amount;
    for (int i = 0; i < k_levels; ++i) {
        const double w = i * keep;
        for (auto& table : map->map) {
            table[i] = vorlite::core::store_rounded(table[i] * amount + w);
        }
    }
}

VOR_API void VorBitmapHistogramTransform(VorBitmap* bitmap, const VorHistMap* map) {
    const std::size_t n = vorlite::core::pixel_count(*bitmap);
    if constexpr (std::endian::native == std::endian::little) {
        if (n >= k_word_table_pixels) {
            transform_words(bitmap->data, n, *map);
            return;
        }
    }
    vorlite::core::histogram_transform_reference(bitmap, *map);
}

}  // extern "C"
