// Lights composed from flares: the ring of light (a lens ghost, or the
// lamp of a camera display) and the two preset flares of the named
// effects, a low sun with its ghost and a warm leak of light at an edge.
#include <algorithm>
#include <cmath>
#include <cstdint>

#include "core/core_internal.h"

namespace {

// The ring's band is an eighth of its radius thick (at least a pixel);
// inside, a glow at a third of the ring's strength fills the disc.
constexpr float k_ring_thickness = 0.12f;
constexpr float k_glow_radius = 0.7f;
constexpr float k_glow_share = 0.35f;
// Beyond 1.4 radii, and 2.5 band widths outside the ring, both have faded
// below a level.
constexpr float k_ring_reach = 1.4f;
constexpr float k_band_reach = 2.5f;

std::uint32_t clamp_to(float v, std::uint32_t size) {
    if (!(v > 0.0f)) return 0;
    if (v >= static_cast<float>(size)) return size;
    return static_cast<std::uint32_t>(v);
}

std::uint8_t weighted_alpha(double alpha, double strength) {
    return vorlite::core::clamp_byte(vorlite::core::truncate_clamped<std::int32_t>(alpha * strength));
}

// The generator that places a preset's light. Hosts often number their
// seeds 0, 1, 2 ..., whose first states agree in their high bits; spreading
// the seed first makes neighbouring seeds pick different sides.
VorRNG placement_rng(std::uint32_t seed) {
    VorRNG rng;
    VorRNGSeed(&rng, seed * 2654435761u + 0x9E3779B9u);
    return rng;
}

}  // namespace

extern "C" {

VOR_API void VorRingFlare(VorBitmap* bitmap, float cx, float cy, float radius, const VorColor* color,
                          uint32_t blendMode) {
    if (color->a == 0 || !(radius > 0.0f) || !(radius < 1e7f)) return;
    if (!(std::fabs(cx) < 1e9f) || !(std::fabs(cy) < 1e9f)) return;
    const float thickness = std::max(1.0f, radius * k_ring_thickness);
    const float reach = std::max(radius * k_ring_reach, radius + k_band_reach * thickness);
    const std::uint32_t x0 = clamp_to(cx - reach, bitmap->width);
    const std::uint32_t x1 = clamp_to(cx + reach + 1.0f, bitmap->width);
    const std::uint32_t y0 = clamp_to(cy - reach, bitmap->height);
    const std::uint32_t y1 = clamp_to(cy + reach + 1.0f, bitmap->height);
    if (x0 >= x1 || y0 >= y1) return;
    vorlite::core::WorkingArray<VorColorBlendMemoTable> memo;
    if (!memo.build(1)) return;
    VorColorBlendInitMemozied(memo.get(), blendMode);
    const float glow = radius * k_glow_radius;
    const auto alpha = static_cast<float>(color->a);
    // Light below 1 / alpha is level 0: the band is dark where band^2 is
    // above ln(alpha), the glow where 2 inner^2 is above ln(share x alpha).
    const float band_dark = vorlite::core::logf(alpha);
    const float glow_dark = vorlite::core::logf(k_glow_share * alpha);
    for (std::uint32_t y = y0; y < y1; ++y) {
        const float dy = static_cast<float>(y) - cy;
        const float dy2 = dy * dy;
        std::uint8_t* p = bitmap->data + (static_cast<std::size_t>(y) * bitmap->width + x0) * 4;
        for (std::uint32_t x = x0; x < x1; ++x, p += 4) {
            const float dx = static_cast<float>(x) - cx;
            const float d = std::sqrt(dx * dx + dy2);
            const float band = (d - radius) / thickness;
            const float inner = d / glow;
            const float band_exponent = band * band;
            const float glow_exponent = 2.0f * inner * inner;
            if (band_exponent > band_dark && glow_exponent > glow_dark) continue;
            const float light = std::max(vorlite::core::expf(-band_exponent),
                                         k_glow_share * vorlite::core::expf(-glow_exponent));
            const auto level = static_cast<std::uint32_t>(light * alpha);
            if (level == 0) continue;
            VorColor out = vorlite::core::load_pixel(p);
            VorColorBlendMemoized(&out, color, level, memo.get());
            vorlite::core::store_pixel(p, out);
        }
    }
}

// A low sun near an upper corner (the seed picks which, and nudges it): a
// wide warm glow, a four-pointed star at its heart and a cool ring ghost
// mirrored through the middle of the picture, as a lens makes.
VOR_API void VorFlareLegacyCorvale(VorBitmap* bitmap, const VLPLRunOptions* options) {
    VorRNG rng = placement_rng(options->seed);
    const float side = (VorRNGNextInt(&rng) >> 31) != 0 ? 1.0f : -1.0f;
    const float dx = (0.64f + 0.16f * VorRNGNextFloat(&rng)) * side;
    const float dy = -0.6f - 0.15f * VorRNGNextFloat(&rng);
    const VorColor glow{255, 214, 160, weighted_alpha(200.0, options->strength)};
    const VorColor star{255, 244, 225, weighted_alpha(230.0, options->strength)};
    VorFlare(bitmap, 1.0f, &glow, VOR_FLARE_BLOB_2, dx, dy, 0.9f, 0.9f, VOR_BLEND_SCREEN);
    VorFlare(bitmap, 1.0f, &star, VOR_FLARE_STARDOM, dx, dy, 0.35f, 0.35f, VOR_BLEND_SCREEN);
    const float half_w = static_cast<float>(bitmap->width / 2);
    const float half_h = static_cast<float>(bitmap->height / 2);
    const VorColor ghost{180, 215, 255, weighted_alpha(110.0, options->strength)};
    const float radius = 0.05f * static_cast<float>(static_cast<std::uint64_t>(bitmap->width) + bitmap->height);
    VorRingFlare(bitmap, half_w - 0.45f * dx * half_w, half_h - 0.45f * dy * half_h, radius, &ghost,
                 VOR_BLEND_SCREEN);
}

// A warm leak of light along a side edge (the seed picks which), as when
// light reaches the film past the camera's door: an orange band with a
// brighter, yellower core near the middle of the edge.
VOR_API void VorFlareLegacyEmberly(VorBitmap* bitmap, const VLPLRunOptions* options) {
    VorRNG rng = placement_rng(options->seed);
    const float side = (VorRNGNextInt(&rng) >> 31) != 0 ? 1.0f : -1.0f;
    const float height_shift = (VorRNGNextFloat(&rng) - 0.5f) * 0.6f;
    const VorColor band{255, 96, 30, weighted_alpha(245.0, options->strength)};
    const VorColor core_light{255, 200, 120, weighted_alpha(200.0, options->strength)};
    VorFlare(bitmap, 1.0f, &band, VOR_FLARE_STRIPE, 0.9f * side, height_shift, 0.45f, 1.2f, VOR_BLEND_SCREEN);
    VorFlare(bitmap, 1.0f, &core_light, VOR_FLARE_BLOB_2, 0.92f * side, height_shift, 0.5f, 0.8f,
             VOR_BLEND_SCREEN);
}

}  // extern "C"
