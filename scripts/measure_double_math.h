/* Arguments for measuring the double-precision elementary functions: the
   ranges the library passes to exp, log, pow, sin, cos and atan2, as grids
   and as random draws. Shared by the C producer (built against each C
   library) and the C++ comparator, so both see the same arguments; only
   + - * / are used here, never the maths library. Not part of the library. */
#ifndef MEASURE_DOUBLE_MATH_H
#define MEASURE_DOUBLE_MATH_H

#include <stdint.h>
#include <string.h>

enum { FN_EXP, FN_LOG, FN_POW, FN_SIN, FN_COS, FN_ATAN2, FN_COUNT };

static const char* const measure_function_names[FN_COUNT] = {"exp", "log", "pow", "sin", "cos", "atan2"};

enum {
    EXP_CONTRAST_RANDOM,  /* v * 0.011314021114911007, v uniform in [-100, 100] */
    EXP_CONTRAST_GRID,    /* the same over an even grid of v */
    EXP_CONTRAST_WHOLE,   /* the same for whole slider values */
    EXP_ERFC,             /* erfc's exponent, uniform in [-110, 1] */
    EXP_FALLOFF,          /* Gaussian falloffs, uniform in [-40, 0] */
    EXP_BITS,             /* random bit patterns within [-745, 709] */
    LOG_BRIGHTNESS_RANDOM, /* v * 0.0025 + 0.5, v uniform in [-100, 100] */
    LOG_BRIGHTNESS_GRID,
    LOG_BRIGHTNESS_WHOLE,
    LOG_MASK_CUTOFFS,     /* 1 - (i + 0.5) / 32, i = 1..31 */
    LOG_UNIT,             /* uniform in (0, 1] */
    LOG_BITS,             /* random bit patterns within (0, 1e300] */
    POW_CBRT_TABLE,       /* (i / 1023) ^ (1/3), i = 1..1023 */
    POW_ENCODING_TABLE,   /* (i / 1023) ^ (1 / 2.4), i = 4..1023 */
    POW_CBRT_RANDOM,      /* t ^ 0.3333333333333333, t uniform in [0, 1] */
    POW_ENCODING_RANDOM,  /* t ^ (1 / 2.4), t uniform in [0.0031308, 1] */
    POW_LEVELS,           /* lo ^ 0.7, lo uniform in [0, 255] */
    POW_FALLOFF,          /* b ^ (4 p), b in [0, 1], p in [0.25, 4] */
    POW_BITS,             /* random x within (0, 1e6], y within [-8, 8] */
    ANGLE_TURN,           /* uniform in [-2 pi, 2 pi] (rotations, gradients) */
    ANGLE_SLIDER_RANDOM,  /* v * 0.015707963267948967, v uniform in [-100, 100] */
    ANGLE_SLIDER_WHOLE,
    ANGLE_DEGREES_FLOAT,  /* (float)(d * 0.017453292519943295), d in [-360, 360] */
    ANGLE_DEGREES,        /* d * 0.017453292519943295, d in [-720, 720] */
    ANGLE_EASE,           /* 2 pi s, s in [-0.5, 0.5] (gradient easing) */
    ANGLE_WIDE,           /* uniform in [-1e4, 1e4] (halftone and line phases) */
    ANGLE_BITS,           /* random bit patterns, every finite magnitude from 2^-30 */
    ATAN2_FLARE,          /* float offsets in [-2, 2] x [-2, 2] */
    ATAN2_PIXELS,         /* whole pixel offsets in [-4096, 4096]^2 */
    ATAN2_WIDE,           /* uniform in [-1000, 1000]^2 */
    ATAN2_BITS,           /* random bit patterns, magnitudes 2^-40 .. 2^40 */
    SET_COUNT
};

typedef struct {
    int function;
    uint64_t count;
    const char* range;
} MeasureSet;

/* At least 10^8 arguments per function; the sin and cos sets are shared. */
static const MeasureSet measure_sets[SET_COUNT] = {
    {FN_EXP, 30000000, "contrast v*0.011314..., v random in [-100,100]"},
    {FN_EXP, 20000000, "contrast v*0.011314..., v on a grid of [-100,100]"},
    {FN_EXP, 201, "contrast v*0.011314..., whole v in [-100,100]"},
    {FN_EXP, 20000000, "erfc exponent, random in [-110,1]"},
    {FN_EXP, 20000000, "falloff, random in [-40,0]"},
    {FN_EXP, 20000000, "random bits in [-745,709]"},
    {FN_LOG, 30000000, "brightness v*0.0025+0.5, v random in [-100,100]"},
    {FN_LOG, 20000000, "brightness v*0.0025+0.5, v on a grid"},
    {FN_LOG, 201, "brightness v*0.0025+0.5, whole v"},
    {FN_LOG, 31, "mask cut-offs 1-(i+0.5)/32"},
    {FN_LOG, 25000000, "random in (0,1]"},
    {FN_LOG, 25000000, "random bits in (0,1e300]"},
    {FN_POW, 1023, "cube-root table (i/1023)^(1/3)"},
    {FN_POW, 1020, "encoding table (i/1023)^(1/2.4)"},
    {FN_POW, 20000000, "t^(1/3), t random in [0,1]"},
    {FN_POW, 20000000, "t^(1/2.4), t random in [0.0031308,1]"},
    {FN_POW, 20000000, "lo^0.7, lo random in [0,255]"},
    {FN_POW, 20000000, "b^(4p), b in [0,1], p in [0.25,4]"},
    {FN_POW, 20000000, "random bits x in (0,1e6], y in [-8,8]"},
    {FN_SIN, 20000000, "angle random in [-2pi,2pi]"},
    {FN_SIN, 20000000, "slider v*pi/200, v random in [-100,100]"},
    {FN_SIN, 201, "slider v*pi/200, whole v"},
    {FN_SIN, 15000000, "degrees through float, d in [-360,360]"},
    {FN_SIN, 15000000, "degrees in double, d in [-720,720]"},
    {FN_SIN, 10000000, "gradient ease 2pi*s, s in [-0.5,0.5]"},
    {FN_SIN, 20000000, "phase random in [-1e4,1e4]"},
    {FN_SIN, 10000000, "random bits, |x| from 2^-30 to the largest"},
    {FN_ATAN2, 30000000, "float offsets in [-2,2]^2"},
    {FN_ATAN2, 30000000, "whole pixel offsets in [-4096,4096]^2"},
    {FN_ATAN2, 20000000, "random in [-1000,1000]^2"},
    {FN_ATAN2, 20000000, "random bits, |x|,|y| in 2^-40..2^40"},
};

/* The sets measured for a function; cos measures the sin sets. */
static inline int measure_set_belongs(int set, int function) {
    int owner = measure_sets[set].function;
    return owner == function || (function == FN_COS && owner == FN_SIN);
}

static inline uint64_t measure_mix(uint64_t z) {
    z += 0x9e3779b97f4a7c15ULL;
    z = (z ^ (z >> 30)) * 0xbf58476d1ce4e5b9ULL;
    z = (z ^ (z >> 27)) * 0x94d049bb133111ebULL;
    return z ^ (z >> 31);
}

static inline double measure_from_bits(uint64_t b) {
    double d;
    memcpy(&d, &b, sizeof d);
    return d;
}

/* Uniform in [lo, hi) from the stream (set, i, lane). */
static inline double measure_uniform(int set, uint64_t i, int lane, double lo, double hi) {
    uint64_t r = measure_mix((uint64_t)set << 56 ^ (uint64_t)lane << 48 ^ i);
    return lo + (hi - lo) * ((double)(r >> 11) * 0x1p-53);
}

/* Random sign, mantissa and an exponent in [emin, emax], until it lies in [lo, hi]. */
static inline double measure_bits(int set, uint64_t i, int lane, int emin, int emax, double lo, double hi) {
    for (uint64_t attempt = 0;; ++attempt) {
        uint64_t r = measure_mix((uint64_t)set << 56 ^ (uint64_t)lane << 48 ^ attempt << 40 ^ i);
        uint64_t e = (uint64_t)(emin + 1023) + (r >> 12) % (uint64_t)(emax - emin + 1);
        uint64_t b = (r & 0x8000000000000000ULL) | e << 52 | (measure_mix(r) & 0x000fffffffffffffULL);
        double x = measure_from_bits(b);
        if (x >= lo && x <= hi) return x;
    }
}

static inline double measure_grid(uint64_t i, uint64_t n, double lo, double hi) {
    return lo + (hi - lo) * ((double)i / (double)(n - 1));
}

/* The i-th argument (a, and b for pow's exponent or atan2's x) of a set. */
static inline void measure_args(int set, uint64_t i, double* a, double* b) {
    const uint64_t n = measure_sets[set].count;
    *b = 0.0;
    switch (set) {
        case EXP_CONTRAST_RANDOM: *a = measure_uniform(set, i, 0, -100, 100) * 0.011314021114911007; break;
        case EXP_CONTRAST_GRID: *a = measure_grid(i, n, -100, 100) * 0.011314021114911007; break;
        case EXP_CONTRAST_WHOLE: *a = ((double)i - 100.0) * 0.011314021114911007; break;
        case EXP_ERFC: *a = measure_uniform(set, i, 0, -110, 1); break;
        case EXP_FALLOFF: *a = measure_uniform(set, i, 0, -40, 0); break;
        case EXP_BITS: *a = measure_bits(set, i, 0, -40, 9, -745, 709); break;
        case LOG_BRIGHTNESS_RANDOM: *a = measure_uniform(set, i, 0, -100, 100) * 0.0025 + 0.5; break;
        case LOG_BRIGHTNESS_GRID: *a = measure_grid(i, n, -100, 100) * 0.0025 + 0.5; break;
        case LOG_BRIGHTNESS_WHOLE: *a = ((double)i - 100.0) * 0.0025 + 0.5; break;
        case LOG_MASK_CUTOFFS: *a = 1.0 - ((double)(i + 1) + 0.5) / 32.0; break;
        case LOG_UNIT: *a = 1.0 - measure_uniform(set, i, 0, 0, 1); break;
        case LOG_BITS: *a = measure_bits(set, i, 0, -1022, 996, 0x1p-1022, 1e300); break;
        case POW_CBRT_TABLE: *a = (double)(i + 1) * (1.0 / 1023.0); *b = 0.3333333333333333; break;
        case POW_ENCODING_TABLE: *a = (double)(i + 4) / 1023.0; *b = 1.0 / 2.4; break;
        case POW_CBRT_RANDOM: *a = measure_uniform(set, i, 0, 0, 1); *b = 0.3333333333333333; break;
        case POW_ENCODING_RANDOM: *a = measure_uniform(set, i, 0, 0.0031308, 1); *b = 1.0 / 2.4; break;
        case POW_LEVELS: *a = measure_uniform(set, i, 0, 0, 255); *b = 0.7; break;
        case POW_FALLOFF:
            *a = measure_uniform(set, i, 0, 0, 1);
            *b = 4.0 * measure_uniform(set, i, 1, 0.25, 4);
            break;
        case POW_BITS:
            *a = measure_bits(set, i, 0, -40, 19, 0x1p-40, 1e6);
            *b = measure_bits(set, i, 1, -20, 3, -8, 8);
            break;
        case ANGLE_TURN: *a = measure_uniform(set, i, 0, -6.283185307179586, 6.283185307179586); break;
        case ANGLE_SLIDER_RANDOM: *a = measure_uniform(set, i, 0, -100, 100) * 0.015707963267948967; break;
        case ANGLE_SLIDER_WHOLE: *a = ((double)i - 100.0) * 0.015707963267948967; break;
        case ANGLE_DEGREES_FLOAT:
            *a = (double)(float)(measure_uniform(set, i, 0, -360, 360) * 0.017453292519943295);
            break;
        case ANGLE_DEGREES: *a = measure_uniform(set, i, 0, -720, 720) * 0.017453292519943295; break;
        case ANGLE_EASE: *a = 6.283185307179586 * measure_uniform(set, i, 0, -0.5, 0.5); break;
        case ANGLE_WIDE: *a = measure_uniform(set, i, 0, -1e4, 1e4); break;
        case ANGLE_BITS: *a = measure_bits(set, i, 0, -30, 1023, -0x1.fffffffffffffp1023, 0x1.fffffffffffffp1023); break;
        case ATAN2_FLARE:
            *a = (double)(float)measure_uniform(set, i, 0, -2, 2);
            *b = (double)(float)measure_uniform(set, i, 1, -2, 2);
            break;
        case ATAN2_PIXELS:
            *a = (double)(int64_t)(measure_mix((uint64_t)set << 56 ^ i) % 8193) - 4096.0;
            *b = (double)(int64_t)(measure_mix((uint64_t)set << 56 ^ 1ULL << 48 ^ i) % 8193) - 4096.0;
            break;
        case ATAN2_WIDE:
            *a = measure_uniform(set, i, 0, -1000, 1000);
            *b = measure_uniform(set, i, 1, -1000, 1000);
            break;
        case ATAN2_BITS:
            *a = measure_bits(set, i, 0, -40, 40, -0x1p41, 0x1p41);
            *b = measure_bits(set, i, 1, -40, 40, -0x1p41, 0x1p41);
            break;
        default: *a = 0.0; break;
    }
}

#endif
