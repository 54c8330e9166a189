// The legacy catalogue: every named effect on its own at both sizes, run
// through "legacyProcessor" with borders enabled, and memcpy of the same
// bytes beside them, so that the report can hold each frame's cost to the
// band it draws.
#include <string>

#include "runner.h"
#include "suite.h"

namespace vorlite::bench {

namespace {

constexpr const char* k_legacy_names[] = {
    "mar_tessaBorder", "kip_coolBorder", "veskBorder", "skarnBorder", "nerioBorder", "kvantBorder",
    "holmvaleBorder", "duskoBorder", "rubraBorder", "bi_chromeBorder", "pallorBorder", "corvaleBorder",
    "emberlyBorder", "terrowBorder", "zenitBorder", "old_kvantBorder", "lira_griffinBorder", "tawnetBorder",
    "narwBorder", "kairoBorder", "colosBorder", "lanaiBorder", "claretBorder", "umbraBorder",
    "corvaleFlare", "emberlyFlare", "soft_focus", "mar_tessaAutoColors", "glimmoBWBorder",
    "glimmoTintypeBorder", "glimmoTintypeColorMatrixTransform", "glimmoTintypeDiamondSquare",
    "glimmoVintageColorMatrixTransform", "murmelGrittyPSSat", "murmelGrittyDots", "murmelBWPSSat",
    "murmelCinematicPSSat", "clarityEnhance"};

}  // namespace

void add_legacy() {
    for (const BitmapSize& size : kSizes) {
        add_memcpy_floor("legacy", size);
        for (const char* name : k_legacy_names) {
            const std::string text = std::string("{\"legacyName\": \"") + name + "\"}";
            add_benchmark(std::string("legacy_") + name, kOurs, size, std::string("legacyProcessor ") + name,
                          [size, text](benchmark::State& state) {
                              yajl_val parameters = yajl_tree_parse(text.c_str(), nullptr, 0);
                              VLPLRunOptions options;
                              VorEffectInitParams(&options);
                              options.seed = 7;
                              options.bordersEnabled = 1;
                              time_in_place(state, sample(size), [&](cv::Mat& image) {
                                  VorBitmap bitmap = as_bitmap(image);
                                  VLPLRunLegacyProcessor(parameters, &bitmap, &options);
                              });
                              yajl_tree_free(parameters);
                          });
        }
    }
}

}  // namespace vorlite::bench
