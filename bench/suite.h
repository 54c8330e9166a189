// The benchmarks of the suite, registered by main once the photo is known.
#ifndef VORLITE_BENCH_SUITE_H
#define VORLITE_BENCH_SUITE_H

#include <string>
#include <vector>

#include "catalogue.h"

namespace vorlite::bench {

// The library against its peers, at both sizes, and the sharpening amounts.
void add_pairs();

// The library's operations that have no peer, at both sizes.
void add_solo();

// The generated effects: vignette and gradient against memcpy, every
// banded frame, gradient shape and flare type on its own, at both sizes.
void add_generated();

// The tool engine: dabs, a stroke segment and its preview box, the
// preview, VorToolInit per kind on a 1080 x 1080 preview, and the
// full-resolution render per kind at both sizes.
void add_tools();

// Every effect of the legacy catalogue at both sizes, and memcpy beside
// them.
void add_legacy();

// The label of one side of a comparison in the catalogue.
const char* comparison_label(const char* operation, const char* side);

// memcpy of the bitmap's bytes under the operation's name: the floor a
// whole-image pass is held against.
void add_memcpy_floor(const char* operation, const BitmapSize& size);

// Picks the first of the candidate effect documents that has exactly five
// processors and runs on a small bitmap, and registers each processor and
// the whole document at both sizes. Returns the chosen path, or an empty
// string (and registers nothing) when no candidate qualifies.
std::string add_document(const std::vector<std::string>& candidates);

}  // namespace vorlite::bench

#endif
