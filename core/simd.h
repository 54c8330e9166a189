// Vector lanes for pixel kernels, through the compiler's generic vector
// extension: SSE2 on x86-64, pairs of scalar VFP operations on 32-bit ARM,
// 128-bit SIMD in WebAssembly.
// Every lane performs exactly the IEEE operation of the scalar code (no
// fused multiply-add: the library builds with -ffp-contract=off), so a
// kernel written with these stores the same bytes as its scalar reference,
// which stays beside it for the tests to hold against.
//
// The helpers below are the operations the generic extension does not
// spell: each names its per-lane result, which its SSE2 instructions and
// its portable form both give for every input it admits.
#ifndef VORLITE_CORE_SIMD_H
#define VORLITE_CORE_SIMD_H

#include <cstdint>
#include <cstring>

#include "core/core_internal.h"

#if defined(__SSE2__)
#include <emmintrin.h>
#endif

// The lane types need GCC's vector extension (GCC and Clang). A kernel
// guards its vector form with this and keeps its scalar form otherwise; a
// build may define it as 0 to run every kernel's scalar form.
#ifndef VORLITE_VECTOR_LANES
#if defined(__GNUC__)
#define VORLITE_VECTOR_LANES 1
#else
#define VORLITE_VECTOR_LANES 0
#endif
#endif

// Float lanes perform the scalar IEEE operation everywhere but on 32-bit
// ARM's NEON, which flushes subnormal floats to zero: float kernels there
// keep to their scalar form. Integer lanes are exact everywhere.
#if VORLITE_VECTOR_LANES && !(defined(__arm__) && defined(__ARM_NEON))
#define VORLITE_EXACT_FLOAT_LANES 1
#else
#define VORLITE_EXACT_FLOAT_LANES 0
#endif

// Integer lanes held in vector registers: SSE2, NEON or WebAssembly's
// 128-bit SIMD. Elsewhere the compiler splits every lane operation into
// scalar ones, and a kernel that only pays where sixteen channels go at
// once keeps its scalar form.
#ifndef VORLITE_NATIVE_INTEGER_LANES
#if VORLITE_VECTOR_LANES && (defined(__SSE2__) || defined(__ARM_NEON) || defined(__wasm_simd128__))
#define VORLITE_NATIVE_INTEGER_LANES 1
#else
#define VORLITE_NATIVE_INTEGER_LANES 0
#endif
#endif

// On x86-64 a kernel may be built twice, for processors with 256-bit
// lanes and for the rest, the copy picked at load time; both copies do the
// same IEEE operations, so the bytes do not depend on the processor. Not
// under the sanitizers, whose runtimes do not take to the load-time pick.
#if defined(__x86_64__) && defined(__GNUC__) && !defined(__clang__) && !defined(__SANITIZE_THREAD__) && \
    !defined(__SANITIZE_ADDRESS__)
#define VORLITE_AVX2_CLONES __attribute__((target_clones("avx2", "default")))
#else
#define VORLITE_AVX2_CLONES
#endif

#if VORLITE_VECTOR_LANES
namespace vorlite::core::simd {

using f32x2 = float __attribute__((vector_size(8)));
using f32x4 = float __attribute__((vector_size(16)));
using f64x2 = double __attribute__((vector_size(16)));
using f64x4 = double __attribute__((vector_size(32)));
using i16x8 = std::int16_t __attribute__((vector_size(16)));
using i32x4 = std::int32_t __attribute__((vector_size(16)));
using u16x8 = std::uint16_t __attribute__((vector_size(16)));
using u32x4 = std::uint32_t __attribute__((vector_size(16)));
using u8x4 = std::uint8_t __attribute__((vector_size(4)));
using u8x16 = std::uint8_t __attribute__((vector_size(16)));

inline f32x4 splat(float v) { return f32x4{v, v, v, v}; }

// Lanes from and to memory of any alignment.
template <typename Lanes>
inline Lanes load(const void* p) {
    Lanes v;
    std::memcpy(&v, p, sizeof v);
    return v;
}

template <typename Lanes>
inline void store(void* p, Lanes v) {
    std::memcpy(p, &v, sizeof v);
}

// v > bound ? v : bound, and v < bound ? v : bound: a NaN lane gives the
// bound. SSE's max and min have exactly these semantics (second operand on
// NaN or equality); the compiler does not pick them for a constant bound.
inline f32x4 max_or_bound(f32x4 v, f32x4 bound) {
#if defined(__SSE2__)
    return _mm_max_ps(v, bound);
#else
    return v > bound ? v : bound;
#endif
}

inline f32x4 min_or_bound(f32x4 v, f32x4 bound) {
#if defined(__SSE2__)
    return _mm_min_ps(v, bound);
#else
    return v < bound ? v : bound;
#endif
}

// Bytes 0..7 (low) or 8..15 (high) of v, each zero-extended to 16 bits.
inline u16x8 widen_low(u8x16 v) {
#if defined(__SSE2__)
    return reinterpret_cast<u16x8>(_mm_unpacklo_epi8(reinterpret_cast<__m128i>(v), _mm_setzero_si128()));
#else
    return __builtin_convertvector(__builtin_shufflevector(v, v, 0, 1, 2, 3, 4, 5, 6, 7), u16x8);
#endif
}

inline u16x8 widen_high(u8x16 v) {
#if defined(__SSE2__)
    return reinterpret_cast<u16x8>(_mm_unpackhi_epi8(reinterpret_cast<__m128i>(v), _mm_setzero_si128()));
#else
    return __builtin_convertvector(__builtin_shufflevector(v, v, 8, 9, 10, 11, 12, 13, 14, 15), u16x8);
#endif
}

// Two signed 16-bit weights x and y, held as add_weighted_byte_pairs
// takes them: alternating in 16-bit lanes for SSE2's multiply-add, else
// sign-extended to 32 bits, which keeps 32-bit multiplies on scalar targets.
struct WeightPair {
#if defined(__SSE2__)
    i16x8 lanes;
#else
    std::uint32_t x, y;
#endif
};

inline WeightPair weight_pair(std::int16_t x, std::int16_t y) {
#if defined(__SSE2__)
    return {i16x8{x, y, x, y, x, y, x, y}};
#else
    return {static_cast<std::uint32_t>(std::int32_t{x}), static_cast<std::uint32_t>(std::int32_t{y})};
#endif
}

// Sixteen 32-bit sums, one per byte of the 16 bytes at a and at b, each
// gaining x a_i + y b_i modulo 2^32.
inline void add_weighted_byte_pairs(u32x4 sums[4], const std::uint8_t* a, const std::uint8_t* b,
                                    const WeightPair& weights) {
#if defined(__SSE2__)
    // Bytes of a and b alternating in 16-bit lanes: one multiply-add then
    // gives x a_i + y b_i, exactly, as a and b are bytes.
    const __m128i zero = _mm_setzero_si128();
    const __m128i va = _mm_loadu_si128(reinterpret_cast<const __m128i*>(a));
    const __m128i vb = _mm_loadu_si128(reinterpret_cast<const __m128i*>(b));
    const __m128i a_low = _mm_unpacklo_epi8(va, zero), a_high = _mm_unpackhi_epi8(va, zero);
    const __m128i b_low = _mm_unpacklo_epi8(vb, zero), b_high = _mm_unpackhi_epi8(vb, zero);
    const __m128i w = reinterpret_cast<__m128i>(weights.lanes);
    sums[0] += reinterpret_cast<u32x4>(_mm_madd_epi16(_mm_unpacklo_epi16(a_low, b_low), w));
    sums[1] += reinterpret_cast<u32x4>(_mm_madd_epi16(_mm_unpackhi_epi16(a_low, b_low), w));
    sums[2] += reinterpret_cast<u32x4>(_mm_madd_epi16(_mm_unpacklo_epi16(a_high, b_high), w));
    sums[3] += reinterpret_cast<u32x4>(_mm_madd_epi16(_mm_unpackhi_epi16(a_high, b_high), w));
#else
    // Unsigned lanes, which wrap.
    for (int i = 0; i < 4; ++i) {
        const u32x4 from_a = __builtin_convertvector(load<u8x4>(a + 4 * i), u32x4);
        const u32x4 from_b = __builtin_convertvector(load<u8x4>(b + 4 * i), u32x4);
        sums[i] += from_a * weights.x + from_b * weights.y;
    }
#endif
}

// Sixteen signed 32-bit lanes, a's first, each clamped to 0..255.
inline u8x16 narrow_clamped(i32x4 a, i32x4 b, i32x4 c, i32x4 d) {
#if defined(__SSE2__)
    // Signed saturation to 16 bits, then unsigned saturation to 8: a clamp.
    const __m128i low = _mm_packs_epi32(reinterpret_cast<__m128i>(a), reinterpret_cast<__m128i>(b));
    const __m128i high = _mm_packs_epi32(reinterpret_cast<__m128i>(c), reinterpret_cast<__m128i>(d));
    return reinterpret_cast<u8x16>(_mm_packus_epi16(low, high));
#else
    std::uint8_t bytes[16];
    const i32x4 lanes[4] = {a, b, c, d};
    for (int i = 0; i < 4; ++i) {
        const i32x4 zero = {0, 0, 0, 0};
        const i32x4 top = {255, 255, 255, 255};
        i32x4 v = lanes[i] < zero ? zero : lanes[i];
        v = v > top ? top : v;
        store(bytes + 4 * i, __builtin_convertvector(v, u8x4));
    }
    return load<u8x16>(bytes);
#endif
}

// Sixteen signed 16-bit lanes, low's first, each clamped to 0..255.
inline u8x16 narrow_clamped(i16x8 low, i16x8 high) {
#if defined(__SSE2__)
    return reinterpret_cast<u8x16>(_mm_packus_epi16(reinterpret_cast<__m128i>(low), reinterpret_cast<__m128i>(high)));
#else
    const auto clamp = [](i16x8 v) {
        const i16x8 zero = {0, 0, 0, 0, 0, 0, 0, 0};
        const i16x8 top = {255, 255, 255, 255, 255, 255, 255, 255};
        v = v < zero ? zero : v;
        return v > top ? top : v;
    };
    return __builtin_convertvector(
        __builtin_shufflevector(clamp(low), clamp(high), 0, 1, 2, 3, 4, 5, 6, 7, 8, 9, 10, 11, 12, 13, 14, 15), u8x16);
#endif
}

// store_truncated of both lanes (clamp to 0..255, NaN to 0, truncate),
// written to p[0] and p[1], for lanes inside the 32-bit integer range:
// SSE2 turns anything beyond it into the most negative integer, hence 0.
inline void store_truncated_pair(std::uint8_t* p, f64x2 v) {
#if defined(__SSE2__)
    // Truncating first, then saturating to 16 and to 8 bits, clamps as
    // clamping before truncation does: -1 < v < 0 gives 0 either way.
    const __m128i truncated = _mm_cvttpd_epi32(reinterpret_cast<__m128d>(v));
    const __m128i words = _mm_packs_epi32(truncated, truncated);
    const __m128i bytes = _mm_packus_epi16(words, words);
    // Through a general register: one move, no word extract.
    const auto pair = static_cast<std::uint16_t>(_mm_cvtsi128_si32(bytes));
    std::memcpy(p, &pair, 2);
#else
    p[0] = store_truncated(v[0]);
    p[1] = store_truncated(v[1]);
#endif
}

}  // namespace vorlite::core::simd
#endif

#endif
