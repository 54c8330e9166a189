// Four-lane vectors for pixel kernels, through the compiler's generic
// vector extension: SSE2 on x86-64, pairs of scalar VFP operations on
// 32-bit ARM; moving bytes in and out of lanes uses SSE2 directly where
// the generic form would go byte by byte. Every lane performs exactly the IEEE operation of the scalar
// code (no fused multiply-add: the library builds with -ffp-contract=off),
// so a kernel written with these stores the same bytes as its scalar
// reference, which stays beside it for the tests to hold against.
#ifndef VORLITE_CORE_SIMD_H
#define VORLITE_CORE_SIMD_H

#include <cstdint>
#include <cstring>

#if defined(__SSE2__)
#include <emmintrin.h>
#endif

namespace vorlite::core::simd {

using f32x4 = float __attribute__((vector_size(16)));
using i32x4 = std::int32_t __attribute__((vector_size(16)));
using u8x4 = std::uint8_t __attribute__((vector_size(4)));
using u8x16 = std::uint8_t __attribute__((vector_size(16)));

inline f32x4 splat(float v) { return f32x4{v, v, v, v}; }

inline i32x4 load_bytes_as_int(const std::uint8_t* p) {
#if defined(__SSE2__)
    // Widening through two unpacks with zero: the generic conversion would
    // convert each byte on its own.
    std::int32_t word;
    std::memcpy(&word, p, 4);
    const __m128i zero = _mm_setzero_si128();
    const __m128i bytes = _mm_cvtsi32_si128(word);
    return (i32x4)_mm_unpacklo_epi16(_mm_unpacklo_epi8(bytes, zero), zero);
#else
    u8x4 bytes;
    std::memcpy(&bytes, p, 4);
    return __builtin_convertvector(bytes, i32x4);
#endif
}

// The four bytes at p (one RGBA pixel, or four channels of a row) as floats.
inline f32x4 load_bytes(const std::uint8_t* p) { return __builtin_convertvector(load_bytes_as_int(p), f32x4); }

// Lane-wise store_truncated: clamp to 0..255 with NaN going to 0 (the
// comparison is false for NaN), then truncate toward zero.
inline i32x4 truncate_to_byte_range(f32x4 v) {
    const f32x4 zero = splat(0.0f);
    const f32x4 top = splat(255.0f);
    f32x4 clamped = v > zero ? v : zero;
    clamped = clamped >= top ? top : clamped;
    return __builtin_convertvector(clamped, i32x4);
}

// Four lanes already within 0..255 written as four bytes.
inline void store_bytes(std::uint8_t* p, i32x4 v) {
#if defined(__SSE2__)
    // Both packs saturate, which changes nothing for lanes within 0..255.
    const __m128i words = _mm_packs_epi32((__m128i)v, (__m128i)v);
    const std::int32_t packed = _mm_cvtsi128_si32(_mm_packus_epi16(words, words));
    std::memcpy(p, &packed, 4);
#else
    const u8x4 bytes = __builtin_convertvector(v, u8x4);
    std::memcpy(p, &bytes, 4);
#endif
}

}  // namespace vorlite::core::simd

#endif
