// paint: replays a brush script on a photo, optionally writing the preview
// after every gesture so a person can watch the edit build up.
#include <cstdio>
#include <string>

#include "commands.h"
#include "image.h"
#include "paint_session.h"

namespace vorlite::cli {
namespace {

void write_frame(const Image& frame, const std::filesystem::path& dir, std::size_t number) {
    char name[32];
    std::snprintf(name, sizeof name, "frame-%03zu.png", number);
    write_image(frame, dir / name, kDefaultQuality);
}

}  // namespace

int run_paint(const PaintArgs& args) {
    require_format(args.input);
    require_format(args.output);
    Image photo = read_image(args.input);
    std::optional<Image> original;
    if (args.compare) original = photo;
    const Script script = parse_script(read_file(args.script), args.script.string(), photo.width, photo.height);
    const Image preview = preview_of(photo, args.preview_width, args.preview_height);
    const double scale = static_cast<double>(preview.width) / photo.width;
    Session session(script, preview, scale);
    if (args.frames) std::filesystem::create_directories(*args.frames);
    for (std::size_t i = 0; i < script.gestures.size(); ++i) {
        session.play(script.gestures[i]);
        if (args.frames) write_frame(session.shown(), *args.frames, i + 1);
    }
    session.render_on(photo);
    if (args.compare) {
        write_image(side_by_side(*original, photo), args.output, args.quality);
    } else {
        write_image(photo, args.output, args.quality);
    }
    return 0;
}

}  // namespace vorlite::cli
