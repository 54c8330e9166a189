// The library's double-precision elementary functions against the C
// library's, per call, on arguments from the ranges the library passes
// (slider exponents, gamma powers, angles, pixel offsets). The C library's
// figures depend on the variant it picks at run time (on x86-64 glibc the
// fused multiply-add one unless GLIBC_TUNABLES masks it).
#include <benchmark/benchmark.h>

#include <cmath>
#include <cstdint>
#include <random>
#include <vector>

#include "core/core_internal.h"

namespace {

constexpr std::size_t k_arguments = 4096;

std::vector<double> uniform(double lo, double hi, std::uint64_t seed) {
    std::mt19937_64 bits(seed);
    std::vector<double> v(k_arguments);
    for (double& x : v) x = lo + (hi - lo) * (static_cast<double>(bits() >> 11) * 0x1p-53);
    return v;
}

using Unary = double (*)(double);
using Binary = double (*)(double, double);

void unary(benchmark::State& state, Unary f, double lo, double hi) {
    const std::vector<double> args = uniform(lo, hi, 1);
    for (auto _ : state) {
        for (double x : args) benchmark::DoNotOptimize(f(x));
    }
    state.SetItemsProcessed(static_cast<std::int64_t>(state.iterations() * args.size()));
}

void binary(benchmark::State& state, Binary f, double alo, double ahi, double blo, double bhi) {
    const std::vector<double> a = uniform(alo, ahi, 1);
    const std::vector<double> b = uniform(blo, bhi, 2);
    for (auto _ : state) {
        for (std::size_t i = 0; i < a.size(); ++i) benchmark::DoNotOptimize(f(a[i], b[i]));
    }
    state.SetItemsProcessed(static_cast<std::int64_t>(state.iterations() * a.size()));
}

double c_exp(double x) { return ::exp(x); }
double c_log(double x) { return ::log(x); }
double c_pow(double x, double y) { return ::pow(x, y); }
double c_sin(double x) { return ::sin(x); }
double c_cos(double x) { return ::cos(x); }
double c_atan2(double y, double x) { return ::atan2(y, x); }

namespace vc = vorlite::core;

BENCHMARK_CAPTURE(unary, exp_ours, vc::exp, -1.2, 1.2);
BENCHMARK_CAPTURE(unary, exp_libc, c_exp, -1.2, 1.2);
BENCHMARK_CAPTURE(unary, log_ours, vc::log, 0.25, 0.75);
BENCHMARK_CAPTURE(unary, log_libc, c_log, 0.25, 0.75);
BENCHMARK_CAPTURE(binary, pow_ours, vc::pow, 0.0, 1.0, 0.4, 0.42);
BENCHMARK_CAPTURE(binary, pow_libc, c_pow, 0.0, 1.0, 0.4, 0.42);
BENCHMARK_CAPTURE(unary, sin_ours, vc::sin, -6.3, 6.3);
BENCHMARK_CAPTURE(unary, sin_libc, c_sin, -6.3, 6.3);
BENCHMARK_CAPTURE(unary, cos_ours, vc::cos, -6.3, 6.3);
BENCHMARK_CAPTURE(unary, cos_libc, c_cos, -6.3, 6.3);
BENCHMARK_CAPTURE(unary, sin_huge_ours, vc::sin, 1e9, 1e300);
BENCHMARK_CAPTURE(unary, sin_huge_libc, c_sin, 1e9, 1e300);
BENCHMARK_CAPTURE(binary, atan2_ours, vc::atan2, -4096.0, 4096.0, -4096.0, 4096.0);
BENCHMARK_CAPTURE(binary, atan2_libc, c_atan2, -4096.0, 4096.0, -4096.0, 4096.0);

}  // namespace
