// vorlite_bench_math: the library's single-precision elementary functions
// against the C library's, time per call (counter per_call),
// over the arguments the library meets: kernel weights, noise draws,
// linearisation and gain powers, Box-Muller angles, plus wide ranges and
// the large-argument reduction of sine and cosine. Rows are named
// "function/side/range", side "ours" or "libc".
//
// On x86-64, glibc picks its fused multiply-add variants where the processor
// has them; GLIBC_TUNABLES=glibc.cpu.hwcaps=-FMA,-AVX2 times its portable
// code, the one ours reproduces.
#include <benchmark/benchmark.h>
#include <math.h>

#include <cstdint>
#include <random>
#include <string>
#include <vector>

#include "core/core_internal.h"

namespace {

constexpr std::size_t k_calls = 4096;

std::vector<float> uniform(float lo, float hi, std::uint32_t seed) {
    std::mt19937 generator(seed);
    std::uniform_real_distribution<float> draw(lo, hi);
    std::vector<float> values(k_calls);
    for (float& v : values) v = draw(generator);
    return values;
}

// Bases from 2^lo to 2^hi, spread evenly over the exponents.
std::vector<float> log_uniform(float lo, float hi, std::uint32_t seed) {
    std::vector<float> values = uniform(lo, hi, seed);
    for (float& v : values) v = ::exp2f(v);
    return values;
}

void report_per_call(benchmark::State& state) {
    state.counters["per_call"] = benchmark::Counter(
        static_cast<double>(k_calls), benchmark::Counter::kIsIterationInvariantRate | benchmark::Counter::kInvert);
}

// The calls are independent, as in a table being filled: the time is the
// throughput of the function, not its latency.
template <float (*F)(float)>
void time_unary(benchmark::State& state, const std::vector<float>& x) {
    std::vector<float> out(k_calls);
    for (auto _ : state) {
        for (std::size_t i = 0; i < k_calls; ++i) out[i] = F(x[i]);
        benchmark::DoNotOptimize(out.data());
        benchmark::ClobberMemory();
    }
    report_per_call(state);
}

template <float (*F)(float, float)>
void time_binary(benchmark::State& state, const std::vector<float>& x, const std::vector<float>& y) {
    std::vector<float> out(k_calls);
    for (auto _ : state) {
        for (std::size_t i = 0; i < k_calls; ++i) out[i] = F(x[i], y[i]);
        benchmark::DoNotOptimize(out.data());
        benchmark::ClobberMemory();
    }
    report_per_call(state);
}

template <float (*Ours)(float), float (*Libc)(float)>
void add_unary(const char* function, const char* range, std::vector<float> x) {
    const std::string name = std::string(function) + "/";
    benchmark::RegisterBenchmark((name + "ours/" + range).c_str(),
                                 [x](benchmark::State& state) { time_unary<Ours>(state, x); });
    benchmark::RegisterBenchmark((name + "libc/" + range).c_str(),
                                 [x](benchmark::State& state) { time_unary<Libc>(state, x); });
}

void add_pow(const char* range, std::vector<float> x, std::vector<float> y) {
    benchmark::RegisterBenchmark((std::string("powf/ours/") + range).c_str(), [x, y](benchmark::State& state) {
        time_binary<vorlite::core::powf>(state, x, y);
    });
    benchmark::RegisterBenchmark((std::string("powf/libc/") + range).c_str(), [x, y](benchmark::State& state) {
        time_binary<::powf>(state, x, y);
    });
}

void add_all() {
    namespace core = vorlite::core;
    add_unary<core::expf, ::expf>("expf", "-16..0 kernel weights", uniform(-16.0f, 0.0f, 1));
    add_unary<core::expf, ::expf>("expf", "-87..88", uniform(-87.0f, 88.0f, 2));
    add_unary<core::logf, ::logf>("logf", "0..1 noise draws", uniform(0x1p-24f, 1.0f, 3));
    add_unary<core::logf, ::logf>("logf", "2^-100..2^100", log_uniform(-100.0f, 100.0f, 4));
    add_pow("0.09..1 ^ 2.4", uniform(0.09f, 1.0f, 5), std::vector<float>(k_calls, 2.4f));
    add_pow("1..256 ^ 0.33", uniform(1.0f, 256.0f, 6), std::vector<float>(k_calls, 0.33f));
    add_pow("2^-8..2^8 ^ -8..8", log_uniform(-8.0f, 8.0f, 7), uniform(-8.0f, 8.0f, 8));
    add_unary<core::sinf, ::sinf>("sinf", "0..2pi", uniform(0.0f, 6.2831855f, 9));
    add_unary<core::cosf, ::cosf>("cosf", "0..2pi Box-Muller", uniform(0.0f, 6.2831855f, 10));
    add_unary<core::sinf, ::sinf>("sinf", "1e3..1e6 large reduction", uniform(1e3f, 1e6f, 11));
    add_unary<core::cosf, ::cosf>("cosf", "1e3..1e6 large reduction", uniform(1e3f, 1e6f, 12));
}

}  // namespace

int main(int argc, char** argv) {
    benchmark::Initialize(&argc, argv);
    if (benchmark::ReportUnrecognizedArguments(argc, argv)) return 2;
    add_all();
    benchmark::RunSpecifiedBenchmarks();
    benchmark::Shutdown();
    return 0;
}
