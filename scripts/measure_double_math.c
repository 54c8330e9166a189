/* Producer: evaluates this C library's exp, log, pow, sin, cos and atan2 on
   every measured argument and writes the results' bits, in order, to
   standard output. Built once against glibc (run with and without its
   fused multiply-add variants) and once against musl. Not part of the
   library. */
#include <math.h>
#include <stdio.h>

#include "measure_double_math.h"

static double evaluate(int function, double a, double b) {
    switch (function) {
        case FN_EXP: return exp(a);
        case FN_LOG: return log(a);
        case FN_POW: return pow(a, b);
        case FN_SIN: return sin(a);
        case FN_COS: return cos(a);
        default: return atan2(a, b);
    }
}

int main(void) {
    static double block[1 << 16];
    size_t filled = 0;
    for (int function = 0; function < FN_COUNT; ++function) {
        for (int set = 0; set < SET_COUNT; ++set) {
            if (!measure_set_belongs(set, function)) continue;
            for (uint64_t i = 0; i < measure_sets[set].count; ++i) {
                double a, b;
                measure_args(set, i, &a, &b);
                block[filled++] = evaluate(function, a, b);
                if (filled == sizeof block / sizeof block[0]) {
                    if (fwrite(block, sizeof block[0], filled, stdout) != filled) return 1;
                    filled = 0;
                }
            }
        }
    }
    if (fwrite(block, sizeof block[0], filled, stdout) != filled) return 1;
    return fflush(stdout) != 0;
}
