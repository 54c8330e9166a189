// vorlite: runs the library's effects on PNG and JPEG photos.
// Exit status: 0 done, 1 a file could not be processed, 2 a usage error.
#include <cmath>
#include <cstdio>
#include <cstdlib>
#include <sstream>
#include <new>
#include <thread>

#include <CLI/CLI.hpp>

#include "commands.h"
#include "image.h"
#include "paint_session.h"

namespace {

using namespace vorlite::cli;

constexpr int kUsageStatus = 2;
constexpr int kFailureStatus = 1;

// CLI11's ranges let NaN through; effect strengths and slider values must
// be real numbers.
CLI::Validator finite_in(double low, double high) {
    std::ostringstream range;
    range << "[" << low << " - " << high << "]";
    return CLI::Validator(
        [low, high, range = range.str()](std::string& input) -> std::string {
            char* end = nullptr;
            const double value = std::strtod(input.c_str(), &end);
            if (input.empty() || *end != '\0' || !std::isfinite(value) || value < low || value > high) {
                return "Value " + input + " not in " + range;
            }
            return {};
        },
        "NUMBER in " + range.str());
}

// The one PNG setting of the run, shared by every command that writes.
std::optional<int> png_level_option;

void add_quality(CLI::App* command, int& quality) {
    command->add_option("--quality", quality, "JPEG quality of the written files, 1 to 100")
        ->check(CLI::Range(1, 100))
        ->capture_default_str();
    command->add_option("--png-level", png_level_option,
                        "zlib level 0..9 of written PNGs with adaptive filters (9 for the smallest file; "
                        "default: a fast Paeth and run-length coding about as small as level 6)")
        ->check(CLI::Range(0, 9));
}

void add_run_settings(CLI::App* command, RunSettings& run) {
    command->add_option("--seed", run.seed, "seed of the effect's random choices (grain, ...)")
        ->capture_default_str();
    command->add_option("--strength", run.strength, "overall strength: 0 none, 1 as designed, above 1 stronger")
        ->check(finite_in(0.0, 10.0))
        ->capture_default_str();
    command->add_flag("--no-borders", run.no_borders, "leave out the borders an effect would draw");
}

// "WxH" with both sides 16..20000.
CLI::Validator preview_size(uint32_t& width, uint32_t& height) {
    return CLI::Validator(
        [&width, &height](std::string& input) -> std::string {
            unsigned w = 0, h = 0;
            char extra = 0;
            if (std::sscanf(input.c_str(), "%ux%u%c", &w, &h, &extra) != 2 || w < 16 || h < 16 || w > 20000 ||
                h > 20000) {
                return "Value " + input + " is not a size WxH with sides 16 to 20000";
            }
            width = w;
            height = h;
            return {};
        },
        "WxH");
}

// The one line of a command-line error, with the command it belongs to.
std::string usage_line(const CLI::App& app, const CLI::ParseError& error) {
    std::string command = "vorlite";
    for (const CLI::App* sub : app.get_subcommands()) command += " " + sub->get_name();
    return command + ": " + error.what() + " (see " + command + " --help)";
}

}  // namespace

int main(int argc, char** argv) {
    CLI::App app{"Runs the effects of libzentra_vorlite on PNG and JPEG photos.", "vorlite"};
    app.require_subcommand(1);
    app.footer("Exit status: 0 done, 1 a file could not be processed, 2 a usage error.");

    ApplyArgs apply_args;
    CLI::App* apply = app.add_subcommand("apply", "Run an effect document on a photo");
    apply->add_option("EFFECT", apply_args.effect, "effect document (JSON)")->required();
    apply->add_option("IN", apply_args.input, "photo to read (.png, .jpg, .jpeg)")->required();
    apply->add_option("OUT", apply_args.output, "photo to write; the extension chooses the format")->required();
    add_run_settings(apply, apply_args.run);
    apply->add_flag("--compare", apply_args.compare, "write the original and the result side by side");
    add_quality(apply, apply_args.quality);

    std::filesystem::path check_effect;
    CLI::App* check = app.add_subcommand("check", "Say whether an effect document will run, and if not, why");
    check->add_option("EFFECT", check_effect, "effect document (JSON)")->required();

    AdjustArgs adjust_args;
    CLI::App* adjust = app.add_subcommand(
        "adjust", "Apply the slider adjustments, in the order brightness, contrast, warmth, saturation, sharpness");
    adjust->add_option("IN", adjust_args.input, "photo to read")->required();
    adjust->add_option("OUT", adjust_args.output, "photo to write")->required();
    const CLI::Validator slider = finite_in(-100.0, 100.0);
    adjust->add_option("--brightness", adjust_args.brightness, "-100 darker .. 100 brighter")->check(slider);
    adjust->add_option("--contrast", adjust_args.contrast, "-100 flatter .. 100 stronger")->check(slider);
    adjust->add_option("--saturation", adjust_args.saturation, "-100 grey .. 100 twice as saturated")->check(slider);
    adjust->add_option("--warmth", adjust_args.warmth, "-100 cooler .. 100 warmer")->check(slider);
    adjust->add_option("--sharpness", adjust_args.sharpness, "-100 blurred .. 100 sharper")->check(slider);
    add_quality(adjust, adjust_args.quality);

    AutoArgs auto_args;
    CLI::App* autofix = app.add_subcommand(
        "auto", "Apply automatic corrections, in the order colors, lab-correct, enhance, clarity");
    autofix->add_option("IN", auto_args.input, "photo to read")->required();
    autofix->add_option("OUT", auto_args.output, "photo to write")->required();
    autofix->add_option("--colors", auto_args.colors, "per-channel levels, faded: 0 none .. 1 full")
        ->check(finite_in(0.0, 1.0));
    autofix->add_flag("--lab-correct", auto_args.lab_correct, "remove a colour cast");
    autofix->add_option("--enhance", auto_args.enhance,
                        "brighten by the histogram; MODE 0 strong, 1 gentle toward white, 2 lift only, "
                        "3 contrast first then as 1")
        ->check(CLI::Range(0, 3));
    autofix->add_flag("--clarity", auto_args.clarity, "local contrast enhancement");
    add_quality(autofix, auto_args.quality);

    BatchArgs batch_args;
    batch_args.jobs = std::max(1u, std::thread::hardware_concurrency());
    CLI::App* batch = app.add_subcommand("batch", "Run an effect document on every PNG and JPEG of a folder");
    batch->add_option("EFFECT", batch_args.effect, "effect document (JSON)")->required();
    batch->add_option("INDIR", batch_args.input_dir, "folder of photos")->required();
    batch->add_option("OUTDIR", batch_args.output_dir, "folder for the results (created if missing)")->required();
    batch->add_option("--jobs", batch_args.jobs, "worker threads (default: the number of cores)")
        ->check(CLI::Range(1u, 256u));
    add_run_settings(batch, batch_args.run);
    add_quality(batch, batch_args.quality);

    GalleryArgs gallery_args;
    CLI::App* gallery = app.add_subcommand(
        "gallery", "Draw every border style, flare type, gradient shape and legacy effect on a photo, as labelled contact sheets");
    gallery->add_option("OUTDIR", gallery_args.output_dir,
                        "folder for the sheets borders, flares, gradients and legacy (created if missing)")
        ->required();
    gallery->add_option("--photo", gallery_args.photo,
                        "photo to draw on, .png, .jpg or .jpeg (default: build/photos/coffee.png, the demo's sample, "
                        "when it is there, else a built-in scene)");
    gallery->add_option("--width", gallery_args.width, "scale each sheet down to this many pixels wide")
        ->check(CLI::Range(64u, 100000u));
    gallery->add_option("--format", gallery_args.format, "file format of the sheets, png or jpg")
        ->check(CLI::IsMember({"png", "jpg"}))
        ->capture_default_str();
    gallery->footer("Each tile is the photo scaled to 320 pixels wide with the effect drawn at that size, "
                    "labelled with the value and keyword a document or caller uses.");

    PaintArgs paint_args;
    std::string preview_text;
    CLI::App* paint = app.add_subcommand(
        "paint", "Replay a brush script (strokes and shapes of one tool) on a preview, then render it on the photo");
    paint->add_option("SCRIPT", paint_args.script, "brush script (JSON)")->required();
    paint->add_option("IN", paint_args.input, "photo to read")->required();
    paint->add_option("OUT", paint_args.output, "photo to write")->required();
    paint->add_option("--preview-size", preview_text, "the box the edited preview fits in (default 1080x1080)")
        ->check(preview_size(paint_args.preview_width, paint_args.preview_height));
    paint->add_option("--frames", paint_args.frames, "write the preview after every gesture into this folder");
    paint->add_flag("--compare", paint_args.compare, "write the original and the result side by side");
    add_quality(paint, paint_args.quality);
    paint->footer("A script is {\"tool\": NAME, \"strength\": 0..1, \"color\": {\"r\", \"g\", \"b\", \"a\"}, "
                  "\"gestures\": [...]}; a gesture is {\"type\": \"stroke\", \"points\": [[x, y], ...], \"radius\": R, "
                  "\"mode\": \"apply\" | \"erase\" | \"color-aware\"}, {\"type\": \"radial\", \"center\": [x, y], "
                  "\"radius\": R} or {\"type\": \"linear\", \"center\": [x, y], \"width\": W, \"angle\": degrees}, "
                  "in the photo's pixels. Tools: " +
                  tool_kind_list() + ".");

    LegacyArgs legacy_args;
    CLI::App* legacy = app.add_subcommand("legacy", "Run one named effect of the legacy catalogue on a photo");
    legacy->add_option("NAME", legacy_args.name, "the effect's name (see --list)");
    legacy->add_option("IN", legacy_args.input, "photo to read");
    legacy->add_option("OUT", legacy_args.output, "photo to write");
    legacy->add_flag("--list", legacy_args.list, "list every name with what it does");
    add_run_settings(legacy, legacy_args.run);
    add_quality(legacy, legacy_args.quality);

    CLI::App* info = app.add_subcommand("info", "Show the library and document-format versions and the processors");

    try {
        app.parse(argc, argv);
    } catch (const CLI::Success& done) {
        return app.exit(done);
    } catch (const CLI::ParseError& error) {
        std::fprintf(stderr, "%s\n", usage_line(app, error).c_str());
        return kUsageStatus;
    }

    set_png_level(png_level_option);
    try {
        if (*apply) return run_apply(apply_args);
        if (*check) return run_check(check_effect);
        if (*adjust) return run_adjust(adjust_args);
        if (*autofix) return run_auto(auto_args);
        if (*batch) return run_batch(batch_args);
        if (*info) return run_info();
        if (*gallery) return run_gallery(gallery_args);
        if (*paint) return run_paint(paint_args);
        if (*legacy) return run_legacy(legacy_args);
    } catch (const UsageError& error) {
        std::fprintf(stderr, "vorlite: %s\n", error.what());
        return kUsageStatus;
    } catch (const std::bad_alloc&) {
        std::fprintf(stderr, "vorlite: out of memory\n");
        return kFailureStatus;
    } catch (const std::exception& error) {
        std::fprintf(stderr, "vorlite: %s\n", error.what());
        return kFailureStatus;
    }
    return kUsageStatus;
}
