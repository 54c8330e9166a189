// The tintype: a mottled plate, a diamond-square texture stretched over
// the photo and laid on in overlay so its blotches lighten and darken the
// picture without greying it; and the plate's brown-toned colour matrix.
#include <cstddef>
#include <cstdint>
#include <utility>

#include "color/color_internal.h"
#include "core/core_internal.h"
#include "zentra_vorlite.h"

namespace vorlite::legacy {
namespace {

// The texture is drawn once at 257 x 257 and stretched: the plate's
// mottling is a few dozen blotches across whatever the resolution.
constexpr std::uint32_t k_plate = 257;
constexpr float k_plate_amplitude = 170.0f;
constexpr float k_plate_roughness = 0.85f;
constexpr float k_plate_opacity = 0.75f;

// Where column (or row) i of n falls on the plate: the texture cell and the
// weight of the next one.
struct Tap {
    std::uint32_t cell;
    float t;
};

void stretch_taps(std::uint32_t n, Tap* taps) {
    const float step = n > 1 ? static_cast<float>(k_plate - 1) / static_cast<float>(n - 1) : 0.0f;
    for (std::uint32_t i = 0; i < n; ++i) {
        const float u = static_cast<float>(i) * step;
        auto cell = static_cast<std::uint32_t>(u);
        if (cell >= k_plate - 1) cell = k_plate - 2;
        taps[i] = {cell, u - static_cast<float>(cell)};
    }
}

}  // namespace
}  // namespace vorlite::legacy

using namespace vorlite;

extern "C" {

VOR_API void VorLegacyGlimmoTintypeDiamondSquare(VorBitmap* bitmap, const VLPLRunOptions* options) {
    if (bitmap == nullptr || bitmap->data == nullptr || bitmap->width == 0 || bitmap->height == 0 ||
        options == nullptr || !(options->strength > 0.0)) {
        return;
    }
    const float strength = options->strength > 1.0 ? 1.0f : static_cast<float>(options->strength);
    core::WorkingBitmap plate;
    core::WorkingArray<float> edge_a, edge_b;
    core::WorkingArray<legacy::Tap> columns, rows;
    if (!plate.build(legacy::k_plate, legacy::k_plate) || !edge_a.build(legacy::k_plate) ||
        !edge_b.build(legacy::k_plate) || !columns.build(bitmap->width) || !rows.build(bitmap->height)) {
        return;
    }
    VorBitmapDiamondSquare(plate.get(), legacy::k_plate_amplitude, legacy::k_plate_roughness, edge_a.get(),
                           edge_b.get());
    // The texture itself is fixed; the seed picks one of its eight
    // orientations, so plates differ from photo to photo.
    const std::uint32_t orientation = options->seed % 8u;
    const bool flip_x = (orientation & 1u) != 0;
    const bool flip_y = (orientation & 2u) != 0;
    const bool swap = (orientation & 4u) != 0;
    const std::uint8_t* texels = plate.get()->data;
    const auto texel = [&](std::uint32_t u, std::uint32_t v) {
        if (flip_x) u = legacy::k_plate - 1 - u;
        if (flip_y) v = legacy::k_plate - 1 - v;
        if (swap) std::swap(u, v);
        return static_cast<float>(texels[(static_cast<std::size_t>(v) * legacy::k_plate + u) * 4]);
    };
    legacy::stretch_taps(bitmap->width, columns.get());
    legacy::stretch_taps(bitmap->height, rows.get());
    color::ChannelPairTable overlay(VOR_BLEND_OVERLAY, legacy::k_plate_opacity * strength);
    if (!overlay.valid()) return;
    const std::uint8_t* table = overlay.entries();
    for (std::uint32_t y = 0; y < bitmap->height; ++y) {
        const legacy::Tap ty = rows[y];
        std::uint8_t* p = bitmap->data + static_cast<std::size_t>(y) * bitmap->width * 4;
        for (std::uint32_t x = 0; x < bitmap->width; ++x, p += 4) {
            const legacy::Tap tx = columns[x];
            const float a = texel(tx.cell, ty.cell);
            const float b = texel(tx.cell + 1, ty.cell);
            const float c = texel(tx.cell, ty.cell + 1);
            const float d = texel(tx.cell + 1, ty.cell + 1);
            const float top = a + (b - a) * tx.t;
            const float bottom = c + (d - c) * tx.t;
            const std::uint8_t level = core::store_rounded(top + (bottom - top) * ty.t);
            const std::uint8_t* row = table + (std::size_t{level} << 8);
            p[0] = row[p[0]];
            p[1] = row[p[1]];
            p[2] = row[p[2]];
        }
    }
}

// The tintype's brown-toned monochrome: every channel a warm mix of all
// three, green weighted most.
VOR_API void VorLegacyGlimmoTintypeColorMatrixTransform(VorBitmap* bitmap, const VLPLRunOptions* /*options*/) {
    const VorColorMatrix matrix = {{0.6965f, 0.3845f, 0.0945f, 0.0f, 0.1745f, 0.843f, 0.084f, 0.0f, 0.136f, 0.267f,
                                    0.5655f, 0.0f}};
    VorBitmapColorMatrixTransform(bitmap, &matrix);
}

}  // extern "C"
