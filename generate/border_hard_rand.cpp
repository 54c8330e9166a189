// The rough-edged frame (hard_rand): the banded frame's shading with every
// edge displaced by its own fractal profile, and the colour blended rather
// than painted outside it.
#include <cmath>
#include <cstdint>

#include "core/core_internal.h"

namespace {

constexpr double k_sqrt2 = 1.4142135623730951;
constexpr float k_sqrt2_f = 1.4142135f;
constexpr float k_roughness = 0.7f;

// Pins both ends of each profile, then lets midpoint displacement draw the
// edge between them; each profile's seed is the generator's next value.
void rough_edges(const VorBorderParams& p, std::uint32_t width, std::uint32_t height, VorRNG* rng) {
    const auto corner = static_cast<float>(p.cornerOffset);
    p.leftProfile[height - 1] = corner;
    p.leftProfile[0] = 0.0f;
    p.rightProfile[0] = 0.0f;
    p.rightProfile[height - 1] = 0.0f;
    p.topProfile[0] = 0.0f;
    p.topProfile[width - 1] = 0.0f;
    p.bottomProfile[0] = corner;
    p.bottomProfile[width - 1] = 0.0f;
    const auto across = static_cast<float>(p.roughAmplitude * 0.03 * static_cast<double>(width));
    const auto down = static_cast<float>(p.roughAmplitude * 0.03 * static_cast<double>(height));
    const auto rows = static_cast<std::int32_t>(height - 1);
    const auto columns = static_cast<std::int32_t>(width - 1);
    VorMPDSeed(p.leftProfile, 0, rows, across, k_roughness, p.mpdMode, VorRNGNextInt(rng));
    VorMPDSeed(p.rightProfile, 0, rows, across, k_roughness, p.mpdMode, VorRNGNextInt(rng));
    VorMPDSeed(p.topProfile, 0, columns, down, k_roughness, p.mpdMode, VorRNGNextInt(rng));
    VorMPDSeed(p.bottomProfile, 0, columns, down, k_roughness, p.mpdMode, VorRNGNextInt(rng));
}

std::int64_t truncated(float v) { return vorlite::core::truncate_clamped<std::int64_t>(v); }

void blend(std::uint8_t* p, const VorColor& colour, std::uint32_t mode, float opacity) {
    VorColor out = vorlite::core::load_pixel(p);
    VorColorBlend(&out, &colour, mode, opacity);
    vorlite::core::store_pixel(p, out);
}

}  // namespace

extern "C" {

VOR_API void VorBordersHardRand(VorBitmap* bitmap, const VorBorderParams* params) {
    const std::uint32_t width = bitmap->width;
    const std::uint32_t height = bitmap->height;
    // Each profile needs two ends of its own.
    if (width < 2 || height < 2) return;
    const VorBorderParams& p = *params;
    const float b = static_cast<float>(static_cast<std::int64_t>(width) + height) * 0.033333335f;
    VorRNG rng;
    VorRNGSeed(&rng, p.seed);
    rough_edges(p, width, height, &rng);

    const double radius = static_cast<double>(b) * k_sqrt2;
    const float radius_f = b * k_sqrt2_f;
    const auto inset = static_cast<float>(p.inset);
    const auto mode = static_cast<std::uint32_t>(p.blendMode);
    const auto opacity = static_cast<float>(p.opacity);
    const double falloff = 4.0 * p.falloffPower;
    std::uint8_t* px = bitmap->data;
    for (std::uint32_t y = 0; y < height; ++y) {
        const bool upper = y < height / 2;
        const float from_top = upper ? static_cast<float>(y) : static_cast<float>(height - 1 - y);
        const float* edge_rows = upper ? p.topProfile : p.bottomProfile;
        for (std::uint32_t x = 0; x < width; ++x, px += 4) {
            const bool left = x < width / 2;
            const float from_left = left ? static_cast<float>(x) : static_cast<float>(width - 1 - x);
            const float* edge_columns = left ? p.leftProfile : p.rightProfile;
            const std::int64_t dr = truncated((from_top - inset) - edge_rows[x]);
            const std::int64_t dc = truncated((from_left - inset) - edge_columns[y]);
            if (dr < 0 || dc < 0) {
                blend(px, p.color, mode, opacity);
                continue;
            }
            float d;
            const double r = static_cast<double>(dr);
            const double c = static_cast<double>(dc);
            if (r < radius && c < radius) {
                const double squares = (r - radius) * (r - radius) + (c - radius) * (c - radius);
                d = radius_f - std::sqrt(static_cast<float>(squares));
            } else {
                d = static_cast<float>(dr < dc ? dr : dc);
            }
            if (!(d < b)) continue;
            const float n = VorRNGNextFloat(&rng);
            const double w = 1.0 - static_cast<double>(d / b);
            double v = 1.0 - 2.0 * vorlite::core::pow(w, falloff) * (0.4 * static_cast<double>(n) + 0.6);
            if (v > 1.0) v = 1.0;
            if (!(v > 0.0)) v = 0.0;
            blend(px, p.color, mode, static_cast<float>((1.0 - v) * p.opacity));
        }
    }
}

}  // extern "C"
