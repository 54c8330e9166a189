// The tool's commands. Each returns the exit status (0 done, 1 a file
// failed) and throws Failure or UsageError for the one error line of a
// command that stops.
#pragma once

#include <cstdint>
#include <filesystem>
#include <optional>
#include <string>
#include <vector>

#include "zentra_vorlite.h"

namespace vorlite::cli {

inline constexpr int kDefaultQuality = 90;

// What an effect run is given: the library's run options.
struct RunSettings {
    uint32_t seed = 0;
    double strength = 1.0;
    bool no_borders = false;
    VLPLRunOptions options() const;
};

struct ApplyArgs {
    std::filesystem::path effect, input, output;
    RunSettings run;
    bool compare = false;
    int quality = kDefaultQuality;
};

// Slider values, nominally -100..100, 0 meaning unchanged.
struct AdjustArgs {
    std::filesystem::path input, output;
    std::optional<double> brightness, contrast, saturation, warmth, sharpness;
    int quality = kDefaultQuality;
};

struct AutoArgs {
    std::filesystem::path input, output;
    std::optional<int> enhance;   // auto-enhance mode 0..3
    std::optional<double> colors; // levels fade 0..1
    bool lab_correct = false;
    bool clarity = false;
    int quality = kDefaultQuality;
};

struct BatchArgs {
    std::filesystem::path effect, input_dir, output_dir;
    RunSettings run;
    unsigned jobs = 1;
    int quality = kDefaultQuality;
};

// Contact sheets of every border style, flare type and gradient shape.
struct GalleryArgs {
    std::filesystem::path output_dir;
    std::optional<std::filesystem::path> photo;  // the demo's sample photo, or a built-in scene, when absent
    std::optional<uint32_t> width;               // each sheet scaled down to this width
    std::string format = "png";                  // "png" or "jpg"
};

// A brush script replayed on a preview and rendered on the photo.
struct PaintArgs {
    std::filesystem::path script, input, output;
    uint32_t preview_width = 1080, preview_height = 1080;
    std::optional<std::filesystem::path> frames;  // the preview after every gesture
    bool compare = false;
    int quality = kDefaultQuality;
};

// One named effect of the legacy catalogue.
struct LegacyArgs {
    std::string name;
    std::filesystem::path input, output;
    RunSettings run;
    bool list = false;
    int quality = kDefaultQuality;
};

struct LegacyEffect {
    const char* name;
    const char* description;
    bool border;  // drawn only while borders are enabled
};

// The catalogue's 38 names in its order, each with a line saying what it does.
const std::vector<LegacyEffect>& legacy_effects();
// Runs one named effect as a document's "legacyProcessor" would; false for
// a name the library does not know.
bool run_legacy_effect(const std::string& name, VorBitmap* bitmap, const VLPLRunOptions& options);

int run_apply(const ApplyArgs& args);
int run_check(const std::filesystem::path& effect);
int run_adjust(const AdjustArgs& args);
int run_auto(const AutoArgs& args);
int run_batch(const BatchArgs& args);
int run_info();
int run_gallery(const GalleryArgs& args);
int run_paint(const PaintArgs& args);
int run_legacy(const LegacyArgs& args);

}  // namespace vorlite::cli
