// Brush scripts and their replay through the library's tool engine, the way
// a touch screen drives it: the edit is made on a downscaled preview, each
// touch re-rendering only the rectangle it reports; the mask is then
// enlarged to the photo and the edit rendered at full resolution. Shared by
// `vorlite paint` and the browser page, so that a gesture painted in one
// gives the bytes the other replays.
#pragma once

#include <cstdint>
#include <string>
#include <string_view>
#include <variant>
#include <vector>

#include "image.h"
#include "zentra_vorlite.h"

namespace vorlite::cli {

// The engine's tool kinds by the names a script uses.
struct ToolKind {
    const char* name;
    int32_t kind;
    bool strokes;  // edited with a brush
    bool shapes;   // edited with radial or linear shapes
};

inline constexpr int32_t kStrokeApply = 1;
inline constexpr int32_t kStrokeErase = 2;
inline constexpr int32_t kStrokeColourAware = 3;

struct Stroke {
    std::vector<VorPoint> points;  // in the photo's pixels
    double radius = 0.0;
    int32_t mode = kStrokeApply;
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

// The tool names, comma-separated, for help texts.
std::string tool_kind_list();

// Reads a script for a photo of width x height. Every problem throws
// UsageError as "LABEL: where: what". A script for the browser's live
// session may come without gestures yet.
enum class Gestures { required, optional };
Script parse_script(std::string_view text, const std::string& label, uint32_t width, uint32_t height,
                    Gestures gestures = Gestures::required);

// The preview a phone would edit: the photo fitted inside the box, its
// proportions kept, never enlarged.
Image preview_of(const Image& photo, uint32_t box_width, uint32_t box_height);

// The rectangle of the preview a touch re-rendered, corners included.
struct Box {
    int32_t x0 = 0, y0 = 0, x1 = 0, y1 = 0;
};

// One tool use on the preview, in the engine's calling order.
class Session {
public:
    // scale: preview pixels per photo pixel.
    Session(const Script& script, const Image& preview, double scale);

    // A whole recorded gesture.
    void play(const Gesture& gesture);

    // A stroke as its touches arrive: the settings (its points unused), then
    // every touch in the photo's pixels, the lift flagged as the last. Each
    // touch draws the segment that ends there and returns the box it
    // re-rendered.
    void begin_stroke(const Stroke& settings);
    Box touch(VorPoint point, bool last);

    // The edit rendered on the photo at full resolution, the mask enlarged
    // to it first.
    void render_on(Image& photo);

    const Image& shown() const { return shown_; }
    const Image& mask() const { return mask_; }

private:
    VorPoint on_preview(VorPoint p) const;
    void play_shape(const Shape& gesture);
    Box render_box(VorPoint low, VorPoint high);

    Image image_, full_, mask_, shown_;
    double scale_;
    VorToolDrawParams params_;
    VorToolDrawState state_;
    VorToolStroke stroke_;
    std::vector<VorPoint> points_;
};

}  // namespace vorlite::cli
