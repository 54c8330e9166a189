// adjust and auto: the library's slider tools and automatic corrections.
#include <utility>
#include <vector>

#include "commands.h"
#include "image.h"

namespace vorlite::cli {
namespace {

using Slider = void (*)(VorBitmap*, const void*, double);

void require_any(bool any, const char* command, const char* options) {
    if (!any) throw UsageError(std::string(command) + ": nothing to do; give at least one of " + options);
}

}  // namespace

int run_adjust(const AdjustArgs& args) {
    require_format(args.input);
    require_format(args.output);
    const std::pair<const std::optional<double>&, Slider> sliders[] = {
        {args.brightness, VorToolBrightness}, {args.contrast, VorToolContrast},
        {args.warmth, VorToolWarmth}, {args.saturation, VorToolSaturation},
        {args.sharpness, VorToolSharpness}};
    bool any = false;
    for (const auto& [value, tool] : sliders) any = any || value.has_value();
    require_any(any, "adjust", "--brightness, --contrast, --saturation, --warmth, --sharpness");

    Image image = read_image(args.input);
    VorBitmap bitmap = image.bitmap();
    if (!args.sharpness) {
        // The four tone sliders alone: the library's one call, which is what
        // a phone's slider panel runs.
        VorToolAdjustBrightnessContrastWarmthSaturation(&bitmap, args.brightness.value_or(0.0),
                                                        args.contrast.value_or(0.0), args.warmth.value_or(0.0),
                                                        args.saturation.value_or(0.0));
    } else {
        for (const auto& [value, tool] : sliders) {
            if (value) tool(&bitmap, nullptr, *value);
        }
    }
    write_image(image, args.output, args.quality);
    return 0;
}

int run_auto(const AutoArgs& args) {
    require_format(args.input);
    require_format(args.output);
    require_any(args.colors || args.lab_correct || args.enhance || args.clarity, "auto",
                "--colors, --lab-correct, --enhance, --clarity");

    Image image = read_image(args.input);
    VorBitmap bitmap = image.bitmap();
    // Levels first, so the cast correction and the brightness curve see the
    // full range; local contrast last, on the finished tones.
    if (args.colors) VorAutoColorsFade(&bitmap, *args.colors);
    if (args.lab_correct) VorLabCorrect(&bitmap);
    if (args.enhance) VorAutoEnhance(&bitmap, *args.enhance);
    if (args.clarity) {
        // Local contrast makes every pixel opaque; a photo's transparency is
        // not a tone, so it is put back.
        std::vector<uint8_t> alpha(image.rgba.size() / 4);
        for (std::size_t i = 0; i < alpha.size(); ++i) alpha[i] = image.rgba[4 * i + 3];
        VorLocalContrastEnhance(&bitmap);
        for (std::size_t i = 0; i < alpha.size(); ++i) image.rgba[4 * i + 3] = alpha[i];
    }
    write_image(image, args.output, args.quality);
    return 0;
}

}  // namespace vorlite::cli
