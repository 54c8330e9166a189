// Portable primitives under every pixel kernel: pixel access, the two
// storing rules and conversions that stay defined for every input.
#ifndef VORLITE_CORE_INTERNAL_H
#define VORLITE_CORE_INTERNAL_H

#include <array>
#include <cstddef>
#include <cstdint>
#include <cstring>
#include <limits>
#include <type_traits>

#include "zentra_vorlite.h"

namespace vorlite::core {

// The bits of a value read as another type of the same size: std::bit_cast,
// through the compiler builtin beneath it, which every compiler we build
// with has also where its standard library predates the name.
template <typename To, typename From>
constexpr To bit_cast(const From& from) {
    static_assert(sizeof(To) == sizeof(From) && std::is_trivially_copyable_v<To> &&
                  std::is_trivially_copyable_v<From>);
    return __builtin_bit_cast(To, from);
}

// Float built from its exact bit pattern, so a constant never depends on
// how a decimal literal happens to round.
constexpr float float_bits(std::uint32_t bits) { return bit_cast<float>(bits); }

// 1/255 as the float nearest 0.003921569: the scale from a channel byte to
// 0..1 in every single-precision step.
inline constexpr float k_inv255 = float_bits(0x3B808081u);

constexpr std::size_t pixel_count(const VorBitmap& bitmap) {
    return static_cast<std::size_t>(bitmap.width) * bitmap.height;
}

constexpr std::size_t byte_count(const VorBitmap& bitmap) { return pixel_count(bitmap) * 4; }

inline VorColor load_pixel(const std::uint8_t* p) {
    VorColor c;
    std::memcpy(&c, p, 4);
    return c;
}

inline void store_pixel(std::uint8_t* p, VorColor c) { std::memcpy(p, &c, 4); }

// Red, green and blue through their own 256-entry maps, alpha kept: read
// and written as one word, so a pixel costs one store instead of three.
inline void map_pixel(std::uint8_t* p, const std::uint8_t (*maps)[256]) {
    std::uint32_t word;
    std::memcpy(&word, p, 4);
    word = (word & 0xFF000000u) | std::uint32_t{maps[0][word & 0xFFu]} |
           (std::uint32_t{maps[1][(word >> 8) & 0xFFu]} << 8) | (std::uint32_t{maps[2][(word >> 16) & 0xFFu]} << 16);
    std::memcpy(p, &word, 4);
}

// A pass over a large bitmap waits on memory unless it asks for its bytes
// ahead: the hardware prefetcher alone leaves a 12-megapixel pass at about
// half the speed of a copy. A prefetch never faults, so the address may lie
// past the bitmap; it is formed as an integer for that reason.
inline constexpr std::size_t k_prefetch_distance = 2048;

template <bool for_writing>
inline void prefetch_ahead(const void* p) {
    const auto ahead = reinterpret_cast<std::uintptr_t>(p) + k_prefetch_distance;
    __builtin_prefetch(reinterpret_cast<const void*>(ahead), for_writing ? 1 : 0);
}

// Calls visit(p) for each of the n pixels from p, in memory order, asking
// for the memory ahead once per cache line of 16 pixels.
template <typename Byte, typename Visit>
inline void for_each_pixel(Byte* p, std::size_t n, Visit&& visit) {
    constexpr bool for_writing = !std::is_const_v<Byte>;
    std::size_t i = 0;
    for (; i + 16 <= n; i += 16) {
        prefetch_ahead<for_writing>(p);
        for (int k = 0; k < 16; ++k, p += 4) visit(p);
    }
    for (; i < n; ++i, p += 4) visit(p);
}

// Truncation toward zero that is defined for every input: NaN gives 0 and
// values beyond the range of Int saturate instead of being undefined.
template <typename Int, typename Real>
constexpr Int truncate_clamped(Real v) {
    constexpr Real lo = static_cast<Real>(std::numeric_limits<Int>::min());
    // The largest Real below 2^bits of Int, so the conversion stays in range.
    constexpr Real hi_exclusive = static_cast<Real>(std::numeric_limits<Int>::max() / 2 + 1) * 2;
    if (!(v == v)) return 0;
    if (v <= lo) return std::numeric_limits<Int>::min();
    if (v >= hi_exclusive) return std::numeric_limits<Int>::max();
    return static_cast<Int>(v);
}

// Storing by rounding: above 254.5 is 255, from -0.5 up it is trunc(v + 0.5)
// computed in the value's own precision, below (and NaN) it is 0.
template <typename Real>
constexpr std::uint8_t store_rounded(Real v) {
    if (v > static_cast<Real>(254.5)) return 255;
    if (v >= static_cast<Real>(-0.5)) return static_cast<std::uint8_t>(static_cast<int>(v + static_cast<Real>(0.5)));
    return 0;
}

// Storing by truncation: clamp to 0..255 (NaN to 0), then truncate.
template <typename Real>
constexpr std::uint8_t store_truncated(Real v) {
    if (!(v > static_cast<Real>(0))) return 0;
    if (v >= static_cast<Real>(255)) return 255;
    return static_cast<std::uint8_t>(v);
}

// Clamp an integer to a channel byte.
constexpr std::uint8_t clamp_byte(int v) {
    return static_cast<std::uint8_t>(v < 0 ? 0 : (v > 255 ? 255 : v));
}

// Histogram maps: a single 256-level curve written into the red, green and
// blue tables of a map and applied to the bitmap with
// VorBitmapHistogramTransform; alpha is kept.
using Curve = std::array<std::uint8_t, 256>;
void apply_curve(VorBitmap* bitmap, const Curve& curve);

// The per-channel byte lookups of a histogram map: the reference the
// whole-pixel table path of VorBitmapHistogramTransform is held against.
void histogram_transform_reference(VorBitmap* bitmap, const VorHistMap& map);

// Double-precision elementary functions. They return the same bits on every
// target (the C libraries' own differ in the last bit between x86-64 with
// and without fused multiply-add and between C libraries); an exact path
// calls these rather than <math.h>'s. Special values as in C99 Annex F;
// errno is never set.
double exp(double x);
double log(double x);
double pow(double x, double y);
double sin(double x);
double cos(double x);
double atan2(double y, double x);

// Elementary functions in single precision, from core/math_float.cpp: the
// results of the reference phone's C library, to the bit, on every target
// and whatever traps are enabled. Exact single-precision steps call these
// rather than ::expf and the like.
float expf(float x);
float logf(float x);
float powf(float x, float y);
float sinf(float x);
float cosf(float x);

// Working memory of an operation: a zero-filled bitmap from VorBitmapBuild,
// released when it goes out of scope, on every path.
class WorkingBitmap {
public:
    WorkingBitmap() = default;
    WorkingBitmap(const WorkingBitmap&) = delete;
    WorkingBitmap& operator=(const WorkingBitmap&) = delete;
    ~WorkingBitmap() { VorBitmapFree(&bitmap_); }

    bool build(std::uint32_t width, std::uint32_t height) {
        VorBitmapFree(&bitmap_);
        return VorBitmapBuild(&bitmap_, width, height) != 0;
    }
    // A copy of source's pixels at its size.
    bool build_copy(const VorBitmap& source) {
        return build(source.width, source.height) && VorBitmapCopy(&bitmap_, &source) != 0;
    }
    VorBitmap* get() { return &bitmap_; }
    const VorBitmap* get() const { return &bitmap_; }

private:
    VorBitmap bitmap_{nullptr, 0, 0};
};

// Working memory of an operation: a zero-filled block of T from
// VorArrayBuild2, overflow-checked, released on every path.
template <typename T>
class WorkingArray {
public:
    WorkingArray() = default;
    WorkingArray(const WorkingArray&) = delete;
    WorkingArray& operator=(const WorkingArray&) = delete;
    ~WorkingArray() { VorArrayFree(&slot_); }

    // count_a x count_b elements (count_b = 1 for a plain run of count_a).
    bool build(std::uint32_t count_a, std::uint32_t count_b = 1) {
        VorArrayFree(&slot_);
        return VorArrayBuild2(&slot_, count_a, count_b, sizeof(T)) != 0;
    }
    T* get() const { return static_cast<T*>(slot_); }
    T& operator[](std::size_t i) const { return get()[i]; }

private:
    void* slot_ = nullptr;
};

}  // namespace vorlite::core

#endif
