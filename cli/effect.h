// Effect documents: loading, and finding out exactly why one will not run.
#pragma once

#include <array>
#include <filesystem>
#include <memory>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

#include "image.h"
#include "zentra_vorlite.h"

namespace vorlite::cli {

// The processor names an effect document may use, in the runner's order.
inline constexpr std::array<std::string_view, 13> kProcessorNames = {
    "original", "vignette", "legacyProcessor", "histogramMapping", "gamma",
    "colorMatrixTransform", "intensityMap", "flare", "contrast", "blendWithColor",
    "noise", "sharpness", "gradient"};

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

// A document that passed the check, loaded by the library, with its own
// tree kept to explain a failure on a real photo.
class Effect {
public:
    // Throws Failure naming the file when the document will not run.
    static Effect load(const std::filesystem::path& path, const VLPLRunOptions& options);

    // Runs on the photo in place; throws Failure naming the photo and the
    // failing processor.
    void run(Image& image, const VLPLRunOptions& options, const std::filesystem::path& photo) const;

    const std::vector<std::string>& names() const { return names_; }

private:
    struct DocumentDeleter {
        void operator()(VLPLEffectDocument* document) const { VLPLUnloadEffect(&document); }
    };
    std::unique_ptr<VLPLEffectDocument, DocumentDeleter> document_;
    JsonTree tree_;
    std::vector<std::string> names_;
    std::string path_;
};

}  // namespace vorlite::cli
