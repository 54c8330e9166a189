// Film grain: a uniform offset per pixel (monochrome) or per channel
// (colour) drawn from a generator seeded by the caller, and the "noise"
// processor that drives the monochrome form.
#include <cfloat>
#include <cmath>
#include <cstring>

#include "core/core_internal.h"
#include "core/simd.h"
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

// The generator k steps at once is again a linear congruential step, with
// multiplier 69069^k and increment 1 + 69069 + ... + 69069^(k-1), modulo
// 2^32: lanes that start k draws apart and each take this step replay the
// serial sequence exactly.
struct Jump {
    std::uint32_t multiplier;
    std::uint32_t increment;
};

constexpr Jump jump(std::uint32_t k) {
    Jump j{1u, 0u};
    for (std::uint32_t i = 0; i < k; ++i) j = Jump{j.multiplier * 69069u, j.increment * 69069u + 1u};
    return j;
}

constexpr std::size_t k_lanes = 8;
constexpr Jump k_jump = jump(k_lanes);

// The lanes' float steps are the scalar ones, and with an amplitude below
// 2^20 every product truncates exactly in 32-bit lanes; other amplitudes
// (huge, infinite, NaN) take the one-by-one draws.
bool lanes_exact(float amplitude) {
    return VORLITE_EXACT_FLOAT_LANES != 0 && std::fabs(amplitude) < 1048576.0f;
}

// n consecutive offsets, exactly as n calls of grain_offset would give.
VORLITE_AVX2_CLONES
void grain_offsets(std::uint32_t* state, float amplitude, int* out, std::size_t n, bool lanes) {
    std::size_t i = 0;
#if VORLITE_EXACT_FLOAT_LANES
    if (lanes && lanes_exact(amplitude) && n >= k_lanes) {
        using u32x8 = std::uint32_t __attribute__((vector_size(32)));
        using f32x8 = float __attribute__((vector_size(32)));
        using i32x8 = std::int32_t __attribute__((vector_size(32)));
        u32x8 s;
        std::uint32_t t = *state;
        for (std::size_t k = 0; k < k_lanes; ++k) s[k] = t = rng_step(t);
        const f32x8 a = {amplitude, amplitude, amplitude, amplitude, amplitude, amplitude, amplitude, amplitude};
        for (;;) {
            const f32x8 u = __builtin_convertvector(s, f32x8) * 0x1p-32f;
            const i32x8 offset = __builtin_convertvector(((u + u) - 1.0f) * a, i32x8);
            const i32x8 low = offset < -255 ? -255 : offset;
            const i32x8 clamped = low > 255 ? 255 : low;
            std::memcpy(out + i, &clamped, sizeof clamped);
            i += k_lanes;
            *state = s[k_lanes - 1];
            if (i + k_lanes > n) break;
            s = s * k_jump.multiplier + k_jump.increment;
        }
    }
#else
    (void)lanes;
#endif
    for (; i < n; ++i) out[i] = grain_offset(state, amplitude);
}

#if VORLITE_NATIVE_INTEGER_LANES
// Sixteen signed 16-bit sums clamped to 0..255 and packed into bytes.
vorlite::core::simd::u8x16 saturate_to_bytes(vorlite::core::simd::i16x8 low, vorlite::core::simd::i16x8 high) {
    namespace simd = vorlite::core::simd;
#if defined(__SSE2__)
    return reinterpret_cast<simd::u8x16>(
        _mm_packus_epi16(reinterpret_cast<__m128i>(low), reinterpret_cast<__m128i>(high)));
#else
    const simd::i16x8 zero = {0, 0, 0, 0, 0, 0, 0, 0};
    const simd::i16x8 top = {255, 255, 255, 255, 255, 255, 255, 255};
    low = low < zero ? zero : (low > top ? top : low);
    high = high < zero ? zero : (high > top ? top : high);
    using u8x8 = std::uint8_t __attribute__((vector_size(8)));
    const u8x8 l = __builtin_convertvector(low, u8x8);
    const u8x8 h = __builtin_convertvector(high, u8x8);
    return __builtin_shufflevector(l, h, 0, 1, 2, 3, 4, 5, 6, 7, 8, 9, 10, 11, 12, 13, 14, 15);
#endif
}
#endif

// Grain in runs: the offsets of a run of pixels are drawn ahead, then laid
// on together.
constexpr std::size_t k_run = 512;

template <std::size_t Draws, typename LayRun>
void grain_pass(VorBitmap* bitmap, float intensity, std::uint32_t seed, bool lanes, LayRun&& lay_run) {
    std::uint32_t state = working_state(seed);
    const float amplitude = intensity * 255.0f;
    const std::size_t count = vorlite::core::pixel_count(*bitmap);
    int offsets[k_run * Draws];
    std::uint8_t* p = bitmap->data;
    for (std::size_t done = 0; done < count; done += k_run) {
        const std::size_t n = count - done < k_run ? count - done : k_run;
        grain_offsets(&state, amplitude, offsets, n * Draws, lanes);
        lay_run(p, static_cast<const int*>(offsets), n);
        p += n * 4;
    }
}

// Channel plus offset, stored as the integer sum widened to double, plus
// 0.5, truncated and clamped: for an integer sum that is the sum clamped to
// 0..255 (the half only lifts negative sums, which clamp to 0 either way).
std::uint8_t add_offset(std::uint8_t channel, int offset) { return clamp_byte(channel + offset); }

}  // namespace

namespace vorlite::tone {

void add_noise(VorBitmap* bitmap, float intensity, std::uint32_t seed, bool lanes) {
    grain_pass<1>(bitmap, intensity, seed, lanes, [lanes](std::uint8_t* p, const int* o, std::size_t n) {
        std::size_t i = 0;
#if VORLITE_NATIVE_INTEGER_LANES
        // Four pixels at a time in 16-bit lanes: the sums of a byte and an
        // offset of at most 255 either way fit, and saturating them to a
        // byte is the scalar clamp.
        namespace simd = vorlite::core::simd;
        if (lanes) {
            for (; i + 4 <= n; i += 4, p += 16, o += 4) {
                const simd::u8x16 px = simd::load<simd::u8x16>(p);
                const auto a = static_cast<std::int16_t>(o[0]), b = static_cast<std::int16_t>(o[1]);
                const auto c = static_cast<std::int16_t>(o[2]), d = static_cast<std::int16_t>(o[3]);
                simd::i16x8 low = reinterpret_cast<simd::i16x8>(simd::widen_low(px)) + simd::i16x8{a, a, a, a, b, b, b, b};
                simd::i16x8 high = reinterpret_cast<simd::i16x8>(simd::widen_high(px)) + simd::i16x8{c, c, c, c, d, d, d, d};
                // Grain makes every pixel opaque, whatever its alpha was.
                const simd::u8x16 opaque = {0, 0, 0, 255, 0, 0, 0, 255, 0, 0, 0, 255, 0, 0, 0, 255};
                simd::store(p, saturate_to_bytes(low, high) | opaque);
            }
        }
#else
        (void)lanes;
#endif
        for (; i < n; ++i, p += 4, ++o) {
            p[0] = add_offset(p[0], o[0]);
            p[1] = add_offset(p[1], o[0]);
            p[2] = add_offset(p[2], o[0]);
            p[3] = 255;
        }
    });
}

void add_channel_noise(VorBitmap* bitmap, float intensity, std::uint32_t seed, bool lanes) {
    grain_pass<3>(bitmap, intensity, seed, lanes, [](std::uint8_t* p, const int* o, std::size_t n) {
        for (std::size_t i = 0; i < n; ++i, p += 4, o += 3) {
            p[0] = add_offset(p[0], o[0]);
            p[1] = add_offset(p[1], o[1]);
            p[2] = add_offset(p[2], o[2]);
            p[3] = 255;
        }
    });
}

}  // namespace vorlite::tone

extern "C" {

VOR_API void VorBitmapAddNoise(VorBitmap* bitmap, float intensity, uint32_t seed) {
    vorlite::tone::add_noise(bitmap, intensity, seed, true);
}

VOR_API void VorBitmapAddChannelIndependentNoise(VorBitmap* bitmap, float intensity,
                                                 uint32_t seed) {
    vorlite::tone::add_channel_noise(bitmap, intensity, seed, true);
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
