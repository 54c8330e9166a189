// legacy: one named effect of the library's legacy catalogue on a photo,
// run through the "legacyProcessor" adapter as a document would.
#include <cstdio>
#include <string>

#include "commands.h"
#include "effect.h"
#include "image.h"

namespace vorlite::cli {

const std::vector<LegacyEffect>& legacy_effects() {
    static const std::vector<LegacyEffect> effects = {
        {"mar_tessaBorder", "cream round frame with six torn, translucent edges", true},
        {"kip_coolBorder", "white bulging frame", true},
        {"veskBorder", "frame with today's date in dot-matrix type", true},
        {"skarnBorder", "black fade from every edge", true},
        {"nerioBorder", "thin white round frame", true},
        {"kvantBorder", "thin black round frame", true},
        {"holmvaleBorder", "white round frame with six torn edges", true},
        {"duskoBorder", "black torn then round frame", true},
        {"rubraBorder", "film-edge frame printed with its edge markings", true},
        {"bi_chromeBorder", "white torn frame", true},
        {"pallorBorder", "white round frame with six deep torn edges", true},
        {"corvaleBorder", "smooth white frame", true},
        {"emberlyBorder", "black fade with wide corners", true},
        {"terrowBorder", "grunge frame of brushed dark ink", true},
        {"zenitBorder", "grunge frame of a film strip", true},
        {"old_kvantBorder", "white round frame with six translucent torn edges", true},
        {"lira_griffinBorder", "grunge frame of a burnt print", true},
        {"tawnetBorder", "grunge frame of a worn paper print", true},
        {"narwBorder", "film compact's glowing date-code stamp", true},
        {"kairoBorder", "autofocus finder: focus marks and exposure read-out", true},
        {"colosBorder", "travel camera's stamp of a place and its position", true},
        {"lanaiBorder", "plain date stamp with today's date", true},
        {"claretBorder", "digital compact's screen: battery, shots left, exposure", true},
        {"umbraBorder", "camcorder viewfinder: REC, corner marks and time code", true},
        {"corvaleFlare", "preset flare", false},
        {"emberlyFlare", "preset flare", false},
        {"soft_focus", "soft focus", false},
        {"mar_tessaAutoColors", "levels faded toward a warm cream", false},
        {"glimmoBWBorder", "grey then white rectangular frame (drawn even without borders)", false},
        {"glimmoTintypeBorder", "black tintype plate edge (drawn even without borders)", false},
        {"glimmoTintypeColorMatrixTransform", "brown-toned tintype monochrome", false},
        {"glimmoTintypeDiamondSquare", "mottled tintype plate texture", false},
        {"glimmoVintageColorMatrixTransform", "faded warm vintage colours", false},
        {"murmelGrittyPSSat", "gritty black and white", false},
        {"murmelGrittyDots", "gritty specks", false},
        {"murmelBWPSSat", "black and white", false},
        {"murmelCinematicPSSat", "cinematic black and white", false},
        {"clarityEnhance", "local contrast", false},
    };
    return effects;
}

bool run_legacy_effect(const std::string& name, VorBitmap* bitmap, const VLPLRunOptions& options) {
    const std::string text = "{\"legacyName\": \"" + name + "\"}";
    const JsonTree parameters(yajl_tree_parse(text.c_str(), nullptr, 0));
    return VLPLRunLegacyProcessor(parameters.get(), bitmap, &options) != 0;
}

int run_legacy(const LegacyArgs& args) {
    if (args.list) {
        for (const LegacyEffect& effect : legacy_effects()) {
            std::printf("%-34s %s%s\n", effect.name, effect.description, effect.border ? " [border]" : "");
        }
        return 0;
    }
    if (args.name.empty() || args.input.empty() || args.output.empty()) {
        throw UsageError("legacy: give NAME IN OUT, or --list");
    }
    bool known = false;
    for (const LegacyEffect& effect : legacy_effects()) known = known || args.name == effect.name;
    if (!known) throw UsageError("legacy: unknown effect \"" + args.name + "\" (vorlite legacy --list shows them)");
    require_format(args.input);
    require_format(args.output);
    Image image = read_image(args.input);
    VorBitmap bitmap = image.bitmap();
    const VLPLRunOptions options = args.run.options();
    if (!run_legacy_effect(args.name, &bitmap, options)) {
        throw Failure(args.input.string() + ": the effect " + args.name + " did not run");
    }
    write_image(image, args.output, args.quality);
    return 0;
}

}  // namespace vorlite::cli
