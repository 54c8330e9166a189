// Error function and normal distribution behind the box-hybrid kernel:
// a 28-term Chebyshev expansion of erfc, run in single precision with
// only the final exponential in double, so every kernel weight is the
// same on each platform.
#include <array>

#include "core/core_internal.h"

namespace {

// Chebyshev coefficients of erfc(z) in the variable 4t - 2, t = 2 / (2 + z).
constexpr std::array<float, 28> kErfcCoefficients = {
    -1.3026537197817094f,   6.4196979235649026e-1f, 1.9476473204185836e-2f,
    -9.561514786808631e-3f, -9.46595344482036e-4f,  3.66839497852761e-4f,
    4.2523324806907e-5f,    -2.0278578112534e-5f,   -1.624290004647e-6f,
    1.303655835580e-6f,     1.5626441722e-8f,       -8.5238095915e-8f,
    6.529054439e-9f,        5.059343495e-9f,        -9.91364156e-10f,
    -2.27365122e-10f,       9.6467911e-11f,         2.394038e-12f,
    -6.886027e-12f,         8.94487e-13f,           3.13092e-13f,
    -1.12708e-13f,          3.81e-16f,              7.106e-15f,
    -1.523e-15f,            -9.4e-17f,              1.21e-16f,
    -2.8e-17f};

}  // namespace

extern "C" {

VOR_API float VorMathErfccheb(float z) {
    // erfc is only expanded on the right half-line; the left half is
    // reached through erf's symmetry instead.
    if (z < 0.0f) return 0.0f;
    const float t = 2.0f / (2.0f + z);
    const float ty = 4.0f * t - 2.0f;
    float d = 0.0f;
    float dd = 0.0f;
    for (int j = 27; j > 0; --j) {
        const float previous = d;
        d = ty * d - dd + kErfcCoefficients[j];
        dd = previous;
    }
    // The last Clenshaw step is a float step like the others; only the
    // exponent is assembled in double.
    const float last = kErfcCoefficients[0] + ty * d;
    const float minus_z_squared = -z * z;
    const double exponent =
        (static_cast<double>(minus_z_squared) - static_cast<double>(dd)) +
        0.5 * static_cast<double>(last);
    return static_cast<float>(static_cast<double>(t) * vorlite::core::exp(exponent));
}

VOR_API float VorMathErf(float x) {
    if (x >= 0.0f) return 1.0f - VorMathErfccheb(x);
    return VorMathErfccheb(-x) - 1.0f;
}

VOR_API float VorMathNormalCDF(float x, float sigma) {
    const float y = static_cast<float>(static_cast<double>(x) * 0.7071067811865476 /
                                       static_cast<double>(sigma));
    return 0.5f * (1.0f + VorMathErf(y));
}

}  // extern "C"
