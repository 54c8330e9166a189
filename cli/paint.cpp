// paint: replays a brush script through the library's tool engine the way
// a touch screen drives it. The edit is made on a downscaled preview, each
// touch re-rendering only the rectangle it reports; the mask is then
// enlarged to the photo and the edit rendered at full resolution.
#include <algorithm>
#include <cmath>
#include <cstdio>
#include <cstring>
#include <limits>
#include <string>
#include <variant>
#include <vector>

#include "commands.h"
#include "effect.h"
#include "image.h"

namespace vorlite::cli {
namespace {

// The engine's tool kinds by the names a script uses.
struct ToolKind {
    const char* name;
    int32_t kind;
    bool strokes;  // edited with a brush
    bool shapes;   // edited with radial or linear shapes
};

constexpr ToolKind kToolKinds[] = {
    {"desaturate-except", 1, true, true}, {"blur", 2, false, true},      {"blur-brush", 3, true, true},
    {"red-eye", 4, true, true},           {"whiten", 5, true, true},     {"darken", 6, true, true},
    {"tint-warm", 7, false, true},        {"tint-amber", 8, false, true}, {"tint-rose", 9, false, true},
    {"sharpen", 10, false, true},         {"soften", 11, false, true},   {"paint", 12, true, false},
};

constexpr int32_t kApply = 1;
constexpr int32_t kErase = 2;
constexpr int32_t kColourAware = 3;
constexpr std::size_t kMaxPoints = 100000;
constexpr std::size_t kMaxGestures = 10000;

struct Stroke {
    std::vector<VorPoint> points;  // in the photo's pixels
    double radius = 0.0;
    int32_t mode = kApply;
    bool fixed = false;
    VorColor colour{255, 255, 255, 255};
};

struct Shape {
    int32_t kind = 0;  // 1 radial, 2 linear
    VorPoint centre{0.0f, 0.0f};
    double size = 0.0;
    double angle = 0.0;  // degrees
};

using Gesture = std::variant<Stroke, Shape>;

struct Script {
    const ToolKind* tool = nullptr;
    double strength = 1.0;
    bool has_colour = false;
    VorColor colour{255, 255, 255, 255};
    std::vector<Gesture> gestures;
};

// Every problem of a script is reported as "SCRIPT: where: what".
class Checker {
public:
    Checker(std::string file, uint32_t width, uint32_t height) : file_(std::move(file)), width_(width), height_(height) {}

    [[noreturn]] void fail(const std::string& where, const std::string& what) const {
        throw UsageError(file_ + ": " + (where.empty() ? "" : where + ": ") + what);
    }

    void only_keys(yajl_val object, const std::string& where, std::initializer_list<const char*> keys) const {
        const auto* o = &object->u.object;
        for (std::size_t i = 0; i < o->len; ++i) {
            const bool known = std::any_of(keys.begin(), keys.end(),
                                           [&](const char* key) { return std::strcmp(key, o->keys[i]) == 0; });
            if (!known) fail(where, std::string("unknown key \"") + o->keys[i] + "\"");
        }
    }

    yajl_val member(yajl_val object, const char* key) const {
        const auto* o = &object->u.object;
        for (std::size_t i = 0; i < o->len; ++i) {
            if (std::strcmp(o->keys[i], key) == 0) return o->values[i];
        }
        return nullptr;
    }

    double number(yajl_val value, const std::string& where, double low, double high) const {
        if (value == nullptr || !YAJL_IS_NUMBER(value)) fail(where, "expected a number, got " + shown(value));
        const double v = YAJL_GET_DOUBLE(value);
        if (!std::isfinite(v) || v < low || v > high) {
            fail(where, shown(value) + " is not in " + range(low, high));
        }
        return v;
    }

    std::string text(yajl_val value, const std::string& where) const {
        if (value == nullptr || !YAJL_IS_STRING(value)) fail(where, "expected a string, got " + shown(value));
        return YAJL_GET_STRING(value);
    }

    // A point [x, y] inside the photo, pixel centres on whole numbers.
    VorPoint point(yajl_val value, const std::string& where) const {
        if (value == nullptr || !YAJL_IS_ARRAY(value) || YAJL_GET_ARRAY(value)->len != 2) {
            fail(where, "expected a point [x, y], got " + shown(value));
        }
        const double x = number(YAJL_GET_ARRAY(value)->values[0], where + "[0]", -infinity(), infinity());
        const double y = number(YAJL_GET_ARRAY(value)->values[1], where + "[1]", -infinity(), infinity());
        if (x < 0.0 || y < 0.0 || x > width_ - 1.0 || y > height_ - 1.0) {
            fail(where, shown(value) + " lies outside the " + std::to_string(width_) + " x " + std::to_string(height_) +
                            " photo");
        }
        return VorPoint{static_cast<float>(x), static_cast<float>(y)};
    }

    VorColor colour(yajl_val value, const std::string& where) const {
        VorColor c{255, 255, 255, 255};
        if (value == nullptr || !VLPLColorFromColorVal(value, &c)) {
            fail(where, "expected a colour {\"r\", \"g\", \"b\", \"a\"} of integers 0..255, got " + shown(value));
        }
        return c;
    }

    // The longest brush or shape that still means something on this photo.
    double longest() const { return 4.0 * std::max(width_, height_); }

private:
    static double infinity() { return std::numeric_limits<double>::infinity(); }
    static std::string shown(yajl_val value) { return value == nullptr ? "nothing" : describe_json(value); }
    static std::string range(double low, double high) {
        char text[96];
        std::snprintf(text, sizeof text, "%g..%g", low, high);
        return text;
    }

    std::string file_;
    uint32_t width_, height_;
};

const ToolKind& tool_named(const Checker& check, const std::string& name) {
    for (const ToolKind& kind : kToolKinds) {
        if (name == kind.name) return kind;
    }
    std::string names;
    for (const ToolKind& kind : kToolKinds) names += std::string(names.empty() ? "" : ", ") + kind.name;
    check.fail("tool", "unknown tool \"" + name + "\" (one of " + names + ")");
}

Stroke stroke_from(const Checker& check, yajl_val g, const std::string& where, const ToolKind& tool) {
    if (!tool.strokes) check.fail(where, std::string("the ") + tool.name + " tool is edited with radial or linear shapes");
    check.only_keys(g, where, {"type", "points", "radius", "mode", "color"});
    Stroke stroke;
    stroke.radius = check.number(check.member(g, "radius"), where + ".radius", 0.5, check.longest());
    if (yajl_val mode = check.member(g, "mode")) {
        const std::string name = check.text(mode, where + ".mode");
        if (name == "apply") {
            stroke.mode = kApply;
        } else if (name == "erase") {
            stroke.mode = kErase;
        } else if (name == "color-aware" && tool.kind == 1) {
            stroke.mode = kColourAware;
        } else {
            check.fail(where + ".mode", "unknown mode \"" + name + "\" (apply, erase" +
                                            (tool.kind == 1 ? ", color-aware)" : ")"));
        }
    }
    if (yajl_val colour = check.member(g, "color")) {
        if (stroke.mode != kColourAware) check.fail(where + ".color", "a fixed colour belongs to a color-aware stroke");
        stroke.fixed = true;
        stroke.colour = check.colour(colour, where + ".color");
    }
    const yajl_val points = check.member(g, "points");
    if (points == nullptr || !YAJL_IS_ARRAY(points) || YAJL_GET_ARRAY(points)->len == 0) {
        check.fail(where + ".points", "expected a list of at least one point [x, y]");
    }
    const std::size_t count = YAJL_GET_ARRAY(points)->len;
    if (count > kMaxPoints) check.fail(where + ".points", "more than " + std::to_string(kMaxPoints) + " points");
    for (std::size_t i = 0; i < count; ++i) {
        stroke.points.push_back(
            check.point(YAJL_GET_ARRAY(points)->values[i], where + ".points[" + std::to_string(i) + "]"));
    }
    return stroke;
}

Shape shape_from(const Checker& check, yajl_val g, const std::string& where, const ToolKind& tool, bool radial) {
    if (!tool.shapes) check.fail(where, std::string("the ") + tool.name + " tool is edited with strokes");
    Shape shape;
    shape.kind = radial ? 1 : 2;
    if (radial) {
        check.only_keys(g, where, {"type", "center", "radius"});
        shape.size = check.number(check.member(g, "radius"), where + ".radius", 0.0, check.longest());
    } else {
        check.only_keys(g, where, {"type", "center", "width", "angle"});
        shape.size = check.number(check.member(g, "width"), where + ".width", 0.0, check.longest());
        if (yajl_val angle = check.member(g, "angle")) shape.angle = check.number(angle, where + ".angle", -360.0, 360.0);
    }
    shape.centre = check.point(check.member(g, "center"), where + ".center");
    return shape;
}

Script parse_script(const std::filesystem::path& path, uint32_t width, uint32_t height) {
    const Checker check(path.string(), width, height);
    std::string text = read_file(path);
    if (auto error = json_syntax_error(text)) check.fail("", *error);
    text.resize(std::min(text.size(), text.find('\0')));
    const JsonTree tree(yajl_tree_parse(text.c_str(), nullptr, 0));
    const yajl_val root = tree.get();
    if (root == nullptr || !YAJL_IS_OBJECT(root)) check.fail("", "expected an object with \"tool\" and \"gestures\"");
    check.only_keys(root, "", {"tool", "strength", "color", "gestures"});
    Script script;
    script.tool = &tool_named(check, check.text(check.member(root, "tool"), "tool"));
    if (yajl_val strength = check.member(root, "strength")) script.strength = check.number(strength, "strength", 0.0, 1.0);
    if (yajl_val colour = check.member(root, "color")) {
        script.has_colour = true;
        script.colour = check.colour(colour, "color");
    }
    const yajl_val gestures = check.member(root, "gestures");
    if (gestures == nullptr || !YAJL_IS_ARRAY(gestures) || YAJL_GET_ARRAY(gestures)->len == 0) {
        check.fail("gestures", "expected a list of at least one stroke or shape");
    }
    if (YAJL_GET_ARRAY(gestures)->len > kMaxGestures) {
        check.fail("gestures", "more than " + std::to_string(kMaxGestures) + " gestures");
    }
    for (std::size_t i = 0; i < YAJL_GET_ARRAY(gestures)->len; ++i) {
        const std::string where = "gestures[" + std::to_string(i) + "]";
        const yajl_val g = YAJL_GET_ARRAY(gestures)->values[i];
        if (!YAJL_IS_OBJECT(g)) check.fail(where, "expected an object with a \"type\"");
        const std::string type = check.text(check.member(g, "type"), where + ".type");
        if (type == "stroke") {
            script.gestures.emplace_back(stroke_from(check, g, where, *script.tool));
        } else if (type == "radial" || type == "linear") {
            script.gestures.emplace_back(shape_from(check, g, where, *script.tool, type == "radial"));
        } else {
            check.fail(where + ".type", "unknown gesture \"" + type + "\" (stroke, radial, linear)");
        }
    }
    return script;
}

// The preview a phone would edit: the photo fitted inside the box, its
// proportions kept, never enlarged.
Image preview_of(const Image& photo, uint32_t box_width, uint32_t box_height) {
    const double scale = std::min({1.0, static_cast<double>(box_width) / photo.width,
                                   static_cast<double>(box_height) / photo.height});
    if (scale >= 1.0) return photo;
    const auto width = std::max<uint32_t>(1, static_cast<uint32_t>(std::lround(photo.width * scale)));
    const auto height = std::max<uint32_t>(1, static_cast<uint32_t>(std::lround(photo.height * scale)));
    return reduced(photo, width, height);
}

// One tool use on the preview, in the engine's calling order.
class Session {
public:
    Session(const Script& script, const Image& preview, double scale)
        : script_(script), image_(preview), full_(preview.width, preview.height), mask_(preview.width, preview.height),
          shown_(preview), scale_(scale) {
        VorToolDrawParamsInit(&params_);
        VorToolDrawStateInit(&state_);
        params_.kind = script.tool->kind;
        params_.strength = script.strength;
        if (script.has_colour) params_.color = script.colour;
        state_.kind = params_.kind;
        if (script.has_colour) state_.color = script.colour;
        VorBitmap image = image_.bitmap(), full = full_.bitmap(), mask = mask_.bitmap(), shown = shown_.bitmap();
        VorToolInit(&image, &full, &mask, &params_, &state_);
        VorToolRenderPreview(&shown, &image, &full, &mask, nullptr);
    }

    void play(const Gesture& gesture) {
        if (const auto* stroke = std::get_if<Stroke>(&gesture)) {
            play_stroke(*stroke);
        } else {
            play_shape(std::get<Shape>(gesture));
        }
    }

    const Image& shown() const { return shown_; }
    const Image& mask() const { return mask_; }
    VorToolDrawParams& params() { return params_; }
    const VorToolDrawState& state() const { return state_; }

private:
    VorPoint on_preview(VorPoint p) const {
        return VorPoint{static_cast<float>(p.x * scale_), static_cast<float>(p.y * scale_)};
    }

    // Touch down, moves, and the lift with the last position: each call
    // draws the segment that ends at the newest touch.
    void play_stroke(const Stroke& gesture) {
        std::vector<VorPoint> points;
        points.reserve(gesture.points.size());
        VorToolStroke stroke;
        VorToolStrokeInit(&stroke);
        stroke.radius = gesture.radius * scale_;
        stroke.mode = gesture.mode;
        stroke.useFixedColor = gesture.fixed ? 1 : 0;
        stroke.fixedColor = gesture.colour;
        VorBitmap image = image_.bitmap(), mask = mask_.bitmap();
        for (std::size_t i = 0; i < gesture.points.size(); ++i) {
            points.push_back(on_preview(gesture.points[i]));
            stroke.points = points.data();
            stroke.count = static_cast<uint32_t>(points.size());
            stroke.finished = i + 1 == gesture.points.size() && i > 0 ? 1 : 0;
            VorPoint low = points.back(), high = points.back();
            if (i == 0) pad(&low, &high, stroke.radius);
            VorToolDrawStrokeOutRect(&image, &mask, &stroke, &params_, &state_, &low, &high);
            stroke.nextIndex = stroke.count;
            render_box(low, high);
        }
        if (gesture.points.size() == 1) {
            stroke.finished = 1;
            VorToolDrawStroke(&image, &mask, &stroke, &params_, &state_);
        }
    }

    // The touch-down dab reports no rectangle; the host pads the touch the
    // way the engine pads a segment.
    static void pad(VorPoint* low, VorPoint* high, double radius) {
        const float margin = std::ceil(static_cast<float>(radius + radius));
        low->x -= margin;
        low->y -= margin;
        high->x += margin;
        high->y += margin;
    }

    void play_shape(const Shape& gesture) {
        VorToolShape shape;
        VorToolShapeInit(&shape);
        shape.kind = gesture.kind;
        shape.center = on_preview(gesture.centre);
        shape.size = gesture.size * scale_;
        shape.angle = gesture.angle;
        VorBitmap image = image_.bitmap(), full = full_.bitmap(), mask = mask_.bitmap(), shown = shown_.bitmap();
        VorToolDrawShapeInMask(&image, &mask, &shape);
        VorToolRenderPreview(&shown, &image, &full, &mask, nullptr);
    }

    // The reported rectangle widened to whole pixels.
    void render_box(VorPoint low, VorPoint high) {
        const auto whole = [](float v) {
            const float limit = 1e9f;
            return static_cast<int32_t>(std::clamp(v, -limit, limit));
        };
        VorBitmap image = image_.bitmap(), full = full_.bitmap(), mask = mask_.bitmap(), shown = shown_.bitmap();
        VorToolRenderPreviewBox(&shown, &image, &full, &mask, whole(std::floor(low.x)), whole(std::floor(low.y)),
                                whole(std::ceil(high.x)), whole(std::ceil(high.y)), nullptr);
    }

    const Script& script_;
    Image image_, full_, mask_, shown_;
    double scale_;
    VorToolDrawParams params_;
    VorToolDrawState state_;
};

void write_frame(const Image& frame, const std::filesystem::path& dir, std::size_t number) {
    char name[32];
    std::snprintf(name, sizeof name, "frame-%03zu.png", number);
    write_image(frame, dir / name, kDefaultQuality);
}

}  // namespace

std::string tool_kind_list() {
    std::string names;
    for (const ToolKind& kind : kToolKinds) names += std::string(names.empty() ? "" : ", ") + kind.name;
    return names;
}

int run_paint(const PaintArgs& args) {
    require_format(args.input);
    require_format(args.output);
    Image photo = read_image(args.input);
    std::optional<Image> original;
    if (args.compare) original = photo;
    const Script script = parse_script(args.script, photo.width, photo.height);
    const Image preview = preview_of(photo, args.preview_width, args.preview_height);
    const double scale = static_cast<double>(preview.width) / photo.width;
    Session session(script, preview, scale);
    if (args.frames) std::filesystem::create_directories(*args.frames);
    for (std::size_t i = 0; i < script.gestures.size(); ++i) {
        session.play(script.gestures[i]);
        if (args.frames) write_frame(session.shown(), *args.frames, i + 1);
    }
    // The mask is the host's to bring to the photo's size; the engine then
    // renders the edit on the photo itself.
    const Image mask = preview.width == photo.width && preview.height == photo.height
                           ? session.mask()
                           : enlarged(session.mask(), photo.width, photo.height);
    VorBitmap bitmap = photo.bitmap();
    const VorBitmap mask_bitmap{const_cast<uint8_t*>(mask.rgba.data()), mask.width, mask.height};
    VorToolRenderHiRes(&bitmap, &mask_bitmap, &session.params(), &session.state());
    if (args.compare) {
        write_image(side_by_side(*original, photo), args.output, args.quality);
    } else {
        write_image(photo, args.output, args.quality);
    }
    return 0;
}

}  // namespace vorlite::cli
