// The library's operations that have no peer, and a whole effect document
// processor by processor.
#include <fstream>
#include <memory>
#include <sstream>
#include <utility>
#include <vector>

#include "runner.h"
#include "suite.h"
#include "workload.h"

namespace vorlite::bench {

namespace {

using PixelOp = std::function<void(VorBitmap&)>;

void add_solo_op(const std::string& operation, const std::string& label, PixelOp op) {
    for (const BitmapSize& size : kSizes) {
        add_benchmark(operation, kOurs, size, label, [size, op](benchmark::State& state) {
            time_in_place(state, sample(size), [&op](cv::Mat& image) {
                VorBitmap bitmap = as_bitmap(image);
                op(bitmap);
            });
        });
    }
}

// An effect document kept loaded for the whole run, with its processors as
// separate JSON values so each can be run and timed on its own.
class Document {
  public:
    static std::unique_ptr<Document> load(const std::string& path) {
        std::ifstream file(path);
        if (!file) return nullptr;
        std::ostringstream text;
        text << file.rdbuf();
        auto document = std::unique_ptr<Document>(new Document);
        document->handle_ = VLPLLoadEffect(text.str().c_str());
        document->tree_ = yajl_tree_parse(text.str().c_str(), nullptr, 0);
        if (document->handle_ == nullptr || document->tree_ == nullptr) return nullptr;
        const char* key[] = {"processors", nullptr};
        const yajl_val list = yajl_tree_get(document->tree_, key, yajl_t_array);
        if (list == nullptr) return nullptr;
        for (size_t i = 0; i < list->u.array.len; ++i) {
            const char* name_key[] = {"name", nullptr};
            const yajl_val name = yajl_tree_get(list->u.array.values[i], name_key, yajl_t_string);
            document->processors_.emplace_back(name != nullptr ? YAJL_GET_STRING(name) : "unnamed",
                                               list->u.array.values[i]);
        }
        return document;
    }

    Document(const Document&) = delete;
    Document& operator=(const Document&) = delete;
    ~Document() {
        VLPLUnloadEffect(&handle_);
        yajl_tree_free(tree_);
    }

    const VLPLEffectDocument* handle() const { return handle_; }
    const std::vector<std::pair<std::string, yajl_val>>& processors() const { return processors_; }

  private:
    Document() = default;
    VLPLEffectDocument* handle_ = nullptr;
    yajl_val tree_ = nullptr;
    std::vector<std::pair<std::string, yajl_val>> processors_;
};

VLPLRunOptions run_options() {
    VLPLRunOptions options;
    VorEffectInitParams(&options);
    options.seed = 7;
    return options;
}

bool runs_on_small_bitmap(const Document& document) {
    cv::Mat image(24, 32, CV_8UC4);
    for (int y = 0; y < image.rows; ++y) {
        for (int x = 0; x < image.cols; ++x) {
            image.at<cv::Vec4b>(y, x) = cv::Vec4b(static_cast<uchar>(x * 8), static_cast<uchar>(y * 10), 128, 255);
        }
    }
    VorBitmap bitmap = as_bitmap(image);
    const VLPLRunOptions options = run_options();
    return VLPLRunEffect(document.handle(), &bitmap, &options) == 1;
}

void fail_unless(benchmark::State& state, int result, const char* what) {
    if (result != 1) state.SkipWithError(what);
}

}  // namespace

void add_solo() {
    add_solo_op("clarity", "VorEnhanceClarity", [](VorBitmap& bitmap) { VorEnhanceClarity(&bitmap, nullptr); });
    for (const BitmapSize& size : kSizes) add_memcpy_floor("clarity", size);
    for (int mode = 0; mode < 4; ++mode) {
        add_solo_op("enhance" + std::to_string(mode), "VorAutoEnhance, mode " + std::to_string(mode),
                    [mode](VorBitmap& bitmap) { VorAutoEnhance(&bitmap, mode); });
    }
    add_solo_op("autocolors", "VorAutoColors", [](VorBitmap& bitmap) { VorAutoColors(&bitmap); });
    add_solo_op("softfocus", "VorConvolutionEffectSoftFocus",
                [](VorBitmap& bitmap) { VorConvolutionEffectSoftFocus(&bitmap); });
    add_solo_op("intensitymap", "VorBitmapIntensityMap, normal, alpha 0.6", [](VorBitmap& bitmap) {
        static const VorHistMap map = tone_map();
        VorBitmapIntensityMap(&bitmap, &map, VOR_BLEND_NORMAL, kIntensityMapAlpha);
    });
}

std::string add_document(const std::vector<std::string>& candidates) {
    static std::unique_ptr<Document> chosen;
    std::string chosen_path;
    for (const std::string& path : candidates) {
        auto document = Document::load(path);
        if (document && document->processors().size() == 5 && runs_on_small_bitmap(*document)) {
            chosen = std::move(document);
            chosen_path = path;
            break;
        }
    }
    if (!chosen) return {};
    const Document* document = chosen.get();
    for (size_t i = 0; i < document->processors().size(); ++i) {
        const std::string& name = document->processors()[i].first;
        const std::string operation = "doc_p" + std::to_string(i + 1) + "_" + name;
        const std::string label = "document, processor " + std::to_string(i + 1) + ": \"" + name + "\"";
        for (const BitmapSize& size : kSizes) {
            add_benchmark(operation, kOurs, size, label, [size, document, i](benchmark::State& state) {
                const VLPLRunOptions options = run_options();
                // Each processor sees what the ones before it made, as in a
                // run of the whole document.
                cv::Mat input = sample(size).clone();
                VorBitmap staged = as_bitmap(input);
                int result = 1;
                for (size_t before = 0; before < i && result == 1; ++before) {
                    result = VLPLRunProcessor(document->processors()[before].second, &staged, &options);
                }
                const yajl_val processor = document->processors()[i].second;
                time_in_place(state, input, [&](cv::Mat& image) {
                    VorBitmap bitmap = as_bitmap(image);
                    result = VLPLRunProcessor(processor, &bitmap, &options);
                });
                fail_unless(state, result, "the processor failed");
            });
        }
    }
    for (const BitmapSize& size : kSizes) {
        add_benchmark("doc_total", kOurs, size, "document, all five processors (VLPLRunEffect)",
                      [size, document](benchmark::State& state) {
                          const VLPLRunOptions options = run_options();
                          int result = 1;
                          time_in_place(state, sample(size), [&](cv::Mat& image) {
                              VorBitmap bitmap = as_bitmap(image);
                              result = VLPLRunEffect(document->handle(), &bitmap, &options);
                          });
                          fail_unless(state, result, "the document failed");
                      });
    }
    return chosen_path;
}

}  // namespace vorlite::bench
