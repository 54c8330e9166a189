// Single-precision exp, log, pow, sin and cos whose results are the same bits
// on every target. Each widens its argument to double, works over a small
// table and a short polynomial with one rounding per operation (the build
// forbids contracting a*b+c into a fused multiply-add), and narrows once at
// the end. These are the results of the 32-bit ARM phone the library's
// outputs are defined on; the C library of another machine may pick fused or
// otherwise different code and differ in the last bit.
//
// Special values are produced from bit patterns rather than by arithmetic
// that overflows or divides by zero, so no path raises invalid, divide-by-zero
// or overflow and the functions behave the same with those traps enabled. A
// NaN argument comes back quiet with its payload, as an arithmetic step would
// return it; an invalid operation gives the positive default NaN.
#include <array>
#include <cstdint>

#include "core/core_internal.h"

namespace vorlite::core {
namespace {

constexpr std::uint32_t bits_of(float x) { return bit_cast<std::uint32_t>(x); }
constexpr std::uint64_t bits_of(double x) { return bit_cast<std::uint64_t>(x); }
constexpr double double_bits(std::uint64_t bits) { return bit_cast<double>(bits); }

constexpr std::uint32_t k_sign = 0x80000000u;
constexpr std::uint32_t k_quiet = 0x00400000u;
constexpr std::uint32_t k_inf_bits = 0x7F800000u;
constexpr float k_inf = float_bits(k_inf_bits);
constexpr float k_min_subnormal = float_bits(1u);
// The NaN an invalid operation produces on the reference: positive and
// without payload (x86 produces the negative one).
constexpr float k_default_nan = float_bits(0x7FC00000u);

constexpr bool is_nan(std::uint32_t ix) { return (ix & ~k_sign) > k_inf_bits; }
constexpr bool is_signaling(std::uint32_t ix) { return is_nan(ix) && (ix & k_quiet) == 0; }
constexpr float quiet(std::uint32_t ix) { return float_bits(ix | k_quiet); }
constexpr float with_sign(float magnitude, bool negative) {
    return negative ? float_bits(bits_of(magnitude) | k_sign) : magnitude;
}

// The NaN that x + y returns on the reference when at least one of them is
// NaN: a signalling operand wins over a quiet one, then the first over the
// second.
constexpr float nan_of_sum(std::uint32_t ix, std::uint32_t iy) {
    if (is_signaling(ix)) return quiet(ix);
    if (is_signaling(iy)) return quiet(iy);
    return is_nan(ix) ? quiet(ix) : quiet(iy);
}

// Top 12 bits of the representation (sign, exponent, three mantissa bits),
// enough to place an argument among the ranges of each method.
constexpr std::uint32_t top12(float x) { return bits_of(x) >> 20; }
constexpr std::uint32_t abs_top12(float x) { return top12(x) & 0x7FF; }

// ---------------------------------------------------------------------------
// 2^x: a 32-entry table of 2^(i/32) plus a degree-3 polynomial for 2^r with
// |r| <= 1/64. Shared by exp and pow.

constexpr int k_exp2_table_bits = 5;
constexpr std::uint64_t k_exp2_n = 1u << k_exp2_table_bits;

// Entry i is the representation of 2^(i/32) less i << 47, so that adding
// k << 47 for k = 32 m + i gives 2^(k/32) directly, exponent included.
constexpr std::array<std::uint64_t, k_exp2_n> k_exp2_table = {
    0x3ff0000000000000, 0x3fefd9b0d3158574, 0x3fefb5586cf9890f, 0x3fef9301d0125b51,
    0x3fef72b83c7d517b, 0x3fef54873168b9aa, 0x3fef387a6e756238, 0x3fef1e9df51fdee1,
    0x3fef06fe0a31b715, 0x3feef1a7373aa9cb, 0x3feedea64c123422, 0x3feece086061892d,
    0x3feebfdad5362a27, 0x3feeb42b569d4f82, 0x3feeab07dd485429, 0x3feea47eb03a5585,
    0x3feea09e667f3bcd, 0x3fee9f75e8ec5f74, 0x3feea11473eb0187, 0x3feea589994cce13,
    0x3feeace5422aa0db, 0x3feeb737b0cdc5e5, 0x3feec49182a3f090, 0x3feed503b23e255d,
    0x3feee89f995ad3ad, 0x3feeff76f2fb5e47, 0x3fef199bdd85529c, 0x3fef3720dcef9069,
    0x3fef5818dcfba487, 0x3fef7c97337b9b5f, 0x3fefa4afa2a490da, 0x3fefd0765b6e4540,
};

// 2^r ~ 1 + c2 r + c1 r^2 + c0 r^3 for r in units of 1.
constexpr std::array<double, 3> k_exp2_poly = {0x1.c6af84b912394p-5, 0x1.ebfce50fac4f3p-3,
                                               0x1.62e42ff0c52d6p-1};
// The same polynomial for r in units of 1/32 (the scalings are exact).
constexpr std::array<double, 3> k_exp2_poly_scaled = {
    0x1.c6af84b912394p-5 / 32 / 32 / 32, 0x1.ebfce50fac4f3p-3 / 32 / 32,
    0x1.62e42ff0c52d6p-1 / 32};

// Adding 1.5 * 2^52 rounds a double of magnitude below 2^51 to an integer in
// the low mantissa bits; 1.5 * 2^47 does the same in steps of 1/32.
constexpr double k_round_shift = 0x1.8p+52;
constexpr double k_round_shift_scaled = 0x1.8p+52 / 32;

// s * 2^r from the table entry of the rounded exponent and the remainder r.
// ki holds the rounded exponent, in units of 1/32, in its low bits;
// sign_bias (1 << 16, or 0) lands on the sign bit of the scale.
inline double exp2_scaled(std::uint64_t ki, std::uint64_t sign_bias, double r,
                          const std::array<double, 3>& c) {
    std::uint64_t t = k_exp2_table[ki % k_exp2_n];
    t += (ki + sign_bias) << (52 - k_exp2_table_bits);
    const double s = double_bits(t);
    const double z = c[0] * r + c[1];
    const double r2 = r * r;
    double y = c[2] * r + 1.0;
    y = z * r2 + y;
    return y * s;
}

// 2^xd for |xd| below 1023, negated when sign_bias is set: xd = k/32 + r.
inline double exp2_of(double xd, std::uint64_t sign_bias) {
    double kd = xd + k_round_shift_scaled;
    const std::uint64_t ki = bits_of(kd);
    kd -= k_round_shift_scaled;
    return exp2_scaled(ki, sign_bias, xd - kd, k_exp2_poly);
}

// ---------------------------------------------------------------------------
// Logarithms: the argument is split as 2^k z with z in [0x3F330000, 2 x that)
// (about 0.7 to 1.4), the range cut into 16 parts, each with a centre c whose
// 1/c and log(c) are tabled; log1p(z/c - 1) comes from a short polynomial.

constexpr int k_log_table_bits = 4;
constexpr std::uint32_t k_log_n = 1u << k_log_table_bits;
constexpr std::uint32_t k_log_offset = 0x3F330000u;

struct LogEntry {
    double invc, logc;
};

// 1/c and ln(c).
constexpr std::array<LogEntry, k_log_n> k_log_table = {{
    {0x1.661ec79f8f3bep+0, -0x1.57bf7808caadep-2},
    {0x1.571ed4aaf883dp+0, -0x1.2bef0a7c06ddbp-2},
    {0x1.49539f0f010bp+0, -0x1.01eae7f513a67p-2},
    {0x1.3c995b0b80385p+0, -0x1.b31d8a68224e9p-3},
    {0x1.30d190c8864a5p+0, -0x1.6574f0ac07758p-3},
    {0x1.25e227b0b8eap+0, -0x1.1aa2bc79c81p-3},
    {0x1.1bb4a4a1a343fp+0, -0x1.a4e76ce8c0e5ep-4},
    {0x1.12358f08ae5bap+0, -0x1.1973c5a611cccp-4},
    {0x1.0953f419900a7p+0, -0x1.252f438e10c1ep-5},
    {0x1p+0, 0x0p+0},
    {0x1.e608cfd9a47acp-1, 0x1.aa5aa5df25984p-5},
    {0x1.ca4b31f026aap-1, 0x1.c5e53aa362eb4p-4},
    {0x1.b2036576afce6p-1, 0x1.526e57720db08p-3},
    {0x1.9c2d163a1aa2dp-1, 0x1.bc2860d22477p-3},
    {0x1.886e6037841edp-1, 0x1.1058bc8a07ee1p-2},
    {0x1.767dcf5534862p-1, 0x1.4043057b6ee09p-2},
}};
constexpr double k_ln2 = 0x1.62e42fefa39efp-1;
// log1p(r) ~ r + a2 r^2 + a1 r^3 + a0 r^4.
constexpr std::array<double, 3> k_log_poly = {-0x1.00ea348b88334p-2, 0x1.5575b0be00b6ap-2,
                                              -0x1.ffffef20a4123p-2};

// 1/c and log2(c), for the more accurate base-2 logarithm inside pow.
constexpr std::array<LogEntry, k_log_n> k_log2_table = {{
    {0x1.661ec79f8f3bep+0, -0x1.efec65b963019p-2},
    {0x1.571ed4aaf883dp+0, -0x1.b0b6832d4fca4p-2},
    {0x1.49539f0f010bp+0, -0x1.7418b0a1fb77bp-2},
    {0x1.3c995b0b80385p+0, -0x1.39de91a6dcf7bp-2},
    {0x1.30d190c8864a5p+0, -0x1.01d9bf3f2b631p-2},
    {0x1.25e227b0b8eap+0, -0x1.97c1d1b3b7afp-3},
    {0x1.1bb4a4a1a343fp+0, -0x1.2f9e393af3c9fp-3},
    {0x1.12358f08ae5bap+0, -0x1.960cbbf788d5cp-4},
    {0x1.0953f419900a7p+0, -0x1.a6f9db6475fcep-5},
    {0x1p+0, 0x0p+0},
    {0x1.e608cfd9a47acp-1, 0x1.338ca9f24f53dp-4},
    {0x1.ca4b31f026aap-1, 0x1.476a9543891bap-3},
    {0x1.b2036576afce6p-1, 0x1.e840b4ac4e4d2p-3},
    {0x1.9c2d163a1aa2dp-1, 0x1.40645f0c6651cp-2},
    {0x1.886e6037841edp-1, 0x1.88e9c2c1b9ff8p-2},
    {0x1.767dcf5534862p-1, 0x1.ce0a44eb17bccp-2},
}};
// log1p(r)/ln2 ~ a4 r + a3 r^2 + a2 r^3 + a1 r^4 + a0 r^5.
constexpr std::array<double, 5> k_log2_poly = {0x1.27616c9496e0bp-2, -0x1.71969a075c67ap-2,
                                               0x1.ec70a6ca7baddp-2, -0x1.7154748bef6c8p-1,
                                               0x1.71547652ab82bp0};

// log2 of the positive float with representation ix, where a subnormal has
// been normalised to a representation whose biased exponent is negative
// (the wrap-around of the unsigned arithmetic carries it into k).
inline double log2_of_bits(std::uint32_t ix) {
    const std::uint32_t tmp = ix - k_log_offset;
    const std::uint32_t i = (tmp >> (23 - k_log_table_bits)) % k_log_n;
    const std::uint32_t top = tmp & 0xFF800000u;
    const std::uint32_t iz = ix - top;
    const int k = static_cast<std::int32_t>(top) >> 23;
    const LogEntry& e = k_log2_table[i];
    const double z = float_bits(iz);

    const double r = z * e.invc - 1.0;
    const double y0 = e.logc + static_cast<double>(k);
    const auto& a = k_log2_poly;
    const double r2 = r * r;
    double y = a[0] * r + a[1];
    const double p = a[2] * r + a[3];
    const double r4 = r2 * r2;
    double q = a[4] * r + y0;
    q = p * r2 + q;
    y = y * r4 + q;
    return y;
}

// pow's test for an integer exponent on the representation of a non-zero
// finite y: 0 not an integer, 1 odd, 2 even.
constexpr int integer_kind(std::uint32_t iy) {
    const int e = static_cast<int>((iy >> 23) & 0xFF);
    if (e < 0x7F) return 0;
    if (e > 0x7F + 23) return 2;
    const std::uint32_t unit = 1u << (0x7F + 23 - e);
    if (iy & (unit - 1)) return 0;
    if (iy & unit) return 1;
    return 2;
}

// Zero, infinity or NaN: the values where pow's general path does not apply.
constexpr bool is_zero_inf_nan(std::uint32_t ix) { return 2 * ix - 1 >= 2u * k_inf_bits - 1; }

// pow for y zero, infinite or NaN.
float pow_special_exponent(std::uint32_t ix, std::uint32_t iy) {
    if (2 * iy == 0) return is_signaling(ix) ? quiet(ix) : 1.0f;
    if (ix == 0x3F800000u) return is_signaling(iy) ? quiet(iy) : 1.0f;
    if (is_nan(ix) || is_nan(iy)) return nan_of_sum(ix, iy);
    if (2 * ix == 2 * 0x3F800000u) return 1.0f;  // (-1)^(+-inf)
    // |x| < 1 with y = +inf, or |x| > 1 with y = -inf, vanishes.
    if ((2 * ix < 2 * 0x3F800000u) == !(iy & k_sign)) return 0.0f;
    return k_inf;
}

// pow for x zero, infinite or NaN and y finite and non-zero: x^y is x*x
// (0, infinity or x's NaN) or its reciprocal, negated for a negative x and
// an odd y.
float pow_special_base(std::uint32_t ix, std::uint32_t iy) {
    const bool negative = (ix & k_sign) && integer_kind(iy) == 1;
    const bool y_negative = (iy & k_sign) != 0;
    if (is_nan(ix)) return float_bits((ix | k_quiet) ^ (negative ? k_sign : 0u));
    const bool x_is_zero = 2 * ix == 0;
    const bool infinite = x_is_zero == y_negative;
    return with_sign(infinite ? k_inf : 0.0f, negative);
}

// ---------------------------------------------------------------------------
// Sine and cosine: reduction to r in [-pi/4, pi/4] and a quadrant n, then
// odd (sine) or even (cosine) polynomials in r, evaluated in double. The
// second table negates the cosine polynomial so quadrants 2 and 3 come for
// free.

struct SinCosTable {
    std::array<double, 4> sign;  // sign of the sine in quadrants 0..3
    double hpi_inv;              // 2/pi, times 2^24 for the fixed-point quadrant
    double hpi;                  // pi/2
    double c0, c1, c2, c3, c4;   // cosine polynomial
    double s1, s2, s3;           // sine polynomial
};

constexpr std::array<SinCosTable, 2> k_sincos = {{
    {{1.0, -1.0, -1.0, 1.0},
     0x1.45F306DC9C883p+23,
     0x1.921FB54442D18p0,
     0x1p0,
     -0x1.ffffffd0c621cp-2,
     0x1.55553e1068f19p-5,
     -0x1.6c087e89a359dp-10,
     0x1.99343027bf8c3p-16,
     -0x1.555545995a603p-3,
     0x1.1107605230bc4p-7,
     -0x1.994eb3774cf24p-13},
    {{1.0, -1.0, -1.0, 1.0},
     0x1.45F306DC9C883p+23,
     0x1.921FB54442D18p0,
     -0x1p0,
     0x1.ffffffd0c621cp-2,
     -0x1.55553e1068f19p-5,
     0x1.6c087e89a359dp-10,
     -0x1.99343027bf8c3p-16,
     -0x1.555545995a603p-3,
     0x1.1107605230bc4p-7,
     -0x1.994eb3774cf24p-13},
}};

// 4/pi to 192 bits; entry j holds bits 8j .. 8j + 31, so any 32-bit window
// starting on a byte is one aligned load.
constexpr std::array<std::uint32_t, 24> k_inv_pio4 = {
    0xa2,       0xa2f9,     0xa2f983,   0xa2f9836e, 0xf9836e4e, 0x836e4e44,
    0x6e4e4415, 0x4e441529, 0x441529fc, 0x1529fc27, 0x29fc2757, 0xfc2757d1,
    0x2757d1f5, 0x57d1f534, 0xd1f534dd, 0xf534ddc0, 0x34ddc0db, 0xddc0db62,
    0xc0db6295, 0xdb629599, 0x6295993c, 0x95993c43, 0x993c4390, 0x3c439041};

constexpr float k_pio4 = 0x1.921FB6p-1f;
constexpr double k_pi63 = 0x1.921FB54442D18p-62;  // 2 pi / 2^64

// sin(x) for even n, cos(x) for odd n, with x2 = x * x.
inline float sin_cos_poly(double x, double x2, const SinCosTable& p, int n) {
    if ((n & 1) == 0) {
        const double x3 = x * x2;
        const double s1 = p.s2 + x2 * p.s3;
        const double x7 = x3 * x2;
        const double s = x + x3 * p.s1;
        return static_cast<float>(s + x7 * s1);
    }
    const double x4 = x2 * x2;
    const double c2 = p.c3 + x2 * p.c4;
    const double c1 = p.c0 + x2 * p.c1;
    const double x6 = x4 * x2;
    const double c = c1 + x4 * p.c2;
    return static_cast<float>(c + x6 * c2);
}

// For |x| < 120: one multiply-subtract with pi/2 in double. The quadrant is
// rounded in fixed point (2/pi prescaled by 2^24) so that truncating a
// negative product still rounds to nearest.
inline double reduce_fast(double x, const SinCosTable& p, int* quadrant) {
    const double r = x * p.hpi_inv;
    const int n = (static_cast<std::int32_t>(r) + 0x800000) >> 24;
    *quadrant = n;
    return x - n * p.hpi;
}

// For finite |x| >= 120, from its representation (sign ignored): the exact
// product of the 24-bit mantissa with 96 bits of 4/pi gives x mod pi/2 as a
// 2.62 fixed-point number.
inline double reduce_large(std::uint32_t xi, int* quadrant) {
    const std::uint32_t* arr = &k_inv_pio4[(xi >> 26) & 15];
    const int shift = static_cast<int>((xi >> 23) & 7);
    xi = ((xi & 0xFFFFFF) | 0x800000) << shift;

    // The first product only contributes its low 32 bits.
    std::uint64_t res0 = static_cast<std::uint32_t>(xi * arr[0]);
    const std::uint64_t res1 = static_cast<std::uint64_t>(xi) * arr[4];
    const std::uint64_t res2 = static_cast<std::uint64_t>(xi) * arr[8];
    res0 = (res2 >> 32) | (res0 << 32);
    res0 += res1;

    const std::uint64_t n = (res0 + (1ull << 61)) >> 62;
    res0 -= n << 62;
    *quadrant = static_cast<int>(n);
    return static_cast<double>(static_cast<std::int64_t>(res0)) * k_pi63;
}

// sin (cos_shift 0) or cos (cos_shift 1) of y, |y| >= pi/4 and finite.
inline float sin_cos_reduced(float y, int cos_shift) {
    const SinCosTable* p = &k_sincos[0];
    int n;
    double x;
    int quadrant;
    if (abs_top12(y) < abs_top12(120.0f)) {
        x = reduce_fast(y, *p, &n);
        quadrant = n;
    } else {
        const std::uint32_t xi = bits_of(y);
        x = reduce_large(xi, &n);
        quadrant = n + static_cast<int>(xi >> 31);
    }
    const double s = p->sign[quadrant & 3];
    if (quadrant & 2) p = &k_sincos[1];
    return sin_cos_poly(x * s, x * x, *p, n ^ cos_shift);
}

}  // namespace

// e^x = 2^(k/32) 2^(r/32) with k = round(32 x / ln 2): the 32-entry table
// and the cubic, all in double.
float expf(float x) {
    const std::uint32_t ix = bits_of(x);
    const std::uint32_t abstop = abs_top12(x);
    if (abstop >= top12(88.0f)) {
        if (ix == bits_of(-k_inf)) return 0.0f;
        if (abstop >= top12(k_inf)) return is_nan(ix) ? quiet(ix) : x;
        if (x > 0x1.62e42ep6f) return k_inf;             // beyond log(2^128)
        if (x < -0x1.9fe368p6f) return 0.0f;             // below log(2^-150)
        if (x < -0x1.9d1d9ep6f) return k_min_subnormal;  // below log(2^-149)
    }
    const double z = 0x1.71547652b82fep+5 * static_cast<double>(x);  // 32 / ln 2
    double kd = z + k_round_shift;
    const std::uint64_t ki = bits_of(kd);
    kd -= k_round_shift;
    const double r = z - kd;
    return static_cast<float>(exp2_scaled(ki, 0, r, k_exp2_poly_scaled));
}

// ln x = ln(c) + k ln 2 + log1p(z/c - 1), from the 16-entry table and a
// degree-4 polynomial, in double.
float logf(float x) {
    std::uint32_t ix = bits_of(x);
    if (ix == 0x3F800000u) return 0.0f;
    if (ix - 0x00800000u >= k_inf_bits - 0x00800000u) {
        // Zero, subnormal, negative, infinite or NaN.
        if (2 * ix == 0) return -k_inf;
        if (ix == k_inf_bits) return x;
        if (is_nan(ix)) return quiet(ix);
        if (ix & k_sign) return k_default_nan;
        // Subnormal: scaled exactly into the normal range, exponent taken back.
        ix = bits_of(x * 0x1p23f);
        ix -= 23u << 23;
    }
    const std::uint32_t tmp = ix - k_log_offset;
    const std::uint32_t i = (tmp >> (23 - k_log_table_bits)) % k_log_n;
    const int k = static_cast<std::int32_t>(tmp) >> 23;
    const std::uint32_t iz = ix - (tmp & (0x1FFu << 23));
    const LogEntry& e = k_log_table[i];
    const double z = float_bits(iz);

    const double r = z * e.invc - 1.0;
    const double y0 = e.logc + static_cast<double>(k) * k_ln2;
    const auto& a = k_log_poly;
    const double r2 = r * r;
    double y = a[1] * r + a[2];
    y = a[0] * r2 + y;
    y = y * r2 + (y0 + r);
    return static_cast<float>(y);
}

// x^y = 2^(y log2 x): log2 from the 16-entry table and a degree-5
// polynomial, the product in double (exact enough: y has 24 bits), then the
// 2^x of exp. A negative x is allowed for integer y, the sign following
// y's parity.
float powf(float x, float y) {
    std::uint64_t sign_bias = 0;
    std::uint32_t ix = bits_of(x);
    const std::uint32_t iy = bits_of(y);
    if (ix - 0x00800000u >= k_inf_bits - 0x00800000u || is_zero_inf_nan(iy)) {
        // x zero, subnormal, negative, infinite or NaN, or y zero, infinite or NaN.
        if (is_zero_inf_nan(iy)) return pow_special_exponent(ix, iy);
        if (is_zero_inf_nan(ix)) return pow_special_base(ix, iy);
        if (ix & k_sign) {
            const int kind = integer_kind(iy);
            if (kind == 0) return k_default_nan;
            if (kind == 1) sign_bias = 1u << (k_exp2_table_bits + 11);
            ix &= ~k_sign;
        }
        if (ix < 0x00800000u) {
            ix = bits_of(x * 0x1p23f) & ~k_sign;
            ix -= 23u << 23;
        }
    }
    const bool negative = sign_bias != 0;
    const double ylogx = static_cast<double>(y) * log2_of_bits(ix);
    if (((bits_of(ylogx) >> 47) & 0xFFFF) >= bits_of(126.0) >> 47) {
        // |y log2 x| >= 126: the result may leave the normal range.
        if (ylogx > 0x1.fffffffd1d571p+6) return with_sign(k_inf, negative);
        if (ylogx > 0x1.fffffffa3aae2p+6) {
            // Just below 2^128 the final narrowing may round up to infinity;
            // give infinity without the overflow of the conversion.
            const double big = exp2_of(ylogx, sign_bias);
            if ((negative ? -big : big) >= 0x1.ffffffp127) return with_sign(k_inf, negative);
            return static_cast<float>(big);
        }
        if (ylogx <= -150.0) return with_sign(0.0f, negative);
        if (ylogx < -149.0) return with_sign(k_min_subnormal, negative);
    }
    return static_cast<float>(exp2_of(ylogx, sign_bias));
}

float sinf(float y) {
    const std::uint32_t top = abs_top12(y);
    if (top < abs_top12(k_pio4)) {
        // sin y rounds to y below 2^-12.
        if (top < abs_top12(0x1p-12f)) return y;
        const double x = y;
        return sin_cos_poly(x, x * x, k_sincos[0], 0);
    }
    if (top < abs_top12(k_inf)) return sin_cos_reduced(y, 0);
    return is_nan(bits_of(y)) ? quiet(bits_of(y)) : k_default_nan;
}

float cosf(float y) {
    const std::uint32_t top = abs_top12(y);
    if (top < abs_top12(k_pio4)) {
        // cos y rounds to 1 below 2^-12.
        if (top < abs_top12(0x1p-12f)) return 1.0f;
        const double x = y;
        return sin_cos_poly(x, x * x, k_sincos[0], 1);
    }
    if (top < abs_top12(k_inf)) return sin_cos_reduced(y, 1);
    return is_nan(bits_of(y)) ? quiet(bits_of(y)) : k_default_nan;
}

}  // namespace vorlite::core
