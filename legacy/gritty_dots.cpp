// Grit: small dark and light specks scattered over the photo like coarse
// film grain, sized with the photo so the texture reads the same at any
// resolution.
#include <cstdint>

#include "core/core_internal.h"
#include "zentra_vorlite.h"

namespace vorlite::legacy {
namespace {

// Speck radius: one nine-hundredth of the smaller side, never under 0.6 px
// (below that a dot is a faint smudge, not grit).
float speck_radius(const VorBitmap& bitmap) {
    const std::uint32_t smaller = bitmap.width < bitmap.height ? bitmap.width : bitmap.height;
    const float r = static_cast<float>(smaller) * (1.0f / 900.0f);
    return r < 0.6f ? 0.6f : r;
}

// Grit density is capped: past a third of the area the specks merge into a
// tone rather than a texture.
constexpr float k_density_max = 0.33f;

}  // namespace
}  // namespace vorlite::legacy

using namespace vorlite;

extern "C" {

VOR_API void VorLegacyGrittyDots(VorBitmap* bitmap, float density, int32_t monochrome, uint32_t seed) {
    if (bitmap == nullptr || bitmap->data == nullptr || !(density > 0.0f)) return;
    const float d = density > legacy::k_density_max ? legacy::k_density_max : density;
    const float r = legacy::speck_radius(*bitmap);
    const auto w = static_cast<float>(bitmap->width);
    const auto h = static_cast<float>(bitmap->height);
    // Each speck covers about pi r^2 pixels.
    const double count = static_cast<double>(d) * static_cast<double>(w) * static_cast<double>(h) /
                         (3.14159265 * static_cast<double>(r) * static_cast<double>(r));
    const auto n = static_cast<std::uint64_t>(count);
    VorRNG rng;
    VorRNGSeed(&rng, seed);
    for (std::uint64_t i = 0; i < n; ++i) {
        const float x = VorRNGNextFloat(&rng) * w;
        const float y = VorRNGNextFloat(&rng) * h;
        const std::uint32_t pick = VorRNGNextInt(&rng);
        const float size = r * (0.5f + VorRNGNextFloat(&rng));
        const float opacity = 0.15f + 0.35f * VorRNGNextFloat(&rng);
        // Three specks in five darken: grit reads as dirt more than as light.
        const bool dark = pick % 5u < 3u;
        VorColor c = dark ? VorColor{0, 0, 0, 255} : VorColor{255, 255, 255, 255};
        if (monochrome == 0) {
            // A tinted speck: one channel pulled a third of the way back.
            const int channel = static_cast<int>((pick >> 8) % 3u);
            (&c.r)[channel] = dark ? 85 : 170;
        }
        VorDrawBasicDotLegacy(bitmap, x, y, size, &c, opacity);
    }
}

VOR_API void VorLegacyMurmelGrittyDots(VorBitmap* bitmap, const VLPLRunOptions* options) {
    if (options == nullptr) return;
    const double strength = options->strength > 2.0 ? 2.0 : options->strength;
    VorLegacyGrittyDots(bitmap, static_cast<float>(0.051 * strength), 1, options->seed);
}

}  // extern "C"
