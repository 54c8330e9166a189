// The library as the browser page's worker sees it: plain C entry points on
// the module's own memory. Documents and brush scripts go through the same
// checking and replay code as the command-line tool, so the page says what
// `vorlite check` says and exports what `vorlite apply` followed by
// `vorlite paint` writes.
#include <emscripten/emscripten.h>

#include <cstdint>
#include <cstdlib>
#include <cstring>
#include <memory>
#include <optional>
#include <string>

#include "check.h"
#include "image.h"
#include "paint_session.h"
#include "zentra_vorlite.h"

namespace {

using vorlite::cli::Image;

// The last message for the page: a diagnostic, or empty.
std::string message;
// The last image made for the page (a preview).
Image result;

struct Painting {
    vorlite::cli::Script script;
    std::unique_ptr<vorlite::cli::Session> session;
    int32_t box[4] = {0, 0, 0, 0};
};
std::optional<Painting> painting;

Image copy_of(const uint8_t* rgba, uint32_t width, uint32_t height) {
    Image image(width, height);
    std::memcpy(image.rgba.data(), rgba, image.rgba.size());
    return image;
}

}  // namespace

extern "C" {

EMSCRIPTEN_KEEPALIVE void* vw_malloc(std::size_t bytes) { return std::malloc(bytes); }
EMSCRIPTEN_KEEPALIVE void vw_free(void* p) { std::free(p); }
EMSCRIPTEN_KEEPALIVE const char* vw_message() { return message.c_str(); }

// 1 when the document runs, and the message lists its processors; 0 with
// the one-line diagnostic of `vorlite check`.
EMSCRIPTEN_KEEPALIVE int vw_check(const char* text, uint32_t seed, double strength, int borders) {
    const VLPLRunOptions options = vorlite::cli::run_options(seed, strength, borders != 0);
    const vorlite::cli::Verdict verdict = vorlite::cli::check_effect(text, options);
    if (verdict.error) {
        message = *verdict.error;
        return 0;
    }
    message.clear();
    for (const std::string& name : verdict.names) message += (message.empty() ? "" : ", ") + name;
    return 1;
}

// Runs a document on the pixels in place, as `vorlite apply` does; 0 with
// the diagnostic (the pixels then untouched) when it will not run.
EMSCRIPTEN_KEEPALIVE int vw_apply(const char* text, uint8_t* rgba, uint32_t width, uint32_t height, uint32_t seed,
                                  double strength, int borders) {
    const VLPLRunOptions options = vorlite::cli::run_options(seed, strength, borders != 0);
    const vorlite::cli::Verdict verdict = vorlite::cli::check_effect(text, options);
    if (verdict.error) {
        message = *verdict.error;
        return 0;
    }
    VLPLEffectDocument* document = VLPLLoadEffect(text);
    if (document == nullptr) {
        message = "the library did not load the document";
        return 0;
    }
    Image work = copy_of(rgba, width, height);
    VorBitmap bitmap = work.bitmap();
    const int ran = VLPLRunEffect(document, &bitmap, &options);
    VLPLUnloadEffect(&document);
    if (!ran) {
        const vorlite::cli::JsonTree tree(yajl_tree_parse(text, nullptr, 0));
        Image probe = copy_of(rgba, width, height);
        VorBitmap again = probe.bitmap();
        message = "the effect failed on this photo: " +
                  vorlite::cli::processor_error(tree.get(), &again, options).value_or("no single processor failed alone");
        return 0;
    }
    std::memcpy(rgba, work.rgba.data(), work.rgba.size());
    message.clear();
    return 1;
}

// The photo fitted inside box x box, as the tool's paint preview: the
// result's pixels, its size from vw_result_width and vw_result_height.
EMSCRIPTEN_KEEPALIVE uint8_t* vw_preview(const uint8_t* rgba, uint32_t width, uint32_t height, uint32_t box) {
    result = vorlite::cli::preview_of(copy_of(rgba, width, height), box, box);
    return result.rgba.data();
}
EMSCRIPTEN_KEEPALIVE uint32_t vw_result_width() { return result.width; }
EMSCRIPTEN_KEEPALIVE uint32_t vw_result_height() { return result.height; }

// Starts a brush session on the preview of a photo of photo_width x
// photo_height and replays the script's gestures so far (undo replays all
// but the last). 0 with the diagnostic when the script is wrong.
EMSCRIPTEN_KEEPALIVE int vw_paint_start(const char* script, const uint8_t* preview, uint32_t preview_width,
                                        uint32_t preview_height, uint32_t photo_width, uint32_t photo_height) {
    painting.reset();
    try {
        Painting p;
        p.script = vorlite::cli::parse_script(script, "script", photo_width, photo_height,
                                              vorlite::cli::Gestures::optional);
        const double scale = static_cast<double>(preview_width) / photo_width;
        p.session = std::make_unique<vorlite::cli::Session>(p.script, copy_of(preview, preview_width, preview_height),
                                                            scale);
        for (const vorlite::cli::Gesture& gesture : p.script.gestures) p.session->play(gesture);
        painting = std::move(p);
    } catch (const std::exception& error) {
        message = error.what();
        return 0;
    }
    message.clear();
    return 1;
}

// A stroke begins: radius in photo pixels, mode 1 apply, 2 erase,
// 3 colour-aware (with a fixed colour when fixed is set, as r, g, b, a).
EMSCRIPTEN_KEEPALIVE void vw_paint_stroke(double radius, int32_t mode, int fixed, uint8_t r, uint8_t g, uint8_t b,
                                          uint8_t a) {
    if (!painting) return;
    vorlite::cli::Stroke settings;
    settings.radius = radius;
    settings.mode = mode;
    settings.fixed = fixed != 0;
    settings.colour = VorColor{r, g, b, a};
    painting->session->begin_stroke(settings);
}

// A touch of the stroke, in photo pixels; the box of the preview it
// re-rendered, as x0, y0, x1, y1.
EMSCRIPTEN_KEEPALIVE const int32_t* vw_paint_touch(float x, float y, int last) {
    if (!painting) return nullptr;
    const vorlite::cli::Box box = painting->session->touch(VorPoint{x, y}, last != 0);
    painting->box[0] = box.x0;
    painting->box[1] = box.y0;
    painting->box[2] = box.x1;
    painting->box[3] = box.y1;
    return painting->box;
}

// A radial (kind 1) or linear (kind 2) shape, in photo pixels and degrees;
// the whole preview is re-rendered.
EMSCRIPTEN_KEEPALIVE void vw_paint_shape(int32_t kind, float x, float y, double size, double angle) {
    if (!painting) return;
    vorlite::cli::Shape shape;
    shape.kind = kind;
    shape.centre = VorPoint{x, y};
    shape.size = size;
    shape.angle = angle;
    painting->session->play(shape);
}

// The preview as the brush session shows it.
EMSCRIPTEN_KEEPALIVE const uint8_t* vw_paint_shown() {
    return painting ? painting->session->shown().rgba.data() : nullptr;
}

// The whole script replayed on the photo in place, exactly as `vorlite
// paint` does with a preview fitted inside box x box. 0 with the diagnostic
// (the pixels untouched) when the script is wrong.
EMSCRIPTEN_KEEPALIVE int vw_paint_render(const char* script, uint8_t* rgba, uint32_t width, uint32_t height,
                                         uint32_t box) {
    try {
        const vorlite::cli::Script parsed = vorlite::cli::parse_script(script, "script", width, height);
        Image photo = copy_of(rgba, width, height);
        const Image preview = vorlite::cli::preview_of(photo, box, box);
        vorlite::cli::Session session(parsed, preview, static_cast<double>(preview.width) / photo.width);
        for (const vorlite::cli::Gesture& gesture : parsed.gestures) session.play(gesture);
        session.render_on(photo);
        std::memcpy(rgba, photo.rgba.data(), photo.rgba.size());
    } catch (const std::exception& error) {
        message = error.what();
        return 0;
    }
    message.clear();
    return 1;
}

}  // extern "C"
