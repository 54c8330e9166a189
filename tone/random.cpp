// The library's one random generator: a 32-bit linear congruential
// generator that the caller seeds, with uniform, normal and Laplace draws.
// Every seeded effect replays this exact sequence, so each conversion and
// draw order below is part of the observable behaviour.
#include <cmath>
#include <stdlib.h>

#include "core/core_internal.h"
#include "tone/tone_internal.h"

namespace {

using vorlite::tone::rng_step;
using vorlite::tone::rng_unit_float;

// The 64-bit state field only ever holds a 32-bit value.
std::uint32_t advance(VorRNG* rng) {
    const std::uint32_t next = rng_step(static_cast<std::uint32_t>(rng->state));
    rng->state = next;
    return next;
}

}  // namespace

extern "C" {

VOR_API void VorRNGSeed(VorRNG* rng, uint32_t seed) {
    rng->seed = seed;
    rng->state = seed;
}

VOR_API void VorRNGInit(VorRNG* rng) {
    // Doubling in float spreads lrand48's 31 bits over the 32-bit seed
    // range; the top value rounds to 2^32 and saturates.
    const float drawn = static_cast<float>(::lrand48());
    VorRNGSeed(rng, vorlite::core::truncate_clamped<std::uint32_t>(drawn + drawn));
}

VOR_API uint32_t VorRNGNextInt(VorRNG* rng) { return advance(rng); }

VOR_API uint32_t VorRNGNextSeedN(uint32_t seed, uint32_t n) {
    for (uint32_t i = 0; i < n; ++i) seed = rng_step(seed);
    return seed;
}

VOR_API float VorRNGNextFloat(VorRNG* rng) { return rng_unit_float(advance(rng)); }

VOR_API float VorRNGNextFloatNormal(VorRNG* rng) {
    // Box-Muller, cosine half only; both uniforms are drawn before either
    // is redrawn, and zero is redrawn so the logarithm stays finite.
    float u1 = VorRNGNextFloat(rng);
    float u2 = VorRNGNextFloat(rng);
    while (u1 == 0.0f) u1 = VorRNGNextFloat(rng);
    while (u2 == 0.0f) u2 = VorRNGNextFloat(rng);
    const float radius = std::sqrt(vorlite::core::logf(u1) * -2.0f);
    const float theta = static_cast<float>(static_cast<double>(u2) * 6.283185307179586);
    return vorlite::core::cosf(theta) * radius;
}

VOR_API float VorRNGNextFloatLaplace(VorRNG* rng) {
    // Inverse distribution of the unit Laplace law on d in [-0.5, 0.5];
    // a draw of exactly 0 gives +infinity.
    const float d = 0.5f - VorRNGNextFloat(rng);
    if (d < 0.0f) return vorlite::core::logf(d + d + 1.0f);
    return -vorlite::core::logf(1.0f - (d + d));
}

}  // extern "C"
