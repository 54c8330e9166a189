// The double-precision elementary functions must give the reference's bits
// (32-bit ARM glibc, which computes as x86-64 glibc does with its fused
// multiply-add variants switched off) on every target.
#include <gtest/gtest.h>

#include <bit>
#include <cmath>
#include <cstdint>
#include <cstdlib>
#include <cstring>
#include <limits>
#include <random>
#include <sstream>
#include <string>
#include <vector>

#include "core/core_internal.h"

namespace {

namespace vc = vorlite::core;

enum class Fn { exp, log, pow, sin, cos, atan2 };

constexpr const char* name_of(Fn fn) {
    constexpr const char* names[] = {"exp", "log", "pow", "sin", "cos", "atan2"};
    return names[static_cast<int>(fn)];
}

double ours(Fn fn, double a, double b) {
    switch (fn) {
        case Fn::exp: return vc::exp(a);
        case Fn::log: return vc::log(a);
        case Fn::pow: return vc::pow(a, b);
        case Fn::sin: return vc::sin(a);
        case Fn::cos: return vc::cos(a);
        case Fn::atan2: return vc::atan2(a, b);
    }
    return 0.0;
}

double c_library(Fn fn, double a, double b) {
    switch (fn) {
        case Fn::exp: return ::exp(a);
        case Fn::log: return ::log(a);
        case Fn::pow: return ::pow(a, b);
        case Fn::sin: return ::sin(a);
        case Fn::cos: return ::cos(a);
        case Fn::atan2: return ::atan2(a, b);
    }
    return 0.0;
}

bool takes_two(Fn fn) { return fn == Fn::pow || fn == Fn::atan2; }

std::string call_text(Fn fn, double a, double b) {
    std::ostringstream s;
    s << std::hexfloat << name_of(fn) << "(" << a;
    if (takes_two(fn)) s << ", " << b;
    s << ")";
    return s.str();
}

std::string hex(double x) {
    std::ostringstream s;
    s << std::hexfloat << x;
    return s.str();
}

// Bit-identical, with every NaN one value: a NaN's payload is not promised.
bool same_result(double x, double y) {
    if (std::isnan(x) && std::isnan(y)) return true;
    return std::bit_cast<std::uint64_t>(x) == std::bit_cast<std::uint64_t>(y);
}

// Distance in units in the last place, across zero and up to infinity.
std::uint64_t ulp_distance(double x, double y) {
    if (std::isnan(x) || std::isnan(y)) return std::isnan(x) && std::isnan(y) ? 0 : UINT64_MAX;
    auto ordered = [](double v) {
        const auto b = std::bit_cast<std::int64_t>(v);
        return b < 0 ? std::numeric_limits<std::int64_t>::min() - b : b;
    };
    const std::int64_t a = ordered(x), c = ordered(y);
    return a > c ? static_cast<std::uint64_t>(a) - static_cast<std::uint64_t>(c)
                 : static_cast<std::uint64_t>(c) - static_cast<std::uint64_t>(a);
}

struct Case {
    Fn fn;
    double a, b, expected;
};

constexpr double inf = std::numeric_limits<double>::infinity();
constexpr double nan = std::numeric_limits<double>::quiet_NaN();
constexpr double pi = 0x1.921fb54442d18p+1;
constexpr double largest = 0x1.fffffffffffffp1023;

void expect_cases(const std::vector<Case>& cases) {
    for (const Case& c : cases) {
        const double got = ours(c.fn, c.a, c.b);
        EXPECT_TRUE(same_result(got, c.expected))
            << call_text(c.fn, c.a, c.b) << " gave " << hex(got) << ", expected " << hex(c.expected);
    }
}

// Zeros keep their sign, infinities and NaN go where C99 Annex F sends them,
// and the extremes overflow, underflow and reduce correctly.
TEST(DoubleMath, SpecialValuesFollowAnnexF) {
    expect_cases({
        {Fn::exp, 0.0, 0, 1.0},
        {Fn::exp, -0.0, 0, 1.0},
        {Fn::exp, 0x1p-60, 0, 1.0},
        {Fn::exp, inf, 0, inf},
        {Fn::exp, -inf, 0, 0.0},
        {Fn::exp, nan, 0, nan},
        {Fn::exp, 709.8, 0, inf},
        {Fn::exp, 709.7, 0, 0x1.d75ae7a50ee14p+1023},
        {Fn::exp, -740.0, 0, 0x0.0000000000055p-1022},
        {Fn::exp, -0x1.74385446d71c3p+9, 0, 0x0.0000000000001p-1022},
        {Fn::exp, -746.0, 0, 0.0},
        {Fn::log, 1.0, 0, 0.0},
        {Fn::log, 0.0, 0, -inf},
        {Fn::log, -0.0, 0, -inf},
        {Fn::log, -1.0, 0, nan},
        {Fn::log, -inf, 0, nan},
        {Fn::log, inf, 0, inf},
        {Fn::log, nan, 0, nan},
        {Fn::log, 0x1p-1074, 0, -0x1.74385446d71c3p+9},
        {Fn::log, largest, 0, 0x1.62e42fefa39efp+9},
        {Fn::pow, nan, 0.0, 1.0},
        {Fn::pow, 1.0, nan, 1.0},
        {Fn::pow, nan, 1.0, nan},
        {Fn::pow, -3.0, 5.0, -243.0},
        {Fn::pow, -2.0, 0.5, nan},
        {Fn::pow, -0.0, -1.0, -inf},
        {Fn::pow, 0.0, -2.0, inf},
        {Fn::pow, -0.0, 3.0, -0.0},
        {Fn::pow, 2.0, 1024.0, inf},
        {Fn::pow, -2.0, -1075.0, -0.0},
        {Fn::pow, 0x1p-1000, 1.07, 0x0.000000000001p-1022},
        {Fn::pow, 0x1p-1074, 0.5, 0x1p-537},
        {Fn::pow, -1.0, inf, 1.0},
        {Fn::pow, 0.5, inf, 0.0},
        {Fn::pow, 2.0, -inf, 0.0},
        {Fn::pow, inf, -1.0, 0.0},
        {Fn::pow, -inf, 3.0, -inf},
        {Fn::sin, -0.0, 0, -0.0},
        {Fn::sin, 0x1p-30, 0, 0x1p-30},
        {Fn::sin, inf, 0, nan},
        {Fn::sin, nan, 0, nan},
        {Fn::sin, pi, 0, 0x1.1a62633145c07p-53},
        {Fn::sin, 1e22, 0, -0x1.b453ab76bf397p-1},
        {Fn::cos, -0.0, 0, 1.0},
        {Fn::cos, -inf, 0, nan},
        {Fn::cos, pi, 0, -1.0},
        {Fn::cos, largest, 0, -0x1.fffe62ecfab75p-1},
        {Fn::atan2, 0.0, 0.0, 0.0},
        {Fn::atan2, -0.0, 0.0, -0.0},
        {Fn::atan2, 0.0, -0.0, pi},
        {Fn::atan2, -0.0, -1.0, -pi},
        {Fn::atan2, 1.0, 0.0, pi / 2},
        {Fn::atan2, -1.0, -0.0, -pi / 2},
        {Fn::atan2, inf, inf, pi / 4},
        {Fn::atan2, -inf, -inf, -0x1.2d97c7f3321d2p+1},
        {Fn::atan2, 1.0, inf, 0.0},
        {Fn::atan2, -1.0, -inf, -pi},
        {Fn::atan2, inf, -5.0, pi / 2},
        {Fn::atan2, nan, 1.0, nan},
        {Fn::atan2, 1e-300, 1e300, 0.0},
        {Fn::atan2, -1e300, -1e-300, -pi / 2},
        {Fn::atan2, 0x1p-1074, -1.0, pi},
        {Fn::atan2, 3e-310, 5e-310, 0x1.14b1dd5f90ce1p-1},
    });
}

// Arguments where x86-64 glibc's fused multiply-add variants or musl round
// the other way, one or more per algorithm path; the expected values are
// the reference's.
TEST(DoubleMath, ReproducesTheReferenceWhereOtherLibrariesDiffer) {
    expect_cases({
        {Fn::exp, -0x1.d38b239929956p-1, 0, 0x1.9ae13f23647a6p-2},
        {Fn::exp, 0x1.d0551fa1032fap-1, 0, 0x1.3d024446b4db8p+1},
        {Fn::exp, 0x1.5f224d2638367p+9, 0, 0x1.1dbc061ca1cfap+1013},
        {Fn::log, 0x1.eb8af15bbeff6p-1, 0, -0x1.4e08e2078e191p-5},
        {Fn::log, 0x1.7bdfd10046c65p-2, 0, -0x1.fbb71dcbfb62ap-1},
        {Fn::log, 0x1.0a31e50eb16p+18, 0, 0x1.90809e74ed719p+3},
        {Fn::pow, 1005.0 / 1023.0, 1.0 / 2.4, 0x1.fc3a1571310dep-1},
        {Fn::pow, 0x1.e556b53ae2d12p+3, 0.7, 0x1.ad5853acd2566p+2},
        {Fn::pow, 0x1.da102065f398ep-1, -0x1.6be83721df096p+5, 0x1.096d34189f3b2p+5},
        {Fn::pow, 0x1.6b222720a8a3dp+1, -0x1.4973d2ea17861p+9, 0x1.b5558993a2d5bp-992},
        {Fn::sin, 0x1.c1790b4d335eep-4, 0, 0x1.c09240f83a2d8p-4},
        {Fn::sin, 0x1.33c9af0b44fe1p-2, 0, 0x1.2f2c99528285cp-2},
        {Fn::sin, 0x1.5481cb375f519p-1, 0, 0x1.3bf49d790ea9p-1},
        {Fn::sin, 0x1.2c8f2d840d19ep+1, 0, 0x1.6cf347fd7aec6p-1},
        {Fn::sin, 0x1.8cee6af80bb14p+2, 0, -0x1.4bf544f361803p-4},
        {Fn::sin, 0x1.d08c7b19b0d8ap+12, 0, -0x1.cf3cbd315de17p-3},
        {Fn::sin, 0x1.3a73e4b82eecfp+25, 0, 0x1.377615350e3c1p-2},
        {Fn::sin, 0x1.85d7c4467b6e4p+994, 0, -0x1.3772ce319f2d4p-2},
        {Fn::cos, 0x1.81d1762f4e4aap-4, 0, 0x1.fdbaf6562eb6fp-1},
        {Fn::cos, -0x1.3a7d1aeba48acp-1, 0, 0x1.a269e50a53894p-1},
        {Fn::cos, 0x1.111f0d4d1f2a5p-1, 0, 0x1.b8dd3d1dccc25p-1},
        {Fn::cos, 0x1.1f76b2bb8486fp+1, 0, -0x1.3ff3ed9505e6bp-1},
        {Fn::cos, -0x1.921fb54442d19p+0, 0, -0x1.72cece675d1fcp-53},
        {Fn::cos, 0x1.335879f9b0ab4p+12, 0, -0x1.2f18b5fe39c49p-1},
        {Fn::cos, 0x1.e9b56cb2d219cp+22, 0, -0x1.0b1de0c280929p-3},
        {Fn::cos, -0x1.d0981c7308a9ap+873, 0, 0x1.bc8c15b755ca4p-1},
        {Fn::cos, 0x1.e27e06053ef3fp+994, 0, 0x1.84248cb7ab7a3p-3},
        {Fn::atan2, 0x1.9f39db484500ap-1, 0x1.a65820395c142p+5, 0x1.f754c31ddd887p-7},
        {Fn::atan2, 0x1.26369298a28f2p+3, 0x1.1952a77b9b679p+2, 0x1.1ff4a83ffece8p+0},
        {Fn::atan2, 0x1.74df16aac487ep+3, -0x1.c97eaa077a09cp-1, 0x1.a5b77b12b072p+0},
        {Fn::atan2, -0x1.f5dc22a8a78a6p-1, -0x1.e0a2c25d10318p+3, -0x1.89c84cb3e3c79p+1},
        {Fn::atan2, 0x1.783741f609e68p+2, -0x1.2f734a8e24a0fp+2, 0x1.1ff0ee296e652p+1},
        {Fn::atan2, 0x1.f2d2d6p+0, 0x1.497f32p-1, 0x1.4076145553a3bp+0},
        {Fn::atan2, -0x1.d6p+10, -0x1.2ap+7, -0x1.a65ef33a22bc6p+0},
        {Fn::atan2, -0x1.18ad2d8044c2bp+12, -0x1.4caa6c116ddccp-36, -0x1.921fb54442d2bp+0},
    });
}

// A fixed sample over every algorithm path: the library's table-driven
// regions, the reductions for huge angles, arguments near 1 for log and
// pow, the subnormal range. Same seed, same arguments on every target.
struct Sample {
    Fn fn;
    double a, b;
};

std::vector<Sample> fixed_sample() {
    std::mt19937_64 bits(20240611);
    auto uniform = [&](double lo, double hi) { return lo + (hi - lo) * (static_cast<double>(bits() >> 11) * 0x1p-53); };
    // Random sign and mantissa with a binary exponent in [emin, emax].
    auto spread = [&](int emin, int emax, bool negative_too) {
        const std::uint64_t r = bits();
        const std::uint64_t e = static_cast<std::uint64_t>(emin + 1023) + (r >> 11) % static_cast<std::uint64_t>(emax - emin + 1);
        const std::uint64_t sign = negative_too ? (r & 0x8000000000000000ULL) : 0;
        return std::bit_cast<double>(sign | e << 52 | (bits() & 0x000fffffffffffffULL));
    };
    std::vector<Sample> sample;
    constexpr int n = 20000;
    for (int i = 0; i < n; ++i) {
        sample.push_back({Fn::exp, uniform(-2, 2), 0});
        sample.push_back({Fn::exp, uniform(-746, 710), 0});
        sample.push_back({Fn::log, uniform(0.9, 1.1), 0});
        sample.push_back({Fn::log, spread(-1074, 1023, false), 0});
        sample.push_back({Fn::pow, uniform(0, 256), uniform(-3, 3)});
        sample.push_back({Fn::pow, uniform(0.99, 1.01), uniform(-2000, 2000)});
        sample.push_back({Fn::pow, spread(-1074, 1023, false), spread(-10, 3, true)});
        for (Fn fn : {Fn::sin, Fn::cos}) {
            sample.push_back({fn, uniform(-4, 4), 0});
            sample.push_back({fn, uniform(-2e4, 2e4), 0});
            sample.push_back({fn, spread(-30, 1023, true), 0});
        }
        sample.push_back({Fn::atan2, uniform(-10, 10), uniform(-10, 10)});
        sample.push_back({Fn::atan2, spread(-1074, 1023, true), spread(-1074, 1023, true)});
    }
    return sample;
}

// Runs everywhere: a transcription slip in a table or a constant shows as
// an error of many units in the last place against any C library.
TEST(DoubleMath, StaysWithinOneUlpOfTheCLibrary) {
    int failures = 0;
    for (const Sample& s : fixed_sample()) {
        const double want = c_library(s.fn, s.a, s.b);
        const double got = ours(s.fn, s.a, s.b);
        if (ulp_distance(got, want) > 1 && ++failures <= 10) {
            ADD_FAILURE() << call_text(s.fn, s.a, s.b) << " gave " << hex(got) << ", the C library " << hex(want);
        }
    }
    EXPECT_EQ(failures, 0);
}

// Whether the running C library computes as the reference does: glibc on
// 32-bit ARM, or x86-64 glibc when neither its fused multiply-add (FMA with
// AVX2) nor its FMA4 variants are in use.
bool c_library_is_reference(std::string* why) {
#if defined(__GLIBC__) && defined(__arm__)
    *why = "32-bit ARM glibc";
    return true;
#elif defined(__GLIBC__) && defined(__x86_64__)
    const char* tunables = std::getenv("GLIBC_TUNABLES");
    auto masked = [&](const std::string& feature) {
        if (tunables == nullptr) return false;
        std::string items = tunables;
        for (char& c : items) {
            if (c == ':' || c == '=') c = ',';
        }
        return ("," + items + ",").find(",-" + feature + ",") != std::string::npos;
    };
    __builtin_cpu_init();
    const bool fma = __builtin_cpu_supports("fma") && __builtin_cpu_supports("avx2") && !masked("FMA") &&
                     !masked("AVX2");
    const bool fma4 = __builtin_cpu_supports("fma4") && !masked("FMA4");
    if (fma || fma4) {
        *why = "x86-64 glibc picks its fused multiply-add variants; run with "
               "GLIBC_TUNABLES=glibc.cpu.hwcaps=-FMA,-AVX2,-FMA4 to compare";
        return false;
    }
    *why = "x86-64 glibc without fused multiply-add";
    return true;
#else
    *why = "this C library is not the reference's";
    return false;
#endif
}

TEST(DoubleMath, MatchesTheCLibraryWhereItIsTheReference) {
    std::string why;
    if (!c_library_is_reference(&why)) GTEST_SKIP() << why;
    int failures = 0;
    for (const Sample& s : fixed_sample()) {
        const double want = c_library(s.fn, s.a, s.b);
        const double got = ours(s.fn, s.a, s.b);
        if (!same_result(got, want) && ++failures <= 10) {
            ADD_FAILURE() << why << ": " << call_text(s.fn, s.a, s.b) << " gave " << hex(got) << ", the C library "
                          << hex(want);
        }
    }
    EXPECT_EQ(failures, 0);
}

}  // namespace
