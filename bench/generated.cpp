// The generated effects: the vignette and a full-frame gradient against
// memcpy of the same bytes, and every banded frame, gradient shape and
// flare type on its own, at both sizes. Each flare is also drawn at half
// its size on the large bitmap, so that the report can tell whether its
// cost follows its work box.
#include <cmath>
#include <string>
#include <vector>

#include "runner.h"
#include "suite.h"

namespace vorlite::bench {

namespace {

using Draw = std::function<void(VorBitmap&)>;

void add_ours(const std::string& operation, const std::string& label, Draw draw) {
    for (const BitmapSize& size : kSizes) {
        add_benchmark(operation, kOurs, size, label, [size, draw](benchmark::State& state) {
            time_in_place(state, sample(size), [&draw](cv::Mat& image) {
                VorBitmap bitmap = as_bitmap(image);
                draw(bitmap);
            });
        });
    }
}

// A dark vignette reaching a little past the middle: every pixel beyond
// the clear centre takes the ramp or the full colour.
void vignette(VorBitmap& bitmap) {
    VorBorderParams p;
    VorBorderInitParams(&p);
    p.style = VOR_BORDER_VIGNETTE;
    p.color = VorColor{0, 0, 0, 200};
    p.blendMode = VOR_BLEND_MULTIPLY;
    p.vignetteScale = 0.6;
    p.stretch = 1;
    VorBorders(&bitmap, &p);
}

void banded(VorBitmap& bitmap, int32_t style) {
    const std::size_t larger = bitmap.width > bitmap.height ? bitmap.width : bitmap.height;
    std::vector<float> left(larger), right(larger), top(larger), bottom(larger);
    VorBorderParams p;
    VorBorderInitParams(&p);
    p.leftProfile = left.data();
    p.rightProfile = right.data();
    p.topProfile = top.data();
    p.bottomProfile = bottom.data();
    p.style = style;
    p.inset = 0.3;
    p.seed = 7;
    VorBorders(&bitmap, &p);
}

void gradient(VorBitmap& bitmap, int32_t shape) {
    VorGradient g;
    if (!VorGradientBuild(&g, 3, 2)) return;
    g.colorStops[0] = {{255, 170, 60, 255}, 0.0};
    g.colorStops[1] = {{230, 60, 120, 255}, 50.0};
    g.colorStops[2] = {{40, 40, 160, 255}, 100.0};
    g.opacityStops[0] = {0.8, 0.0};
    g.opacityStops[1] = {0.5, 100.0};
    VorGradientShapeParams p;
    VorGradientShapeParamsInit(&p);
    p.shape = shape;
    p.angle = 0.5;
    p.xCenter = 0.0;
    p.yCenter = 0.0;
    p.vignetteScale = 0.7;
    VorGradientApply(&bitmap, &p, &g, VOR_BLEND_OVERLAY, 1.0);
    VorGradientFree(&g);
}

// The flare types' work boxes in shape coordinates, as the interface
// documents them: the benchmark's own statement of the area a flare may
// visit, to divide its time by.
struct Range {
    double low;
    double high;
};

struct FlareBox {
    Range x;
    Range y;
};

FlareBox documented_box(int32_t type) {
    switch (type) {
        case VOR_FLARE_SINC: return {{-15.0, 15.0}, {-15.0, 15.0}};
        case VOR_FLARE_GAUSSIAN_THING: return {{-1.4, 1.35}, {-1.4, 1.45}};
        case VOR_FLARE_GAUSSIAN_THING_2: return {{-1.3, 1.35}, {-1.4, 1.4}};
        case VOR_FLARE_GAUSSIAN_THING_3: return {{-0.95, 1.35}, {-1.6, 1.35}};
        case VOR_FLARE_GAUSSIAN_THING_4: return {{-1.6, 1.6}, {-5.0, 5.0}};
        case VOR_FLARE_LOBES: return {{-1.6, 1.6}, {-1.6, 1.6}};
        case VOR_FLARE_STRIPE: return {{-2.15, 2.15}, {-15.0, 15.0}};
        case VOR_FLARE_STRIPE_2: return {{-15.0, 15.0}, {-2.15, 2.15}};
        case VOR_FLARE_DIAMOND: return {{-1.4, 1.4}, {-1.4, 1.4}};
        case VOR_FLARE_CROSS: return {{-20.0, 20.0}, {-20.0, 20.0}};
        case VOR_FLARE_BLOB_FLARE: return {{-1.55, 1.35}, {-1.6, 1.35}};
        case VOR_FLARE_BLOB: return {{-0.71, 0.71}, {-0.71, 0.71}};
        case VOR_FLARE_BLOB_2: return {{-0.85, 0.85}, {-0.85, 0.85}};
        default: return {{-99999.0, 99999.0}, {-99999.0, 99999.0}};
    }
}

// Pixels of one axis that a range covers once scaled and shifted and
// mapped from -1..1 to 0..size.
double covered(Range range, float scale, float offset, std::uint32_t size) {
    const auto index = [size](double b) {
        const double i = std::floor(((b + 1.0) * size + 1.0) * 0.5);
        return i < 0.0 ? 0.0 : (i > size ? static_cast<double>(size) : i);
    };
    const double a = range.low * scale + offset;
    const double b = range.high * scale + offset;
    return index(a > b ? a : b) - index(a > b ? b : a);
}

// Every flare is centred, in a warm colour screened over the photo, its
// width and height this share of the image's half-size (and half of it).
constexpr float kFlareSize = 0.4f;
constexpr float kFlareHalfSize = kFlareSize / 2.0f;

const char* const kFlareKeywords[] = {"sinc",        "gaussianThing", "gaussianThing2", "gaussianThing3",
                                      "gaussianThing4", "angleGaussian", "stardom",      "lobes",
                                      "no keyword",  "stripe",        "stripe2",        "dimondFlare",
                                      "crossFlare",  "cornerFlares",  "fingerFlare",    "blobFlare",
                                      "blah",        "blob",          "blob2"};

void add_flare(int32_t type, const std::string& operation, float size, const BitmapSize& bitmap_size) {
    const std::string label = "VorFlare, type " + std::to_string(type) + " (" + kFlareKeywords[type] + "), size " +
                              (size == kFlareSize ? "0.4" : "0.2") + ", screen";
    const FlareBox box = documented_box(type);
    const double box_pixels = covered(box.x, size, 0.0f, bitmap_size.width) *
                              covered(box.y, size, 0.0f, bitmap_size.height);
    // The type without light returns at once: left to find its own count,
    // the benchmark would copy the photo (untimed) for tens of thousands of
    // iterations to fill its minimum time.
    const std::int64_t iterations = type == VOR_FLARE_NONE ? 100 : 0;
    add_benchmark(
        operation, kOurs, bitmap_size, label,
        [type, size, bitmap_size, box_pixels](benchmark::State& state) {
            const VorColor warm{255, 222, 170, 235};
            time_in_place(state, sample(bitmap_size), [&](cv::Mat& image) {
                VorBitmap bitmap = as_bitmap(image);
                VorFlare(&bitmap, 1.0f, &warm, type, 0.0f, 0.0f, size, size, VOR_BLEND_SCREEN);
            });
            state.counters[kBoxPixelsCounter] = box_pixels;
        },
        iterations);
}

}  // namespace

void add_generated() {
    for (const BitmapSize& size : kSizes) {
        add_benchmark("vignette", kOurs, size, comparison_label("vignette", kOurs), [size](benchmark::State& state) {
            time_in_place(state, sample(size), [](cv::Mat& image) {
                VorBitmap bitmap = as_bitmap(image);
                vignette(bitmap);
            });
        });
        add_memcpy_floor("vignette", size);
        add_benchmark("gradient", kOurs, size, comparison_label("gradient", kOurs), [size](benchmark::State& state) {
            time_in_place(state, sample(size), [](cv::Mat& image) {
                VorBitmap bitmap = as_bitmap(image);
                gradient(bitmap, VOR_GRADIENT_LINEAR);
            });
        });
        add_memcpy_floor("gradient", size);
    }
    const char* styles[] = {"halftone", "lines", "smooth", "shadow", "fade", "rough"};
    for (int32_t style = 1; style <= 6; ++style) {
        add_ours(std::string("border_") + styles[style - 1], std::string("VorBorders, style ") + styles[style - 1],
                 [style](VorBitmap& b) { banded(b, style); });
    }
    add_ours("border_viewfinder", "VorBorders, style viewfinder",
             [](VorBitmap& b) { banded(b, VOR_BORDER_VIEWFINDER); });
    add_ours("border_hard_rand", "VorBorders, style hard_rand", [](VorBitmap& b) { banded(b, VOR_BORDER_HARD_RAND); });
    add_ours("gradient_radial", "VorGradientApply, radial, overlay",
             [](VorBitmap& b) { gradient(b, VOR_GRADIENT_RADIAL); });
    add_ours("gradient_vignette", "VorGradientApply, linear with vignette, overlay",
             [](VorBitmap& b) { gradient(b, VOR_GRADIENT_LINEAR_VIGNETTE); });
    for (int32_t type = 0; type <= 18; ++type) {
        const std::string operation = "flare" + std::to_string(type);
        for (const BitmapSize& size : kSizes) add_flare(type, operation, kFlareSize, size);
        add_flare(type, operation + kHalfSizeSuffix, kFlareHalfSize, kLarge);
    }
}

}  // namespace vorlite::bench
