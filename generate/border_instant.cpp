// The instant-print frame: an even margin on three sides and a deep one at
// the bottom, in the record's colour (an off-white card), with a faint
// shade where the card meets the picture and a trace of paper grain.
#include <algorithm>
#include <cstdint>

#include "core/core_internal.h"

namespace {

// Margins as shares of width + height: 3.2 % at the top and sides, three
// and a half times that at the bottom, where an instant print is held.
constexpr float k_side_margin = 0.032f;
constexpr float k_bottom_factor = 3.5f;
// The edge shade: 3 pixels deep per 1000 of width + height, at most a
// fifth of the colour's weight darker.
constexpr float k_shade_depth = 0.003f;
constexpr float k_shade_strength = 0.2f;

}  // namespace

extern "C" {

VOR_API void VorBordersInstant(VorBitmap* bitmap, const VorBorderParams* params) {
    const std::uint32_t width = bitmap->width;
    const std::uint32_t height = bitmap->height;
    if (width < 2 || height < 2) return;
    const auto sum = static_cast<float>(static_cast<std::uint64_t>(width) + height);
    const double w = params->width;
    const float scale = (w == w && w > 0.0 && w < 4.0) ? static_cast<float>(w) : 1.0f;
    const float shorter = static_cast<float>(std::min(width, height));
    const float side = std::min(k_side_margin * scale * sum, 0.2f * shorter);
    const float bottom = std::min(side * k_bottom_factor, 0.45f * static_cast<float>(height));
    const float shade = std::max(1.0f, k_shade_depth * sum);
    const VorColor card = params->color;
    const auto mode = static_cast<std::uint32_t>(params->blendMode);
    const float opacity = static_cast<float>(card.a) * vorlite::core::k_inv255;
    VorRNG rng;
    VorRNGSeed(&rng, params->seed);
    std::uint8_t* p = bitmap->data;
    for (std::uint32_t y = 0; y < height; ++y) {
        const float from_top = static_cast<float>(y);
        const float from_bottom = static_cast<float>(height - 1 - y);
        for (std::uint32_t x = 0; x < width; ++x, p += 4) {
            const float from_left = static_cast<float>(x);
            const float from_right = static_cast<float>(width - 1 - x);
            // How far inside the picture's opening, negative on the card.
            const float inside = std::min({from_top - side, from_bottom - bottom, from_left - side, from_right - side});
            if (inside >= shade) continue;
            VorColor out = vorlite::core::load_pixel(p);
            if (inside < 0.0f) {
                // Card: the colour with a grain of about one level.
                const float grain = (VorRNGNextFloat(&rng) - 0.5f) * 3.0f;
                const VorColor fibre{vorlite::core::store_truncated(card.r + grain),
                                     vorlite::core::store_truncated(card.g + grain),
                                     vorlite::core::store_truncated(card.b + grain), card.a};
                VorColorBlend(&out, &fibre, mode, opacity);
            } else {
                // The picture's edge, shaded as if set a little below the card.
                const float u = 1.0f - inside / shade;
                const VorColor dark{0, 0, 0, 255};
                VorColorBlend(&out, &dark, VOR_BLEND_NORMAL, k_shade_strength * u * u);
            }
            vorlite::core::store_pixel(p, out);
        }
    }
}

}  // extern "C"
