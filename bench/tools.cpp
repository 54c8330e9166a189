// The tool engine at touch speed: one dab of radius 40 for each brush kind,
// one stroke segment and the preview box it reports, a full preview and
// VorToolInit for each kind on a 1080 x 1080 preview; and the
// full-resolution render of each kind at both photo sizes.
#include <array>
#include <string>
#include <vector>

#include "runner.h"
#include "suite.h"

namespace vorlite::bench {

namespace {

constexpr BitmapSize kPreview{"1080", 1080, 1080};
constexpr std::array<std::int32_t, 6> kBrushKinds = {1, 3, 4, 5, 6, 12};

// One tool use on the 1080 x 1080 preview of the sample photo.
struct Use {
    cv::Mat image, full, mask, out;
    VorToolDrawParams params;
    VorToolDrawState state;

    explicit Use(std::int32_t kind)
        : image(load_photo(photo_path(), kPreview.width, kPreview.height)), full(image.clone()),
          mask(image.clone()), out(image.clone()) {
        VorToolDrawParamsInit(&params);
        VorToolDrawStateInit(&state);
        params.kind = kind;
        state.kind = kind;
        state.color = VorColor{250, 240, 222, 255};
        VorBitmap i = as_bitmap(image), f = as_bitmap(full), m = as_bitmap(mask);
        VorToolInit(&i, &f, &m, &params, &state);
    }
};

std::string kind_name(std::int32_t kind) { return "kind " + std::to_string(kind); }

void add_dabs() {
    for (const std::int32_t kind : kBrushKinds) {
        add_benchmark("tool_dab_" + std::to_string(kind), kOurs, kPreview,
                      "VorToolDrawPoint, radius 40, " + kind_name(kind), [kind](benchmark::State& s) {
                          Use use(kind);
                          VorToolPoint point;
                          VorToolPointInit(&point);
                          point.position = VorPoint{540.0f, 540.0f};
                          point.radius = 40.0;
                          point.mode = 1;
                          VorBitmap image = as_bitmap(use.image), mask = as_bitmap(use.mask);
                          for (auto _ : s) {
                              VorToolDrawPoint(&image, &mask, &point, &use.params, &use.state);
                              benchmark::ClobberMemory();
                          }
                      });
    }
}

// A curve segment between the midpoints of three touches 60 pixels apart,
// and the rectangle it reports re-rendered.
void add_segment() {
    static std::vector<VorPoint> touches = {{400, 500}, {460, 520}, {520, 500}};
    const auto segment = [](Use& use, VorPoint* low, VorPoint* high) {
        VorToolStroke stroke;
        VorToolStrokeInit(&stroke);
        stroke.points = touches.data();
        stroke.count = 3;
        stroke.nextIndex = 2;
        stroke.radius = 40.0;
        stroke.mode = 1;
        VorBitmap image = as_bitmap(use.image), mask = as_bitmap(use.mask);
        VorToolDrawStrokeOutRect(&image, &mask, &stroke, &use.params, &use.state, low, high);
    };
    add_benchmark("tool_segment", kOurs, kPreview, "VorToolDrawStrokeOutRect, one segment, radius 40, kind 3",
                  [segment](benchmark::State& s) {
                      Use use(3);
                      VorPoint low, high;
                      for (auto _ : s) {
                          segment(use, &low, &high);
                          benchmark::ClobberMemory();
                      }
                  });
    add_benchmark("tool_preview_box", kOurs, kPreview, "VorToolRenderPreviewBox of that segment's rectangle",
                  [segment](benchmark::State& s) {
                      Use use(3);
                      VorPoint low, high;
                      segment(use, &low, &high);
                      VorBitmap out = as_bitmap(use.out), image = as_bitmap(use.image), full = as_bitmap(use.full),
                                mask = as_bitmap(use.mask);
                      for (auto _ : s) {
                          VorToolRenderPreviewBox(&out, &image, &full, &mask, static_cast<std::int32_t>(low.x),
                                                  static_cast<std::int32_t>(low.y), static_cast<std::int32_t>(high.x) + 1,
                                                  static_cast<std::int32_t>(high.y) + 1, nullptr);
                          benchmark::ClobberMemory();
                      }
                  });
    add_benchmark("tool_preview", kOurs, kPreview, "VorToolRenderPreview, whole preview", [](benchmark::State& s) {
        Use use(3);
        VorBitmap out = as_bitmap(use.out), image = as_bitmap(use.image), full = as_bitmap(use.full),
                  mask = as_bitmap(use.mask);
        for (auto _ : s) {
            VorToolRenderPreview(&out, &image, &full, &mask, nullptr);
            benchmark::ClobberMemory();
        }
    });
}

void add_inits() {
    for (std::int32_t kind = 1; kind <= 12; ++kind) {
        add_benchmark("tool_init_" + std::to_string(kind), kOurs, kPreview, "VorToolInit, " + kind_name(kind),
                      [kind](benchmark::State& s) {
                          const cv::Mat image = load_photo(photo_path(), kPreview.width, kPreview.height);
                          cv::Mat full = image.clone(), mask = image.clone();
                          VorBitmap i = as_bitmap(const_cast<cv::Mat&>(image)), f = as_bitmap(full),
                                    m = as_bitmap(mask);
                          for (auto _ : s) {
                              VorToolDrawParams params;
                              VorToolDrawState state;
                              VorToolDrawParamsInit(&params);
                              VorToolDrawStateInit(&state);
                              params.kind = kind;
                              state.kind = kind;
                              VorToolInit(&i, &f, &m, &params, &state);
                              benchmark::ClobberMemory();
                          }
                      });
    }
}

// The finished edit on the photo: a radial mask (a hole around the middle)
// and each kind's render.
void add_hires() {
    for (std::int32_t kind = 1; kind <= 12; ++kind) {
        for (const BitmapSize& size : kSizes) {
            add_benchmark("tool_hires_" + std::to_string(kind), kOurs, size,
                          "VorToolRenderHiRes, " + kind_name(kind), [kind, size](benchmark::State& s) {
                              cv::Mat mask = sample(size).clone();
                              VorBitmap m = as_bitmap(mask);
                              VorMaskRadial(&m, &m, size.width / 2.0, size.height / 2.0, size.height / 4.0);
                              time_in_place(s, sample(size), [&](cv::Mat& image) {
                                  VorBitmap bitmap = as_bitmap(image);
                                  VorToolDrawParams params;
                                  VorToolDrawState state;
                                  VorToolDrawParamsInit(&params);
                                  VorToolDrawStateInit(&state);
                                  params.kind = kind;
                                  state.kind = kind;
                                  VorToolRenderHiRes(&bitmap, &m, &params, &state);
                              });
                          });
        }
    }
}

}  // namespace

void add_tools() {
    add_dabs();
    add_segment();
    add_inits();
    add_hires();
}

}  // namespace vorlite::bench
