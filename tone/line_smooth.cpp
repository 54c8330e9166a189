// Gaussian smoothing of a line of floats, the kernel spanning the whole
// line: it smooths the 256 per-level gains of local contrast and auto
// enhance, where the ends of the line matter as much as the middle.
#include "core/core_internal.h"

extern "C" {

VOR_API void VorLineSmooth1D(float* values, uint32_t n, int32_t sigma) {
    vorlite::core::WorkingArray<float> scratch;
    if (!scratch.build(n, 2)) return;
    float* const smoothed = scratch.get();
    float* const weight = smoothed + n;
    // 2 sigma^2 and -(i - j)^2 are integer products; they wrap as 32-bit
    // ints would, without the undefined behaviour of signed overflow.
    const auto s = static_cast<std::uint32_t>(sigma);
    const float k = 1.0f / static_cast<float>(static_cast<std::int32_t>(2u * s * s));
    // The weight depends only on the distance |i - j|, so each distinct
    // exponential is computed once; the sums below use the very same values.
    for (std::uint32_t d = 0; d < n; ++d) {
        const auto exponent = static_cast<std::int32_t>(0u - d * d);
        weight[d] = vorlite::core::expf(static_cast<float>(exponent) * k);
    }
    for (std::uint32_t i = 0; i < n; ++i) {
        float num = 0.0f;
        float den = 0.0f;
        for (std::uint32_t j = 0; j < n; ++j) {
            const float w = weight[i > j ? i - j : j - i];
            num += values[j] * w;
            den += w;
        }
        smoothed[i] = num / den;
    }
    for (std::uint32_t i = 0; i < n; ++i) values[i] = smoothed[i];
}

}  // extern "C"
