// Effect documents loaded for a run on photos.
#pragma once

#include <filesystem>
#include <memory>
#include <string>
#include <vector>

#include "check.h"
#include "image.h"
#include "zentra_vorlite.h"

namespace vorlite::cli {

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
