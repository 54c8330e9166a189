// Turns Google Benchmark's JSON output into the results table: medians in
// nanoseconds per pixel, ratios of the library to each peer against their
// goals, growth with size and amount, and the tool's peak memory.
#ifndef VORLITE_BENCH_REPORT_H
#define VORLITE_BENCH_REPORT_H

#include <map>
#include <string>

namespace vorlite::bench::report {

// Median times per pixel by both clocks: the process's CPU time over all
// its threads, and wall-clock time.
struct Median {
    double cpu_ns_per_pixel = 0.0;
    double wall_ns_per_pixel = 0.0;
    double pixels = 0.0;
    double box_pixels = 0.0;  // the work box's pixels, for the operations that have one
    std::string label;
};

// One run of the benchmark program: the medians keyed "operation/side/size"
// and the string entries of its context (date, host, custom entries).
struct Run {
    std::map<std::string, Median> medians;
    std::map<std::string, std::string> context;
    int repetitions = 0;
};

// Reads the median aggregates of a JSON report; benchmarks that ended in an
// error are left out. False, with a reason in error, if the text is not a
// Google Benchmark JSON report.
bool read_run(const std::string& json, Run& run, std::string& error);

struct Memory {
    bool measured = false;
    double peak_bytes = 0.0;
    double bitmap_bytes = 0.0;
    std::string note;  // why it was not measured, or how it was
};

// Everything on one thread is compared by CPU time, which other programs
// on a shared machine disturb least; the peers on every core by wall-clock
// time, which is what their threads buy.
struct Inputs {
    Run single;  // every benchmark, peers on one thread
    Run multi;   // the peers again on every core; may be empty
    Run cold;    // the library again, each copy pushed out of the core's caches; may be empty
    std::string machine;
    std::string date;
    Memory memory;
};

// The whole of RESULTS.md.
std::string render(const Inputs& inputs);

}  // namespace vorlite::bench::report

#endif
