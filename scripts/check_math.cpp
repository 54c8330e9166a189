// Holds the library's single-precision elementary functions against a C
// library and against the pinned results of the test suite.
//
//   check_math reference [THREADS]
//       every float argument of expf, logf, sinf and cosf, and some 4 x 10^9
//       powf pairs (grids near 1, random patterns, the library's constant
//       exponents over every float base they can meet), against the running
//       C library, which must compute the reference results: glibc's
//       portable code (scripts/check_math.sh switches the FMA variants off).
//   check_math self
//       the known and special cases and the sample checksums, with no
//       reference library at hand (the musl stage of scripts/test.sh); the
//       running C library's own disagreements are shown for information.
//
// Prints a count of differences per family; exit status 0 when all are 0.
#include <pthread.h>
#include <stdio.h>
#include <stdlib.h>
#include <time.h>
#include <unistd.h>

#include <bit>
#include <cstdint>
#include <span>
#include <string.h>

#include "tests/core/math_float_cases.h"

namespace {

using namespace vorlite::test::mathf;

float as_float(std::uint32_t b) { return std::bit_cast<float>(b); }
std::uint32_t word(float f) { return std::bit_cast<std::uint32_t>(f); }
std::uint32_t word_of_int(int v) { return word(static_cast<float>(v)); }

double seconds_now() {
    timespec t;
    clock_gettime(CLOCK_MONOTONIC, &t);
    return static_cast<double>(t.tv_sec) + static_cast<double>(t.tv_nsec) * 1e-9;
}

// One family of arguments: count of them, the i-th given by a function.
struct Family {
    const char* label;
    Fn fn;
    std::uint64_t count;
    Pair (*argument)(const Family&, std::uint64_t i);
    std::uint32_t lo = 0, y = 0;  // for the sweeps of one exponent over bases from lo
};

Pair every_word(const Family&, std::uint64_t i) { return {static_cast<std::uint32_t>(i), 0}; }

Pair near_one(const Family&, std::uint64_t i) {
    return {0x3F800000u - 0x20000u + static_cast<std::uint32_t>(i & 0x3FFFF),
            word_of_int(static_cast<int>(i >> 18) - 327)};
}

Pair random_patterns(const Family&, std::uint64_t i) {
    const auto k = static_cast<std::uint32_t>(i);
    return {scatter(k ^ 0x40000000u), scatter(k ^ 0xC0000000u)};
}

Pair random_positive_moderate(const Family&, std::uint64_t i) {
    const auto k = static_cast<std::uint32_t>(i);
    const std::uint32_t b = scatter(k ^ 0xA0000000u);
    return {scatter(k ^ 0x20000000u) & 0x7FFFFFFFu, (b & 0x80000000u) | ((b & 0x7FFFFFFFu) % 0x43800000u)};
}

Pair sweep_bases(const Family& f, std::uint64_t i) { return {f.lo + static_cast<std::uint32_t>(i), f.y}; }

// Enhance's per-level exponents 0.5 shade^2.2 over ratios 1/256..256,
// every 256th float.
std::uint32_t g_level_exponents[256];
Pair per_level(const Family&, std::uint64_t i) {
    return {0x3B800000u + static_cast<std::uint32_t>(i >> 8) * 256u, g_level_exponents[i & 255]};
}

// Curve levels i/255 and i/127 under exponents 1/128..128, every 256th float.
std::uint32_t g_curve_levels[384];
Pair curve_levels(const Family&, std::uint64_t i) {
    return {g_curve_levels[i % 384], 0x3C000000u + static_cast<std::uint32_t>(i / 384) * 256u};
}

Family sweep(const char* label, float exponent, std::uint32_t lo, std::uint32_t hi) {
    Family f{label, Fn::pow, std::uint64_t{hi} - lo + 1, sweep_bases};
    f.lo = lo;
    f.y = word(exponent);
    return f;
}

// Shared by the threads of one family. The counters use the compiler's
// atomic built-ins rather than <atomic>, whose C++20 header needs more of
// the C library than musl offers libstdc++.
struct Tally {
    std::uint64_t next = 0, differ = 0, nan_convention = 0;
    pthread_mutex_t lock = PTHREAD_MUTEX_INITIALIZER;
    int shown = 0;
};

std::uint64_t fetch_add(std::uint64_t* counter, std::uint64_t n) {
    return __atomic_fetch_add(counter, n, __ATOMIC_RELAXED);
}

struct Work {
    const Family* family;
    Tally* tally;
};

constexpr std::uint64_t k_chunk = 1u << 16;

void* run_chunks(void* arg) {
    const Work& w = *static_cast<Work*>(arg);
    const Family& f = *w.family;
    for (;;) {
        const std::uint64_t start = fetch_add(&w.tally->next, k_chunk);
        if (start >= f.count) break;
        const std::uint64_t end = start + k_chunk < f.count ? start + k_chunk : f.count;
        std::uint64_t differ = 0, nan_convention = 0;
        for (std::uint64_t i = start; i < end; ++i) {
            const Pair a = f.argument(f, i);
            const std::uint32_t mine = word(ours(f.fn, as_float(a.x), as_float(a.y)));
            const std::uint32_t theirs = word(libc(f.fn, as_float(a.x), as_float(a.y)));
            if (mine == theirs) continue;
            if (agrees_with_reference(f.fn, a, mine, theirs)) {
                ++nan_convention;
                continue;
            }
            ++differ;
            pthread_mutex_lock(&w.tally->lock);
            if (w.tally->shown++ < 5) {
                printf("    %s(0x%08X%s", name(f.fn), a.x, f.fn == Fn::pow ? ", " : ")");
                if (f.fn == Fn::pow) printf("0x%08X)", a.y);
                printf(": ours 0x%08X, C library 0x%08X\n", mine, theirs);
            }
            pthread_mutex_unlock(&w.tally->lock);
        }
        fetch_add(&w.tally->differ, differ);
        fetch_add(&w.tally->nan_convention, nan_convention);
    }
    return nullptr;
}

// Runs one family on `threads` threads; returns its count of differences.
std::uint64_t run_family(const Family& f, int threads) {
    Tally tally;
    Work work{&f, &tally};
    const double start = seconds_now();
    pthread_t ids[64];
    for (int t = 0; t < threads; ++t) pthread_create(&ids[t], nullptr, run_chunks, &work);
    for (int t = 0; t < threads; ++t) pthread_join(ids[t], nullptr);
    printf("%-5s %-52s %11llu args %6llu differ", name(f.fn), f.label,
           static_cast<unsigned long long>(f.count), static_cast<unsigned long long>(tally.differ));
    if (tally.nan_convention) {
        printf("  (%llu x86 NaN conventions)", static_cast<unsigned long long>(tally.nan_convention));
    }
    printf("  %6.1f s\n", seconds_now() - start);
    fflush(stdout);
    return tally.differ;
}

int check_reference(int threads) {
    const char* problem = reference_library_problem();
    if (*problem) {
        fprintf(stderr, "check_math: %s\n", problem);
        return 2;
    }
    for (int level = 0; level < 256; ++level) {
        const float shade = 1.0f - static_cast<float>(level) * (1.0f / 255.0f);
        g_level_exponents[level] = word(0.5f * vorlite::core::powf(shade, 2.2f));
    }
    for (int i = 0; i < 256; ++i) g_curve_levels[i] = word(static_cast<float>(i) * (1.0f / 255.0f));
    for (int i = 0; i < 128; ++i) g_curve_levels[256 + i] = word(static_cast<float>(i) * (1.0f / 127.0f));

    const std::uint64_t all_words = std::uint64_t{1} << 32;
    const Family families[] = {
        {"every float", Fn::exp, all_words, every_word},
        {"every float", Fn::log, all_words, every_word},
        {"every float", Fn::sin, all_words, every_word},
        {"every float", Fn::cos, all_words, every_word},
        {"bases within 2^17 ulp of 1, exponents -327..327", Fn::pow, (1u << 18) * 655ull, near_one},
        {"random patterns", Fn::pow, 1u << 27, random_patterns},
        {"random positive bases, exponents below 256", Fn::pow, 1u << 27, random_positive_moderate},
        sweep("^2.4 over every base 1/16..1", 2.4f, 0x3D800000u, 0x3F800000u),
        sweep("^0.33333334 over every base 1/128..2", 0.33333334f, 0x3C000000u, 0x40000000u),
        sweep("^0.8 over every base 0..256", 0.8f, 0x00000000u, 0x43800000u),
        sweep("^0.65 over every base 1..256", 0.65f, 0x3F800000u, 0x43800000u),
        sweep("^0.5 over every base 0..256", 0.5f, 0x00000000u, 0x43800000u),
        sweep("^0.33 over every base 1..256", 0.33f, 0x3F800000u, 0x43800000u),
        sweep("^2.2 over every base 0..1", 2.2f, 0x00000000u, 0x3F800000u),
        {"256 enhance level exponents, ratios 1/256..256", Fn::pow, (((0x43800000u - 0x3B800000u) >> 8) + 1) * 256ull,
         per_level},
        {"curve levels i/255, i/127, exponents 1/128..128", Fn::pow, (((0x43000000u - 0x3C000000u) >> 8) + 1) * 384ull,
         curve_levels},
    };
    const double start = seconds_now();
    std::uint64_t total = 0, pow_pairs = 0;
    for (const Family& f : families) {
        total += run_family(f, threads);
        if (f.fn == Fn::pow) pow_pairs += f.count;
    }
    printf("powf pairs: %llu; differences in all: %llu; %.0f s on %d threads\n",
           static_cast<unsigned long long>(pow_pairs), static_cast<unsigned long long>(total),
           seconds_now() - start, threads);
    return total == 0 ? 0 : 1;
}

int check_self() {
    int failures = 0;
    std::size_t cases = 0;
    for (const std::span<const Case> table : {std::span<const Case>(k_known), std::span<const Case>(k_special)}) {
        cases += table.size();
        for (const Case& c : table) {
            const std::uint32_t got = word(ours(c.fn, as_float(c.x), as_float(c.y)));
            if (got == c.expected) continue;
            ++failures;
            printf("%s(0x%08X, 0x%08X): ours 0x%08X, reference 0x%08X\n", name(c.fn), c.x, c.y, got,
                   c.expected);
        }
    }
    printf("known and special cases: %zu, %d differ\n", cases, failures);
    for (const Fn fn : k_functions) {
        const std::uint64_t sum = sample_checksum(fn);
        const bool same = sum == golden_checksum(fn);
        failures += same ? 0 : 1;
        std::uint32_t libc_differ = 0;
        for (std::uint32_t i = 0; i < k_sample_size; ++i) {
            const Pair a = sample(fn, i);
            const float x = as_float(a.x), y = as_float(a.y);
            if (!agrees_with_reference(fn, a, word(ours(fn, x, y)), word(libc(fn, x, y)))) ++libc_differ;
        }
        printf("%s sample checksum 0x%016llX %s; the C library here differs on %u of %u\n", name(fn),
               static_cast<unsigned long long>(sum), same ? "as pinned" : "DIFFERS from the pinned one",
               libc_differ, k_sample_size);
    }
    return failures == 0 ? 0 : 1;
}

}  // namespace

int main(int argc, char** argv) {
    if (argc >= 2 && strcmp(argv[1], "self") == 0) return check_self();
    if (argc >= 2 && strcmp(argv[1], "reference") == 0) {
        long threads = argc >= 3 ? strtol(argv[2], nullptr, 10) : sysconf(_SC_NPROCESSORS_ONLN);
        if (threads < 1) threads = 1;
        if (threads > 64) threads = 64;
        return check_reference(static_cast<int>(threads));
    }
    fprintf(stderr, "usage: check_math reference [THREADS] | check_math self\n");
    return 2;
}
