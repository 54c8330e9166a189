// Double-precision exp, log, pow, sin, cos and atan2 that give the same bits
// on every target. The C libraries disagree in the last bit: one picks a
// fused multiply-add variant at run time on x86-64, another uses different
// algorithms altogether. These reproduce, operation for operation, the
// portable code of the C library of our reference phone (32-bit ARM, no
// fused multiply-add), so a result never depends on where it is computed.
//
// Every step is a plain IEEE double operation in the order written; the
// build forbids contraction (-ffp-contract=off), so a*b + c stays two
// roundings. Special inputs follow C99 Annex F; errno and the floating-point
// flags are left alone, and a NaN result carries no promised payload.
#include <cstdint>
#include <limits>

#include "core/core_internal.h"

namespace vorlite::core {

namespace {

constexpr double k_inf = std::numeric_limits<double>::infinity();

constexpr std::uint64_t bits_of(double x) { return bit_cast<std::uint64_t>(x); }
constexpr double from_bits(std::uint64_t b) { return bit_cast<double>(b); }
constexpr std::uint32_t top12(double x) { return static_cast<std::uint32_t>(bits_of(x) >> 52); }
constexpr std::uint32_t high_word(double x) { return static_cast<std::uint32_t>(bits_of(x) >> 32); }
constexpr std::uint32_t low_word(double x) { return static_cast<std::uint32_t>(bits_of(x)); }
constexpr double abs_of(double x) { return from_bits(bits_of(x) & 0x7fffffffffffffffULL); }
constexpr double with_sign_of(double magnitude, double sign) {
    return from_bits((bits_of(magnitude) & 0x7fffffffffffffffULL) | (bits_of(sign) & 0x8000000000000000ULL));
}

// Results that overflow or underflow, with the sign asked for.
constexpr double overflowed(bool negative) { return negative ? -k_inf : k_inf; }
constexpr double underflowed(bool negative) { return negative ? -0.0 : 0.0; }

// ---------------------------------------------------------------------------
// exp: x = k ln2/128 + r with |r| <= ln2/256; exp(x) = 2^(k/128) exp(r), the
// power of two from a 128-entry table as scale (1 + tail) and exp(r) - 1 from
// a degree-5 polynomial. The caller's xtail carries extra bits of x (pow).

constexpr double k_exp_inv_ln2_n = 0x1.71547652b82fep7;
constexpr double k_exp_neg_ln2_hi_n = -0x1.62e42fefa0000p-8;
constexpr double k_exp_neg_ln2_lo_n = -0x1.cf79abc9e3b3ap-47;
constexpr double k_exp_shift = 0x1.8p52;
constexpr double k_exp_c2 = 0x1.ffffffffffdbdp-2;
constexpr double k_exp_c3 = 0x1.555555555543cp-3;
constexpr double k_exp_c4 = 0x1.55555cf172b91p-5;
constexpr double k_exp_c5 = 0x1.1111167a4d017p-7;
constexpr int k_exp_table_bits = 7;
constexpr std::uint64_t k_exp_n = 1u << k_exp_table_bits;
// Added to k so that the scale's sign bit comes out set (a negative power).
constexpr std::uint64_t k_exp_sign_bias = 0x800u << k_exp_table_bits;

extern const std::uint64_t k_exp_table[2 * k_exp_n];

// scale (1 + tmp) where scale's exponent may lie outside the normal range:
// scaled into range first, and below 1 rounded once at the final precision
// before entering the subnormals, so the result is rounded only once.
double exp_out_of_range(double tmp, std::uint64_t sbits, std::uint64_t ki) {
    if ((ki & 0x80000000u) == 0) {
        sbits -= 1009ULL << 52;
        const double scale = from_bits(sbits);
        return 0x1p1009 * (scale + scale * tmp);
    }
    sbits += 1022ULL << 52;
    const double scale = from_bits(sbits);
    double y = scale + scale * tmp;
    if (abs_of(y) < 1.0) {
        const double one = y < 0.0 ? -1.0 : 1.0;
        double lo = scale - y + scale * tmp;
        const double hi = one + y;
        lo = one - hi + y + lo;
        y = (hi + lo) - one;
        if (y == 0.0) y = from_bits(sbits & 0x8000000000000000ULL);
    }
    return 0x1p-1022 * y;
}

// exp(x + xtail), negated when sign_bias is set; x is finite.
double exp_with_tail(double x, double xtail, std::uint64_t sign_bias) {
    std::uint32_t abstop = top12(x) & 0x7ff;
    if (abstop - top12(0x1p-54) >= top12(512.0) - top12(0x1p-54)) {
        if (abstop - top12(0x1p-54) >= 0x80000000u) {
            const double one = 1.0 + x;
            return sign_bias != 0 ? -one : one;
        }
        if (abstop >= top12(1024.0)) {
            return (bits_of(x) >> 63) != 0 ? underflowed(sign_bias != 0) : overflowed(sign_bias != 0);
        }
        abstop = 0;  // large |x|: the scale needs the out-of-range path
    }
    const double z = k_exp_inv_ln2_n * x;
    double kd = z + k_exp_shift;
    const std::uint64_t ki = bits_of(kd);
    kd -= k_exp_shift;
    double r = x + kd * k_exp_neg_ln2_hi_n + kd * k_exp_neg_ln2_lo_n;
    r += xtail;
    const std::uint64_t idx = 2 * (ki % k_exp_n);
    const std::uint64_t top = (ki + sign_bias) << (52 - k_exp_table_bits);
    const double tail = from_bits(k_exp_table[idx]);
    const std::uint64_t sbits = k_exp_table[idx + 1] + top;
    const double r2 = r * r;
    const double tmp = tail + r + r2 * (k_exp_c2 + r * k_exp_c3) + r2 * r2 * (k_exp_c4 + r * k_exp_c5);
    if (abstop == 0) return exp_out_of_range(tmp, sbits, ki);
    const double scale = from_bits(sbits);
    return scale + scale * tmp;
}

// ---------------------------------------------------------------------------
// log: x = 2^k z with z in [0x1.6p-1, 0x1.6p0) split into 128 intervals of
// centre c; log(x) = k ln2 + log(c) + log1p(z/c - 1), the last by a degree-6
// polynomial. z/c - 1 is formed as (z - c_hi - c_lo) / c, exact enough
// without a fused multiply-add. Near 1 a degree-12 polynomial in x - 1.

constexpr double k_ln2_hi = 0x1.62e42fefa3800p-1;
constexpr double k_ln2_lo = 0x1.ef35793c76730p-45;
constexpr double k_log_a[5] = {-0x1.0000000000001p-1, 0x1.555555551305bp-2, -0x1.fffffffeb459p-3,
                               0x1.999b324f10111p-3, -0x1.55575e506c89fp-3};
constexpr double k_log_b[11] = {-0x1p-1,
                                0x1.5555555555577p-2,
                                -0x1.ffffffffffdcbp-3,
                                0x1.999999995dd0cp-3,
                                -0x1.55555556745a7p-3,
                                0x1.24924a344de3p-3,
                                -0x1.fffffa4423d65p-4,
                                0x1.c7184282ad6cap-4,
                                -0x1.999eb43b068ffp-4,
                                0x1.78182f7afd085p-4,
                                -0x1.5521375d145cdp-4};
constexpr int k_log_table_bits = 7;
constexpr std::uint64_t k_log_off = 0x3fe6000000000000ULL;

struct LogEntry {
    double invc, logc, chi, clo;
};
extern const LogEntry k_log_table[1 << k_log_table_bits];

double log_near_one(double x) {
    const double* b = k_log_b;
    const double r = x - 1.0;
    const double r2 = r * r;
    const double r3 = r * r2;
    double y = r3 * (b[1] + r * b[2] + r2 * b[3] +
                     r3 * (b[4] + r * b[5] + r2 * b[6] + r3 * (b[7] + r * b[8] + r2 * b[9] + r3 * b[10])));
    // r - r^2/2 in two parts, so the leading terms keep their low bits.
    double w = r * 0x1p27;
    const double rhi = r + w - w;
    const double rlo = r - rhi;
    w = rhi * rhi * b[0];
    const double hi = r + w;
    double lo = r - hi + w;
    lo += b[0] * rlo * (rhi + r);
    y += lo;
    y += hi;
    return y;
}

// ---------------------------------------------------------------------------
// pow: exp(y log x) with log x carried to about 68 bits as hi + lo (its own
// 128-entry table whose 1/c have few bits, so z/c - 1 is exact) and the
// product y log x split into halves whose products are exact.

constexpr double k_pow_a[7] = {-0x1p-1,
                               -0x1.555555555556p-1,
                               0x1.0000000000006p-1,
                               0x1.999999959554ep-1,
                               -0x1.555555529a47ap-1,
                               -0x1.2495b9b4845e9p0,
                               0x1.0002b8b263fc3p0};
constexpr int k_pow_table_bits = 7;
constexpr std::uint64_t k_pow_off = 0x3fe6955500000000ULL;

struct PowLogEntry {
    double invc, logc, logctail;
};
extern const PowLogEntry k_pow_log_table[1 << k_pow_table_bits];

// log(x) as the returned head plus *tail; ix is x's bit pattern, subnormals
// pre-normalised with the exponent running negative.
double pow_log(std::uint64_t ix, double* tail) {
    const double* a = k_pow_a;
    const std::uint64_t tmp = ix - k_pow_off;
    const int i = static_cast<int>((tmp >> (52 - k_pow_table_bits)) % (1u << k_pow_table_bits));
    const int k = static_cast<int>(static_cast<std::int64_t>(tmp) >> 52);
    const std::uint64_t iz = ix - (tmp & 0xfffULL << 52);
    const double z = from_bits(iz);
    const double kd = static_cast<double>(k);
    const PowLogEntry& e = k_pow_log_table[i];

    // z split so that zhi * invc - 1 and zlo * invc are exact.
    const double zhi = from_bits((iz + (1ULL << 31)) & (~0ULL << 32));
    const double zlo = z - zhi;
    const double rhi = zhi * e.invc - 1.0;
    const double rlo = zlo * e.invc;
    const double r = rhi + rlo;

    const double t1 = kd * k_ln2_hi + e.logc;
    const double t2 = t1 + r;
    const double lo1 = kd * k_ln2_lo + e.logctail;
    const double lo2 = t1 - t2 + r;
    const double ar = a[0] * r;
    const double ar2 = r * ar;
    const double ar3 = r * ar2;
    const double arhi = a[0] * rhi;
    const double arhi2 = rhi * arhi;
    const double hi = t2 + arhi2;
    const double lo3 = rlo * (ar + arhi);
    const double lo4 = t2 - hi + arhi2;
    const double p = ar3 * (a[1] + r * a[2] + ar2 * (a[3] + r * a[4] + ar2 * (a[5] + r * a[6])));
    const double lo = lo1 + lo2 + lo3 + lo4 + p;
    const double y = hi + lo;
    *tail = hi - y + lo;
    return y;
}

// 0 when y (bits iy, finite, non-zero) is not an integer, 1 when odd, 2 when even.
int integer_kind(std::uint64_t iy) {
    const int e = static_cast<int>(iy >> 52 & 0x7ff);
    if (e < 0x3ff) return 0;
    if (e > 0x3ff + 52) return 2;
    if ((iy & ((1ULL << (0x3ff + 52 - e)) - 1)) != 0) return 0;
    if ((iy & (1ULL << (0x3ff + 52 - e))) != 0) return 1;
    return 2;
}

// True for the bit patterns of 0, infinity and NaN (either sign).
constexpr bool zero_inf_nan(std::uint64_t i) { return 2 * i - 1 >= 2 * bits_of(k_inf) - 1; }

constexpr bool is_signaling(std::uint64_t ix) {
    return 2 * (ix ^ 0x0008000000000000ULL) > 2 * 0x7ff8000000000000ULL;
}

// ---------------------------------------------------------------------------
// sin and cos: the argument is reduced to a + da in [-pi/4, pi/4] plus a
// quadrant (by pi/2 in three parts up to 105414350, by a 24-bit-digit
// expansion of 2/pi beyond); then a small-angle series, or the nearest
// multiple x0 of 1/128 from a table of sin and cos in two parts each and
// sin(x0 + h) = sin x0 cos h + cos x0 sin h with short series in h.

constexpr double k_sin_s1 = -0x1.5555555555555p-3;
constexpr double k_sin_s2 = 0x1.1111111110ECEp-7;
constexpr double k_sin_s3 = -0x1.A01A019DB08B8p-13;
constexpr double k_sin_s4 = 0x1.71DE27B9A7ED9p-19;
constexpr double k_sin_s5 = -0x1.ADDFFC2FCDF59p-26;
constexpr double k_sn3 = -0x1.5555555555515p-3;
constexpr double k_sn5 = 0x1.11110e829872fp-7;
constexpr double k_cs2 = 0x1p-1;
constexpr double k_cs4 = -0x1.5555555555535p-5;
constexpr double k_cs6 = 0x1.6c16bedd9e239p-10;
// Adding it leaves |x| rounded to a multiple of 1/128 in the low word.
constexpr double k_table_big = 0x1.8p45;
constexpr double k_hp0 = 0x1.921FB54442D18p0;  // pi/2 in two parts
constexpr double k_hp1 = 0x1.1A62633145C07p-54;
constexpr double k_mp1 = 0x1.921FB58000000p0;  // pi/2 in four parts
constexpr double k_mp2 = -0x1.DDE973C000000p-27;
constexpr double k_pp3 = -0x1.CB3B398000000p-55;
constexpr double k_pp4 = -0x1.d747f23e32ed7p-83;
constexpr double k_hpinv = 0x1.45F306DC9C883p-1;
constexpr double k_toint = 0x1.8p52;

extern const std::uint64_t k_sincos_table[440];

// sin x0, its low part, cos x0, its low part for the x0 nearest |x|.
struct TableAngle {
    double sn, ssn, cs, ccs;
};
TableAngle table_angle(double u) {
    const std::uint32_t k = low_word(u) << 2;
    return {from_bits(k_sincos_table[k]), from_bits(k_sincos_table[k + 1]), from_bits(k_sincos_table[k + 2]),
            from_bits(k_sincos_table[k + 3])};
}

// cos(x + dx).
double cos_parts(double x, double dx) {
    if (x < 0) dx = -dx;
    const double u = k_table_big + abs_of(x);
    x = abs_of(x) - (u - k_table_big) + dx;
    const double xx = x * x;
    const double s = x + x * xx * (k_sn3 + xx * k_sn5);
    const double c = xx * (k_cs2 + xx * (k_cs4 + xx * k_cs6));
    const TableAngle t = table_angle(u);
    const double cor = (t.ccs - s * t.ssn - t.cs * c) - t.sn * s;
    return t.cs + cor;
}

// sin(x + dx).
double sin_parts(double x, double dx) {
    const double xold = x;
    if (abs_of(x) < 0.126) {
        const double xx = x * x;
        const double poly = ((((k_sin_s5 * xx + k_sin_s4) * xx + k_sin_s3) * xx + k_sin_s2) * xx) + k_sin_s1;
        const double t = ((poly * x - 0.5 * dx) * xx + dx);
        return x + t;
    }
    if (x <= 0) dx = -dx;
    const double u = k_table_big + abs_of(x);
    x = abs_of(x) - (u - k_table_big);
    const double xx = x * x;
    const double s = x + (dx + x * xx * (k_sn3 + xx * k_sn5));
    const double c = x * dx + xx * (k_cs2 + xx * (k_cs4 + xx * k_cs6));
    const TableAngle t = table_angle(u);
    const double cor = (t.ssn + s * t.ccs - t.sn * c) + t.cs * s;
    return with_sign_of(t.sn + cor, xold);
}

// x = n pi/2 + (a + da) for |x| < 105414350; returns n mod 4.
int reduce_medium(double x, double* a, double* da) {
    const double t = x * k_hpinv + k_toint;
    const double xn = t - k_toint;
    const double y = (x - xn * k_mp1) - xn * k_mp2;
    const int n = static_cast<int>(low_word(t) & 3);
    double t1 = xn * k_pp3;
    const double t2 = y - t1;
    double db = (y - t2) - t1;
    t1 = xn * k_pp4;
    const double b = t2 - t1;
    db += (t2 - b) - t1;
    *a = b;
    *da = db;
    return n;
}

// 2/pi in 24-bit digits, for reducing arguments of any size.
constexpr double k_two_over_pi_digits[75] = {
    10680707.0, 7228996.0,  1387004.0,  2578385.0,  16069853.0, 12639074.0, 9804092.0,  4427841.0,
    16666979.0, 11263675.0, 12935607.0, 2387514.0,  4345298.0,  14681673.0, 3074569.0,  13734428.0,
    16653803.0, 1880361.0,  10960616.0, 8533493.0,  3062596.0,  8710556.0,  7349940.0,  6258241.0,
    3772886.0,  3769171.0,  3798172.0,  8675211.0,  12450088.0, 3874808.0,  9961438.0,  366607.0,
    15675153.0, 9132554.0,  7151469.0,  3571407.0,  2607881.0,  12013382.0, 4155038.0,  6285869.0,
    7677882.0,  13102053.0, 15825725.0, 473591.0,   9065106.0,  15363067.0, 6271263.0,  9264392.0,
    5636912.0,  4652155.0,  7056368.0,  13614112.0, 10155062.0, 1944035.0,  9527646.0,  15080200.0,
    6658437.0,  6231200.0,  6832269.0,  16767104.0, 5075751.0,  3212806.0,  1398474.0,  7579849.0,
    6349435.0,  12618859.0, 4703257.0,  12806093.0, 14477321.0, 2786137.0,  12875403.0, 9837734.0,
    14528324.0, 13719321.0, 343717.0};
constexpr double k_split = 134217729.0;  // 2^27 + 1: splits a double into halves
constexpr double k_round_big = 0x1.8p52;
constexpr double k_round_big4 = 0x1.8p54;
constexpr double k_red_mp2 = -0x1.dde974p-27;

struct ReducedPart {
    double sum, b, bb;
};

// One half of x (at most 27 bits) times 2/pi: the integer part mod 4 in sum,
// the fraction as b + bb.
ReducedPart reduce_half(double xh) {
    int k = static_cast<int>((high_word(xh) >> 20) & 2047);
    k = (k - 450) / 24;
    if (k < 0) k = 0;
    double gor = from_bits(bits_of(0x1p576) - (static_cast<std::uint64_t>(k * 24) << 52));
    double r[6];
    for (int i = 0; i < 6; ++i) {
        r[i] = xh * k_two_over_pi_digits[k + i] * gor;
        gor *= 0x1p-24;
    }
    double sum = 0;
    for (int i = 0; i < 3; ++i) {
        const double s = (r[i] + k_round_big) - k_round_big;
        sum += s;
        r[i] -= s;
    }
    double t = 0;
    for (int i = 0; i < 6; ++i) t += r[5 - i];
    double bb = (((((r[0] - t) + r[1]) + r[2]) + r[3]) + r[4]) + r[5];
    double s = (t + k_round_big) - k_round_big;
    sum += s;
    t -= s;
    const double b = t + bb;
    bb = (t - b) + bb;
    s = (sum + k_round_big4) - k_round_big4;
    sum -= s;
    return {sum, b, bb};
}

// x = n pi/2 + (a + da) for any finite x; returns n mod 4.
int reduce_large(double x, double* a, double* aa) {
    x *= 0x1p-600;
    double t = x * k_split;
    const double x1 = t - (t - x);
    const double x2 = x - x1;
    const ReducedPart p1 = reduce_half(x1);
    const ReducedPart p2 = reduce_half(x2);
    double sum = p1.sum + p2.sum;
    double b = p1.b + p2.b;
    double bb = abs_of(p1.b) > abs_of(p2.b) ? (p1.b - b) + p2.b : (p2.b - b) + p1.b;
    if (b > 0.5) {
        b -= 1.0;
        sum += 1.0;
    } else if (b < -0.5) {
        b += 1.0;
        sum -= 1.0;
    }
    double s = b + (bb + p1.bb + p2.bb);
    t = ((b - s) + bb) + (p1.bb + p2.bb);
    b = s * k_split;
    const double t1 = b - (b - s);
    const double t2 = s - t1;
    b = s * k_hp0;
    bb = (((t1 * k_mp1 - b) + t1 * k_red_mp2) + t2 * k_mp1) + (t2 * k_red_mp2 + s * k_hp1 + t * k_hp0);
    s = b + bb;
    t = (b - s) + bb;
    *a = s;
    *aa = t;
    return static_cast<int>(sum) & 3;
}

// sin(a + da + n pi/2).
double sin_quadrant(double a, double da, int n) {
    const double v = (n & 1) != 0 ? cos_parts(a, da) : sin_parts(a, da);
    return (n & 2) != 0 ? -v : v;
}

// ---------------------------------------------------------------------------
// atan2: atan of the smaller of |y|/|x| and |x|/|y| as u + du (the quotient
// and its exact remainder), by an odd series below 1/16 and otherwise by a
// Taylor expansion around the nearest tabulated point x0 = j/256; then
// moved to its octant through pi/2 and pi held in two parts.

constexpr double k_atan_d3 = -0x1.5555555555555p-2;
constexpr double k_atan_d5 = 0x1.99999999997fdp-3;
constexpr double k_atan_d7 = -0x1.24924923f7603p-3;
constexpr double k_atan_d9 = 0x1.c71c6e5129a3bp-4;
constexpr double k_atan_d11 = -0x1.7458022b13c25p-4;
constexpr double k_atan_d13 = 0x1.375f08b31cbcep-4;
constexpr double k_inv16 = 0x1p-4;
constexpr double k_pi = 0x1.921fb54442d18p+1;
constexpr double k_pi_lo = 0x1.1a62633145c07p-53;
constexpr double k_half_pi = 0x1.921fb54442d18p+0;
constexpr double k_half_pi_lo = 0x1.1a62633145c07p-54;
constexpr double k_quarter_pi = 0x1.921fb54442d18p-1;
constexpr double k_three_quarter_pi = 0x1.2d97c7f3321d2p+1;

// Per tabulated point: x0, atan(x0), then the Taylor coefficients 1..5.
extern const std::uint64_t k_atan_table[241][7];

// (atan(u) - u) / u^3 for small u, as a polynomial in v = u^2.
double atan_series(double v) {
    return k_atan_d3 + v * (k_atan_d5 + v * (k_atan_d7 + v * (k_atan_d9 + v * (k_atan_d11 + v * k_atan_d13))));
}

double atan_coefficient(int i, int j) { return from_bits(k_atan_table[i][j]); }

int atan_table_index(double u) {
    constexpr double two52 = 0x1p52;
    return static_cast<int>((two52 + 256 * u) - two52) - 16;
}

// z + zz = x * y exactly, by splitting both factors.
void exact_product(double x, double y, double* z, double* zz) {
    double p = k_split * x;
    const double hx = (x - p) + p;
    const double tx = x - hx;
    p = k_split * y;
    const double hy = (y - p) + p;
    const double ty = y - hy;
    *z = x * y;
    *zz = (((hx * hy - *z) + hx * ty) + tx * hy) + tx * ty;
}

// z + zz = x + y exactly.
void exact_sum(double x, double y, double* z, double* zz) {
    *z = x + y;
    *zz = abs_of(x) > abs_of(y) ? ((x - *z) + y) : ((y - *z) + x);
}

// z + zz = x - y exactly.
void exact_difference(double x, double y, double* z, double* zz) {
    *z = x - y;
    *zz = abs_of(x) > abs_of(y) ? ((x - *z) - y) : (x - (y + *z));
}

// atan2(y, x) for finite, non-zero y and x of comparable size, given |x|
// and |y| scaled by a common power of two into the comfortable range.
double atan2_general(double y, double x, double ax, double ay) {
    double u, du, v, vv;
    if (ay < ax) {
        u = ay / ax;
        exact_product(ax, u, &v, &vv);
        du = ((ay - v) - vv) / ax;
    } else {
        u = ax / ay;
        exact_product(ay, u, &v, &vv);
        du = ((ax - v) - vv) / ay;
    }
    double z, zz, t1, t2, t3, cor, dv;
    if (x > 0) {
        if (ay < ax) {
            // |y| < x: atan(u).
            if (u < k_inv16) {
                v = u * u;
                zz = du + u * v * atan_series(v);
                z = u + zz;
                return with_sign_of(z, y);
            }
            const int i = atan_table_index(u);
            t3 = u - atan_coefficient(i, 0);
            exact_sum(t3, du, &v, &dv);
            t1 = atan_coefficient(i, 1);
            t2 = atan_coefficient(i, 2);
            zz = v * t2 + (dv * t2 + v * v * (atan_coefficient(i, 3) +
                                              v * (atan_coefficient(i, 4) +
                                                   v * (atan_coefficient(i, 5) + v * atan_coefficient(i, 6)))));
            z = t1 + zz;
            return with_sign_of(z, y);
        }
        // x <= |y|: pi/2 - atan(u).
        if (u < k_inv16) {
            v = u * u;
            zz = u * v * atan_series(v);
            exact_difference(k_half_pi, u, &t2, &cor);
            t3 = ((k_half_pi_lo + cor) - du) - zz;
            z = t2 + t3;
            return with_sign_of(z, y);
        }
        const int i = atan_table_index(u);
        v = (u - atan_coefficient(i, 0)) + du;
        zz = k_half_pi_lo -
             v * (atan_coefficient(i, 2) +
                  v * (atan_coefficient(i, 3) +
                       v * (atan_coefficient(i, 4) + v * (atan_coefficient(i, 5) + v * atan_coefficient(i, 6)))));
        t1 = k_half_pi - atan_coefficient(i, 1);
        z = t1 + zz;
        return with_sign_of(z, y);
    }
    if (ax < ay) {
        // -x < |y|: pi/2 + atan(u).
        if (u < k_inv16) {
            v = u * u;
            zz = u * v * atan_series(v);
            exact_sum(k_half_pi, u, &t2, &cor);
            t3 = ((k_half_pi_lo + cor) + du) + zz;
            z = t2 + t3;
            return with_sign_of(z, y);
        }
        const int i = atan_table_index(u);
        v = (u - atan_coefficient(i, 0)) + du;
        zz = k_half_pi_lo +
             v * (atan_coefficient(i, 2) +
                  v * (atan_coefficient(i, 3) +
                       v * (atan_coefficient(i, 4) + v * (atan_coefficient(i, 5) + v * atan_coefficient(i, 6)))));
        t1 = k_half_pi + atan_coefficient(i, 1);
        z = t1 + zz;
        return with_sign_of(z, y);
    }
    // |y| <= -x: pi - atan(u).
    if (u < k_inv16) {
        v = u * u;
        zz = u * v * atan_series(v);
        exact_difference(k_pi, u, &t2, &cor);
        t3 = ((k_pi_lo + cor) - du) - zz;
        z = t2 + t3;
        return with_sign_of(z, y);
    }
    const int i = atan_table_index(u);
    v = (u - atan_coefficient(i, 0)) + du;
    zz = k_pi_lo - v * (atan_coefficient(i, 2) +
                        v * (atan_coefficient(i, 3) +
                             v * (atan_coefficient(i, 4) + v * (atan_coefficient(i, 5) + v * atan_coefficient(i, 6)))));
    t1 = k_pi - atan_coefficient(i, 1);
    z = t1 + zz;
    return with_sign_of(z, y);
}

}  // namespace

double exp(double x) {
    const std::uint32_t abstop = top12(x) & 0x7ff;
    if (abstop >= top12(1024.0) && abstop - top12(0x1p-54) < 0x80000000u) {
        if (bits_of(x) == bits_of(-k_inf)) return 0.0;
        if (abstop >= top12(k_inf)) return 1.0 + x;
        return (bits_of(x) >> 63) != 0 ? 0.0 : k_inf;
    }
    return exp_with_tail(x, 0.0, 0);
}

double log(double x) {
    std::uint64_t ix = bits_of(x);
    const std::uint32_t top = static_cast<std::uint32_t>(ix >> 48);
    constexpr std::uint64_t near_lo = bits_of(1.0 - 0x1p-4);
    constexpr std::uint64_t near_hi = bits_of(1.0 + 0x1.09p-4);
    if (ix - near_lo < near_hi - near_lo) {
        if (ix == bits_of(1.0)) return 0.0;
        return log_near_one(x);
    }
    if (top - 0x0010 >= 0x7ff0 - 0x0010) {
        if (ix * 2 == 0) return -k_inf;
        if (ix == bits_of(k_inf)) return x;
        if ((top & 0x8000) != 0 || (top & 0x7ff0) == 0x7ff0) return (x - x) / (x - x);
        ix = bits_of(x * 0x1p52);  // subnormal: normalise
        ix -= 52ULL << 52;
    }
    const std::uint64_t tmp = ix - k_log_off;
    const int i = static_cast<int>((tmp >> (52 - k_log_table_bits)) % (1u << k_log_table_bits));
    const int k = static_cast<int>(static_cast<std::int64_t>(tmp) >> 52);
    const std::uint64_t iz = ix - (tmp & 0xfffULL << 52);
    const LogEntry& e = k_log_table[i];
    const double z = from_bits(iz);
    const double r = (z - e.chi - e.clo) * e.invc;
    const double kd = static_cast<double>(k);
    const double w = kd * k_ln2_hi + e.logc;
    const double hi = w + r;
    const double lo = w - hi + r + kd * k_ln2_lo;
    const double r2 = r * r;
    const double* a = k_log_a;
    return lo + r2 * a[0] + r * r2 * (a[1] + r * a[2] + r2 * (a[3] + r * a[4])) + hi;
}

double pow(double x, double y) {
    std::uint64_t sign_bias = 0;
    std::uint64_t ix = bits_of(x);
    const std::uint64_t iy = bits_of(y);
    std::uint32_t topx = top12(x);
    const std::uint32_t topy = top12(y);
    if (topx - 0x001 >= 0x7ff - 0x001 || (topy & 0x7ff) - 0x3be >= 0x43e - 0x3be) {
        // x subnormal, zero, negative, infinite or NaN; or |y| below 2^-65,
        // from 2^63 (where the result is 0, 1 or infinite), or not finite.
        if (zero_inf_nan(iy)) {
            if (2 * iy == 0) return is_signaling(ix) ? x + y : 1.0;
            if (ix == bits_of(1.0)) return is_signaling(iy) ? x + y : 1.0;
            if (2 * ix > 2 * bits_of(k_inf) || 2 * iy > 2 * bits_of(k_inf)) return x + y;
            if (2 * ix == 2 * bits_of(1.0)) return 1.0;
            if ((2 * ix < 2 * bits_of(1.0)) == !(iy >> 63)) return 0.0;
            return y * y;
        }
        if (zero_inf_nan(ix)) {
            double x2 = x * x;
            if ((ix >> 63) != 0 && integer_kind(iy) == 1) x2 = -x2;
            return (iy >> 63) != 0 ? 1 / x2 : x2;
        }
        if ((ix >> 63) != 0) {
            const int yint = integer_kind(iy);
            if (yint == 0) return (x - x) / (x - x);
            if (yint == 1) sign_bias = k_exp_sign_bias;
            ix &= 0x7fffffffffffffffULL;
            topx &= 0x7ff;
        }
        if ((topy & 0x7ff) - 0x3be >= 0x43e - 0x3be) {
            if (ix == bits_of(1.0)) return 1.0;
            if ((topy & 0x7ff) < 0x3be) return ix > bits_of(1.0) ? 1.0 + y : 1.0 - y;
            return (ix > bits_of(1.0)) == (topy < 0x800) ? k_inf : 0.0;
        }
        if (topx == 0) {
            ix = bits_of(x * 0x1p52);  // subnormal: normalise, exponent negative
            ix &= 0x7fffffffffffffffULL;
            ix -= 52ULL << 52;
        }
    }
    double lo;
    const double hi = pow_log(ix, &lo);
    // y * (hi + lo) as ehi + elo: 26-bit halves make yhi * lhi exact.
    const double yhi = from_bits(iy & ~0ULL << 27);
    const double ylo = y - yhi;
    const double lhi = from_bits(bits_of(hi) & ~0ULL << 27);
    const double llo = hi - lhi + lo;
    const double ehi = yhi * lhi;
    const double elo = ylo * lhi + y * llo;
    return exp_with_tail(ehi, elo, sign_bias);
}

double sin(double x) {
    const std::uint32_t k = high_word(x) & 0x7fffffff;
    double a, da;
    if (k < 0x3e500000) return x;  // |x| < 2^-26: sin x rounds to x
    if (k < 0x3feb6000) return sin_parts(x, 0);
    if (k < 0x400368fd) return with_sign_of(cos_parts(k_hp0 - abs_of(x), k_hp1), x);
    if (k < 0x419921FB) {
        const int n = reduce_medium(x, &a, &da);
        return sin_quadrant(a, da, n);
    }
    if (k < 0x7ff00000) {
        const int n = reduce_large(x, &a, &da);
        return sin_quadrant(a, da, n);
    }
    return x / x;
}

double cos(double x) {
    const std::uint32_t k = high_word(x) & 0x7fffffff;
    double a, da;
    if (k < 0x3e400000) return 1.0;  // |x| < 2^-27
    if (k < 0x3feb6000) return cos_parts(x, 0);
    if (k < 0x400368fd) {
        const double y = k_hp0 - abs_of(x);
        a = y + k_hp1;
        da = (y - a) + k_hp1;
        return sin_parts(a, da);
    }
    if (k < 0x419921FB) {
        const int n = reduce_medium(x, &a, &da);
        return sin_quadrant(a, da, n + 1);
    }
    if (k < 0x7ff00000) {
        const int n = reduce_large(x, &a, &da);
        return sin_quadrant(a, da, n + 1);
    }
    return x / x;
}

double atan2(double y, double x) {
    if (x != x || y != y) return x + y;
    const std::uint64_t bx = bits_of(x);
    const std::uint64_t by = bits_of(y);
    const bool x_negative = (bx >> 63) != 0;
    const bool y_negative = (by >> 63) != 0;
    if (y == 0) {
        if (!x_negative) return y;  // atan2(±0, +0 or x > 0) = ±0
        return y_negative ? -k_pi : k_pi;
    }
    if (x == 0) return y_negative ? -k_half_pi : k_half_pi;
    const bool x_inf = abs_of(x) == k_inf;
    const bool y_inf = abs_of(y) == k_inf;
    if (x_inf) {
        if (y_inf) {
            const double angle = x_negative ? k_three_quarter_pi : k_quarter_pi;
            return y_negative ? -angle : angle;
        }
        if (!x_negative) return y_negative ? -0.0 : 0.0;
        return y_negative ? -k_pi : k_pi;
    }
    if (y_inf) return y_negative ? -k_half_pi : k_half_pi;

    double ax = abs_of(x);
    double ay = abs_of(y);
    // One quotient beyond 2^(57*16) of the other: the angle is an axis's,
    // or y/x itself.
    const int de = static_cast<int>(high_word(y) & 0x7ff00000) - static_cast<int>(high_word(x) & 0x7ff00000);
    constexpr int far_apart = 59768832;
    if (de >= far_apart) return y > 0 ? k_half_pi : -k_half_pi;
    if (de <= -far_apart) {
        if (x > 0) return with_sign_of(ay / ax, y);
        return y > 0 ? k_pi : -k_pi;
    }
    if (ax < 0x1p-500 || ay < 0x1p-500) {
        ax *= 0x1p500;
        ay *= 0x1p500;
    }
    if (ax > 0x1p500 || ay > 0x1p500) {
        ax *= 0x1p-500;
        ay *= 0x1p-500;
    }
    return atan2_general(y, x, ax, ay);
}


namespace {

// 2^(k/128) for k = 0..127 as pairs: the bits of tail, and the bits of the
// scale less k << 45, so that adding k's bits shifted by 45 gives the scale.
const std::uint64_t k_exp_table[256] = {
    0x0000000000000000, 0x3ff0000000000000, 0x3c9b3b4f1a88bf6e, 0x3feff63da9fb3335,
    0xbc7160139cd8dc5d, 0x3fefec9a3e778061, 0xbc905e7a108766d1, 0x3fefe315e86e7f85,
    0x3c8cd2523567f613, 0x3fefd9b0d3158574, 0xbc8bce8023f98efa, 0x3fefd06b29ddf6de,
    0x3c60f74e61e6c861, 0x3fefc74518759bc8, 0x3c90a3e45b33d399, 0x3fefbe3ecac6f383,
    0x3c979aa65d837b6d, 0x3fefb5586cf9890f, 0x3c8eb51a92fdeffc, 0x3fefac922b7247f7,
    0x3c3ebe3d702f9cd1, 0x3fefa3ec32d3d1a2, 0xbc6a033489906e0b, 0x3fef9b66affed31b,
    0xbc9556522a2fbd0e, 0x3fef9301d0125b51, 0xbc5080ef8c4eea55, 0x3fef8abdc06c31cc,
    0xbc91c923b9d5f416, 0x3fef829aaea92de0, 0x3c80d3e3e95c55af, 0x3fef7a98c8a58e51,
    0xbc801b15eaa59348, 0x3fef72b83c7d517b, 0xbc8f1ff055de323d, 0x3fef6af9388c8dea,
    0x3c8b898c3f1353bf, 0x3fef635beb6fcb75, 0xbc96d99c7611eb26, 0x3fef5be084045cd4,
    0x3c9aecf73e3a2f60, 0x3fef54873168b9aa, 0xbc8fe782cb86389d, 0x3fef4d5022fcd91d,
    0x3c8a6f4144a6c38d, 0x3fef463b88628cd6, 0x3c807a05b0e4047d, 0x3fef3f49917ddc96,
    0x3c968efde3a8a894, 0x3fef387a6e756238, 0x3c875e18f274487d, 0x3fef31ce4fb2a63f,
    0x3c80472b981fe7f2, 0x3fef2b4565e27cdd, 0xbc96b87b3f71085e, 0x3fef24dfe1f56381,
    0x3c82f7e16d09ab31, 0x3fef1e9df51fdee1, 0xbc3d219b1a6fbffa, 0x3fef187fd0dad990,
    0x3c8b3782720c0ab4, 0x3fef1285a6e4030b, 0x3c6e149289cecb8f, 0x3fef0cafa93e2f56,
    0x3c834d754db0abb6, 0x3fef06fe0a31b715, 0x3c864201e2ac744c, 0x3fef0170fc4cd831,
    0x3c8fdd395dd3f84a, 0x3feefc08b26416ff, 0xbc86a3803b8e5b04, 0x3feef6c55f929ff1,
    0xbc924aedcc4b5068, 0x3feef1a7373aa9cb, 0xbc9907f81b512d8e, 0x3feeecae6d05d866,
    0xbc71d1e83e9436d2, 0x3feee7db34e59ff7, 0xbc991919b3ce1b15, 0x3feee32dc313a8e5,
    0x3c859f48a72a4c6d, 0x3feedea64c123422, 0xbc9312607a28698a, 0x3feeda4504ac801c,
    0xbc58a78f4817895b, 0x3feed60a21f72e2a, 0xbc7c2c9b67499a1b, 0x3feed1f5d950a897,
    0x3c4363ed60c2ac11, 0x3feece086061892d, 0x3c9666093b0664ef, 0x3feeca41ed1d0057,
    0x3c6ecce1daa10379, 0x3feec6a2b5c13cd0, 0x3c93ff8e3f0f1230, 0x3feec32af0d7d3de,
    0x3c7690cebb7aafb0, 0x3feebfdad5362a27, 0x3c931dbdeb54e077, 0x3feebcb299fddd0d,
    0xbc8f94340071a38e, 0x3feeb9b2769d2ca7, 0xbc87deccdc93a349, 0x3feeb6daa2cf6642,
    0xbc78dec6bd0f385f, 0x3feeb42b569d4f82, 0xbc861246ec7b5cf6, 0x3feeb1a4ca5d920f,
    0x3c93350518fdd78e, 0x3feeaf4736b527da, 0x3c7b98b72f8a9b05, 0x3feead12d497c7fd,
    0x3c9063e1e21c5409, 0x3feeab07dd485429, 0x3c34c7855019c6ea, 0x3feea9268a5946b7,
    0x3c9432e62b64c035, 0x3feea76f15ad2148, 0xbc8ce44a6199769f, 0x3feea5e1b976dc09,
    0xbc8c33c53bef4da8, 0x3feea47eb03a5585, 0xbc845378892be9ae, 0x3feea34634ccc320,
    0xbc93cedd78565858, 0x3feea23882552225, 0x3c5710aa807e1964, 0x3feea155d44ca973,
    0xbc93b3efbf5e2228, 0x3feea09e667f3bcd, 0xbc6a12ad8734b982, 0x3feea012750bdabf,
    0xbc6367efb86da9ee, 0x3fee9fb23c651a2f, 0xbc80dc3d54e08851, 0x3fee9f7df9519484,
    0xbc781f647e5a3ecf, 0x3fee9f75e8ec5f74, 0xbc86ee4ac08b7db0, 0x3fee9f9a48a58174,
    0xbc8619321e55e68a, 0x3fee9feb564267c9, 0x3c909ccb5e09d4d3, 0x3feea0694fde5d3f,
    0xbc7b32dcb94da51d, 0x3feea11473eb0187, 0x3c94ecfd5467c06b, 0x3feea1ed0130c132,
    0x3c65ebe1abd66c55, 0x3feea2f336cf4e62, 0xbc88a1c52fb3cf42, 0x3feea427543e1a12,
    0xbc9369b6f13b3734, 0x3feea589994cce13, 0xbc805e843a19ff1e, 0x3feea71a4623c7ad,
    0xbc94d450d872576e, 0x3feea8d99b4492ed, 0x3c90ad675b0e8a00, 0x3feeaac7d98a6699,
    0x3c8db72fc1f0eab4, 0x3feeace5422aa0db, 0xbc65b6609cc5e7ff, 0x3feeaf3216b5448c,
    0x3c7bf68359f35f44, 0x3feeb1ae99157736, 0xbc93091fa71e3d83, 0x3feeb45b0b91ffc6,
    0xbc5da9b88b6c1e29, 0x3feeb737b0cdc5e5, 0xbc6c23f97c90b959, 0x3feeba44cbc8520f,
    0xbc92434322f4f9aa, 0x3feebd829fde4e50, 0xbc85ca6cd7668e4b, 0x3feec0f170ca07ba,
    0x3c71affc2b91ce27, 0x3feec49182a3f090, 0x3c6dd235e10a73bb, 0x3feec86319e32323,
    0xbc87c50422622263, 0x3feecc667b5de565, 0x3c8b1c86e3e231d5, 0x3feed09bec4a2d33,
    0xbc91bbd1d3bcbb15, 0x3feed503b23e255d, 0x3c90cc319cee31d2, 0x3feed99e1330b358,
    0x3c8469846e735ab3, 0x3feede6b5579fdbf, 0xbc82dfcd978e9db4, 0x3feee36bbfd3f37a,
    0x3c8c1a7792cb3387, 0x3feee89f995ad3ad, 0xbc907b8f4ad1d9fa, 0x3feeee07298db666,
    0xbc55c3d956dcaeba, 0x3feef3a2b84f15fb, 0xbc90a40e3da6f640, 0x3feef9728de5593a,
    0xbc68d6f438ad9334, 0x3feeff76f2fb5e47, 0xbc91eee26b588a35, 0x3fef05b030a1064a,
    0x3c74ffd70a5fddcd, 0x3fef0c1e904bc1d2, 0xbc91bdfbfa9298ac, 0x3fef12c25bd71e09,
    0x3c736eae30af0cb3, 0x3fef199bdd85529c, 0x3c8ee3325c9ffd94, 0x3fef20ab5fffd07a,
    0x3c84e08fd10959ac, 0x3fef27f12e57d14b, 0x3c63cdaf384e1a67, 0x3fef2f6d9406e7b5,
    0x3c676b2c6c921968, 0x3fef3720dcef9069, 0xbc808a1883ccb5d2, 0x3fef3f0b555dc3fa,
    0xbc8fad5d3ffffa6f, 0x3fef472d4a07897c, 0xbc900dae3875a949, 0x3fef4f87080d89f2,
    0x3c74a385a63d07a7, 0x3fef5818dcfba487, 0xbc82919e2040220f, 0x3fef60e316c98398,
    0x3c8e5a50d5c192ac, 0x3fef69e603db3285, 0x3c843a59ac016b4b, 0x3fef7321f301b460,
    0xbc82d52107b43e1f, 0x3fef7c97337b9b5f, 0xbc892ab93b470dc9, 0x3fef864614f5a129,
    0x3c74b604603a88d3, 0x3fef902ee78b3ff6, 0x3c83c5ec519d7271, 0x3fef9a51fbc74c83,
    0xbc8ff7128fd391f0, 0x3fefa4afa2a490da, 0xbc8dae98e223747d, 0x3fefaf482d8e67f1,
    0x3c8ec3bc41aa2008, 0x3fefba1bee615a27, 0x3c842b94c3a9eb32, 0x3fefc52b376bba97,
    0x3c8a64a931d185ee, 0x3fefd0765b6e4540, 0xbc8e37bae43be3ed, 0x3fefdbfdad9cbe14,
    0x3c77893b4d91cd9d, 0x3fefe7c1819e90d8, 0x3c5305c14160cc89, 0x3feff3c22b8f71f1,
};

// Per interval of the log argument: 1/c, log(c), and c in two parts.
const LogEntry k_log_table[128] = {
    {0x1.734f0c3e0de9fp+0, -0x1.7cc7f79e69000p-2, 0x1.61000014fb66bp-1, 0x1.e026c91425b3cp-56},
    {0x1.713786a2ce91fp+0, -0x1.76feec20d0000p-2, 0x1.63000034db495p-1, 0x1.dbfea48005d41p-55},
    {0x1.6f26008fab5a0p+0, -0x1.713e31351e000p-2, 0x1.650000d94d478p-1, 0x1.e7fa786d6a5b7p-55},
    {0x1.6d1a61f138c7dp+0, -0x1.6b85b38287800p-2, 0x1.67000074e6fadp-1, 0x1.1fcea6b54254cp-57},
    {0x1.6b1490bc5b4d1p+0, -0x1.65d5590807800p-2, 0x1.68ffffedf0faep-1, -0x1.c7e274c590efdp-56},
    {0x1.69147332f0cbap+0, -0x1.602d076180000p-2, 0x1.6b0000763c5bcp-1, -0x1.ac16848dcda01p-55},
    {0x1.6719f18224223p+0, -0x1.5a8ca86909000p-2, 0x1.6d0001e5cc1f6p-1, 0x1.33f1c9d499311p-55},
    {0x1.6524f99a51ed9p+0, -0x1.54f4356035000p-2, 0x1.6efffeb05f63ep-1, -0x1.e80041ae22d53p-56},
    {0x1.63356aa8f24c4p+0, -0x1.4f637c36b4000p-2, 0x1.710000e86978p-1, 0x1.bff6671097952p-56},
    {0x1.614b36b9ddc14p+0, -0x1.49da7fda85000p-2, 0x1.72ffffc67e912p-1, 0x1.c00e226bd8724p-55},
    {0x1.5f66452c65c4cp+0, -0x1.445923989a800p-2, 0x1.74fffdf81116ap-1, -0x1.e02916ef101d2p-57},
    {0x1.5d867b5912c4fp+0, -0x1.3edf439b0b800p-2, 0x1.770000f679c9p-1, -0x1.7fc71cd549c74p-57},
    {0x1.5babccb5b90dep+0, -0x1.396ce448f7000p-2, 0x1.78ffffa7ec835p-1, 0x1.1bec19ef50483p-55},
    {0x1.59d61f2d91a78p+0, -0x1.3401e17bda000p-2, 0x1.7affffe20c2e6p-1, -0x1.07e1729cc6465p-56},
    {0x1.5805612465687p+0, -0x1.2e9e2ef468000p-2, 0x1.7cfffed3fc9p-1, -0x1.08072087b8b1cp-55},
    {0x1.56397cee76bd3p+0, -0x1.2941b3830e000p-2, 0x1.7efffe9261a76p-1, 0x1.dc0286d9df9aep-55},
    {0x1.54725e2a77f93p+0, -0x1.23ec58cda8800p-2, 0x1.81000049ca3e8p-1, 0x1.97fd251e54c33p-55},
    {0x1.52aff42064583p+0, -0x1.1e9e129279000p-2, 0x1.8300017932c8fp-1, -0x1.afee9b630f381p-55},
    {0x1.50f22dbb2bddfp+0, -0x1.1956d2b48f800p-2, 0x1.850000633739cp-1, 0x1.9bfbf6b6535bcp-55},
    {0x1.4f38f4734ded7p+0, -0x1.141679ab9f800p-2, 0x1.87000204289c6p-1, -0x1.bbf65f3117b75p-55},
    {0x1.4d843cfde2840p+0, -0x1.0edd094ef9800p-2, 0x1.88fffebf57904p-1, -0x1.9006ea23dcb57p-55},
    {0x1.4bd3ec078a3c8p+0, -0x1.09aa518db1000p-2, 0x1.8b00022bc04dfp-1, -0x1.d00df38e04b0ap-56},
    {0x1.4a27fc3e0258ap+0, -0x1.047e65263b800p-2, 0x1.8cfffe50c1b8ap-1, -0x1.8007146ff9f05p-55},
    {0x1.4880524d48434p+0, -0x1.feb224586f000p-3, 0x1.8effffc918e43p-1, 0x1.3817bd07a7038p-55},
    {0x1.46dce1b192d0bp+0, -0x1.f474a7517b000p-3, 0x1.910001efa5fc7p-1, 0x1.93e9176dfb403p-55},
    {0x1.453d9d3391854p+0, -0x1.ea4443d103000p-3, 0x1.9300013467bb9p-1, 0x1.f804e4b980276p-56},
    {0x1.43a2744b4845ap+0, -0x1.e020d44e9b000p-3, 0x1.94fffe6ee076fp-1, -0x1.f7ef0d9ff622ep-55},
    {0x1.420b54115f8fbp+0, -0x1.d60a22977f000p-3, 0x1.96fffde3c12d1p-1, -0x1.082aa962638bap-56},
    {0x1.40782da3ef4b1p+0, -0x1.cc00104959000p-3, 0x1.98ffff4458a0dp-1, -0x1.7801b9164a8efp-55},
    {0x1.3ee8f5d57fe8fp+0, -0x1.c202956891000p-3, 0x1.9afffdd982e3ep-1, -0x1.740e08a5a9337p-55},
    {0x1.3d5d9a00b4ce9p+0, -0x1.b81178d811000p-3, 0x1.9cfffed49fb66p-1, 0x1.fce08c19bep-60},
    {0x1.3bd60c010c12bp+0, -0x1.ae2c9ccd3d000p-3, 0x1.9f00020f19c51p-1, -0x1.a3faa27885b0ap-55},
    {0x1.3a5242b75dab8p+0, -0x1.a45402e129000p-3, 0x1.a10001145b006p-1, 0x1.4ff489958da56p-56},
    {0x1.38d22cd9fd002p+0, -0x1.9a877681df000p-3, 0x1.a300007bbf6fap-1, 0x1.cbeab8a2b6d18p-55},
    {0x1.3755bc5847a1cp+0, -0x1.90c6d69483000p-3, 0x1.a500010971d79p-1, 0x1.8fecadd78793p-55},
    {0x1.35dce49ad36e2p+0, -0x1.87120a645c000p-3, 0x1.a70001df52e48p-1, -0x1.f41763dd8abdbp-55},
    {0x1.34679984dd440p+0, -0x1.7d68fb4143000p-3, 0x1.a90001c593352p-1, -0x1.ebf0284c27612p-55},
    {0x1.32f5cceffcb24p+0, -0x1.73cb83c627000p-3, 0x1.ab0002a4f3e4bp-1, -0x1.9fd043cff3f5fp-57},
    {0x1.3187775a10d49p+0, -0x1.6a39a9b376000p-3, 0x1.acfffd7ae1ed1p-1, -0x1.23ee7129070b4p-55},
    {0x1.301c8373e3990p+0, -0x1.60b3154b7a000p-3, 0x1.aefffee510478p-1, 0x1.a063ee00edea3p-57},
    {0x1.2eb4ebb95f841p+0, -0x1.5737d76243000p-3, 0x1.b0fffdb650d5bp-1, 0x1.a06c8381f0ab9p-58},
    {0x1.2d50a0219a9d1p+0, -0x1.4dc7b8fc23000p-3, 0x1.b2ffffeaaca57p-1, -0x1.9011e74233c1dp-56},
    {0x1.2bef9a8b7fd2ap+0, -0x1.4462c51d20000p-3, 0x1.b4fffd995badcp-1, -0x1.9ff1068862a9fp-56},
    {0x1.2a91c7a0c1babp+0, -0x1.3b08abc830000p-3, 0x1.b7000249e659cp-1, 0x1.aff45d0864f3ep-55},
    {0x1.293726014b530p+0, -0x1.31b996b490000p-3, 0x1.b8ffff987164p-1, 0x1.cfe7796c2c3f9p-56},
    {0x1.27dfa5757a1f5p+0, -0x1.2875490a44000p-3, 0x1.bafffd204cb4fp-1, -0x1.3ff27eef22bc4p-57},
    {0x1.268b39b1d3bbfp+0, -0x1.1f3b9f879a000p-3, 0x1.bcfffd2415c45p-1, -0x1.cffb7ee3bea21p-57},
    {0x1.2539d838ff5bdp+0, -0x1.160c8252ca000p-3, 0x1.beffff86309dfp-1, -0x1.14103972e0b5cp-55},
    {0x1.23eb7aac9083bp+0, -0x1.0ce7f57f72000p-3, 0x1.c0fffe1b57653p-1, 0x1.bc16494b76a19p-55},
    {0x1.22a012ba940b6p+0, -0x1.03cdc49fea000p-3, 0x1.c2ffff1fa57e3p-1, -0x1.4feef8d30c6edp-57},
    {0x1.2157996cc4132p+0, -0x1.f57bdbc4b8000p-4, 0x1.c4fffdcbfe424p-1, -0x1.43f68bcec4775p-55},
    {0x1.201201dd2fc9bp+0, -0x1.e370896404000p-4, 0x1.c6fffed54b9f7p-1, 0x1.47ea3f053e0ecp-55},
    {0x1.1ecf4494d480bp+0, -0x1.d17983ef94000p-4, 0x1.c8fffeb998fd5p-1, 0x1.383068df992f1p-56},
    {0x1.1d8f5528f6569p+0, -0x1.bf9674ed8a000p-4, 0x1.cb0002125219ap-1, -0x1.8fd8e64180e04p-57},
    {0x1.1c52311577e7cp+0, -0x1.adc79202f6000p-4, 0x1.ccfffdd94469cp-1, 0x1.e7ebe1cc7ea72p-55},
    {0x1.1b17c74cb26e9p+0, -0x1.9c0c3e7288000p-4, 0x1.cefffeafdc476p-1, 0x1.ebe39ad9f88fep-55},
    {0x1.19e010c2c1ab6p+0, -0x1.8a646b372c000p-4, 0x1.d1000169af82bp-1, 0x1.57d91a8b95a71p-56},
    {0x1.18ab07bb670bdp+0, -0x1.78d01b3ac0000p-4, 0x1.d30000d0ff71dp-1, 0x1.9c1906970c7dap-55},
    {0x1.1778a25efbcb6p+0, -0x1.674f145380000p-4, 0x1.d4fffea790fc4p-1, -0x1.80e37c558fe0cp-58},
    {0x1.1648d354c31dap+0, -0x1.55e0e6d878000p-4, 0x1.d70002edc87e5p-1, -0x1.f80d64dc10f44p-56},
    {0x1.151b990275fddp+0, -0x1.4485cdea1e000p-4, 0x1.d900021dc82aap-1, -0x1.47c8f94fd5c5cp-56},
    {0x1.13f0ea432d24cp+0, -0x1.333d94d6aa000p-4, 0x1.dafffd86b0283p-1, 0x1.c7f1dc521617ep-55},
    {0x1.12c8b7210f9dap+0, -0x1.22079f8c56000p-4, 0x1.dd000296c4739p-1, 0x1.8019eb2ffb153p-55},
    {0x1.11a3028ecb531p+0, -0x1.10e4698622000p-4, 0x1.defffe54490f5p-1, 0x1.e00d2c652cc89p-57},
    {0x1.107fbda8434afp+0, -0x1.ffa6c6ad20000p-5, 0x1.e0fffcdabf694p-1, -0x1.f8340202d69d2p-56},
    {0x1.0f5ee0f4e6bb3p+0, -0x1.dda8d4a774000p-5, 0x1.e2fffdb52c8ddp-1, 0x1.b00c1ca1b0864p-56},
    {0x1.0e4065d2a9fcep+0, -0x1.bbcece4850000p-5, 0x1.e4ffff24216efp-1, 0x1.2ffa8b094ab51p-56},
    {0x1.0d244632ca521p+0, -0x1.9a1894012c000p-5, 0x1.e6fffe88a5e11p-1, -0x1.7f673b1efbe59p-58},
    {0x1.0c0a77ce2981ap+0, -0x1.788583302c000p-5, 0x1.e9000119eff0dp-1, -0x1.4808d5e0bc801p-55},
    {0x1.0af2f83c636d1p+0, -0x1.5715e67d68000p-5, 0x1.eafffdfa51744p-1, 0x1.80006d54320b5p-56},
    {0x1.09ddb98a01339p+0, -0x1.35c8a49658000p-5, 0x1.ed0001a127fa1p-1, -0x1.002f860565c92p-58},
    {0x1.08cabaf52e7dfp+0, -0x1.149e364154000p-5, 0x1.ef00007babcc4p-1, -0x1.540445d35e611p-55},
    {0x1.07b9f2f4e28fbp+0, -0x1.e72c082eb8000p-6, 0x1.f0ffff57a8d02p-1, -0x1.ffb3139ef9105p-59},
    {0x1.06ab58c358f19p+0, -0x1.a55f152528000p-6, 0x1.f30001ee58ac7p-1, 0x1.a81acf2731155p-55},
    {0x1.059eea5ecf92cp+0, -0x1.63d62cf818000p-6, 0x1.f4ffff5823494p-1, 0x1.a3f41d4d7c743p-55},
    {0x1.04949cdd12c90p+0, -0x1.228fb8caa0000p-6, 0x1.f6ffffca94c6bp-1, -0x1.202f41c987875p-57},
    {0x1.038c6c6f0ada9p+0, -0x1.c317b20f90000p-7, 0x1.f8fffe1f9c441p-1, 0x1.77dd1f477e74bp-56},
    {0x1.02865137932a9p+0, -0x1.419355daa0000p-7, 0x1.fafffd2e0e37ep-1, -0x1.f01199a7ca331p-57},
    {0x1.0182427ea7348p+0, -0x1.81203c2ec0000p-8, 0x1.fd0001c77e49ep-1, 0x1.181ee4bceacb1p-56},
    {0x1.008040614b195p+0, -0x1.0040979240000p-9, 0x1.feffff7e0c331p-1, -0x1.e05370170875ap-57},
    {0x1.fe01ff726fa1ap-1, 0x1.feff384900000p-9, 0x1.00ffff465606ep+0, -0x1.a7ead491c0adap-55},
    {0x1.fa11cc261ea74p-1, 0x1.7dc41353d0000p-7, 0x1.02ffff3867a58p+0, -0x1.77f69c3fcb2ep-54},
    {0x1.f6310b081992ep-1, 0x1.3cea3c4c28000p-6, 0x1.04ffffdfc0d17p+0, 0x1.7bffe34cb945bp-54},
    {0x1.f25f63ceeadcdp-1, 0x1.b9fc114890000p-6, 0x1.0700003cd4d82p+0, 0x1.20083c0e456cbp-55},
    {0x1.ee9c8039113e7p-1, 0x1.1b0d8ce110000p-5, 0x1.08ffff9f2cbe8p+0, -0x1.dffdfbe37751ap-57},
    {0x1.eae8078cbb1abp-1, 0x1.58a5bd001c000p-5, 0x1.0b000010cda65p+0, -0x1.13f7faee626ebp-54},
    {0x1.e741aa29d0c9bp-1, 0x1.95c8340d88000p-5, 0x1.0d00001a4d338p+0, 0x1.07dfa79489ff7p-55},
    {0x1.e3a91830a99b5p-1, 0x1.d276aef578000p-5, 0x1.0effffadafdfdp+0, -0x1.7040570d66bcp-56},
    {0x1.e01e009609a56p-1, 0x1.07598e598c000p-4, 0x1.110000bbafd96p+0, 0x1.e80d4846d0b62p-55},
    {0x1.dca01e577bb98p-1, 0x1.253f5e30d2000p-4, 0x1.12ffffae5f45dp+0, 0x1.dbffa64fd36efp-54},
    {0x1.d92f20b7c9103p-1, 0x1.42edd8b380000p-4, 0x1.150000dd59ad9p+0, 0x1.a0077701250aep-54},
    {0x1.d5cac66fb5ccep-1, 0x1.606598757c000p-4, 0x1.170000f21559ap+0, 0x1.dfdf9e2e3deeep-55},
    {0x1.d272caa5ede9dp-1, 0x1.7da76356a0000p-4, 0x1.18ffffc275426p+0, 0x1.10030dc3b7273p-54},
    {0x1.cf26e3e6b2ccdp-1, 0x1.9ab434e1c6000p-4, 0x1.1b000123d3c59p+0, 0x1.97f7980030188p-54},
    {0x1.cbe6da2a77902p-1, 0x1.b78c7bb0d6000p-4, 0x1.1cffff8299eb7p+0, -0x1.5f932ab9f8c67p-57},
    {0x1.c8b266d37086dp-1, 0x1.d431332e72000p-4, 0x1.1effff48ad4p+0, 0x1.37fbf9da75bebp-54},
    {0x1.c5894bd5d5804p-1, 0x1.f0a3171de6000p-4, 0x1.210000c8b86a4p+0, 0x1.f806b91fd5b22p-54},
    {0x1.c26b533bb9f8cp-1, 0x1.067152b914000p-3, 0x1.2300003854303p+0, 0x1.3ffc2eb9fbf33p-54},
    {0x1.bf583eeece73fp-1, 0x1.147858292b000p-3, 0x1.24fffffbcf684p+0, 0x1.601e77e2e2e72p-56},
    {0x1.bc4fd75db96c1p-1, 0x1.2266ecdca3000p-3, 0x1.26ffff52921d9p+0, 0x1.ffcbb767f0c61p-56},
    {0x1.b951e0c864a28p-1, 0x1.303d7a6c55000p-3, 0x1.2900014933a3cp+0, -0x1.202ca3c02412bp-56},
    {0x1.b65e2c5ef3e2cp-1, 0x1.3dfc33c331000p-3, 0x1.2b00014556313p+0, -0x1.2808233f21f02p-54},
    {0x1.b374867c9888bp-1, 0x1.4ba366b7a8000p-3, 0x1.2cfffebfe523bp+0, -0x1.8ff7e384fdcf2p-55},
    {0x1.b094b211d304ap-1, 0x1.5933928d1f000p-3, 0x1.2f0000bb8ad96p+0, -0x1.5ff51503041c5p-55},
    {0x1.adbe885f2ef7ep-1, 0x1.66acd2418f000p-3, 0x1.30ffffb7ae2afp+0, -0x1.10071885e289dp-55},
    {0x1.aaf1d31603da2p-1, 0x1.740f8ec669000p-3, 0x1.32ffffeac5f7fp+0, -0x1.1ff5d3fb7b715p-54},
    {0x1.a82e63fd358a7p-1, 0x1.815c0f51af000p-3, 0x1.350000ca66756p+0, 0x1.57f82228b82bdp-54},
    {0x1.a5740ef09738bp-1, 0x1.8e92954f68000p-3, 0x1.3700011fbf721p+0, 0x1.000bac40dd5ccp-55},
    {0x1.a2c2a90ab4b27p-1, 0x1.9bb3602f84000p-3, 0x1.38ffff9592fb9p+0, -0x1.43f9d2db2a751p-54},
    {0x1.a01a01393f2d1p-1, 0x1.a8bed1c2c0000p-3, 0x1.3b00004ddd242p+0, 0x1.57f6b707638e1p-55},
    {0x1.9d79f24db3c1bp-1, 0x1.b5b515c01d000p-3, 0x1.3cffff5b2c957p+0, 0x1.a023a10bf1231p-56},
    {0x1.9ae2505c7b190p-1, 0x1.c2967ccbcc000p-3, 0x1.3efffeab0b418p+0, 0x1.87f6d66b152bp-54},
    {0x1.9852ef297ce2fp-1, 0x1.cf635d5486000p-3, 0x1.410001532aff4p+0, 0x1.7f8375f198524p-57},
    {0x1.95cbaeea44b75p-1, 0x1.dc1bd3446c000p-3, 0x1.4300017478b29p+0, 0x1.301e672dc5143p-55},
    {0x1.934c69de74838p-1, 0x1.e8c01b8cfe000p-3, 0x1.44fffe795b463p+0, 0x1.9ff69b8b2895ap-55},
    {0x1.90d4f2f6752e6p-1, 0x1.f5509c0179000p-3, 0x1.46fffe80475ep+0, -0x1.5c0b19bc2f254p-54},
    {0x1.8e6528effd79dp-1, 0x1.00e6c121fb800p-2, 0x1.48fffef6fc1e7p+0, 0x1.b4009f23a2a72p-54},
    {0x1.8bfce9fcc007cp-1, 0x1.071b80e93d000p-2, 0x1.4afffe5bea704p+0, -0x1.4ffb7bf0d7d45p-54},
    {0x1.899c0dabec30ep-1, 0x1.0d46b9e867000p-2, 0x1.4d000171027dep+0, -0x1.9c06471dc6a3dp-54},
    {0x1.87427aa2317fbp-1, 0x1.13687334bd000p-2, 0x1.4f0000ff03ee2p+0, 0x1.77f890b85531cp-54},
    {0x1.84f00acb39a08p-1, 0x1.1980d67234800p-2, 0x1.5100012dc4bd1p+0, 0x1.004657166a436p-57},
    {0x1.82a49e8653e55p-1, 0x1.1f8ffe0cc8000p-2, 0x1.530001605277ap+0, -0x1.6bfcece233209p-54},
    {0x1.8060195f40260p-1, 0x1.2595fd7636800p-2, 0x1.54fffecdb704cp+0, -0x1.902720505a1d7p-55},
    {0x1.7e22563e0a329p-1, 0x1.2b9300914a800p-2, 0x1.56fffef5f54a9p+0, 0x1.bbfe60ec96412p-54},
    {0x1.7beb377dcb5adp-1, 0x1.3187210436000p-2, 0x1.5900017e61012p+0, 0x1.87ec581afef9p-55},
    {0x1.79baa679725c2p-1, 0x1.377266dec1800p-2, 0x1.5b00003c93e92p+0, -0x1.f41080abf0ccp-54},
    {0x1.77907f2170657p-1, 0x1.3d54ffbaf3000p-2, 0x1.5d0001d4919bcp+0, -0x1.8812afb254729p-54},
    {0x1.756cadbd6130cp-1, 0x1.432eee32fe000p-2, 0x1.5efffe7b87a89p+0, -0x1.47eb780ed6904p-54},
};

// Per interval of the pow argument: 1/c, log(c) in two parts.
const PowLogEntry k_pow_log_table[128] = {
    {0x1.6a00000000000p+0, -0x1.62c82f2b9c800p-2, 0x1.ab42428375680p-48},
    {0x1.6800000000000p+0, -0x1.5d1bdbf580800p-2, -0x1.ca508d8e0f720p-46},
    {0x1.6600000000000p+0, -0x1.5767717455800p-2, -0x1.362a4d5b6506dp-45},
    {0x1.6400000000000p+0, -0x1.51aad872df800p-2, -0x1.684e49eb067d5p-49},
    {0x1.6200000000000p+0, -0x1.4be5f95777800p-2, -0x1.41b6993293ee0p-47},
    {0x1.6000000000000p+0, -0x1.4618bc21c6000p-2, 0x1.3d82f484c84ccp-46},
    {0x1.5e00000000000p+0, -0x1.404308686a800p-2, 0x1.c42f3ed820b3ap-50},
    {0x1.5c00000000000p+0, -0x1.3a64c55694800p-2, 0x1.0b1c686519460p-45},
    {0x1.5a00000000000p+0, -0x1.347dd9a988000p-2, 0x1.5594dd4c58092p-45},
    {0x1.5800000000000p+0, -0x1.2e8e2bae12000p-2, 0x1.67b1e99b72bd8p-45},
    {0x1.5600000000000p+0, -0x1.2895a13de8800p-2, 0x1.5ca14b6cfb03fp-46},
    {0x1.5600000000000p+0, -0x1.2895a13de8800p-2, 0x1.5ca14b6cfb03fp-46},
    {0x1.5400000000000p+0, -0x1.22941fbcf7800p-2, -0x1.65a242853da76p-46},
    {0x1.5200000000000p+0, -0x1.1c898c1699800p-2, -0x1.fafbc68e75404p-46},
    {0x1.5000000000000p+0, -0x1.1675cababa800p-2, 0x1.f1fc63382a8f0p-46},
    {0x1.4e00000000000p+0, -0x1.1058bf9ae4800p-2, -0x1.6a8c4fd055a66p-45},
    {0x1.4c00000000000p+0, -0x1.0a324e2739000p-2, -0x1.c6bee7ef4030ep-47},
    {0x1.4a00000000000p+0, -0x1.0402594b4d000p-2, -0x1.036b89ef42d7fp-48},
    {0x1.4a00000000000p+0, -0x1.0402594b4d000p-2, -0x1.036b89ef42d7fp-48},
    {0x1.4800000000000p+0, -0x1.fb9186d5e4000p-3, 0x1.d572aab993c87p-47},
    {0x1.4600000000000p+0, -0x1.ef0adcbdc6000p-3, 0x1.b26b79c86af24p-45},
    {0x1.4400000000000p+0, -0x1.e27076e2af000p-3, -0x1.72f4f543fff10p-46},
    {0x1.4200000000000p+0, -0x1.d5c216b4fc000p-3, 0x1.1ba91bbca681bp-45},
    {0x1.4000000000000p+0, -0x1.c8ff7c79aa000p-3, 0x1.7794f689f8434p-45},
    {0x1.4000000000000p+0, -0x1.c8ff7c79aa000p-3, 0x1.7794f689f8434p-45},
    {0x1.3e00000000000p+0, -0x1.bc286742d9000p-3, 0x1.94eb0318bb78fp-46},
    {0x1.3c00000000000p+0, -0x1.af3c94e80c000p-3, 0x1.a4e633fcd9066p-52},
    {0x1.3a00000000000p+0, -0x1.a23bc1fe2b000p-3, -0x1.58c64dc46c1eap-45},
    {0x1.3a00000000000p+0, -0x1.a23bc1fe2b000p-3, -0x1.58c64dc46c1eap-45},
    {0x1.3800000000000p+0, -0x1.9525a9cf45000p-3, -0x1.ad1d904c1d4e3p-45},
    {0x1.3600000000000p+0, -0x1.87fa06520d000p-3, 0x1.bbdbf7fdbfa09p-45},
    {0x1.3400000000000p+0, -0x1.7ab890210e000p-3, 0x1.bdb9072534a58p-45},
    {0x1.3400000000000p+0, -0x1.7ab890210e000p-3, 0x1.bdb9072534a58p-45},
    {0x1.3200000000000p+0, -0x1.6d60fe719d000p-3, -0x1.0e46aa3b2e266p-46},
    {0x1.3000000000000p+0, -0x1.5ff3070a79000p-3, -0x1.e9e439f105039p-46},
    {0x1.3000000000000p+0, -0x1.5ff3070a79000p-3, -0x1.e9e439f105039p-46},
    {0x1.2e00000000000p+0, -0x1.526e5e3a1b000p-3, -0x1.0de8b90075b8fp-45},
    {0x1.2c00000000000p+0, -0x1.44d2b6ccb8000p-3, 0x1.70cc16135783cp-46},
    {0x1.2c00000000000p+0, -0x1.44d2b6ccb8000p-3, 0x1.70cc16135783cp-46},
    {0x1.2a00000000000p+0, -0x1.371fc201e9000p-3, 0x1.178864d27543ap-48},
    {0x1.2800000000000p+0, -0x1.29552f81ff000p-3, -0x1.48d301771c408p-45},
    {0x1.2600000000000p+0, -0x1.1b72ad52f6000p-3, -0x1.e80a41811a396p-45},
    {0x1.2600000000000p+0, -0x1.1b72ad52f6000p-3, -0x1.e80a41811a396p-45},
    {0x1.2400000000000p+0, -0x1.0d77e7cd09000p-3, 0x1.a699688e85bf4p-47},
    {0x1.2400000000000p+0, -0x1.0d77e7cd09000p-3, 0x1.a699688e85bf4p-47},
    {0x1.2200000000000p+0, -0x1.fec9131dbe000p-4, -0x1.575545ca333f2p-45},
    {0x1.2000000000000p+0, -0x1.e27076e2b0000p-4, 0x1.a342c2af0003cp-45},
    {0x1.2000000000000p+0, -0x1.e27076e2b0000p-4, 0x1.a342c2af0003cp-45},
    {0x1.1e00000000000p+0, -0x1.c5e548f5bc000p-4, -0x1.d0c57585fbe06p-46},
    {0x1.1c00000000000p+0, -0x1.a926d3a4ae000p-4, 0x1.53935e85baac8p-45},
    {0x1.1c00000000000p+0, -0x1.a926d3a4ae000p-4, 0x1.53935e85baac8p-45},
    {0x1.1a00000000000p+0, -0x1.8c345d631a000p-4, 0x1.37c294d2f5668p-46},
    {0x1.1a00000000000p+0, -0x1.8c345d631a000p-4, 0x1.37c294d2f5668p-46},
    {0x1.1800000000000p+0, -0x1.6f0d28ae56000p-4, -0x1.69737c93373dap-45},
    {0x1.1600000000000p+0, -0x1.51b073f062000p-4, 0x1.f025b61c65e57p-46},
    {0x1.1600000000000p+0, -0x1.51b073f062000p-4, 0x1.f025b61c65e57p-46},
    {0x1.1400000000000p+0, -0x1.341d7961be000p-4, 0x1.c5edaccf913dfp-45},
    {0x1.1400000000000p+0, -0x1.341d7961be000p-4, 0x1.c5edaccf913dfp-45},
    {0x1.1200000000000p+0, -0x1.16536eea38000p-4, 0x1.47c5e768fa309p-46},
    {0x1.1000000000000p+0, -0x1.f0a30c0118000p-5, 0x1.d599e83368e91p-45},
    {0x1.1000000000000p+0, -0x1.f0a30c0118000p-5, 0x1.d599e83368e91p-45},
    {0x1.0e00000000000p+0, -0x1.b42dd71198000p-5, 0x1.c827ae5d6704cp-46},
    {0x1.0e00000000000p+0, -0x1.b42dd71198000p-5, 0x1.c827ae5d6704cp-46},
    {0x1.0c00000000000p+0, -0x1.77458f632c000p-5, -0x1.cfc4634f2a1eep-45},
    {0x1.0c00000000000p+0, -0x1.77458f632c000p-5, -0x1.cfc4634f2a1eep-45},
    {0x1.0a00000000000p+0, -0x1.39e87b9fec000p-5, 0x1.502b7f526feaap-48},
    {0x1.0a00000000000p+0, -0x1.39e87b9fec000p-5, 0x1.502b7f526feaap-48},
    {0x1.0800000000000p+0, -0x1.f829b0e780000p-6, -0x1.980267c7e09e4p-45},
    {0x1.0800000000000p+0, -0x1.f829b0e780000p-6, -0x1.980267c7e09e4p-45},
    {0x1.0600000000000p+0, -0x1.7b91b07d58000p-6, -0x1.88d5493faa639p-45},
    {0x1.0400000000000p+0, -0x1.fc0a8b0fc0000p-7, -0x1.f1e7cf6d3a69cp-50},
    {0x1.0400000000000p+0, -0x1.fc0a8b0fc0000p-7, -0x1.f1e7cf6d3a69cp-50},
    {0x1.0200000000000p+0, -0x1.fe02a6b100000p-8, -0x1.9e23f0dda40e4p-46},
    {0x1.0200000000000p+0, -0x1.fe02a6b100000p-8, -0x1.9e23f0dda40e4p-46},
    {0x1.0000000000000p+0, 0x0.0000000000000p+0, 0x0.0000000000000p+0},
    {0x1.0000000000000p+0, 0x0.0000000000000p+0, 0x0.0000000000000p+0},
    {0x1.fc00000000000p-1, 0x1.0101575890000p-7, -0x1.0c76b999d2be8p-46},
    {0x1.f800000000000p-1, 0x1.0205658938000p-6, -0x1.3dc5b06e2f7d2p-45},
    {0x1.f400000000000p-1, 0x1.8492528c90000p-6, -0x1.aa0ba325a0c34p-45},
    {0x1.f000000000000p-1, 0x1.0415d89e74000p-5, 0x1.111c05cf1d753p-47},
    {0x1.ec00000000000p-1, 0x1.466aed42e0000p-5, -0x1.c167375bdfd28p-45},
    {0x1.e800000000000p-1, 0x1.894aa149fc000p-5, -0x1.97995d05a267dp-46},
    {0x1.e400000000000p-1, 0x1.ccb73cdddc000p-5, -0x1.a68f247d82807p-46},
    {0x1.e200000000000p-1, 0x1.eea31c006c000p-5, -0x1.e113e4fc93b7bp-47},
    {0x1.de00000000000p-1, 0x1.1973bd1466000p-4, -0x1.5325d560d9e9bp-45},
    {0x1.da00000000000p-1, 0x1.3bdf5a7d1e000p-4, 0x1.cc85ea5db4ed7p-45},
    {0x1.d600000000000p-1, 0x1.5e95a4d97a000p-4, -0x1.c69063c5d1d1ep-45},
    {0x1.d400000000000p-1, 0x1.700d30aeac000p-4, 0x1.c1e8da99ded32p-49},
    {0x1.d000000000000p-1, 0x1.9335e5d594000p-4, 0x1.3115c3abd47dap-45},
    {0x1.cc00000000000p-1, 0x1.b6ac88dad6000p-4, -0x1.390802bf768e5p-46},
    {0x1.ca00000000000p-1, 0x1.c885801bc4000p-4, 0x1.646d1c65aacd3p-45},
    {0x1.c600000000000p-1, 0x1.ec739830a2000p-4, -0x1.dc068afe645e0p-45},
    {0x1.c400000000000p-1, 0x1.fe89139dbe000p-4, -0x1.534d64fa10afdp-45},
    {0x1.c000000000000p-1, 0x1.1178e8227e000p-3, 0x1.1ef78ce2d07f2p-45},
    {0x1.be00000000000p-1, 0x1.1aa2b7e23f000p-3, 0x1.ca78e44389934p-45},
    {0x1.ba00000000000p-1, 0x1.2d1610c868000p-3, 0x1.39d6ccb81b4a1p-47},
    {0x1.b800000000000p-1, 0x1.365fcb0159000p-3, 0x1.62fa8234b7289p-51},
    {0x1.b400000000000p-1, 0x1.4913d8333b000p-3, 0x1.5837954fdb678p-45},
    {0x1.b200000000000p-1, 0x1.527e5e4a1b000p-3, 0x1.633e8e5697dc7p-45},
    {0x1.ae00000000000p-1, 0x1.6574ebe8c1000p-3, 0x1.9cf8b2c3c2e78p-46},
    {0x1.ac00000000000p-1, 0x1.6f0128b757000p-3, -0x1.5118de59c21e1p-45},
    {0x1.aa00000000000p-1, 0x1.7898d85445000p-3, -0x1.c661070914305p-46},
    {0x1.a600000000000p-1, 0x1.8beafeb390000p-3, -0x1.73d54aae92cd1p-47},
    {0x1.a400000000000p-1, 0x1.95a5adcf70000p-3, 0x1.7f22858a0ff6fp-47},
    {0x1.a000000000000p-1, 0x1.a93ed3c8ae000p-3, -0x1.8724350562169p-45},
    {0x1.9e00000000000p-1, 0x1.b31d8575bd000p-3, -0x1.c358d4eace1aap-47},
    {0x1.9c00000000000p-1, 0x1.bd087383be000p-3, -0x1.d4bc4595412b6p-45},
    {0x1.9a00000000000p-1, 0x1.c6ffbc6f01000p-3, -0x1.1ec72c5962bd2p-48},
    {0x1.9600000000000p-1, 0x1.db13db0d49000p-3, -0x1.aff2af715b035p-45},
    {0x1.9400000000000p-1, 0x1.e530effe71000p-3, 0x1.212276041f430p-51},
    {0x1.9200000000000p-1, 0x1.ef5ade4dd0000p-3, -0x1.a211565bb8e11p-51},
    {0x1.9000000000000p-1, 0x1.f991c6cb3b000p-3, 0x1.bcbecca0cdf30p-46},
    {0x1.8c00000000000p-1, 0x1.07138604d5800p-2, 0x1.89cdb16ed4e91p-48},
    {0x1.8a00000000000p-1, 0x1.0c42d67616000p-2, 0x1.7188b163ceae9p-45},
    {0x1.8800000000000p-1, 0x1.1178e8227e800p-2, -0x1.c210e63a5f01cp-45},
    {0x1.8600000000000p-1, 0x1.16b5ccbacf800p-2, 0x1.b9acdf7a51681p-45},
    {0x1.8400000000000p-1, 0x1.1bf99635a6800p-2, 0x1.ca6ed5147bdb7p-45},
    {0x1.8200000000000p-1, 0x1.214456d0eb800p-2, 0x1.a87deba46baeap-47},
    {0x1.7e00000000000p-1, 0x1.2bef07cdc9000p-2, 0x1.a9cfa4a5004f4p-45},
    {0x1.7c00000000000p-1, 0x1.314f1e1d36000p-2, -0x1.8e27ad3213cb8p-45},
    {0x1.7a00000000000p-1, 0x1.36b6776be1000p-2, 0x1.16ecdb0f177c8p-46},
    {0x1.7800000000000p-1, 0x1.3c25277333000p-2, 0x1.83b54b606bd5cp-46},
    {0x1.7600000000000p-1, 0x1.419b423d5e800p-2, 0x1.8e436ec90e09dp-47},
    {0x1.7400000000000p-1, 0x1.4718dc271c800p-2, -0x1.f27ce0967d675p-45},
    {0x1.7200000000000p-1, 0x1.4c9e09e173000p-2, -0x1.e20891b0ad8a4p-45},
    {0x1.7000000000000p-1, 0x1.522ae0738a000p-2, 0x1.ebe708164c759p-45},
    {0x1.6e00000000000p-1, 0x1.57bf753c8d000p-2, 0x1.fadedee5d40efp-46},
    {0x1.6c00000000000p-1, 0x1.5d5bddf596000p-2, -0x1.a0b2a08a465dcp-47},
};

// sin x0, its low part, cos x0, its low part, for x0 = j/128, j = 0..109.
const std::uint64_t k_sincos_table[440] = {
    0x0000000000000000, 0x0000000000000000, 0x3ff0000000000000, 0x0000000000000000,
    0x3f7fffeaaaaeeeef, 0xbc1e45e2ec67b77c, 0x3fefffc000155552, 0x3c8f4a01a0196dae,
    0x3f8fffaaaaeeeed5, 0xbc02ab639a9f0777, 0x3fefff000155549f, 0x3c828a28a03a5ef3,
    0x3f97ff7001033255, 0x3bfefe2b51527336, 0x3feffdc006bff7e6, 0x3c8ae6dae86977bd,
    0x3f9ffeaaaeeee86f, 0xbc3cd406fb224ae2, 0x3feffc00155527d3, 0xbc83b54492d89b5b,
    0x3fa3feb2b12d45d5, 0x3c34ec54203d1c11, 0x3feff9c03414a7ba, 0x3c6991f4be6c59bf,
    0x3fa7fdc01032fba9, 0xbc4599bdf46e997a, 0x3feff7006bfdf99f, 0xbc78b3b560648d5f,
    0x3fabfc6d78586dac, 0x3c18e4fd03dbf236, 0x3feff3c0c8103a31, 0x3c74856dbddc0e66,
    0x3faffaaaeeed4edb, 0xbc42d16d32684b69, 0x3feff0015549f4d3, 0x3c8328387b99426f,
    0x3fb1fc343d808bef, 0xbc5f3d32e6f3be4f, 0x3fefebc222a8ef9f, 0x3c57934934f54c77,
    0x3fb3facb12d1755b, 0xbc5921915299468c, 0x3fefe7034129ef6f, 0xbc6cbf4337c96f97,
    0x3fb5f911fd10b737, 0xbc50184f02be9102, 0x3fefe1c4c3c873eb, 0xbc35a9c9057c4a02,
    0x3fb7f701032550e4, 0x3c3afc2d1800501a, 0x3fefdc06bf7e6b9b, 0x3c831902b535f8db,
    0x3fb9f4902d55d1f9, 0x3c52696d7eac1dc1, 0x3fefd5c94b43e000, 0xbc62e768cb4f92f9,
    0x3fbbf1b78568391d, 0x3c5e91841dea4cc8, 0x3fefcf0c800e99b1, 0x3c6ea3d786d186ac,
    0x3fbdee6f16c1cce6, 0xbc450f8e2fb71673, 0x3fefc7d078d1bc88, 0x3c8075d2447db685,
    0x3fbfeaaeee86ee36, 0xbc4afcb2bcc6f03b, 0x3fefc015527d5bd3, 0x3c8b68f35094efb8,
    0x3fc0f3378ddd71d1, 0x3c6d8468724f0f9e, 0x3fefb7db2bfe0695, 0x3c821dadf4f65ab1,
    0x3fc1f0d3d7afceaf, 0xbc66ef95099769a5, 0x3fefaf22263c4bd3, 0xbc552ace133a2769,
    0x3fc2ee285e4ab88f, 0xbc6e4d0f05dee058, 0x3fefa5ea641c36f2, 0x3c404da6ed17cc7c,
    0x3fc3eb312c5d66cb, 0x3c647d666b66cb91, 0x3fef9c340a7cc428, 0x3c8c5b6b063b7462,
    0x3fc4e7ea4dc5f27b, 0x3c5949db2ac072fc, 0x3fef91ff40374d01, 0xbc67d03f4d3a9e4c,
    0x3fc5e44fcfa126f3, 0xbc66f443063f89b6, 0x3fef874c2e1eecf6, 0xbc8c6514e1332b16,
    0x3fc6e05dc05a4d4c, 0xbbd32c5c8b81c940, 0x3fef7c1afeffde24, 0xbc78f55bc47540b1,
    0x3fc7dc102fbaf2b5, 0x3c45ab50e23c97c3, 0x3fef706bdf9ece1c, 0xbc8698c80c36dcb4,
    0x3fc8d7632efaa944, 0xbc620fa262cbb953, 0x3fef643efeb82acd, 0x3c76b00ac1fe28ac,
    0x3fc9d252d0cec312, 0x3c59c43d80b1137d, 0x3fef57948cff6797, 0x3c6e3a0d3e03b1d5,
    0x3fcaccdb297a0765, 0xbc59883b57d6cdeb, 0x3fef4a6cbd1e3a79, 0x3c813df0edaebb57,
    0x3fcbc6f84edc6199, 0x3c69c1a56a7b0cab, 0x3fef3cc7c3b3d16e, 0xbc621a3ad28a3494,
    0x3fccc0a6588289a3, 0xbc6868d09bc87c6b, 0x3fef2ea5d753ffed, 0x3c8cc4215f56d583,
    0x3fcdb9e15fb5a5d0, 0xbc632e20d6cc6fc2, 0x3fef20073086649f, 0x3c7b940416c1984b,
    0x3fceb2a57f8ae5a3, 0xbc60be06af572ceb, 0x3fef10ec09c5873b, 0x3c8d9072762c1283,
    0x3fcfaaeed4f31577, 0xbc615d88508e32b8, 0x3fef01549f7deea1, 0x3c8d3c1e99e5cafd,
    0x3fd0515cbf65155c, 0xbc79b8c29dfd8ec8, 0x3feef141300d2f26, 0xbc82aa1b08ded372,
    0x3fd0cd00cef36436, 0xbc79fb0a0c93e2b5, 0x3feee0b1fbc0f11c, 0xbc4bfd2380bbc3b1,
    0x3fd14861aa94ddeb, 0xbc6be881b5b615a4, 0x3feecfa744d5efa1, 0xbc556d0a4af541d0,
    0x3fd1c37d64c6b876, 0x3c746076fe0dcff5, 0x3feebe214f76efa8, 0xbc802f9f12ba543e,
    0x3fd23e52111aaf36, 0xbc74f080334eff18, 0x3feeac2061bbaf4f, 0x3c62c1d53e94658d,
    0x3fd2b8ddc43eb49f, 0x3c61553899f2d807, 0x3fee99a4c3a7cd83, 0xbc82264b1bc53ce8,
    0x3fd3331e94049f87, 0x3c7e0cb6b40c302c, 0x3fee86aebf29a9ed, 0x3c89397afdbb58a7,
    0x3fd3ad129769d3d8, 0x3c003d5504878398, 0x3fee733ea0193d40, 0xbc86428b3546ce13,
    0x3fd426b7e69ee697, 0xbc7f09c75705c59f, 0x3fee5f54b436e9d0, 0x3c87eb0fd02fc8bc,
    0x3fd4a00c9b0f3d20, 0x3c7823ba6bb08ead, 0x3fee4af14b2a449c, 0xbc868ca02e8a6833,
    0x3fd5190ecf68a77a, 0x3c7b357155eef0f3, 0x3fee3614b680d6a5, 0xbc727793aa015237,
    0x3fd591bc9fa2f597, 0x3c67c74bac3fe0cb, 0x3fee20bf49acd6c1, 0xbc5660aec7ef636c,
    0x3fd60a1429078775, 0x3c5b1fd80ba89133, 0x3fee0af15a03dbce, 0x3c5fe8e702771ae6,
    0x3fd682138a38d7f7, 0xbc7d889202444aad, 0x3fedf4ab3ebd875e, 0xbc8e2d8a7e6736c4,
    0x3fd6f9b8e33a0255, 0x3c742bc14ee9da0d, 0x3feddded50f228d6, 0xbc6e80c8d42ba2bf,
    0x3fd7710255764214, 0xbc66ead7314bb6ce, 0x3fedc6b7eb995912, 0x3c54b364776dcd35,
    0x3fd7e7ee03c86d4e, 0xbc7b63bcdabf5af2, 0x3fedaf0b6b888e83, 0x3c8a249e2b5e5cea,
    0x3fd85e7a12826949, 0x3c78a40e9b5face0, 0x3fed96e82f71a9dc, 0x3c8ff61bd5d2039d,
    0x3fd8d4a4a774992f, 0x3c744a02ea766326, 0x3fed7e4e97e17b4a, 0xbc63b770352bed94,
    0x3fd94a6be9f546c5, 0xbc769ce13e683f58, 0x3fed653f073e4040, 0xbc876236434bec37,
    0x3fd9bfce02e80510, 0x3c709e39a320b0a4, 0x3fed4bb9e1c619e0, 0x3c8f34bb77858f61,
    0x3fda34c91cc50cca, 0xbc5a310e3b50cecd, 0x3fed31bf8d8d7c06, 0x3c7e60dd3089cbdd,
    0x3fdaa95b63a09277, 0xbc66293eb13c0381, 0x3fed1750727d94f0, 0x3c80d52b1ec1a48e,
    0x3fdb1d8305321617, 0xbc7ae242cb99f519, 0x3fecfc6cfa52ad9f, 0x3c88b5b5508f2a0d,
    0x3fdb913e30dbac43, 0xbc7e38ad2f6c3ff1, 0x3fece115909a82e5, 0x3c81f139bb31109a,
    0x3fdc048b17b140a3, 0x3c619fe6757e9fa7, 0x3fecc54aa2b2972e, 0x3c64ee162ba83a98,
    0x3fdc7767ec7fd19e, 0xbc5eb14d1a3d5826, 0x3feca90c9fc67d0b, 0xbc646a81485e3462,
    0x3fdce9d2e3d4a51f, 0xbc62fc8a12dae298, 0x3fec8c5bf8ce1a84, 0x3c7ab3d1a1590123,
    0x3fdd5bca34047661, 0x3c728a44a75fc29c, 0x3fec6f39208be53b, 0xbc8741dbfbaadb42,
    0x3fddcd4c15329c9a, 0x3c70d4c6e171fd9a, 0x3fec51a48b8b175e, 0xbc61bbb43b9aa880,
    0x3fde3e56c1582a69, 0xbc50a4821099f88f, 0x3fec339eb01ddd81, 0xbc8caaf5ee82c5c0,
    0x3fdeaee8744b05f0, 0xbc5789b43c9b027d, 0x3fec1528065b7d50, 0xbc8892111312e828,
    0x3fdf1eff6bc4f97b, 0x3c717212f8a7525c, 0x3febf641081e7536, 0x3c8b7bd71628a9a1,
    0x3fdf8e99e76abc97, 0x3c59d950af2d00a3, 0x3febd6ea310294f5, 0x3c731bbcc88c109d,
    0x3fdffdb628d2f57a, 0x3c6f4a992e905b6a, 0x3febb723fe630f32, 0x3c772bd2452d0a39,
    0x3fe0362939c69955, 0xbc82d8cd78397b01, 0x3feb96eeef58840e, 0x3c545a3cc78fade0,
    0x3fe06d3686946e5b, 0x3c83f5ae4538ff1b, 0x3feb764b84b704c2, 0xbc8f5848c21b389b,
    0x3fe0a4021e9e1001, 0xbc86f643a13914f6, 0x3feb553a410c104e, 0x3c58ff7947027a16,
    0x3fe0da8b26b5672e, 0xbc8a58def0bee909, 0x3feb33bba89c8948, 0x3c8ea6a51d1f6ca9,
    0x3fe110d0c4b69c3b, 0x3c8d918998809981, 0x3feb11d04162a4c6, 0x3c71dd561efbc0c2,
    0x3fe146d21f8b7f82, 0x3c7bf9535e2739a8, 0x3feaef78930bd275, 0xbc7f836279746f94,
    0x3fe17c8e5f2eedb0, 0x3c635e57102e2488, 0x3feaccb526f69de5, 0x3c88fb6a8dd6b6cc,
    0x3fe1b204acb02fdd, 0xbc5f190c70cbb5ff, 0x3feaa98688308913, 0xbc0b83d607cd5070,
    0x3fe1e7343236574c, 0x3c722a3fa4f41d5a, 0x3fea85ed4373e02d, 0x3c69be06385ec792,
    0x3fe21c1c1b0394cf, 0x3c5e5b324b23aa31, 0x3fea61e9e72586af, 0x3c858330e2fd453f,
    0x3fe250bb93788bbb, 0x3c7ea3d02457bcce, 0x3fea3d7d0352bdcf, 0xbc868dbaeca19669,
    0x3fe28511c917a067, 0xbc801df1d9a16b70, 0x3fea18a729aee445, 0x3c395e25736c0358,
    0x3fe2b91dea88421e, 0xbc8fa371db216ab0, 0x3fe9f368ed912f85, 0xbc81d200c5791606,
    0x3fe2ecdf279a3082, 0x3c8d3557e0e7e37e, 0x3fe9cdc2e3f25e5c, 0x3c83f99112993f62,
    0x3fe32054b148bc4f, 0x3c8f6b42095a135b, 0x3fe9a7b5a36a6514, 0x3c8722cfcc9fa7a9,
    0x3fe3537db9be0367, 0x3c6b327e7af040f0, 0x3fe98141c42e1310, 0x3c8d1ff80488f08d,
    0x3fe386597456282b, 0xbc710fada93b07a8, 0x3fe95a67e00cb1fd, 0xbc80befda21f862d,
    0x3fe3b8e715a2840a, 0xbc797653a7d2f07b, 0x3fe93328926d9e92, 0xbc8bb77003600cda,
    0x3fe3eb25d36cd53a, 0xbc5be570e1570fc0, 0x3fe90b84784ddaf7, 0xbc70feb10ab93b87,
    0x3fe41d14e4ba6790, 0x3c84608fd287ecf5, 0x3fe8e37c303d9ad1, 0xbc6463a4b53d4bf8,
    0x3fe44eb381cf386b, 0xbc83ed6c1e6a5505, 0x3fe8bb105a5dc900, 0x3c8863e03e9474c1,
    0x3fe48000e431159f, 0xbc8b194a7463ed10, 0x3fe89241985d871f, 0x3c8c48d9c413ed84,
    0x3fe4b0fc46aab761, 0x3c20da05738cc59a, 0x3fe869108d77a6c6, 0x3c7338ffe2bfe9dd,
    0x3fe4e1a4e54ed51b, 0xbc8a492f89b7c76a, 0x3fe83f7dde701ca0, 0xbc4152cf609bc6e8,
    0x3fe511f9fd7b351c, 0xbc85c0e861c48831, 0x3fe8158a31916d5d, 0xbc6de8b90b8228de,
    0x3fe541facddbb724, 0x3c7232c28520d391, 0x3fe7eb362eaa1488, 0x3c5a1d65a4a5959f,
    0x3fe571a6966d59b3, 0x3c5c843b4d0fb198, 0x3fe7c0827f09e54f, 0xbc6c73d6d72aee68,
    0x3fe5a0fc98813a12, 0xbc8d82e2b7d4227b, 0x3fe7956fcd7f6543, 0xbc8ab276e9d45ae4,
    0x3fe5cffc16bf8f0d, 0x3c896cb370eb578a, 0x3fe769fec655211f, 0xbc6827d5cf8c68c5,
    0x3fe5fea4552a9e57, 0x3c80b6cef7ee20b7, 0x3fe73e30174efba1, 0xbc65d3ae3d94ad5f,
    0x3fe62cf49921ac79, 0xbc8edd9855b6241a, 0x3fe712046fa77678, 0x3c8425b0a5029c81,
    0x3fe65aec2963e755, 0x3c8126f96b71053c, 0x3fe6e57c800cf55e, 0x3c860286dedbd0a6,
    0x3fe6888a4e134b2f, 0xbc86b7d37644d5e6, 0x3fe6b898fa9efb5d, 0x3c715ac786ccf4b2,
    0x3fe6b5ce50b7821a, 0xbc65d5158f702e0f, 0x3fe68b5a92eb6253, 0xbc89a91ad985f89c,
    0x3fe6e2b77c40bde1, 0xbc70e729857fad53, 0x3fe65dc1fdeb8cba, 0xbc597c1b47337c77,
    0x3fe70f451d0a8c40, 0x3c697ede3885770d, 0x3fe62fcff20191c7, 0x3c6d9143895756ef,
    0x3fe73b7680dea578, 0xbc72248306dc12a2, 0x3fe6018526f563df, 0x3c846ca5e0e432d0,
    0x3fe7674af6f7b524, 0x3c7e9d3f94ac84a8, 0x3fe5d2e255f1f17a, 0x3c80314104c8892b,
    0x3fe792c1d0041d52, 0xbc8abf05eeb354eb, 0x3fe5a3e839824077, 0x3c8428aa2759be62,
    0x3fe7bdda5e28b3c2, 0x3c4ad1197ccd0393, 0x3fe574978d8e83f2, 0x3c8f4714af282d23,
    0x3fe7e893f5037959, 0x3c80eefbaa650c4c, 0x3fe544f10f592ca5, 0xbc8e7ae8e6c7a62f,
    0x3fe812ede9ae4ba4, 0xbc87830adf402dda, 0x3fe514f57d7bf3da, 0x3c747a108073c259,
};

// For u from j/256 (j = 16..256): a point x0 there, atan x0 and the Taylor
// coefficients 1 to 5 of atan around it.
const std::uint64_t k_atan_table[241][7] = {
    {0x3fb0400665e0244e, 0x3fb03a737b53dd20, 0x3fefdf1fcf5cfb72, 0xbfb01eb3ce2ae4c2, 0xbfd4d29edd58a40d, 0x3fafda4ad907a18a, 0x3fc814df4df65b18},
    {0x3fb0fffdb9b88cd8, 0x3fb0f99c63645300, 0x3fefdc08a3ded30f, 0xbfb0d9dc669c1aed, 0xbfd4c669f7138de2, 0x3fb0a12f29d085a7, 0x3fc7f0eecfd48d20},
    {0x3fb1fff15a73d4f1, 0x3fb1f85f2bee2040, 0x3fefd7b342b56d31, 0xbfb1d2b7b69dea40, 0xbfd4b5523922ecc9, 0x3fb18f93522b1a04, 0x3fc7bead5660f061},
    {0x3fb2fffdb2524aa2, 0x3fb2f716e71790a0, 0x3fefd31f53b496a4, 0xbfb2cad84aab7374, 0xbfd4a34b58dd2fb2, 0x3fb27c0ad0cecc18, 0x3fc789d25d2743d7},
    {0x3fb3fffe0573f3ac, 0x3fb3f59d1702f6a0, 0x3fefce4db071acc2, 0xbfb3c20f64db3686, 0xbfd49059eb3bfe93, 0x3fb36659caf74fed, 0x3fc752691c011fb0},
    {0x3fb4ffef894384d6, 0x3fb4f3ed0ce204c0, 0x3fefc93ea8ea5a01, 0xbfb4b84f7b5457c9, 0xbfd47c807401f2f9, 0x3fb44e64b4f67209, 0x3fc7187d4c540b77},
    {0x3fb5fff8df406528, 0x3fb5f22b3c73d820, 0x3fefc3f1b1f60f13, 0xbfb5adb2cb7fa73b, 0xbfd467be2b1eb555, 0x3fb5343599edc463, 0x3fc6dc1b238f5059},
    {0x3fb7000f8c4f0d56, 0x3fb6f04b495a2fa0, 0x3fefbe67340dce97, 0xbfb6a2244d98e1ad, 0xbfd4521614064df1, 0x3fb617aa2ba78a66, 0x3fc69d4f50a3d7ac},
    {0x3fb8000fbb4057cf, 0x3fb7ee27be2cd3a0, 0x3fefb8a039ec9246, 0xbfb7957731d9c773, 0xbfd43b8db6dc7d72, 0x3fb6f88ad69547df, 0x3fc65c26f633ce8c},
    {0x3fb8fff239cf2b7f, 0x3fb8ebb79f979e80, 0x3fefb29d435506e1, 0xbfb8879a69b9cdb5, 0xbfd4242885feafa9, 0x3fb7d6bab6191a0e, 0x3fc618afa7cb8bb5},
    {0x3fb9fff96e2f0772, 0x3fb9e93ad32a9480, 0x3fefac5d04a3ec40, 0xbfb978c253f6ea97, 0xbfd40be3089c36f6, 0x3fb8b25c885aeb77, 0x3fc5d2f763cadce1},
    {0x3fbb00026316b097, 0x3fbae68cce24cc00, 0x3fefa5e0938c5c66, 0xbfba68c376f14e4b, 0xbfd3f2c31696cd7c, 0x3fb98b3b722a2cb4, 0x3fc58b0c9067ad62},
    {0x3fbc0008604f58b1, 0x3fbbe3a705650780, 0x3fef9f285a7a2773, 0xbfbb578f3d5ac0a4, 0xbfd3d8cbf767119f, 0x3fba613dc7e31b88, 0x3fc540fdf5594565},
    {0x3fbd00026cca4eba, 0x3fbce07ec1298a80, 0x3fef9834e8d36c4a, 0xbfbc45135bcac5fe, 0xbfd3be018b5236f1, 0x3fbb34472e991970, 0x3fc4f4dab8adb373},
    {0x3fbdfff4b2b47fca, 0x3fbddd164a051d80, 0x3fef910678dcc895, 0xbfbd3149f0966844, 0xbfd3a266744f9a5f, 0x3fbc0446edb7f27a, 0x3fc4a6b2583f9eca},
    {0x3fbf000aa9a05be0, 0x3fbed996a3bda540, 0x3fef899c1b8ba97f, 0xbfbe1c512287a677, 0xbfd385f8edc130bb, 0x3fbcd14bf306ff50, 0x3fc45694a667a72b},
    {0x3fbffffaba8f63de, 0x3fbfd5b569fe4780, 0x3fef81f84863dc7d, 0xbfbf05dbd1518706, 0xbfd368c44687a69c, 0x3fbd9b081b3868da, 0x3fc40491c345adfc},
    {0x3fc07ffa6eccada8, 0x3fc068d00a396400, 0x3fef7a19f1fcfc6b, 0xbfbfee0c861df0df, 0xbfd34ac65a586c0c, 0x3fbe618f189d637a, 0x3fc3b0ba195779d4},
    {0x3fc1000333432713, 0x3fc0e6b0f203d1a0, 0x3fef7200fe0eb463, 0xbfc06a72e15cb19a, 0xbfd32c00b8db761e, 0x3fbf24d8a11f5e3e, 0x3fc35b1e569e85dd},
    {0x3fc17ffcda1c4811, 0x3fc1646229ebda00, 0x3fef69af7d558737, 0xbfc0dd170b33969b, 0xbfd30c7d33ac50d1, 0x3fbfe4aa9be43f0f, 0x3fc303cf692539cb},
    {0x3fc1ffff3cca418d, 0x3fc1e1fa3b978ea0, 0x3fef612445d421a9, 0xbfc14f03acac8aa8, 0xbfd2ec3962e675a3, 0x3fc0508c2fa6b426, 0x3fc2aade780a6467},
    {0x3fc27ff7d9c78922, 0x3fc25f661b91e640, 0x3fef5860f52e192c, 0xbfc1c023e5de2394, 0xbfd2cb3d6bee0abd, 0x3fc0acfb5e075c1a, 0x3fc2505cdffe453a},
    {0x3fc2fff7a1fc1aaa, 0x3fc2dcb583257c40, 0x3fef4f64c719b6fb, 0xbfc2308261514083, 0xbfd2a9887f7b72d5, 0x3fc107a77c887402, 0x3fc1f45c2c3cd6d1},
    {0x3fc380059d78e15e, 0x3fc359ee6ac98ee0, 0x3fef462f944cec16, 0xbfc2a020d85b87a9, 0xbfd2871c2e4ab369, 0x3fc1608dc31a65d9, 0x3fc196ee130bbe50},
    {0x3fc400049f431b1a, 0x3fc3d6f36bd65360, 0x3fef3cc3dd99b68a, 0xbfc30ee1b3dd00ed, 0xbfd26403f8482664, 0x3fc1b792fe136626, 0x3fc138246eac7440},
    {0x3fc48004e01d95a1, 0x3fc453d386f00cc0, 0x3fef3320e3970539, 0xbfc37ccf0a5279aa, 0xbfd2403f3b151d5d, 0x3fc20cbbe331c9e6, 0x3fc0d81139e3f097},
    {0x3fc4fff7aa9382dd, 0x3fc4d07f8c590a80, 0x3fef294834df28e0, 0xbfc3e9d85b43915c, 0xbfd21bd5eb8845a2, 0x3fc25ff8ac6ac8ad, 0x3fc076c688ed96ca},
    {0x3fc58006352408be, 0x3fc54d1ec39a73e0, 0x3fef1f3709ae009c, 0xbfc4561cb9be8550, 0xbfd1f6c00053f52e, 0x3fc2b15def783be9, 0x3fc014568615239b},
    {0x3fc5ffff2b193f81, 0x3fc5c9804f73e000, 0x3fef14f1ae110e29, 0xbfc4c16e9098b3d2, 0xbfd1d10f8f058241, 0x3fc300c6a14fa897, 0x3fbf61a6d56607c0},
    {0x3fc680084460e6e1, 0x3fc645c804a55e20, 0x3fef0a758fa36ec5, 0xbfc52be9d62fa883, 0xbfd1aabd69a74048, 0x3fc34e451679eb02, 0x3fbe989ef7c14c3d},
    {0x3fc6fffb9e99a846, 0x3fc6c1d04b35fd40, 0x3feeffc63ef8ef95, 0xbfc5956b76a2fe63, 0xbfd183d8ddc78ddf, 0x3fc399bdac606d66, 0x3fbdcdba070d286a},
    {0x3fc780080ffcd490, 0x3fc73dc5b55758e0, 0x3feef4e0457e2065, 0xbfc5fe167d6ff9bc, 0xbfd15c579fadd384, 0x3fc3e34773e52d32, 0x3fbd011c9a65ae4b},
    {0x3fc80006148e79c1, 0x3fc7b9812b7f8ca0, 0x3feee9c7701687ed, 0xbfc665c70e1ef36d, 0xbfd13449ccbcbdab, 0x3fc42ac75c71b3e8, 0x3fbc32eb3e81980e},
    {0x3fc880060f487c17, 0x3fc83511bc0e3640, 0x3feede7ad2d55329, 0xbfc6cc8737e644ba, 0xbfd10bae60597557, 0x3fc4704313e26fbe, 0x3fbb634a6fb18bf4},
    {0x3fc90004d3518d76, 0x3fc8b0738874c100, 0x3feed2fb2ed6673b, 0xbfc732512a6ebac3, 0xbfd0e28a6924232f, 0x3fc4b3b573bcc03f, 0x3fba925e8c72507f},
    {0x3fc97fffd2f20d5c, 0x3fc92ba351af5920, 0x3feec7493d32449f, 0xbfc7971fc308255f, 0xbfd0b8e2d572d28f, 0x3fc4f51a337448fe, 0x3fb9c04bcfcbc620},
    {0x3fca0005bf80f060, 0x3fc9a6ae6e9e8960, 0x3feebb641ef200e7, 0xbfc7fafb6e96e5c1, 0xbfd08eb6ec6ad647, 0x3fc53475f53d0ba6, 0x3fb8ed364433c20e},
    {0x3fca7ff7deeca8e4, 0x3fca2176948578e0, 0x3feeaf4f328ff98b, 0xbfc85dc958149b1c, 0xbfd06414f933a1ab, 0x3fc571b760c45a8f, 0x3fb81941be58c308},
    {0x3fcaffff7defd553, 0x3fca9c229eba6b80, 0x3feea30710a85e10, 0xbfc8bfa67f9dea61, 0xbfd038f35a474e8f, 0x3fc5acf030c225d2, 0x3fb74491d062812f},
    {0x3fcb7ffe669932a5, 0x3fcb1694cff6dfe0, 0x3fee968f1921d387, 0xbfc92078e075d95a, 0xbfd00d60526793c4, 0x3fc5e61073842a52, 0x3fb66f49c5331d5a},
    {0x3fcbfff9b44759f3, 0x3fcb90d15073a2a0, 0x3fee89e756598313, 0xbfc98041cfb9203d, 0xbfcfc2bcbed91b37, 0x3fc61d196d4fc2fc, 0x3fb5998c9411537e},
    {0x3fcc80075568f3ec, 0x3fcc0aec4a31dbe0, 0x3fee7d0e18f270a8, 0xbfc9df0ef522b132, 0xbfcf69d42179c242, 0x3fc6521336646fcd, 0x3fb4c37cdc699095},
    {0x3fccfff8601a799f, 0x3fcc84b849db66a0, 0x3fee7008a0ee780e, 0xbfca3cbb3a403934, 0xbfcf102fd490be32, 0x3fc684ea037d4137, 0x3fb3ed3cd9ec855a},
    {0x3fcd7ff97bbf1497, 0x3fccfe5f1e008ce0, 0x3fee62d2f04615c7, 0xbfca996515aade2c, 0xbfceb5b90b44b682, 0x3fc6b5af92ec8d57, 0x3fb316ee60d831ae},
    {0x3fce000840209b20, 0x3fcd77ddb145a760, 0x3fee556dbe1dfdf1, 0xbfcaf5082186af0f, 0xbfce5a799420489d, 0x3fc6e462454feb2c, 0x3fb240b2d2945a8c},
    {0x3fce8000c0ae943c, 0x3fcdf1113ca10100, 0x3fee47dd59e7308b, 0xbfcb4f889439f69f, 0xbfcdfe93798de600, 0x3fc710f58f267389, 0x3fb16aab1a8a373e},
    {0x3fcf00036d532803, 0x3fce6a17cb4e5c80, 0x3fee3a1ee3d0f6c2, 0xbfcba8fb6e31f768, 0xbfcda1f7e6a382e3, 0x3fc73b75b36ac4c0, 0x3fb094f7a3470b0a},
    {0x3fcf7ffa48b8afc3, 0x3fcee2dbe1654560, 0x3fee2c3543f2ab37, 0xbfcc014f598207d6, 0xbfcd44bf1efe809a, 0x3fc763dc698a561e, 0x3faf7f70a7cf78a3},
    {0x3fd00002eb334fae, 0x3fcf5b7b77ab25e0, 0x3fee1e1d78a5c127, 0xbfcc5898c555d571, 0xbfcce6d9b706cf86, 0x3fc78a350823f643, 0x3fadd6190b9118e8},
    {0x3fd03ffca8af86fe, 0x3fcfd3cbb53a0c00, 0x3fee0fdcfdcbac8b, 0xbfccaeb76c3246ff, 0xbfcc8870d6e19ad3, 0x3fc7ae73d2c48e91, 0x3fac2e260510fdb0},
    {0x3fd07ffcd38984b7, 0x3fd025f75732d4a0, 0x3fee017049c17ab3, 0xbfcd03c29afe5028, 0xbfcc29719a2c1833, 0x3fc7d0a569041dcf, 0x3faa87d3f497c653},
    {0x3fd0bfff1ed2add7, 0x3fd061edcd7f7420, 0x3fedf2d8da96b750, 0xbfcd57b2c777881e, 0xbfcbc9ea8692b503, 0x3fc7f0c942abf9e7, 0x3fa8e35e04b42bb4},
    {0x3fd10003a8515cda, 0x3fd09dc9027416a0, 0x3fede41734899950, 0xbfcdaa867983ede4, 0xbfcb69e3999706b6, 0x3fc80ee1b0f126db, 0x3fa740fe17ee9bab},
    {0x3fd14001f3af9cc5, 0x3fd0d980b6e1aba0, 0x3fedd52de0412681, 0xbfcdfc316863b28b, 0xbfcb0971c55b8d5a, 0x3fc82aeda6731aac, 0x3fa5a0ecc73bd8f0},
    {0x3fd18003b6122509, 0x3fd1151daa1e67a0, 0x3fedc61b2e0c1f32, 0xbfce4cbeb9ba6b7e, 0xbfcaa88e90c2431c, 0x3fc844f48bcbda5e, 0x3fa4036150e585ff},
    {0x3fd1bfffa6a2a153, 0x3fd15096e7a18dc0, 0x3fedb6e1e1218f3f, 0xbfce9c219621d6a2, 0xbfca475022627b04, 0x3fc85cf5ff8b908e, 0x3fa268919833c0d6},
    {0x3fd1fffd2d345aaf, 0x3fd18bf3053bf760, 0x3feda780cc3acb29, 0xbfceea622aa756ae, 0xbfc9e5b347ed9793, 0x3fc872f887ab542a, 0x3fa0d0b2158e9e9a},
    {0x3fd23ffcf14cf05a, 0x3fd1c7324d568460, 0x3fed97f855f32d3d, 0xbfcf378021d457c8, 0xbfc983bef065b845, 0x3fc886fffba70cd8, 0x3f9e77ebaeb85ccc},
    {0x3fd27ffe0bae6fc9, 0x3fd202539a27c160, 0x3fed88494619176e, 0xbfcf83795c0ac9ec, 0xbfc9217c5e645195, 0x3fc8990ff4264515, 0x3f9b551ce6b92e65},
    {0x3fd2c001a297a7de, 0x3fd23d57acb927c0, 0x3fed7873e4958fb6, 0xbfcfce4e43572249, 0xbfc8bef19f3560f3, 0x3fc8a92cdf7f0e5b, 0x3f983958116f3b19},
    {0x3fd2fffe7267616a, 0x3fd27835b2f378c0, 0x3fed687b13906586, 0xbfd00bf9afda1a0f, 0xbfc85c34c197ad7d, 0x3fc8b7591e99f0a7, 0x3f9524fa6525c365},
    {0x3fd33ffe48153b20, 0x3fd2b2f66a2fdcc0, 0x3fed585cf827fbe4, 0xbfd03039b45a6918, 0xbfc7f93e5dfc3f72, 0x3fc8c39bc5210022, 0x3f92185e168fb62e},
    {0x3fd380038122579a, 0x3fd2ed9baf6ec1e0, 0x3fed4819872f20d3, 0xbfd053e81f4c1031, 0xbfc79612621ffd79, 0x3fc8cdf9db9d9dfc, 0x3f8e27b480c6852f},
    {0x3fd3c0033ef39141, 0x3fd3281b4668c700, 0x3fed37b418590d1a, 0xbfd076fea3ef2560, 0xbfc732c93033287a, 0x3fc8d676ca2e5458, 0x3f882f85d80944b1},
    {0x3fd4000163fa0e31, 0x3fd362787b565000, 0x3fed272c47a813da, 0xbfd0997f493b9d88, 0xbfc6cf643da9fe3c, 0x3fc8dd18c1cd3331, 0x3f8248d1f70f6e07},
    {0x3fd4400374071092, 0x3fd39cb80f0a4000, 0x3fed16813ba47a6b, 0xbfd0bb6cd8788947, 0xbfc66be2589596a6, 0x3fc8e1e5c9b3ec1e, 0x3f78e868d20fab86},
    {0x3fd48000c880f200, 0x3fd3d6d1deffb460, 0x3fed05b5cadc576c, 0xbfd0dcc2a1d352c2, 0xbfc608583d7d2574, 0x3fc8e4e303208bc0, 0x3f6ac9096379e732},
    {0x3fd4c0004d97d2cb, 0x3fd410cbf3a2e220, 0x3fecf4c8bb7ed511, 0xbfd0fd8437766a49, 0xbfc5a4c25aabc13c, 0x3fc8e616c80dac4b, 0x3f4038aab04695c2},
    {0x3fd4fffd9397539f, 0x3fd44aa206a7dec0, 0x3fece3bbcf479dde, 0xbfd11daf4d122984, 0xbfc5412eb1024df0, 0x3fc8e5871b2c560d, 0xbf625da8951c088d},
    {0x3fd53ffff304715f, 0x3fd4845a791f3900, 0x3fecd28da45e0fd8, 0xbfd13d478d61f221, 0xbfc4dd98d3e9bb99, 0x3fc8e33a0f181507, 0xbf743c33d08bd25c},
    {0x3fd58002e88ea386, 0x3fd4bdf0f575d6c0, 0x3fecc14002035609, 0xbfd15c4ab808071e, 0xbfc47a0eb2945fcf, 0x3fc8df35fc056447, 0xbf7f2011b00a45cd},
    {0x3fd5bffd70f4d590, 0x3fd4f75d284d7ae0, 0x3fecafd5f2de98b6, 0xbfd17ab4a2b42f42, 0xbfc416a51c285a92, 0x3fc8d982511d6c5a, 0xbf84ecc177008605},
    {0x3fd5fffdb70d6e53, 0x3fd530ab8e2ff500, 0x3fec9e4c32d2429d, 0xbfd1988c35190681, 0xbfc3b34cbf748319, 0x3fc8d22498d3a613, 0xbf8a33d4aa295f9f},
    {0x3fd63ffc5c7399e2, 0x3fd569d54f022e80, 0x3fec8ca558dd180f, 0xbfd1b5ce1d701de4, 0xbfc35017a7806a5a, 0x3fc8c92456c01cf9, 0xbf8f64d9942059e1},
    {0x3fd67ffd9a1ac7d2, 0x3fd5a2ddf50031e0, 0x3fec7ae0ceff6deb, 0xbfd1d27c7c8c245b, 0xbfc2ed05c6aa933f, 0x3fc8be87ddc5cf1f, 0xbf923fb6d594386f},
    {0x3fd6bffd6f7b9353, 0x3fd5dbc1b4e066c0, 0x3fec6900456b591a, 0xbfd1ee95c2d6d0aa, 0xbfc28a23b11086f7, 0x3fc8b256dde22d5a, 0xbf94c19a489d85a4},
    {0x3fd6fffbf02a83e4, 0x3fd614806a237dc0, 0x3fec57044cc81773, 0xbfd20a1a4b9029ca, 0xbfc2277789f5fb1c, 0x3fc8a4989b09e911, 0xbf9737ec130d419a},
    {0x3fd73ffe128c213a, 0x3fd64d1e42499480, 0x3fec44ec129c0d30, 0xbfd2250c83787259, 0xbfc1c4ffd55be4fc, 0x3fc8955336b2d603, 0xbf99a2842e43df46},
    {0x3fd77ffbea0cdc7a, 0x3fd6859405b0e220, 0x3fec32ba687132c0, 0xbfd23f697273497e, 0xbfc162cecd39b037, 0x3fc8848ffa930aaf, 0xbf9c013da4554412},
    {0x3fd7c003f18edab8, 0x3fd6bdee4127bee0, 0x3fec206bc01607bd, 0xbfd259375fee2f42, 0xbfc100d4307761e1, 0x3fc872525dfec556, 0xbf9e53f67958f973},
    {0x3fd7fffd41f35c4c, 0x3fd6f616da6607a0, 0x3fec0e07cddc8437, 0xbfd2726cbfb4daea, 0xbfc09f3be0db1472, 0x3fc85ea92a95aa1b, 0xbfa04d47d872cfa2},
    {0x3fd8400326c7c46b, 0x3fd72e2596b8be00, 0x3febfb874cdedf38, 0xbfd28b14d09404f3, 0xbfc03de1e7fb61f2, 0x3fc84993acb33be9, 0xbfa16a769b1de607},
    {0x3fd88003ca90b179, 0x3fd7660aa104a220, 0x3febe8eff236e2f6, 0xbfd2a32919a94ddf, 0xbfbfb9ce0856a081, 0x3fc8331f33f70280, 0xbfa2817af01308cc},
    {0x3fd8c003e9692fd5, 0x3fd79dc9f0b2cb00, 0x3febd640f2966495, 0xbfd2baabfd6ec2ea, 0xbfbef892e08e9c2d, 0x3fc81b52031873e3, 0xbfa39249ac12113d},
    {0x3fd8fffe35be5c5f, 0x3fd7d55ebdccdfc0, 0x3febc37c6eabcf77, 0xbfd2d19c2d74f445, 0xbfbe382ce63f2cdb, 0x3fc802360e6fe2ae, 0xbfa49cd90e66ab41},
    {0x3fd94002aa8974cd, 0x3fd80cd6b8afd880, 0x3febb09e4468ccba, 0xbfd2e7ffec84e686, 0xbfbd787688c659e8, 0x3fc7e7ccc2f15460, 0xbfa5a120b410d3ed},
    {0x3fd98002e08efdea, 0x3fd8442534856920, 0x3feb9dab3f290478, 0xbfd2fdd2bb81edef, 0xbfbcb9a531e68398, 0x3fc7cc23c2dbb11b, 0xbfa69f1998467e78},
    {0x3fd9c00275294b6b, 0x3fd87b4d299f6200, 0x3feb8aa2de96cf1f, 0xbfd313168c4d45d2, 0xbfbbfbb7edce4dba, 0x3fc7af418907fec9, 0xbfa796be07419f55},
    {0x3fda0002f3e490ec, 0x3fd8b24fc21a4500, 0x3feb77853b5ef7dd, 0xbfd327cc8eae70cd, 0xbfbb3eb3d49e40da, 0x3fc7912d4d93f7ea, 0xbfa888099e21606a},
    {0x3fda3fff458461b6, 0x3fd8e9287754d2c0, 0x3feb64546a0daf0e, 0xbfd33bf3dc2a9a3f, 0xbfba82b14917d003, 0x3fc771f17c7566cf, 0xbfa972f93d700dd8},
    {0x3fda800287e12aae, 0x3fd91fe0a5dfd000, 0x3feb510da0d82e05, 0xbfd34f90a76ad312, 0xbfb9c798deec35ad, 0x3fc751908a0ef43e, 0xbfaa578b0872efc8},
    {0x3fdac00149a86c84, 0x3fd9566e5c4516e0, 0x3feb3db4dd03f6b6, 0xbfd362a0291c1f82, 0xbfb90d9503f6df60, 0x3fc7301825091e92, 0xbfab35be577a022b},
    {0x3fdaffff2f4cc2e1, 0x3fd98cd494226540, 0x3feb2a499297200a, 0xbfd375245153fd01, 0xbfb854a3ae3de27e, 0x3fc70d8e7eb3f331, 0xbfac0d93b6ad570e},
    {0x3fdb4000c2f3711e, 0x3fd9c31701cdc4c0, 0x3feb16caea63781b, 0xbfd3871f3665b649, 0xbfb79cc03f70fbc6, 0x3fc6e9f9061dfc2e, 0xbfacdf0cd837f9c3},
    {0x3fdb8000a777e180, 0x3fd9f930f3748f20, 0x3feb033b0fb0162a, 0xbfd3989025978cab, 0xbfb6e6025c765aab, 0x3fc6c5629c16d678, 0xbfadaa2c92a16ebf},
    {0x3fdbbffd087e14ed, 0x3fda2f20bf0ddb00, 0x3feaef9b1cce6e94, 0xbfd3a9778b73e3c3, 0xbfb6307709efd1cc, 0x3fc69fd458408d3a, 0xbfae6ef6d2e48013},
    {0x3fdc0000f0086783, 0x3fda64ef8d448080, 0x3feadbe835990b5a, 0xbfd3b9d927241b86, 0xbfb57c06c20e4001, 0x3fc6794f90e6c8ab, 0xbfaf2d709a630a27},
    {0x3fdc4001863e58f8, 0x3fda9a941c3a1ba0, 0x3feac82635ed7dd2, 0xbfd3c9b30c075b50, 0xbfb4c8d7a429793c, 0x3fc651e295903c22, 0xbfafe59ff0f8b649},
    {0x3fdc7ffc6c62c3bf, 0x3fdad00c580a5840, 0x3feab45662d1d808, 0xbfd3d905acbb06ec, 0xbfb416f7421e42dc, 0x3fc62996e5608efd, 0xbfb04bc5f14b649a},
    {0x3fdcc00234b2a209, 0x3fdb0565f68f3b40, 0x3feaa0741e3dc946, 0xbfd3e7d5e2db674e, 0xbfb3663ea4833ffe, 0x3fc60069c4f0392b, 0xbfb0a19e38b10201},
    {0x3fdcfffcaac5f9f9, 0x3fdb3a8e59c45cc0, 0x3fea8c86d2389c24, 0xbfd3f61f8362b2cb, 0xbfb2b6f1c6c746a6, 0x3fc5d671426d2946, 0xbfb0f45d4981ce75},
    {0x3fdd40040d800c64, 0x3fdb6f9988af6580, 0x3fea78877498ced2, 0xbfd403e8ef8975c0, 0xbfb208d4bea81e2b, 0x3fc5aba5283ffa4e, 0xbfb1440811705130},
    {0x3fdd7ffeb0e64500, 0x3fdba4722324e140, 0x3fea647e8c5ad680, 0xbfd4112da03f042d, 0xbfb15c339580389c, 0x3fc5801e49d9889e, 0xbfb190a3ef96554f},
    {0x3fddbffe2dfcf4eb, 0x3fdbd9269f1d27a0, 0x3fea50671ac286ca, 0xbfd41df2590a4de1, 0xbfb0b0e48bd1efa5, 0x3fc553d8702506d0, 0xbfb1da36ada415a6},
    {0x3fddfffd8a34bbc2, 0x3fdc0db2c4f7a2c0, 0x3fea3c432ef70bb3, 0xbfd42a3716ee647c, 0xbfb006fadb6270bb, 0x3fc526de86f08de6, 0xbfb220c67e5061fb},
    {0x3fde3ffdd26415c0, 0x3fdc421758282940, 0x3fea2812f391ddcb, 0xbfd435fd18eddf0a, 0xbfaebcf288a589af, 0x3fc4f9374cf96163, 0xbfb26459f6a18481},
    {0x3fde7fff37f72672, 0x3fdc765467aa3dc0, 0x3fea13d6d6ce86b3, 0xbfd4414574037e91, 0xbfad6ec93b2cc445, 0x3fc4caea0564f101, 0xbfb2a4f80c49cd64},
    {0x3fdebffda11bc00f, 0x3fdcaa6685e23660, 0x3fe9ff90a25c2396, 0xbfd44c108a64724f, 0xbfac23992f871e82, 0x3fc49c010afbfb85, 0xbfb2e2a80f0ff3fe},
    {0x3fdeffff3313756d, 0x3fdcde529d30cc20, 0x3fe9eb3edff9491f, 0xbfd456607e6abaae, 0xbfaadb4c3e8aa98d, 0x3fc46c7f25d8ff7d, 0xbfb31d71a71d448d},
    {0x3fdf4001914b856e, 0x3fdd1216aac1bb20, 0x3fe9d6e2c9bc4315, 0xbfd46036004e7e91, 0xbfa995f7fb901f89, 0x3fc43c6d3f5be04a, 0xbfb3555cce8abf92},
    {0x3fdf8003cd144428, 0x3fdd45b1d93e9640, 0x3fe9c27d256fdfeb, 0xbfd4699209f7c145, 0xbfa853a9ed521174, 0x3fc40bd32b27751f, 0xbfb38a71cfa5c5f2},
    {0x3fdfc00200545bd9, 0x3fdd7920f536d960, 0x3fe9ae0faae99ea5, 0xbfd4727538dd66f4, 0xbfa7147db5484f74, 0x3fc3dabaf8efc373, 0xbfb3bcb93ea6b864},
    {0x3fdffffbda6f2aa8, 0x3fddac63b420faa0, 0x3fe9999aed4d0cab, 0xbfd47ae0bfcc6072, 0xbfa5d87c25bf7a4a, 0x3fc3a92bf5999ee5, 0xbfb3ec3bf7f09d08},
    {0x3fe01fffa65118c8, 0x3fdddf852bf70c00, 0x3fe9851aecd72ae5, 0xbfd482d78f5794c5, 0xbfa49f682e4a020b, 0x3fc3772225a156da, 0xbfb4190319f58064},
    {0x3fe040019c0b0556, 0x3fde127dfa2ba200, 0x3fe9709308c17a55, 0xbfd48a59957a7efd, 0xbfa369762648f2bb, 0x3fc344ab592569b1, 0xbfb4431803752ddb},
    {0x3fe05fffc24501db, 0x3fde4547a495bcc0, 0x3fe95c064f225b79, 0xbfd491672163f5b8, 0xbfa236d34b79b89f, 0x3fc311d4b530b7be, 0xbfb46a844d931476},
    {0x3fe07ffe865125fc, 0x3fde77e92a5fad60, 0x3fe947725c13b0ea, 0xbfd498026f33abca, 0xbfa1075ade947c6b, 0x3fc2de9dd8d5e01b, 0xbfb48f51ca17ca60},
    {0x3fe0a002107eac25, 0x3fdeaa6908243180, 0x3fe932d4f339824b, 0xbfd49e2d7145f475, 0xbf9fb5d800571424, 0x3fc2ab0685d1cf84, 0xbfb4b18a7dbbbabe},
    {0x3fe0bfff7376e5d4, 0x3fdedcb5f79ff560, 0x3fe91e358ee1b492, 0xbfd4a3e749498453, 0xbf9d63e4be685c6f, 0x3fc27726c4b1f032, 0xbfb4d1389e6ecc3a},
    {0x3fe0dffe1715ee2e, 0x3fdf0edb9be1bb80, 0x3fe9098fd993bd60, 0xbfd4a9329b84e907, 0xbf9b185ae07dba5e, 0x3fc242f8f2d7a804, 0xbfb4ee668ddaa340},
    {0x3fe100017f3d776c, 0x3fdf40df6119e100, 0x3fe8f4e1fb44bcfb, 0xbfd4ae1116e3467e, 0xbf98d304cf368422, 0x3fc20e7d736708ae, 0xbfb5091ed7b3658d},
    {0x3fe11ffefd8c7b65, 0x3fdf72b08fd21560, 0x3fe8e0334770fb0a, 0xbfd4b2825c0f6783, 0xbf9694ac7ffe0364, 0x3fc1d9cbe529bf4c, 0xbfb5216c2c73e5f0},
    {0x3fe14000afa3ee71, 0x3fdfa45ee3324d60, 0x3fe8cb7d9ff684df, 0xbfd4b68917add34d, 0xbf945ca367276e70, 0x3fc1a4d9a1fbf3b1, 0xbfb537595fba2374},
    {0x3fe15fff73336187, 0x3fdfd5df3de48d00, 0x3fe8b6c60cbe3546, 0xbfd4ba259b291bcb, 0xbf922b6f5fb712cc, 0x3fc16fb855e28b0b, 0xbfb54af1633f423c},
    {0x3fe17fff6c447b82, 0x3fe0039c0208ecc0, 0x3fe8a20a48f15926, 0xbfd4bd59a5808ac3, 0xbf9000cd5eef6f2a, 0x3fc13a66ebe54aa7, 0xbfb55c3f45420ce4},
    {0x3fe19fffae932b61, 0x3fe01c33e0091bc0, 0x3fe88d4b55664e00, 0xbfd4c026579f5abb, 0xbf8bb9a68797c32a, 0x3fc104ec95d4f64e, 0xbfb56b4e2bbc325e},
    {0x3fe1bfffba12ae50, 0x3fe034b6d3aba020, 0x3fe87889ebdccf04, 0xbfd4c28ce6d463c1, 0xbf877f1cb36211fc, 0x3fc0cf4fb90b11e7, 0xbfb5782952dcbe1a},
    {0x3fe1e0014b459e41, 0x3fe04d262dc05800, 0x3fe863c551625b6a, 0xbfd4c48eaffdd399, 0xbf8351cb603059ca, 0x3fc09992de65d0d9, 0xbfb582dc087bb367},
    {0x3fe2000032306f33, 0x3fe0657ebafb6ce0, 0x3fe84f00a1e2eec3, 0xbfd4c62cb79ec8c6, 0xbf7e6488d95de8d1, 0x3fc063c2661df241, 0xbfb58b71aaa63bad},
    {0x3fe22000d30a486c, 0x3fe07dc3d2165080, 0x3fe83a3966b3e5bf, 0xbfd4c7687de04dee, 0xbf763ff7800f052f, 0x3fc02ddc28f35edd, 0xbfb591f5a351cf91},
    {0x3fe23ffe215e03fc, 0x3fe095f19f380a00, 0x3fe8257348be5f3f, 0xbfd4c8431b793f77, 0xbf6c6e63625993b8, 0x3fbfefdb8c5e4b3b, 0xbfb5967366fe9ca7},
    {0x3fe260006833d65d, 0x3fe0ae0e6496a8c0, 0x3fe810a945b44aa3, 0xbfd4c8be055b407a, 0xbf5920a7ae83f0a4, 0x3fbf83dc860a6a5e, 0xbfb598f670d98ee7},
    {0x3fe28000e82d4d50, 0x3fe0c615095f5300, 0x3fe7fbe01e9337b7, 0xbfd4c8da573c6f6a, 0x3f38b6c7c50f565d, 0x3fbf17dbc9c4b6ca, 0xbfb5998a45d6dae0},
    {0x3fe29fff203b6a0b, 0x3fe0de0530852720, 0x3fe7e7188520538d, 0xbfd4c899668c6963, 0x3f6286ecbeca8ab0, 0x3fbeabe49b6ac5bd, 0xbfb5983a575a9684},
    {0x3fe2c001e91a9d93, 0x3fe0f5e3f7817a20, 0x3fe7d24e63a45d97, 0xbfd4c7fc5f83c46d, 0x3f70e1995d9c800a, 0x3fbe3fe93721a8e0, 0xbfb59512377da840},
    {0x3fe2dfffc6fb4948, 0x3fe10daa4ce36040, 0x3fe7bd883e39011f, 0xbfd4c704b5eae11f, 0x3f786398192c622b, 0x3fbdd412b62ba357, 0xbfb5901d5f0e020e},
    {0x3fe2ffff39cb4eed, 0x3fe1255d0970ad60, 0x3fe7a8c2365b7a9b, 0xbfd4c5b38925f532, 0x3f7fcb03785e3070, 0x3fbd68540eedf3b3, 0xbfb58967479c252a},
    {0x3fe31ffe002e31cb, 0x3fe13cfa81fd3780, 0x3fe793fe1bbe9667, 0xbfd4c40a3046f4c7, 0x3f838bae8f5e6bf1, 0x3fbcfcbd83775c98, 0xbfb580fb62e887ab},
    {0x3fe34000edc7bffd, 0x3fe1548644d05200, 0x3fe77f39244a1da5, 0xbfd4c2099fb764c1, 0x3f8724e2851b0be5, 0x3fbc9147507c76e0, 0xbfb576e519c7f0ab},
    {0x3fe36001ce042830, 0x3fe16bfbc1656ae0, 0x3fe76a77ad3b2b77, 0xbfd4bfb374aac296, 0x3f8ab07005b229c2, 0x3fbc260e87dca54b, 0xbfb56b2fc90df763},
    {0x3fe37ffe89b8fc54, 0x3fe1835977d0ba80, 0x3fe755bb660caa3d, 0xbfd4bd09308bb975, 0x3f8e2e26fe0a1240, 0x3fbbbb2218790f26, 0xbfb55de6c094f3da},
    {0x3fe3a0019b4da842, 0x3fe19aa7100cd140, 0x3fe740fdd801f889, 0xbfd4ba0b2c32c656, 0x3f90cf998eca44a2, 0x3fbb5066c9863443, 0xbfb54f15406672b5},
    {0x3fe3c000ce6b63e8, 0x3fe1b1dd1d0b0ae0, 0x3fe72c45f28670e6, 0xbfd4b6bb92422e2e, 0x3f928141a0d32146, 0x3fbae60637452321, 0xbfb53ec677d91f56},
    {0x3fe3dfff114a2607, 0x3fe1c8fdc6ff6f20, 0x3fe71792206847a7, 0xbfd4b31b669bd306, 0x3f942c3a04ffd28a, 0x3fba7bfde7fc0825, 0xbfb52d0582f471ba},
    {0x3fe3ffffc1da9b7d, 0x3fe1e00b7f2e8840, 0x3fe702e084371133, 0xbfd4af2b8012fbe4, 0x3f95d0b4bfc47f4b, 0x3fba1249d80ab6c5, 0xbfb519dd69a4108d},
    {0x3fe41ffee11d9c33, 0x3fe1f70367c3ec20, 0x3fe6ee34026a76a0, 0xbfd4aaed96514b12, 0x3f976e8307ba2905, 0x3fb9a8fe261a1221, 0xbfb505591d552ba0},
    {0x3fe43ffffa174676, 0x3fe20de80faff860, 0x3fe6d98a9ea6d162, 0xbfd4a6626b927b3b, 0x3f9905d8f84adbb0, 0x3fb94015dd484db5, 0xbfb4ef83783eef44},
    {0x3fe45fff0d457fa4, 0x3fe224b69f675300, 0x3fe6c4e73a093351, 0xbfd4a18bcbf2bff8, 0x3f9a968a84bb8c16, 0x3fb8d7a493fbb975, 0xbfb4d8673b37e4fb},
    {0x3fe47ffe8f910e57, 0x3fe23b70dd92b840, 0x3fe6b04889b04359, 0xbfd49c6a974b07ff, 0x3f9c20be25f20251, 0x3fb86fa882e9673d, 0xbfb4c00f0d12f550},
    {0x3fe4a0017323fc6b, 0x3fe25218e34e3420, 0x3fe69bacf277fe27, 0xbfd496ff7f856aba, 0x3f9da49e9928150c, 0x3fb8081e3eb66a26, 0xbfb4a68578ab06c5},
    {0x3fe4c000b1bf0500, 0x3fe268a9bd8b2c80, 0x3fe6871942abbd42, 0xbfd4914cec74e64a, 0x3f9f21ded0c3eeec, 0x3fb7a1225b30aa05, 0xbfb48bd4ec53ef43},
    {0x3fe4e0011d07207b, 0x3fe27f26da64f7a0, 0x3fe6728aa7cfbeb2, 0xbfd48b533fcbb247, 0x3fa04c60a7354a41, 0x3fb73aaaeff6f27a, 0xbfb47007b81a6bb2},
    {0x3fe4fffe5f36eb46, 0x3fe2958d35ddd180, 0x3fe65e04307b6af3, 0xbfd48514828bb6e6, 0x3fa1048e48993ed9, 0x3fb6d4cb468d7c59, 0xbfb453280d484989},
    {0x3fe520012afdf759, 0x3fe2abe2eb1c3280, 0x3fe649808dc5daad, 0xbfd47e902c11e3b7, 0x3fa1b9ae88e1b343, 0x3fb66f6cff4501bf, 0xbfb4353ffcd6b8de},
    {0x3fe54001dfdb2423, 0x3fe2c222ab0402c0, 0x3fe63504e7e657fb, 0xbfd477c8eee53fa9, 0x3fa26b9a696cd845, 0x3fb60aad6a3aa6ef, 0xbfb416597704e1f4},
    {0x3fe55ffe72d2a74f, 0x3fe2d84b16be7240, 0x3fe62092ce54aede, 0xbfd470c07b764156, 0x3fa31a4c4d9abee7, 0x3fb5a697a899a63d, 0xbfb3f67e49fa7fb1},
    {0x3fe58000ee716c33, 0x3fe2ee63284f3fe0, 0x3fe60c24181c5720, 0xbfd46975c383b0c1, 0x3fa3c5ffc40a1a5a, 0x3fb543110b7b3b72, 0xbfb3d5b821700401},
    {0x3fe59fff9825cd2a, 0x3fe304642defcf40, 0x3fe5f7bf3c14a317, 0xbfd461ec227a4cde, 0x3fa46e856da8d837, 0x3fb4e03c6162f4c8, 0xbfb3b410857f5976},
    {0x3fe5bffdfe2a42cd, 0x3fe31a50a5110dc0, 0x3fe5e36233cf1268, 0xbfd45a23f68b7dbc, 0x3fa513f5de40f0e9, 0x3fb47e12de05901e, 0xbfb39190da5cabb5},
    {0x3fe5e00057330799, 0x3fe3302b75253480, 0x3fe5cf0a901da45a, 0xbfd4521d552754cf, 0x3fa5b66bbbf000bb, 0x3fb41c8bd2baf7b2, 0xbfb36e425f53241a},
    {0x3fe600014d6055da, 0x3fe345f0ff2eda60, 0x3fe5babbf2ea5900, 0xbfd449dab2008754, 0x3fa655d118f56fbb, 0x3fb3bbbb89a0c1b2, 0xbfb34a2e2e8d60fc},
    {0x3fe620012c3809cb, 0x3fe35ba1812d5040, 0x3fe5a676671e49e9, 0xbfd4415d230e6216, 0x3fa6f22d6b05c7f7, 0x3fb35ba4cfe6b72b, 0xbfb3255d3c3bfa3b},
    {0x3fe6400087b47ecc, 0x3fe3713d69715580, 0x3fe59239c8fb0e69, 0xbfd438a5a5bd1f6e, 0x3fa78b897f9b13cf, 0x3fb2fc4974f57c8f, 0xbfb2ffd8566caaca},
    {0x3fe66000a746397f, 0x3fe386c59d968940, 0x3fe57e0583073c58, 0xbfd42fb4fe3d0083, 0x3fa821f14b9e1eeb, 0x3fb29da91952ee82, 0xbfb2d9a8245866a8},
    {0x3fe68000e4e3094b, 0x3fe39c39b5fe3900, 0x3fe569da36dd131e, 0xbfd4268c74778fe0, 0x3fa8b5679ab0310f, 0x3fb23fc8f2e43205, 0xbfb2b2d526483573},
    {0x3fe6a001e2e37787, 0x3fe3b19a27d52620, 0x3fe555b7b5d865cd, 0xbfd41d2cf1600cd3, 0x3fa945f54b79e859, 0x3fb1e2aa46a0b02d, 0xbfb28b67b508a35b},
    {0x3fe6bffe0df4bbfb, 0x3fe3c6e346f2b6e0, 0x3fe541a1b658afbe, 0xbfd41399388da137, 0x3fa9d387e5b3c2ba, 0x3fb18660173397f9, 0xbfb2636801db4945},
    {0x3fe6dfffea406cea, 0x3fe3dc1c1bb3d400, 0x3fe52d91d33ffe8e, 0xbfd409cf36bcffe9, 0x3faa5e54174405af, 0x3fb12acedc041806, 0xbfb23ade160d6557},
    {0x3fe70000ed01ea65, 0x3fe3f14054e51400, 0x3fe5198c5c8b9119, 0xbfd3ffd1f2ea4ff7, 0x3faae643308c81cd, 0x3fb0d00c1960aaf7, 0xbfb211d1d2f50d25},
    {0x3fe7200200d515eb, 0x3fe40650983bb3e0, 0x3fe50590f2175c71, 0xbfd3f5a2361bb15c, 0x3fab6b5f9b536afc, 0x3fb07617a731624d, 0xbfb1e84af1a8c054},
    {0x3fe740011323de6d, 0x3fe41b4b9483e720, 0x3fe4f1a11027ba01, 0xbfd3eb41bb978c8f, 0x3fabeda77765626a, 0x3fb01cf997f58c8a, 0xbfb1be5103074348},
    {0x3fe75fff25cab4ca, 0x3fe430320001d5c0, 0x3fe4ddbc4573fb6c, 0xbfd3e0b141f21d2a, 0x3fac6d25d1bda00f, 0x3faf89625935ee68, 0xbfb193eb6f8e0689},
    {0x3fe77ffe90921f76, 0x3fe445056cc6af00, 0x3fe4c9e14cffbdae, 0xbfd3d5f10b247ec4, 0x3face9ea943f4516, 0x3faeda73f24a8af1, 0xbfb16921776aac42},
    {0x3fe79ffe47b2f83b, 0x3fe459c535c19f20, 0x3fe4b610fc8f20bd, 0xbfd3cb0273df2a0d, 0x3fad63f823c5d6de, 0x3fae2d319c5116ab, 0xbfb13dfa326e2972},
    {0x3fe7bfff2f1e79a9, 0x3fe46e71f84df5c0, 0x3fe4a24af586b1bd, 0xbfd3bfe62ef81e5b, 0x3faddb58738896f0, 0x3fad819a2515de78, 0xbfb1127c9026fdd0},
    {0x3fe7e001973c8d05, 0x3fe4830bf0fb9580, 0x3fe48e8f3466b08e, 0xbfd3b49d1c53a01a, 0x3fae501325103eed, 0x3facd7af5290f4af, 0xbfb0e6af57ef003b},
    {0x3fe7ffff69efc092, 0x3fe4978f431c3800, 0x3fe47ae1a3e1064a, 0xbfd3a92a666c50c4, 0x3faec2194098a4be, 0x3fac2f942eee57e0, 0xbfb0ba99290d5730},
    {0x3fe82001c52b5232, 0x3fe4ac01d2b83340, 0x3fe4673cd31b7cf5, 0xbfd39d8bc67d05f0, 0x3faf31922a81b5d5, 0x3fab891b8aa20e90, 0xbfb08e407adcefd6},
    {0x3fe84000bd4d4e3f, 0x3fe4c05e9b1dbc60, 0x3fe453a5c8d629f7, 0xbfd391c513e9ef47, 0x3faf9e6917383d6b, 0x3faae471278e21b9, 0xbfb061ab9cf54d10},
    {0x3fe860018c869cbd, 0x3fe4d4a8fd2285a0, 0x3fe4401979b82471, 0xbfd385d55c3e2929, 0x3fb0045b7b2c8ff2, 0x3faa417c39d7ca4f, 0xbfb034e0b767b7d4},
    {0x3fe87ffeb5db3710, 0x3fe4e8dd8b93bca0, 0x3fe42c9b66c6e6bf, 0xbfd379bfa32ee2a1, 0x3fb038386187fe0f, 0x3fa9a05a8b3a0b33, 0xbfb007e5caee03a9},
    {0x3fe8a000863c77e3, 0x3fe4fd018fcd1e80, 0x3fe41926a8a8093f, 0xbfd36d81b5ee344d, 0x3fb06adc2841f292, 0x3fa900e42484560b, 0xbfafb58162792f0a},
    {0x3fe8bfff0ed982af, 0x3fe5111016e28ac0, 0x3fe405c0389112ee, 0xbfd3611f89d38dc7, 0x3fb09c3db450b9f7, 0x3fa86342312d0c4a, 0xbfaf5aee3a6ca012},
    {0x3fe8e00002c3aeae, 0x3fe5250cc0ab0a40, 0x3fe3f264c65593c5, 0xbfd35497d82be900, 0x3fb0cc6968546d39, 0x3fa7c759db8499fd, 0xbfaf001d36a32337},
    {0x3fe90000ecbfa97b, 0x3fe538f60e8d4ee0, 0x3fe3df15f4119333, 0xbfd347ec7d2149f4, 0x3fb0fb5efa921d3c, 0x3fa72d3869693e89, 0xbfaea51923a0f5f3},
    {0x3fe91fffd251c01c, 0x3fe54ccad3f3bd20, 0x3fe3cbd51554dd15, 0xbfd33b1f2bc94245, 0x3fb1291f2fc4c3f6, 0x3fa694e81b7a765c, 0xbfae49ec826e86f6},
    {0x3fe94001d90af4e6, 0x3fe5608e4d4ec640, 0x3fe3b89f3445ef72, 0xbfd32e2eb7bbd79a, 0x3fb155b4e401d071, 0x3fa5fe513a256f1c, 0xbfadeea1890ff662},
    {0x3fe9600104fd6c17, 0x3fe5743cd5673c20, 0x3fe3a57809ebc6e2, 0xbfd3211e6da5039c, 0x3fb1811b4e62286b, 0x3fa5699071bece9d, 0xbfad934223911641},
    {0x3fe980002d214b82, 0x3fe587d83b0d6120, 0x3fe3925e01eaac3e, 0xbfd313ee08425504, 0x3fb1ab5a02bdb571, 0x3fa4d6989ebd70b8, 0xbfad37d7f482965a},
    {0x3fe99ffdeb980651, 0x3fe59b5fb16ba7a0, 0x3fe37f5210b1ab7a, 0xbfd3069ef993d676, 0x3fb1d472cded25a8, 0x3fa445702d0abd9a, 0xbfacdc6c56221aa1},
    {0x3fe9bfffe5504053, 0x3fe5aed6b55de6a0, 0x3fe36c50fa91c51e, 0xbfd2f92fbe311e56, 0x3fb1fc705be3af05, 0x3fa3b5fdacd5cdc7, 0xbfac81085adbb9b8},
    {0x3fe9e0016e60a234, 0x3fe5c23a79acd480, 0x3fe3595da5fab2ea, 0xbfd2eba31ddeceea, 0x3fb2235035736518, 0x3fa3285622f9fd28, 0xbfac25b4ce8b2259},
    {0x3fe9ffffb685741b, 0x3fe5d5895ad40460, 0x3fe34679d832b8d3, 0xbfd2ddfb230eda41, 0x3fb24912b23c0ba2, 0x3fa29c854c4e86da, 0xbfabca7a37002a55},
    {0x3fea20019d59b943, 0x3fe5e8c78c187ea0, 0x3fe333a19ede2183, 0xbfd2d035b0043779, 0x3fb26dc37ab9110c, 0x3fa2126c959cfc0e, 0xbfab6f60d556233e},
    {0x3fea3fffbe9e153f, 0x3fe5fbf0a9c08ae0, 0x3fe320d96f7861aa, 0xbfd2c256c2200f18, 0x3fb2915da6795293, 0x3fa18a2b256a8fde, 0xbfab1470a67a4e89},
    {0x3fea5ffe7a23a1ce, 0x3fe60f0763200600, 0x3fe30e1ed13d395e, 0xbfd2b45d44403932, 0x3fb2b3e9c967f013, 0x3fa103ad35d002b8, 0xbfaab9b16496a8f1},
    {0x3fea800157f250b8, 0x3fe6220ddd6453a0, 0x3fe2fb6fcfffcc1e, 0xbfd2a6486f8d8291, 0x3fb2d56f03654cc3, 0x3fa07ee34bb6e7a6, 0xbfaa5f2a87992f03},
    {0x3feaa000dd839d49, 0x3fe634ffb412c9a0, 0x3fe2e8d0e2d59e01, 0xbfd2981c5467cfdd, 0x3fb2f5e8ff1fadb5, 0x3f9ff7d6a3ba803c, 0xbfaa04e346af8db7},
    {0x3feac000770df220, 0x3fe647defef70020, 0x3fe2d640220aff7f, 0xbfd289d836f9e74f, 0x3fb3155ee509140a, 0x3f9ef56b61ab0b7f, 0xbfa9aae298ce391f},
    {0x3feae001125bbe48, 0x3fe65aac57a24d20, 0x3fe2c3bd1bfb3559, 0xbfd27b7c6dde55dd, 0x3fb333d515c4c270, 0x3f9df67a9bac4ecf, 0xbfa9512f363a972b},
    {0x3feafffe7c321839, 0x3fe66d65569b83c0, 0x3fe2b14a53fbf8d9, 0xbfd26d0b9cfa03ce, 0x3fb3514b2caa2e0c, 0x3f9cfb224597be9a, 0xbfa8f7cf99110022},
    {0x3feb1ffe75486924, 0x3fe6800d68cefb40, 0x3fe29ee48e6aa814, 0xbfd25e83e8afa7eb, 0x3fb36dc9fb0e8ac8, 0x3f9c0331ad5d66ca, 0xbfa89ec9fedb1e8b},
    {0x3feb40015fb8deb8, 0x3fe692a4d137c500, 0x3fe28c8babff668e, 0xbfd24fe5d8e71e0a, 0x3fb389551297317a, 0x3f9b0ea31d844655, 0xbfa846246914067d},
    {0x3feb6000386c27b9, 0x3fe6a5278cdf6fc0, 0x3fe27a43c5758db8, 0xbfd2413559cadce0, 0x3fb3a3e9ee34ae91, 0x3f9a1da81c5fff05, 0xbfa7ede49ec8aac6},
    {0x3feb8000d1efddb3, 0x3fe6b7990accb660, 0x3fe268099983aab2, 0xbfd2327076047e08, 0x3fb3bd90f132139b, 0x3f99301058deb3e1, 0xbfa796102d194ce9},
    {0x3feb9ffe42cc4047, 0x3fe6c9f686445e60, 0x3fe255e0069f871f, 0xbfd2239a25461639, 0x3fb3d649a926c127, 0x3f9845fbc5a21f70, 0xbfa73eac68e20be6},
    {0x3febc001951aeaad, 0x3fe6dc453c4e45a0, 0x3fe243c1ff6573b0, 0xbfd214aee38fa7e7, 0x3fb3ee1e5ea1330f, 0x3f975f242bcce6df, 0xbfa6e7be6f3902c5},
    {0x3febdffe6616fe11, 0x3fe6ee7e27106fe0, 0x3fe231b697b587f0, 0xbfd205b5240fef32, 0x3fb4050944eb818c, 0x3f967bde108160f9, 0xbfa6914b271d18ad},
    {0x3febffff54511c72, 0x3fe700a7643bbb40, 0x3fe21fb7e1823c8b, 0xbfd1f6a89a854f7a, 0x3fb41b1571f04837, 0x3f959bd8bbd10f7c, 0xbfa63b5741f03711},
    {0x3fec2000c537593e, 0x3fe712bef36d6400, 0x3fe20dc7f754b2d5, 0xbfd1e78b9d24dbed, 0x3fb4304394f485e0, 0x3f94bf29122a6884, 0xbfa5e5e73d2aa4e9},
    {0x3fec4000ddd35719, 0x3fe724c3d7fa3000, 0x3fe1fbe7f2a8b1bf, 0xbfd1d85fb25dddf6, 0x3fb44495d2e3b20f, 0x3f93e5d67fcc1b30, 0xbfa590ff62d0d00f},
    {0x3fec6000402375b6, 0x3fe736b67dff3720, 0x3fe1ea1786c92387, 0xbfd1c92531ddfc58, 0x3fb4580ff8b6cbc2, 0x3f930fd700ce998e, 0xbfa53ca3cb299e5f},
    {0x3fec7fff19904fe4, 0x3fe748970f395860, 0x3fe1d856a825ba33, 0xbfd1b9dca75e0fc5, 0x3fb46ab579f8fd7d, 0x3f923d23a5a90afe, 0xbfa4e8d85d2f574b},
    {0x3fec9ffef9e2409d, 0x3fe75a6679e7f1c0, 0x3fe1c6a48740d2e9, 0xbfd1aa85f198392c, 0x3fb47c8a808c583a, 0x3f916dac857f2526, 0xbfa495a0d0477576},
    {0x3fecc001e038ef72, 0x3fe76c25e6815140, 0x3fe1b50019bdadf8, 0xbfd19b20b4a469ae, 0x3fb48d9342387ea2, 0x3f90a15f7305baf5, 0xbfa44300acae4e17},
    {0x3fecdffeeb72037f, 0x3fe77dd07a7a4aa0, 0x3fe1a36e4f1f6702, 0xbfd18bb1d0992cf8, 0x3fb49dce5aa4990d, 0x3f8fb0dd63759665, 0xbfa3f0fb4d2f0c0f},
    {0x3fecffffea4839ed, 0x3fe78f6bb17088c0, 0x3fe191e9cf32122f, 0xbfd17c35220400ac, 0x3fb4ad440a159641, 0x3f8e252c80894ca9, 0xbfa39f93df89c265},
    {0x3fed1ffdec3ec8b2, 0x3fe7a0f3c8c6c880, 0x3fe18076729f01d6, 0xbfd16cae98515540, 0x3fb4bbf41b0933ff, 0x3f8c9ff5e09a60cd, 0xbfa34ecd662a5704},
    {0x3fed3fff7084edd4, 0x3fe7b26c5f02f220, 0x3fe16f10b9973206, 0xbfd15d1b9e1e0a54, 0x3fb4c9e4ac2c9a30, 0x3f8b20ddefce76cc, 0xbfa2feaab888bc37},
    {0x3fed5ffe8d728e7c, 0x3fe7c3d2488d7e80, 0x3fe15dbbe622a5a7, 0xbfd14d7fa305ceb2, 0x3fb4d716417bf1c7, 0x3f89a81ee19fe239, 0xbfa2af2e84ddad07},
    {0x3fed7fff70aa3b03, 0x3fe7d527db239580, 0x3fe14c75be4fea01, 0xbfd13dd92ad706aa, 0x3fb4e38db49d32aa, 0x3f88357a37df2b6d, 0xbfa2605b507cd77b},
    {0x3fed9fff1434fba3, 0x3fe7e66b82c8a720, 0x3fe13b3fed9b7fed, 0xbfd12e2a3ac9d646, 0x3fb4ef4ce7b01cf5, 0x3f86c905d25fd52d, 0xbfa21233798666ef},
    {0x3fedbffea8c8de8c, 0x3fe7f79df4a0a520, 0x3fe12a19d7fc2119, 0xbfd11e72c6be19df, 0x3fb4fa57634e1b91, 0x3f8562a647f96df5, 0xbfa1c4b9373af599},
    {0x3fede00026573df5, 0x3fe808c04dbcb960, 0x3fe119027903e4b9, 0xbfd10eb25cdfed06, 0x3fb504b0cca681fa, 0x3f8402386f3cde09, 0xbfa177ee9ba8fa6a},
    {0x3fedfffe35009b66, 0x3fe819cfc2cb5340, 0x3fe107fcb1c942b5, 0xbfd0feec230d7d92, 0x3fb50e5a75c5b4f1, 0x3f82a7e8e3c139d8, 0xbfa12bd593fa642b},
    {0x3fee2000492d4c68, 0x3fe82ad05ccb8680, 0x3fe0f704928e55df, 0xbfd0ef1cee0b0721, 0x3fb51759937bfb74, 0x3f8153592bc9fddb, 0xbfa0e06fea1d1824},
    {0x3fee40009412bb65, 0x3fe83bbf14001a60, 0x3fe0e61d37f485da, 0xbfd0df481b2bd37d, 0x3fb51faf64024d14, 0x3f8004b99b849698, 0xbfa095bf450a2434},
    {0x3fee5fff4758ef2f, 0x3fe84c9c1531c180, 0x3fe0d5468b7fece7, 0xbfd0cf6e105bfe1e, 0x3fb5275ef9c5e03a, 0x3f7d77f217aa1137, 0xbfa04bc52a6891e1},
    {0x3fee8000380f819f, 0x3fe85d6974ccc060, 0x3fe0c47e8f1da5b5, 0xbfd0bf8d62ad700f, 0x3fb52e6c1f3fbc2b, 0x3f7af1c3ee24ad7d, 0xbfa00282fece26c9},
    {0x3feea000a6d8cb7b, 0x3fe86e25d00e3a60, 0x3fe0b3c6ba314d62, 0xbfd0afa7e7cb2d84, 0x3fb534d908e9071f, 0x3f7877044ce5e5c9, 0xbf9f73f40eb7c9d5},
    {0x3feec0005a13ba60, 0x3fe87ed119b163e0, 0x3fe0a31f2ebb7ad7, 0xbfd09fbe33a3fce1, 0x3fb53aa889d9af5d, 0x3f760799f7f7040b, 0xbf9ee456d3f0b3fb},
    {0x3feedfff58f8dd18, 0x3fe88f6b6681ca80, 0x3fe09287ec4360b3, 0xbfd08fd0b7ce07e5, 0x3fb53fdd7bdedd3f, 0x3f73a36670c52e66, 0xbf9e56305dca7315},
    {0x3feeffffbe033400, 0x3fe89ff5dd4d7960, 0x3fe081ffdffe15bd, 0xbfd07fdedae56c0f, 0x3fb5447af84d6f5d, 0x3f714a247982941e, 0xbf9dc98281e68835},
    {0x3fef2001e6b5125d, 0x3fe8b070bbe88160, 0x3fe07186df7122e2, 0xbfd06fe8de905325, 0x3fb54883b5deec7a, 0x3f6df762b4a186d5, 0xbf9d3e4ede20f495},
    {0x3fef3ffdf770e0db, 0x3fe8c0d809e96380, 0x3fe06120f5a576a9, 0xbfd05ff31d2912ff, 0x3fb54bf98cd1001f, 0x3f6970fc6e90dc16, 0xbf9cb496d8eb587e},
    {0x3fef5ffe4e16da33, 0x3fe8d13129bccdc0, 0x3fe050c8d33ba4e9, 0xbfd04ff8d74c83d2, 0x3fb54ee0592bb252, 0x3f64ff617193eeb5, 0xbf9c2c5ba459ac86},
    {0x3fef80004576ff2e, 0x3fe8e17acce443a0, 0x3fe0407fd8a97b6c, 0xbfd03ffbc91b3e55, 0x3fb5513a5f3357f7, 0x3f60a2ba14c92b53, 0xbf9ba59e3e70df71},
    {0x3fef9fff39b6a330, 0x3fe8f1b2a7f515a0, 0x3fe0304863064158, 0xbfd02ffeacbaada8, 0x3fb55309f27448c0, 0x3f58b6d64850006b, 0xbf9b205f742323df},
    {0x3fefc001aa76c0b9, 0x3fe901dc15d66d80, 0x3fe0201f28d9b4aa, 0xbfd01ffea98d4c38, 0x3fb55452089780f8, 0x3f5050b57f35c5bb, 0xbf9a9c9fe19247af},
    {0x3fefdffe39a592ca, 0x3fe911f26d88a780, 0x3fe01008e40c6538, 0xbfd01000d31688de, 0x3fb55514e32f1816, 0x3f402a154e1628d2, 0xbf9a1a5ff4faf5a0},
    {0x3feff8018e92d1b0, 0x3fe91dfb9bb4bf00, 0x3fe003ffb884c5a9, 0xbfd003ff3876a954, 0x3fb555515539ddfb, 0x3f2007e77b95e6c2, 0xbf99b9a718a3ba58},
};

}  // namespace

}  // namespace vorlite::core
