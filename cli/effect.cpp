// Loading effect documents, and running them on photos.
#include "effect.h"

#include <algorithm>

namespace vorlite::cli {

Effect Effect::load(const std::filesystem::path& path, const VLPLRunOptions& options) {
    std::string text = read_file(path);
    text.resize(std::min(text.size(), text.find('\0')));
    Verdict verdict = check_effect(text, options);
    if (verdict.error) throw Failure(path.string() + ": " + *verdict.error);
    Effect effect;
    effect.document_.reset(VLPLLoadEffect(text.c_str()));
    if (!effect.document_) throw Failure(path.string() + ": the library did not load the document");
    effect.tree_.reset(yajl_tree_parse(text.c_str(), nullptr, 0));
    effect.names_ = std::move(verdict.names);
    effect.path_ = path.string();
    return effect;
}

void Effect::run(Image& image, const VLPLRunOptions& options, const std::filesystem::path& photo) const {
    VorBitmap bitmap = image.bitmap();
    if (VLPLRunEffect(document_.get(), &bitmap, &options)) return;
    // The document passed on a small bitmap; find the processor that fails on
    // this photo by running them again one at a time on what is left of it.
    const std::optional<std::string> why = processor_error(tree_.get(), &bitmap, options);
    throw Failure(photo.string() + ": the effect " + path_ + " failed: " +
                  why.value_or("the library's run failed although each processor succeeded alone"));
}

}  // namespace vorlite::cli
