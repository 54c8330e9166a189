// Comparator: reads the producers' results (glibc with its fused
// multiply-add variants, glibc without them, musl, and optionally 32-bit ARM
// glibc), evaluates the library's own functions on the same arguments and
// counts, per argument set, the results that differ from glibc without
// fused multiply-add (the reference's arithmetic), in the double and after
// narrowing to float, and the bytes the library's current consumers would
// store differently. Not part of the library.
//   measure_double_math FMA_ON FMA_OFF MUSL [ARM_GLIBC]
#include <array>
#include <cinttypes>
#include <cstdio>
#include <cstring>
#include <vector>

#include "core/core_internal.h"
#include "measure_double_math.h"

namespace {

namespace vc = vorlite::core;

double ours(int function, double a, double b) {
    switch (function) {
        case FN_EXP: return vc::exp(a);
        case FN_LOG: return vc::log(a);
        case FN_POW: return vc::pow(a, b);
        case FN_SIN: return vc::sin(a);
        case FN_COS: return vc::cos(a);
        default: return vc::atan2(a, b);
    }
}

bool same_bits(double x, double y) {
    std::uint64_t bx, by;
    std::memcpy(&bx, &x, 8);
    std::memcpy(&by, &y, 8);
    // Every NaN counts as one value: its payload is not a result.
    if (x != x && y != y) return true;
    return bx == by;
}

bool same_float(double x, double y) { return same_bits(static_cast<float>(x), static_cast<float>(y)); }

// The warmth tool's three 256-entry level maps from the cosine of its slider
// angle, exactly as the tool stores them.
std::array<std::uint8_t, 768> warmth_maps(double v, double cosine) {
    const double w = (1.0 - cosine) * (v > 0.0 ? 100.0 : -100.0);
    const double iw = 0.00392156862745098;
    double gr, gg, gb;
    if (w > 0.0) {
        gr = (255.0 + 0.9078 * w) * iw, gg = (255.0 - 0.24 * w) * iw, gb = (255.0 - 1.4 * w) * iw;
    } else {
        gr = (255.0 + 1.55 * w) * iw, gg = (255.0 - 0.44625 * w) * iw, gb = (255.0 - 2.4531 * w) * iw;
    }
    std::array<std::uint8_t, 768> maps{};
    for (int i = 0; i < 256; ++i) {
        maps[i] = vc::store_rounded(i * gr);
        maps[256 + i] = vc::store_rounded(i * gg);
        maps[512 + i] = vc::store_rounded(i * gb);
    }
    return maps;
}

// The value a current consumer of the result stores or passes on, when the
// set is one of theirs; false when the set has no consumer of its own.
bool consumer_differs(int function, int set, std::uint64_t i, double reference, double other, bool* has) {
    *has = true;
    switch (set) {
        case POW_CBRT_TABLE: return !same_float(reference, other);
        case POW_ENCODING_TABLE: return !same_float(1.055 * reference - 0.055, 1.055 * other - 0.055);
        case EXP_CONTRAST_WHOLE: return !same_float(reference, other);
        case LOG_BRIGHTNESS_WHOLE:
            return i < 100 && !same_float(reference * -1.4426950408889634, other * -1.4426950408889634);
        case ANGLE_SLIDER_WHOLE:
            if (function == FN_COS && i != 100) {
                const double v = static_cast<double>(i) - 100.0;
                return warmth_maps(v, reference) != warmth_maps(v, other);
            }
            break;
        default: break;
    }
    *has = false;
    return false;
}

class Stream {
public:
    explicit Stream(const char* path) : file_(std::fopen(path, "rb")), buffer_(1 << 16) {}
    ~Stream() {
        if (file_ != nullptr) std::fclose(file_);
    }
    bool ok() const { return file_ != nullptr; }
    bool next(double* value) {
        if (at_ == filled_) {
            filled_ = std::fread(buffer_.data(), sizeof(double), buffer_.size(), file_);
            at_ = 0;
            if (filled_ == 0) return false;
        }
        *value = buffer_[at_++];
        return true;
    }

private:
    std::FILE* file_;
    std::vector<double> buffer_;
    std::size_t at_ = 0, filled_ = 0;
};

struct Counts {
    std::uint64_t n = 0;
    std::uint64_t on = 0, musl = 0, arm = 0, ours = 0, ours_vs_on = 0;
    std::uint64_t on_float = 0, musl_float = 0;
    std::uint64_t on_consumer = 0, musl_consumer = 0;
    bool has_consumer = false;
    void add(const Counts& c) {
        n += c.n, on += c.on, musl += c.musl, arm += c.arm, ours += c.ours, ours_vs_on += c.ours_vs_on;
        on_float += c.on_float, musl_float += c.musl_float;
        on_consumer += c.on_consumer, musl_consumer += c.musl_consumer;
    }
};

struct Example {
    double a, b, off, on, musl;
};

void print_example(int function, const char* what, const Example& e) {
    if (function == FN_POW || function == FN_ATAN2) {
        std::printf("    %s: %s(%a, %a): fma-off %a, fma-on %a, musl %a\n", what, measure_function_names[function],
                    e.a, e.b, e.off, e.on, e.musl);
    } else {
        std::printf("    %s: %s(%a): fma-off %a, fma-on %a, musl %a\n", what, measure_function_names[function], e.a,
                    e.off, e.on, e.musl);
    }
}

}  // namespace

int main(int argc, char** argv) {
    if (argc != 4 && argc != 5) {
        std::fprintf(stderr, "usage: %s FMA_ON FMA_OFF MUSL [ARM_GLIBC]\n", argv[0]);
        return 2;
    }
    Stream on(argv[1]), off(argv[2]), musl(argv[3]);
    const bool with_arm = argc == 5;
    Stream arm(with_arm ? argv[4] : argv[2]);
    if (!on.ok() || !off.ok() || !musl.ok() || !arm.ok()) {
        std::fprintf(stderr, "measure_double_math: cannot open a result stream\n");
        return 2;
    }
    bool exact = true;
    for (int function = 0; function < FN_COUNT; ++function) {
        Counts total;
        std::printf("\n%s\n", measure_function_names[function]);
        std::printf("  %-52s %10s %8s %8s%s %8s %8s %8s %8s %10s\n", "arguments", "count", "on!=off", "musl!=off",
                    with_arm ? "  arm!=off" : "", "ours!=off", "ours!=on", "on:float", "musl:flt", "consumer");
        for (int set = 0; set < SET_COUNT; ++set) {
            if (!measure_set_belongs(set, function)) continue;
            Counts c;
            std::vector<Example> on_examples, musl_examples;
            for (std::uint64_t i = 0; i < measure_sets[set].count; ++i) {
                double a, b, r_on, r_off, r_musl, r_arm = 0.0;
                measure_args(set, i, &a, &b);
                if (!on.next(&r_on) || !off.next(&r_off) || !musl.next(&r_musl) ||
                    (with_arm && !arm.next(&r_arm))) {
                    std::fprintf(stderr, "measure_double_math: a result stream ended early\n");
                    return 2;
                }
                const double r_ours = ours(function, a, b);
                ++c.n;
                const bool on_differs = !same_bits(r_on, r_off);
                const bool musl_differs = !same_bits(r_musl, r_off);
                c.on += on_differs;
                c.musl += musl_differs;
                c.arm += with_arm && !same_bits(r_arm, r_off);
                c.ours += !same_bits(r_ours, r_off);
                c.ours_vs_on += !same_bits(r_ours, r_on);
                c.on_float += !same_float(r_on, r_off);
                c.musl_float += !same_float(r_musl, r_off);
                bool has = false;
                c.on_consumer += consumer_differs(function, set, i, r_off, r_on, &has);
                c.musl_consumer += consumer_differs(function, set, i, r_off, r_musl, &has);
                c.has_consumer = has;
                const Example e{a, b, r_off, r_on, r_musl};
                if (on_differs && on_examples.size() < 2) on_examples.push_back(e);
                if (musl_differs && musl_examples.size() < 2) musl_examples.push_back(e);
            }
            char consumer[32] = "-";
            if (c.has_consumer) {
                std::snprintf(consumer, sizeof consumer, "%" PRIu64 "/%" PRIu64, c.on_consumer, c.musl_consumer);
            }
            char arm_column[16] = "";
            if (with_arm) std::snprintf(arm_column, sizeof arm_column, " %9" PRIu64, c.arm);
            std::printf("  %-52s %10" PRIu64 " %8" PRIu64 " %8" PRIu64 "%s %8" PRIu64 " %8" PRIu64 " %8" PRIu64
                        " %8" PRIu64 " %10s\n",
                        measure_sets[set].range, c.n, c.on, c.musl, arm_column, c.ours, c.ours_vs_on, c.on_float,
                        c.musl_float, consumer);
            for (const Example& e : on_examples) print_example(function, "fma-on differs", e);
            for (const Example& e : musl_examples) print_example(function, "musl differs", e);
            total.add(c);
        }
        char arm_total[16] = "";
        if (with_arm) std::snprintf(arm_total, sizeof arm_total, " %9" PRIu64, total.arm);
        std::printf("  %-52s %10" PRIu64 " %8" PRIu64 " %8" PRIu64 "%s %8" PRIu64 " %8" PRIu64 " %8" PRIu64
                    " %8" PRIu64 "\n",
                    "total", total.n, total.on, total.musl, arm_total, total.ours, total.ours_vs_on, total.on_float,
                    total.musl_float);
        exact = exact && total.ours == 0;
    }
    std::printf("\nconsumer column: entries whose stored value differs, fma-on/musl (cube-root and encoding "
                "table floats, contrast and brightness floats, warmth level maps)\n");
    return exact ? 0 : 1;
}
