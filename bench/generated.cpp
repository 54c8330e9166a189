// The generated effects: the vignette and a full-frame gradient against
// memcpy of the same bytes, and every banded frame, gradient shape and
// flare type on its own, at both sizes.
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

void flare(VorBitmap& bitmap, int32_t type) {
    const VorColor warm{255, 222, 170, 235};
    VorFlare(&bitmap, 1.0f, &warm, type, 0.2f, -0.2f, 0.5f, 0.5f, VOR_BLEND_SCREEN);
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
        add_ours("flare" + std::to_string(type), "VorFlare, type " + std::to_string(type) + ", half-size, screen",
                 [type](VorBitmap& b) { flare(b, type); });
    }
}

}  // namespace vorlite::bench
