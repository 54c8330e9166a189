// Vector lanes for pixel kernels, through the compiler's generic vector
// extension: SSE2 on x86-64, pairs of scalar VFP operations on 32-bit ARM.
// Every lane performs exactly the IEEE operation of the scalar code (no
// fused multiply-add: the library builds with -ffp-contract=off), so a
// kernel written with these stores the same bytes as its scalar reference,
// which stays beside it for the tests to hold against.
#ifndef VORLITE_CORE_SIMD_H
#define VORLITE_CORE_SIMD_H

#include <cstdint>

#if defined(__SSE2__)
#include <emmintrin.h>
#endif

// Float lanes perform the scalar IEEE operation everywhere but on 32-bit
// ARM's NEON, which flushes subnormal floats to zero: float kernels there
// keep to their scalar form. Integer lanes are exact everywhere.
#if defined(__arm__) && defined(__ARM_NEON)
#define VORLITE_EXACT_FLOAT_LANES 0
#else
#define VORLITE_EXACT_FLOAT_LANES 1
#endif

namespace vorlite::core::simd {

using f32x4 = float __attribute__((vector_size(16)));
using f64x2 = double __attribute__((vector_size(16)));
using f64x4 = double __attribute__((vector_size(32)));
using i32x4 = std::int32_t __attribute__((vector_size(16)));
using u32x4 = std::uint32_t __attribute__((vector_size(16)));
using u8x4 = std::uint8_t __attribute__((vector_size(4)));
using u8x16 = std::uint8_t __attribute__((vector_size(16)));

inline f32x4 splat(float v) { return f32x4{v, v, v, v}; }

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

}  // namespace vorlite::core::simd

#endif
