// vorlite gallery: every border style, flare type and gradient shape drawn
// on one photo, as labelled contact sheets, so that a designer can see the
// whole family at a glance and at a size relative to the picture.
#include <algorithm>
#include <cmath>
#include <cstdio>
#include <functional>
#include <string>
#include <system_error>
#include <vector>

#include "commands.h"
#include "image.h"
#include "label_font.h"

namespace vorlite::cli {
namespace {

constexpr uint32_t k_tile_width = 320;
constexpr uint32_t k_columns = 4;
constexpr uint32_t k_margin = 8;
constexpr int k_font_scale = 2;
constexpr uint32_t k_label_height = k_glyph_height * k_font_scale + 8;

// The sample photo the demo unpacks, relative to the repository root.
const std::filesystem::path k_default_photo = "build/photos/coffee.png";

struct Sample {
    std::string label;
    std::function<void(VorBitmap*)> draw;
};

// A stand-in photo when none is given and the sample photo is absent: sky,
// sun and hills, so that light and dark effects both show.
Image synthetic_scene(uint32_t width, uint32_t height) {
    Image scene(width, height);
    for (uint32_t y = 0; y < height; ++y) {
        for (uint32_t x = 0; x < width; ++x) {
            const double u = static_cast<double>(x) / width;
            const double v = static_cast<double>(y) / height;
            const double hill = 0.62 + 0.08 * std::sin(u * 9.0) + 0.05 * std::sin(u * 23.0 + 1.0);
            const double sun = std::hypot(u - 0.7, (v - 0.3) * height / width);
            uint8_t* p = scene.pixel(x, y);
            if (v > hill) {
                p[0] = static_cast<uint8_t>(40 + 50 * (1.0 - v));
                p[1] = static_cast<uint8_t>(90 + 60 * (1.0 - v));
                p[2] = 50;
            } else if (sun < 0.06) {
                p[0] = 255;
                p[1] = 236;
                p[2] = 180;
            } else {
                p[0] = static_cast<uint8_t>(110 + 120 * v);
                p[1] = static_cast<uint8_t>(150 + 80 * v);
                p[2] = static_cast<uint8_t>(230 - 20 * v);
            }
            p[3] = 255;
        }
    }
    return scene;
}

// Area-average downscale to the given width (never up).
Image scaled_down(const Image& photo, uint32_t width) {
    if (photo.width <= width) return photo;
    const double step = static_cast<double>(photo.width) / width;
    return reduced(photo, width, std::max<uint32_t>(1, static_cast<uint32_t>(photo.height / step)));
}

// Dark text from (left, top), cut off at right so that a label never runs
// into the next tile's.
void draw_label(Image& sheet, uint32_t left, uint32_t top, uint32_t right, const std::string& text) {
    uint32_t x = left;
    for (const char c : text) {
        for (int row = 0; row < k_glyph_height; ++row) {
            for (int column = 0; column < k_glyph_width; ++column) {
                if (!glyph_cell(c, column, row)) continue;
                for (int dy = 0; dy < k_font_scale; ++dy) {
                    for (int dx = 0; dx < k_font_scale; ++dx) {
                        const uint32_t px = x + static_cast<uint32_t>(column * k_font_scale + dx);
                        const uint32_t py = top + static_cast<uint32_t>(row * k_font_scale + dy);
                        if (px >= right || py >= sheet.height) continue;
                        uint8_t* p = sheet.pixel(px, py);
                        p[0] = p[1] = p[2] = 30;
                    }
                }
            }
        }
        x += (k_glyph_width + 1) * k_font_scale;
    }
}

Image contact_sheet(const Image& tile, const std::vector<Sample>& samples) {
    const uint32_t rows = static_cast<uint32_t>((samples.size() + k_columns - 1) / k_columns);
    const uint32_t cell_width = tile.width + k_margin;
    const uint32_t cell_height = tile.height + k_label_height + k_margin;
    Image sheet(k_columns * cell_width + k_margin, rows * cell_height + k_margin);
    std::fill(sheet.rgba.begin(), sheet.rgba.end(), uint8_t{245});
    for (std::size_t i = 0; i < samples.size(); ++i) {
        Image drawn = tile;
        VorBitmap bitmap = drawn.bitmap();
        samples[i].draw(&bitmap);
        const uint32_t left = k_margin + static_cast<uint32_t>(i % k_columns) * cell_width;
        const uint32_t top = k_margin + static_cast<uint32_t>(i / k_columns) * cell_height;
        for (uint32_t y = 0; y < drawn.height; ++y) {
            for (uint32_t x = 0; x < drawn.width; ++x) {
                const uint8_t* from = drawn.pixel(x, y);
                uint8_t* to = sheet.pixel(left + x, top + y);
                to[0] = from[0];
                to[1] = from[1];
                to[2] = from[2];
                to[3] = 255;
            }
        }
        draw_label(sheet, left, top + drawn.height + 4, left + drawn.width, samples[i].label);
    }
    return sheet;
}

// A border record with profile buffers of the larger side, as the named
// effects build them.
void draw_border(VorBitmap* bitmap, VorBorderStyle style, bool instant) {
    const std::size_t larger = std::max(bitmap->width, bitmap->height);
    std::vector<float> left(larger), right(larger), top(larger), bottom(larger);
    VorBorderParams p;
    VorBorderInitParams(&p);
    p.sideTune0 = 1.0;
    p.leftProfile = left.data();
    p.rightProfile = right.data();
    p.topProfile = top.data();
    p.bottomProfile = bottom.data();
    p.style = style;
    p.seed = 7;
    p.color = VorColor{250, 248, 240, 255};
    p.width = 1.0;
    p.inset = 0.3;
    p.shadowAngle = 45.0;
    // The side styles take their width as a share of width + height, as
    // the named effects set them.
    switch (style) {
        case VOR_BORDER_BULGE:
            p.width = 0.05;
            p.inset = 0.5;
            p.sideTune3 = 0.0;
            break;
        case VOR_BORDER_TORN:
            p.width = 0.02;
            p.sideTune1 = 0.015;
            p.sideTune2 = 0.5;
            break;
        case VOR_BORDER_TORN_2:
            p.width = 0.04;
            p.sideTune1 = 0.018;
            p.sideTune2 = 0.4;
            break;
        case VOR_BORDER_RECT:
            p.width = 0.021;
            break;
        case VOR_BORDER_ROUND:
            p.width = 0.025;
            break;
        case VOR_BORDER_GLIMMO:
            p.width = 0.03;
            break;
        default:
            break;
    }
    if (style == VOR_BORDER_VIGNETTE) {
        p.color = VorColor{0, 0, 0, 230};
        p.vignetteScale = 0.45 * (bitmap->width + bitmap->height) / 2.0;
    } else if (style == VOR_BORDER_SHADOW || style == VOR_BORDER_GLIMMO) {
        p.color = VorColor{20, 20, 20, 255};
    }
    if (instant) {
        VorBordersInstant(bitmap, &p);
    } else {
        VorBorders(bitmap, &p);
    }
}

// "7 bulge": the value a caller passes and the keyword a document uses.
std::string numbered(int32_t value, const char* keyword) { return std::to_string(value) + " " + keyword; }

std::vector<Sample> border_samples() {
    const char* keywords[] = {"halftone", "lines", "smooth", "shadow", "fade",     "rough",   "bulge",     "torn",
                              "torn_2",   "rect",  "round",  "glimmo", "hard_rand", "instant", "vignette", "viewfinder"};
    std::vector<Sample> samples;
    for (int32_t style = 1; style <= 16; ++style) {
        // VorBorders draws nothing for "instant": its print has its own entry point.
        const bool instant = style == VOR_BORDER_INSTANT;
        samples.push_back({numbered(style, keywords[style - 1]),
                           [style, instant](VorBitmap* b) { draw_border(b, style, instant); }});
    }
    return samples;
}

// One flare of each type, placed and sized so that its shape fills a good
// part of the tile: the compact shapes near the middle and larger, the
// whole-image ones as they come. Suns and stars are warm white, lens
// ghosts a cool tint, light leaks orange.
struct FlareSetting {
    int32_t type;
    const char* keyword;
    float dx, dy, size, scale;
    VorColor color;
};

constexpr VorColor k_sun{255, 240, 210, 255};
constexpr VorColor k_ghost{170, 210, 255, 230};
constexpr VorColor k_leak{255, 170, 80, 235};

constexpr FlareSetting k_flares[] = {
    {VOR_FLARE_SINC, "sinc", 0.0f, 0.0f, 1.0f, 0.6f, k_sun},
    {VOR_FLARE_GAUSSIAN_THING, "gaussianThing", 0.2f, 0.1f, 0.8f, 1.0f, k_sun},
    {VOR_FLARE_GAUSSIAN_THING_2, "gaussianThing2", 0.2f, 0.1f, 0.8f, 1.0f, k_sun},
    {VOR_FLARE_GAUSSIAN_THING_3, "gaussianThing3", 0.0f, 0.1f, 0.8f, 1.0f, k_sun},
    {VOR_FLARE_GAUSSIAN_THING_4, "gaussianThing4", 0.0f, 0.0f, 0.45f, 1.0f, k_sun},
    {VOR_FLARE_ANGLE_GAUSSIAN, "angleGaussian", 0.3f, -0.4f, 0.5f, 1.0f, k_sun},
    {VOR_FLARE_STARDOM, "stardom", 0.3f, -0.4f, 0.5f, 1.0f, k_sun},
    {VOR_FLARE_LOBES, "lobes", 0.0f, 0.0f, 0.6f, 1.0f, k_sun},
    {VOR_FLARE_NONE, "(no keyword)", 0.0f, 0.0f, 0.6f, 1.0f, k_sun},
    {VOR_FLARE_STRIPE, "stripe", -0.4f, 0.0f, 0.35f, 1.0f, k_leak},
    {VOR_FLARE_STRIPE_2, "stripe2", 0.0f, -0.5f, 0.35f, 1.0f, k_leak},
    {VOR_FLARE_DIAMOND, "dimondFlare", 0.0f, 0.0f, 0.6f, 1.0f, k_ghost},
    {VOR_FLARE_CROSS, "crossFlare", 0.3f, -0.4f, 0.5f, 1.0f, k_sun},
    {VOR_FLARE_CORNERS, "cornerFlares", 0.0f, 0.0f, 0.5f, 1.0f, k_leak},
    {VOR_FLARE_FINGER, "fingerFlare", 0.0f, 0.0f, 0.5f, 1.0f, k_leak},
    {VOR_FLARE_BLOB_FLARE, "blobFlare", 0.0f, 0.0f, 0.6f, 1.0f, k_ghost},
    {VOR_FLARE_BLAH, "blah", -0.5f, -0.6f, 0.8f, 1.0f, k_sun},
    {VOR_FLARE_BLOB, "blob", 0.0f, 0.0f, 0.7f, 1.0f, k_ghost},
    {VOR_FLARE_BLOB_2, "blob2", 0.0f, 0.0f, 0.7f, 1.0f, k_ghost},
};

std::vector<Sample> flare_samples() {
    std::vector<Sample> samples;
    for (const FlareSetting& f : k_flares) {
        samples.push_back({numbered(f.type, f.keyword), [f](VorBitmap* b) {
                               VorFlare(b, f.scale, &f.color, f.type, f.dx, f.dy, f.size, f.size, VOR_BLEND_SCREEN);
                           }});
    }
    samples.push_back({"ring", [](VorBitmap* b) {
                           const float size = static_cast<float>(b->width + b->height);
                           VorRingFlare(b, 0.4f * b->width, 0.45f * b->height, 0.08f * size, &k_ghost, VOR_BLEND_SCREEN);
                       }});
    samples.push_back({"corvale", [](VorBitmap* b) {
                           VLPLRunOptions o;
                           VorEffectInitParams(&o);
                           VorFlareLegacyCorvale(b, &o);
                       }});
    samples.push_back({"emberly", [](VorBitmap* b) {
                           VLPLRunOptions o;
                           VorEffectInitParams(&o);
                           VorFlareLegacyEmberly(b, &o);
                       }});
    return samples;
}

void draw_gradient(VorBitmap* bitmap, int32_t shape) {
    VorGradient g;
    if (!VorGradientBuild(&g, 3, 2)) return;
    g.colorStops[0] = {{255, 170, 60, 255}, 0.0};
    g.colorStops[1] = {{230, 60, 120, 255}, 50.0};
    g.colorStops[2] = {{40, 40, 160, 255}, 100.0};
    g.opacityStops[0] = {0.85, 0.0};
    g.opacityStops[1] = {0.85, 100.0};
    VorGradientShapeParams p;
    VorGradientShapeParamsInit(&p);
    p.shape = shape;
    p.angle = shape == VOR_GRADIENT_RADIAL ? 0.0 : -0.6;
    p.xCenter = shape == VOR_GRADIENT_RADIAL ? 0.7 : 0.0;
    p.yCenter = shape == VOR_GRADIENT_RADIAL ? 0.3 : 0.0;
    p.vignetteScale = 0.7;
    VorGradientApply(bitmap, &p, &g, VOR_BLEND_OVERLAY, 1.0);
    VorGradientFree(&g);
}

std::vector<Sample> gradient_samples() {
    const char* keywords[] = {"linear", "radial", "linearVignette"};
    std::vector<Sample> samples;
    for (int32_t shape = VOR_GRADIENT_LINEAR; shape <= VOR_GRADIENT_LINEAR_VIGNETTE; ++shape) {
        samples.push_back({numbered(shape, keywords[shape]), [shape](VorBitmap* b) { draw_gradient(b, shape); }});
    }
    return samples;
}

// Every effect of the legacy catalogue, borders enabled, seed 1.
std::vector<Sample> legacy_samples() {
    std::vector<Sample> samples;
    for (const LegacyEffect& effect : legacy_effects()) {
        const std::string name = effect.name;
        samples.push_back({name, [name](VorBitmap* b) {
                               VLPLRunOptions o;
                               VorEffectInitParams(&o);
                               o.seed = 1;
                               o.bordersEnabled = 1;
                               run_legacy_effect(name, b, o);
                           }});
    }
    return samples;
}

}  // namespace

int run_gallery(const GalleryArgs& args) {
    if (args.photo) require_format(*args.photo);
    Image photo;
    if (args.photo) {
        photo = read_image(*args.photo);
    } else if (std::filesystem::exists(k_default_photo)) {
        photo = read_image(k_default_photo);
    } else {
        photo = synthetic_scene(960, 640);
    }
    std::error_code error;
    std::filesystem::create_directories(args.output_dir, error);
    if (error) throw Failure(args.output_dir.string() + ": cannot create the folder (" + error.message() + ")");
    const Image tile = scaled_down(photo, k_tile_width);
    const std::pair<const char*, std::vector<Sample>> families[] = {
        {"borders", border_samples()},
        {"flares", flare_samples()},
        {"gradients", gradient_samples()},
        {"legacy", legacy_samples()}};
    for (const auto& [name, samples] : families) {
        const std::filesystem::path out = args.output_dir / (std::string(name) + "." + args.format);
        const Image sheet = contact_sheet(tile, samples);
        write_image(args.width ? scaled_down(sheet, *args.width) : sheet, out, kDefaultQuality);
        std::printf("%s\n", out.string().c_str());
    }
    return 0;
}

}  // namespace vorlite::cli
