// vorlite_bench_report: writes the results table from the benchmark runs.
//   --single=FILE        JSON of the run with the peers on one thread (required)
//   --multi=FILE         JSON of the peers' run on every core
//   --cold=FILE          JSON of the library's run with --evict-caches
//   --machine=TEXT       description of the machine
//   --date=TEXT          when the runs were made
//   --peak-rss-kb=N      the tool's peak resident memory
//   --bitmap-bytes=N     size of the decoded bitmap it worked on
//   --memory-note=TEXT   why memory was not measured, or how it was
//   --append=FILE        a section written elsewhere (the command-line tool's
//                        timings), added at the end as it stands
//   --out=FILE           where to write (default: standard output)
#include <cstdio>
#include <cstdlib>
#include <cstring>
#include <fstream>
#include <iostream>
#include <sstream>
#include <string>

#include "report.h"

namespace {

bool take(const char* arg, const char* flag, std::string& value) {
    const size_t n = std::strlen(flag);
    if (std::strncmp(arg, flag, n) != 0) return false;
    value = arg + n;
    return true;
}

bool read_file(const std::string& path, std::string& text) {
    std::ifstream file(path);
    if (!file) return false;
    std::ostringstream buffer;
    buffer << file.rdbuf();
    text = buffer.str();
    return true;
}

bool load(const std::string& path, vorlite::bench::report::Run& run) {
    std::string text;
    std::string error;
    if (!read_file(path, text)) {
        std::fprintf(stderr, "vorlite_bench_report: cannot read '%s'\n", path.c_str());
        return false;
    }
    if (!vorlite::bench::report::read_run(text, run, error)) {
        std::fprintf(stderr, "vorlite_bench_report: '%s': %s\n", path.c_str(), error.c_str());
        return false;
    }
    return true;
}

}  // namespace

int main(int argc, char** argv) {
    vorlite::bench::report::Inputs inputs;
    std::string single, multi, cold, out, peak, bitmap, append;
    for (int i = 1; i < argc; ++i) {
        if (!take(argv[i], "--single=", single) && !take(argv[i], "--multi=", multi) &&
            !take(argv[i], "--cold=", cold) &&
            !take(argv[i], "--machine=", inputs.machine) && !take(argv[i], "--date=", inputs.date) &&
            !take(argv[i], "--peak-rss-kb=", peak) && !take(argv[i], "--bitmap-bytes=", bitmap) &&
            !take(argv[i], "--memory-note=", inputs.memory.note) && !take(argv[i], "--out=", out) &&
            !take(argv[i], "--append=", append)) {
            std::fprintf(stderr, "vorlite_bench_report: unknown argument '%s'\n", argv[i]);
            return 2;
        }
    }
    if (single.empty()) {
        std::fprintf(stderr, "vorlite_bench_report: --single=FILE is required\n");
        return 2;
    }
    if (!load(single, inputs.single) || (!multi.empty() && !load(multi, inputs.multi)) ||
        (!cold.empty() && !load(cold, inputs.cold))) {
        return 1;
    }
    if (!peak.empty() && !bitmap.empty()) {
        inputs.memory.measured = true;
        inputs.memory.peak_bytes = std::strtod(peak.c_str(), nullptr) * 1024.0;
        inputs.memory.bitmap_bytes = std::strtod(bitmap.c_str(), nullptr);
    }
    std::string text = vorlite::bench::report::render(inputs);
    if (!append.empty()) {
        std::string section;
        if (!read_file(append, section)) {
            std::fprintf(stderr, "vorlite_bench_report: cannot read '%s'\n", append.c_str());
            return 1;
        }
        text += "\n" + section;
    }
    if (out.empty()) {
        std::cout << text;
        return 0;
    }
    std::ofstream file(out);
    file << text;
    if (!file) {
        std::fprintf(stderr, "vorlite_bench_report: cannot write '%s'\n", out.c_str());
        return 1;
    }
    return 0;
}
