// apply, check and info.
#include "commands.h"

#include <cstdio>

#include "effect.h"
#include "image.h"

namespace vorlite::cli {

VLPLRunOptions RunSettings::options() const { return run_options(seed, strength, !no_borders); }

int run_apply(const ApplyArgs& args) {
    require_format(args.input);
    require_format(args.output);
    const VLPLRunOptions options = args.run.options();
    const Effect effect = Effect::load(args.effect, options);
    Image image = read_image(args.input);
    std::optional<Image> original;
    if (args.compare) original = image;
    effect.run(image, options, args.input);
    // Two calls rather than one conditional expression, which would copy
    // the photo to give both branches one type.
    if (args.compare) {
        write_image(side_by_side(*original, image), args.output, args.quality);
    } else {
        write_image(image, args.output, args.quality);
    }
    return 0;
}

int run_check(const std::filesystem::path& path) {
    VLPLRunOptions options;
    VorEffectInitParams(&options);
    const Verdict verdict = check_effect(read_file(path), options);
    if (verdict.error) throw Failure(path.string() + ": " + *verdict.error);
    std::string list;
    for (const std::string& name : verdict.names) list += (list.empty() ? "" : ", ") + name;
    std::printf("%s: runs; %zu processor%s%s%s%s\n", path.string().c_str(), verdict.names.size(),
                verdict.names.size() == 1 ? "" : "s", list.empty() ? "" : " (", list.c_str(),
                list.empty() ? "" : ")");
    return 0;
}

int run_info() {
    uint32_t library[3];
    uint32_t format[3];
    VorLiteVersion(library);
    VorLiteProclistVersion(format);
    std::printf("libzentra_vorlite %u.%u.%u\n", library[0], library[1], library[2]);
    std::printf("effect document format %u.%u.%u\n", format[0], format[1], format[2]);
    std::printf("processors:");
    for (std::string_view name : kProcessorNames) std::printf(" %.*s", static_cast<int>(name.size()), name.data());
    std::printf("\n");
    return 0;
}

}  // namespace vorlite::cli
