// Whether an effect document will run, and if not exactly why: one line
// that names the place and the problem. Shared by the command-line tool and
// the browser page, so both say the same thing about the same document.
#pragma once

#include <array>
#include <memory>
#include <optional>
#include <string>
#include <string_view>
#include <type_traits>
#include <vector>

#include "zentra_vorlite.h"

namespace vorlite::cli {

// The processor names an effect document may use, in the runner's order.
inline constexpr std::array<std::string_view, 13> kProcessorNames = {
    "original", "vignette", "legacyProcessor", "histogramMapping", "gamma",
    "colorMatrixTransform", "intensityMap", "flare", "contrast", "blendWithColor",
    "noise", "sharpness", "gradient"};

// The library's run options for a seed, a strength and the borders switch,
// the rest at their defaults.
VLPLRunOptions run_options(uint32_t seed, double strength, bool borders);

// The position and yajl's own description of the first syntax error, as
// "line L, column C: invalid JSON (...)", or nothing for well-formed JSON.
// Comments are allowed, as the library's loader allows them.
std::optional<std::string> json_syntax_error(std::string_view text);

// A value as compact JSON on one line; long arrays and long texts are cut
// short with "...".
std::string describe_json(const yajl_val value);

struct TreeDeleter {
    void operator()(yajl_val tree) const { yajl_tree_free(tree); }
};
using JsonTree = std::unique_ptr<std::remove_pointer_t<yajl_val>, TreeDeleter>;

// Why a well-formed document lacks the effect envelope, if it does.
std::optional<std::string> envelope_error(const yajl_val root);

// Runs the processors of a document one at a time on the bitmap, as the
// runner would, and says which one failed and why. The library is the only
// judge of parameters: a processor it rejects is reported with them.
std::optional<std::string> processor_error(const yajl_val root, VorBitmap* bitmap,
                                           const VLPLRunOptions& options);

// The verdict on a document's text: the first reason it will not run (on a
// small test bitmap), or its processor names.
struct Verdict {
    std::optional<std::string> error;
    std::vector<std::string> names;
};
Verdict check_effect(std::string_view text, const VLPLRunOptions& options);

}  // namespace vorlite::cli
