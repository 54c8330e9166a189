// Sanitizer defaults of the test binary and of a sanitized command-line
// tool, so that each behaves the same run through ctest or by hand. The
// slow unwinder sees through yajl's frames, which lets the loader's one
// deliberate leak (a parsed tree without the effect envelope) and the dusko
// frame's one profile be suppressed by name; every other leak fails.
extern "C" const char* __asan_default_options() { return "detect_leaks=1:fast_unwind_on_malloc=0"; }

extern "C" const char* __lsan_default_suppressions() { return "leak:VLPLLoadEffect\nleak:VorEffectDuskoBorder\n"; }

extern "C" const char* __ubsan_default_options() { return "print_stacktrace=1"; }

extern "C" const char* __lsan_default_options() { return "print_suppressions=0"; }
