// Film grain: a uniform offset per pixel (monochrome) or per channel
// (colour) drawn from a generator seeded by the caller, and the "noise"
// processor that drives the monochrome form.
#include <cfloat>

#include "core/core_internal.h"
#include "proclist/proclist_internal.h"
#include "tone/tone_internal.h"

namespace {

using vorlite::core::clamp_byte;
using vorlite::tone::rng_step;
using vorlite::tone::rng_unit_float;

// The working state: the caller's seed stepped once, so that grain seeded
// with s does not reuse the sequence another effect seeded with s draws.
std::uint32_t working_state(std::uint32_t seed) {
    VorRNG first;
    VorRNGSeed(&first, seed);
    VorRNG second;
    VorRNGSeed(&second, VorRNGNextInt(&first));
    return static_cast<std::uint32_t>(second.state);
}

// Offset of one draw: (2u - 1) * amplitude truncated toward zero. Any
// offset beyond +-255 saturates a channel byte just as +-255 does, so it is
// limited there and the channel sum cannot overflow.
int grain_offset(std::uint32_t* state, float amplitude) {
    *state = rng_step(*state);
    const float u = rng_unit_float(*state);
    const int n = vorlite::core::truncate_clamped<int>(((u + u) - 1.0f) * amplitude);
    return n < -255 ? -255 : (n > 255 ? 255 : n);
}

// Channel plus offset, stored as the integer sum widened to double, plus
// 0.5, truncated and clamped: for an integer sum that is the sum clamped to
// 0..255 (the half only lifts negative sums, which clamp to 0 either way).
std::uint8_t add_offset(std::uint8_t channel, int offset) { return clamp_byte(channel + offset); }

}  // namespace

extern "C" {

VOR_API void VorBitmapAddNoise(VorBitmap* bitmap, float intensity, uint32_t seed) {
    std::uint32_t state = working_state(seed);
    const float amplitude = intensity * 255.0f;
    vorlite::core::for_each_pixel(bitmap->data, vorlite::core::pixel_count(*bitmap), [&](std::uint8_t* p) {
        const int n = grain_offset(&state, amplitude);
        p[0] = add_offset(p[0], n);
        p[1] = add_offset(p[1], n);
        p[2] = add_offset(p[2], n);
        // Grain makes every pixel opaque, whatever its alpha was.
        p[3] = 255;
    });
}

VOR_API void VorBitmapAddChannelIndependentNoise(VorBitmap* bitmap, float intensity,
                                                 uint32_t seed) {
    std::uint32_t state = working_state(seed);
    const float amplitude = intensity * 255.0f;
    vorlite::core::for_each_pixel(bitmap->data, vorlite::core::pixel_count(*bitmap), [&](std::uint8_t* p) {
        const int nr = grain_offset(&state, amplitude);
        const int ng = grain_offset(&state, amplitude);
        const int nb = grain_offset(&state, amplitude);
        p[0] = add_offset(p[0], nr);
        p[1] = add_offset(p[1], ng);
        p[2] = add_offset(p[2], nb);
        p[3] = 255;
    });
}

VOR_API int VLPLRunNoiseProcessor(const yajl_val parameters, VorBitmap* bitmap,
                                  const VLPLRunOptions* options) {
    double intensity = 0.0;
    if (!vorlite::proclist::member_double(parameters, "intensity", &intensity)) return 0;
    // The strength scales the amplitude linearly. A product beyond float
    // range is narrowed to the largest float: every non-zero offset then
    // saturates exactly as it would with infinity.
    double amplitude = intensity * options->strength;
    if (amplitude > FLT_MAX) amplitude = FLT_MAX;
    if (amplitude < -FLT_MAX) amplitude = -FLT_MAX;
    VorBitmapAddNoise(bitmap, static_cast<float>(amplitude), options->seed);
    return 1;
}

}  // extern "C"
