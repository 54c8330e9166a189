// Internal helpers of the tone folder shared with other folders.
#ifndef VORLITE_TONE_INTERNAL_H
#define VORLITE_TONE_INTERNAL_H

#include <array>
#include <cstddef>
#include <cstdint>
#include <functional>

#include "core/core_internal.h"
#include "zentra_vorlite.h"

namespace vorlite::tone {

// Random numbers: one generator step and the uniform float of a state,
// inline so that per-pixel grain loops run without a call per draw. They
// are exactly the steps of VorRNGNextInt and VorRNGNextFloat.
constexpr std::uint32_t rng_step(std::uint32_t state) { return state * 69069u + 1u; }
inline float rng_unit_float(std::uint32_t state) {
    // Round the state to float first, then scale by 2^-32 (exact): states
    // from 4294967168 up round to 2^32 and give exactly 1.0.
    return static_cast<float>(state) * 0x1p-32f;
}

// Grain, drawn eight generator steps at a time in lanes where the lanes are
// exact (lanes = true), or one draw at a time: the reference the lanes are
// held against.
void add_noise(VorBitmap* bitmap, float intensity, std::uint32_t seed, bool lanes);
void add_channel_noise(VorBitmap* bitmap, float intensity, std::uint32_t seed, bool lanes);

// Integral images: the sum over the inclusive rectangle x0..x1, y0..y1 of a
// width-wide sum table, modulo 2^32 (four reads whatever the box size).
// The grey level of the grey integral image: 0.2 red, 0.7 green, 0.1 blue
// in double, then rounded in float: narrowing first, then adding the half.
inline std::uint32_t grey_level(const std::uint8_t* p) {
    const double weighted = p[0] * 0.2 + p[1] * 0.7 + p[2] * 0.1;
    return static_cast<std::uint32_t>(static_cast<float>(weighted) + 0.5f);
}

inline std::uint32_t box_sum(const std::uint32_t* sums, std::uint32_t width, std::uint32_t x0,
                             std::uint32_t y0, std::uint32_t x1, std::uint32_t y1) {
    const auto at = [&](std::uint32_t x, std::uint32_t y) {
        return sums[static_cast<std::size_t>(y) * width + x];
    };
    std::uint32_t sum = at(x1, y1);
    if (y0 > 0) sum -= at(x1, y0 - 1);
    if (x0 > 0) sum -= at(x0 - 1, y1);
    if (x0 > 0 && y0 > 0) sum += at(x0 - 1, y0 - 1);
    return sum;
}

// Integer division by a divisor fixed in advance, as a 64-bit multiply and
// a shift: exact for every n with n x (divisor - 1) < 2^shift.
struct ExactDivider {
    std::uint64_t multiplier = 0;
    unsigned shift = 0;
    ExactDivider() = default;
    ExactDivider(std::uint32_t divisor, unsigned shift);
    std::uint32_t divide(std::uint32_t n) const { return static_cast<std::uint32_t>((n * multiplier) >> shift); }
};

// Local contrast: VorBlurHistMap with a given box radius, its integral
// images streamed a few rows ahead of the pass with exact multiplies for
// the repeated divisions (whole boxes eight at a time where the processor
// has 256-bit lanes and `lanes` allows), or (reference = true) as written:
// a mapped copy, two full-size integral images and plain divisions.
void blur_hist_map(VorBitmap* bitmap, const VorHistMap* map, int radius, bool reference, bool lanes = true);

// Sharpening and soft focus: the shape of one box-hybrid pass for a bitmap
// of the given size and amount. The pass sums 2r + 1 boxes of b pixels,
// box r covering x - m .. x + m; sigma is the Gaussian's deviation in boxes.
struct BoxHybridShape {
    bool sharpen;  // false: the pass returns the blur itself
    std::int32_t radius;
    std::int32_t box;
    std::int32_t half_box;
    float sigma;
};
// False when the scaled amount is 0, so the pass leaves the bitmap alone.
bool box_hybrid_shape(std::uint32_t width, std::uint32_t height, float amount,
                      BoxHybridShape* shape);
// Box weights are fixed point with 4096 for one; the weighted sum of a
// pixel starts at 2048 so that dividing by 4096 rounds.
inline constexpr std::int32_t k_box_hybrid_weight_one = 4096;
inline constexpr std::uint32_t k_box_hybrid_rounding = 2048;
// The 2r + 1 box weights k on the 4096 fixed-point scale, truncated.
void box_hybrid_weights(const BoxHybridShape& shape, std::int32_t* weights);
// r never exceeds 4, so a pass reads at most 2r + 2 = 10 prefix sums.
inline constexpr std::size_t k_box_hybrid_max_taps = 10;
// The difference kernel d of the 2r + 2 prefix-sum reads, modulo 2^32:
// d_0 = -k_0, d_j = k_(j-1) - k_j, d_(2r+1) = k_(2r).
using BoxHybridKernel = std::array<std::uint32_t, k_box_hybrid_max_taps>;
BoxHybridKernel box_hybrid_difference_kernel(const BoxHybridShape& shape);
// One pass (rows, or columns when `columns`) computed the plain way from the
// integral lines, for holding the vectorised running-sum form against.
void box_hybrid_pass_reference(VorBitmap* bitmap, float amount, bool columns);
// One pass of a bitmap with pixels in the running-sum vector form, storing
// the reference's bytes. False, with the bitmap untouched, where that form
// does not apply (a difference weight beyond 16 bits, a kernel far wider
// than the line, no vector lanes): the caller then runs the reference.
// Working memory that cannot be had leaves the bitmap alone.
bool box_hybrid_pass_fast(VorBitmap* bitmap, const BoxHybridShape& shape, bool columns);
// Both passes with the vertical one streamed right behind the horizontal
// one, so that each row of the bitmap is read and written once. `finish`
// receives each bitmap row, still holding its original pixels, and the row
// filtered by both passes (scratch it may change); it stores the result.
// Unavailable when the passes would not touch the bitmap or the kernel
// suits only the reference form: the caller then runs the passes itself.
enum class TwoPasses { done, unavailable, out_of_memory };
using FinishRow = std::function<void(std::uint8_t* row, std::uint8_t* filtered, std::uint32_t width)>;
TwoPasses box_hybrid_two_passes(VorBitmap* bitmap, float amount, const FinishRow& finish);

// Intensity map: VorBitmapIntensityMap one pixel at a time, each pixel's
// mapped colour blended with VorColorBlend. The table and colour-mode
// paths of the map give its bytes.
void intensity_map_per_pixel(VorBitmap* bitmap, const VorHistMap& map, std::uint32_t mode, float opacity);

// Histograms: the per-channel histogram of a bitmap and its cumulative
// distribution, in working memory released with the record.
struct ChannelStatistics {
    core::WorkingArray<VorHistogram> histogram;
    core::WorkingArray<VorCDF> cdf;
};
// Allocates, then fills the histogram and the CDF of the bitmap; false,
// with every buffer already allocated released again, when memory runs out.
bool gather_channel_statistics(const VorBitmap* bitmap, ChannelStatistics* statistics);

}  // namespace vorlite::tone

#endif
