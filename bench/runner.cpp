#include "runner.h"

#include <cstddef>
#include <utility>
#include <vector>

namespace vorlite::bench {

std::string benchmark_name(const std::string& operation, const std::string& side, const BitmapSize& size) {
    return operation + "/" + side + "/" + size.label;
}

void add_benchmark(const std::string& operation, const std::string& side, const BitmapSize& size,
                   const std::string& label, std::function<void(benchmark::State&)> body,
                   std::int64_t iterations) {
    const double pixels = static_cast<double>(size.width) * size.height;
    auto* registered = benchmark::RegisterBenchmark(
        benchmark_name(operation, side, size).c_str(),
        [body = std::move(body), label, pixels](benchmark::State& state) {
            body(state);
            state.SetLabel(label);
            state.counters["pixels"] = pixels;
        });
    // Both clocks are recorded: the process's CPU time, summed over its
    // threads, is what one core spends and hardly moves when other programs
    // share the machine; wall-clock time is what a caller waits for when a
    // peer uses every core. A 12-megapixel call takes tens to hundreds of
    // milliseconds, so a few iterations per repetition are enough.
    registered->MeasureProcessCPUTime()->UseRealTime()->Unit(benchmark::kMillisecond);
    if (iterations > 0) {
        registered->Iterations(iterations);
    } else {
        registered->MinTime(size.width == kLarge.width ? 0.3 : 0.2);
    }
}

namespace {

bool evict_private_caches = false;

// Writing a buffer several times the size of a core's private caches
// leaves none of the bitmap in them.
void evict() {
    static std::vector<unsigned char> sweep(std::size_t{64} << 20);
    for (std::size_t i = 0; i < sweep.size(); i += 64) ++sweep[i];
    benchmark::DoNotOptimize(sweep.data());
}

}  // namespace

void set_evict_private_caches(bool evict) { evict_private_caches = evict; }

void time_in_place(benchmark::State& state, const cv::Mat& source, const std::function<void(cv::Mat&)>& op) {
    cv::Mat work = source.clone();
    op(work);
    for (auto _ : state) {
        state.PauseTiming();
        source.copyTo(work);
        if (evict_private_caches) evict();
        state.ResumeTiming();
        op(work);
        benchmark::ClobberMemory();
    }
}

void time_as_is(benchmark::State& state, const std::function<bool()>& op) {
    if (!op()) {
        state.SkipWithError("the peer reported a failure");
        return;
    }
    for (auto _ : state) {
        if (!op()) {
            state.SkipWithError("the peer reported a failure");
            break;
        }
        benchmark::ClobberMemory();
    }
}

}  // namespace vorlite::bench
