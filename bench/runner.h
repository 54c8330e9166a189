// Registration and timing loops shared by every benchmark of the suite.
#ifndef VORLITE_BENCH_RUNNER_H
#define VORLITE_BENCH_RUNNER_H

#include <benchmark/benchmark.h>
#include <cstdint>
#include <functional>
#include <opencv2/core.hpp>
#include <string>

#include "catalogue.h"
#include "photo.h"

namespace vorlite::bench {

// "operation/side/size", the name the report splits again.
std::string benchmark_name(const std::string& operation, const std::string& side, const BitmapSize& size);

// Registers body under benchmark_name(...), timed in milliseconds of
// process CPU time and of wall-clock time, labelled for the report and with
// the bitmap's pixel count as the counter "pixels".
// iterations > 0 fixes the count, for an operation so quick that filling
// the minimum time would mostly spend its untimed set-up.
void add_benchmark(const std::string& operation, const std::string& side, const BitmapSize& size,
                   const std::string& label, std::function<void(benchmark::State&)> body,
                   std::int64_t iterations = 0);

// Each timing loop first makes one untimed call, so that one-off costs (a
// peer's tables built on first use, output pages touched the first time) do
// not land in the first repetition.

// Times op on a fresh copy of source each iteration; making the copy is not
// timed. For operations that work in place, like every one of the library.
void time_in_place(benchmark::State& state, const cv::Mat& source, const std::function<void(cv::Mat&)>& op);

// When set, time_in_place pushes the fresh copy out of the core's own
// caches before timing, so that every size starts from the shared cache or
// memory, as a photo decoded a while before would.
void set_evict_private_caches(bool evict);

// Times op as it is: for peers that write into their own output buffer.
// op returns false when the peer failed, which ends the benchmark with an
// error rather than a figure.
void time_as_is(benchmark::State& state, const std::function<bool()>& op);

}  // namespace vorlite::bench

#endif
