// Brush scripts read, checked and replayed through the tool engine.
#include "paint_session.h"

#include <algorithm>
#include <cmath>
#include <cstdio>
#include <cstring>
#include <limits>

#include "check.h"

namespace vorlite::cli {
namespace {

constexpr ToolKind kToolKinds[] = {
    {"desaturate-except", 1, true, true}, {"blur", 2, false, true},      {"blur-brush", 3, true, true},
    {"red-eye", 4, true, true},           {"whiten", 5, true, true},     {"darken", 6, true, true},
    {"tint-warm", 7, false, true},        {"tint-amber", 8, false, true}, {"tint-rose", 9, false, true},
    {"sharpen", 10, false, true},         {"soften", 11, false, true},   {"paint", 12, true, false},
};

constexpr std::size_t kMaxPoints = 100000;
constexpr std::size_t kMaxGestures = 10000;

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
            stroke.mode = kStrokeApply;
        } else if (name == "erase") {
            stroke.mode = kStrokeErase;
        } else if (name == "color-aware" && tool.kind == 1) {
            stroke.mode = kStrokeColourAware;
        } else {
            check.fail(where + ".mode", "unknown mode \"" + name + "\" (apply, erase" +
                                            (tool.kind == 1 ? ", color-aware)" : ")"));
        }
    }
    if (yajl_val colour = check.member(g, "color")) {
        if (stroke.mode != kStrokeColourAware) check.fail(where + ".color", "a fixed colour belongs to a color-aware stroke");
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

}  // namespace

Script parse_script(std::string_view text, const std::string& label, uint32_t width, uint32_t height,
                    Gestures wanted) {
    const Checker check(label, width, height);
    text = text.substr(0, std::min(text.size(), text.find('\0')));
    if (auto error = json_syntax_error(text)) check.fail("", *error);
    const std::string terminated(text);
    const JsonTree tree(yajl_tree_parse(terminated.c_str(), nullptr, 0));
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
    if (gestures == nullptr || !YAJL_IS_ARRAY(gestures) ||
        (YAJL_GET_ARRAY(gestures)->len == 0 && wanted == Gestures::required)) {
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

Image preview_of(const Image& photo, uint32_t box_width, uint32_t box_height) {
    const double scale = std::min({1.0, static_cast<double>(box_width) / photo.width,
                                   static_cast<double>(box_height) / photo.height});
    if (scale >= 1.0) return photo;
    const auto width = std::max<uint32_t>(1, static_cast<uint32_t>(std::lround(photo.width * scale)));
    const auto height = std::max<uint32_t>(1, static_cast<uint32_t>(std::lround(photo.height * scale)));
    return reduced(photo, width, height);
}

std::string tool_kind_list() {
    std::string names;
    for (const ToolKind& kind : kToolKinds) names += std::string(names.empty() ? "" : ", ") + kind.name;
    return names;
}

Session::Session(const Script& script, const Image& preview, double scale)
    : image_(preview), full_(preview.width, preview.height), mask_(preview.width, preview.height), shown_(preview),
      scale_(scale) {
    VorToolDrawParamsInit(&params_);
    VorToolDrawStateInit(&state_);
    VorToolStrokeInit(&stroke_);
    params_.kind = script.tool->kind;
    params_.strength = script.strength;
    if (script.has_colour) params_.color = script.colour;
    state_.kind = params_.kind;
    if (script.has_colour) state_.color = script.colour;
    VorBitmap image = image_.bitmap(), full = full_.bitmap(), mask = mask_.bitmap(), shown = shown_.bitmap();
    VorToolInit(&image, &full, &mask, &params_, &state_);
    VorToolRenderPreview(&shown, &image, &full, &mask, nullptr);
}

void Session::play(const Gesture& gesture) {
    if (const auto* stroke = std::get_if<Stroke>(&gesture)) {
        begin_stroke(*stroke);
        for (std::size_t i = 0; i < stroke->points.size(); ++i) touch(stroke->points[i], i + 1 == stroke->points.size());
    } else {
        play_shape(std::get<Shape>(gesture));
    }
}

VorPoint Session::on_preview(VorPoint p) const {
    return VorPoint{static_cast<float>(p.x * scale_), static_cast<float>(p.y * scale_)};
}

void Session::begin_stroke(const Stroke& settings) {
    points_.clear();
    VorToolStrokeInit(&stroke_);
    stroke_.radius = settings.radius * scale_;
    stroke_.mode = settings.mode;
    stroke_.useFixedColor = settings.fixed ? 1 : 0;
    stroke_.fixedColor = settings.colour;
}

// The touch-down dab reports no rectangle; the host pads the touch the way
// the engine pads a segment. A lift is flagged on the segment it draws; a
// touch that is lifted where it went down draws its dab, then finishes.
Box Session::touch(VorPoint point, bool last) {
    const bool first = points_.empty();
    points_.push_back(on_preview(point));
    stroke_.points = points_.data();
    stroke_.count = static_cast<uint32_t>(points_.size());
    stroke_.finished = last && !first ? 1 : 0;
    VorPoint low = points_.back(), high = points_.back();
    if (first) {
        const float margin = std::ceil(static_cast<float>(stroke_.radius + stroke_.radius));
        low.x -= margin;
        low.y -= margin;
        high.x += margin;
        high.y += margin;
    }
    VorBitmap image = image_.bitmap(), mask = mask_.bitmap();
    VorToolDrawStrokeOutRect(&image, &mask, &stroke_, &params_, &state_, &low, &high);
    stroke_.nextIndex = stroke_.count;
    const Box box = render_box(low, high);
    if (last && first) {
        stroke_.finished = 1;
        VorToolDrawStroke(&image, &mask, &stroke_, &params_, &state_);
    }
    return box;
}

void Session::play_shape(const Shape& gesture) {
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
Box Session::render_box(VorPoint low, VorPoint high) {
    const auto whole = [](float v) {
        const float limit = 1e9f;
        return static_cast<int32_t>(std::clamp(v, -limit, limit));
    };
    const Box box{whole(std::floor(low.x)), whole(std::floor(low.y)), whole(std::ceil(high.x)),
                  whole(std::ceil(high.y))};
    VorBitmap image = image_.bitmap(), full = full_.bitmap(), mask = mask_.bitmap(), shown = shown_.bitmap();
    VorToolRenderPreviewBox(&shown, &image, &full, &mask, box.x0, box.y0, box.x1, box.y1, nullptr);
    return box;
}

// The mask is the host's to bring to the photo's size; the engine then
// renders the edit on the photo itself.
void Session::render_on(Image& photo) {
    const Image mask = mask_.width == photo.width && mask_.height == photo.height
                           ? mask_
                           : enlarged(mask_, photo.width, photo.height);
    VorBitmap bitmap = photo.bitmap();
    const VorBitmap mask_bitmap{const_cast<uint8_t*>(mask.rgba.data()), mask.width, mask.height};
    VorToolRenderHiRes(&bitmap, &mask_bitmap, &params_, &state_);
}

}  // namespace vorlite::cli
