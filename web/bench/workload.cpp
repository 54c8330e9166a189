// The browser page's two heaviest kinds of work, timed the same way in a
// native build and in the WebAssembly build under Node: a five-processor
// look on a 12-megapixel photo, and one preview box re-rendered after a
// stroke segment on a 1080-pixel preview.
//   vorlite_web_bench RAW WIDTH HEIGHT DOCUMENT REPETITIONS
// RAW holds the photo's RGBA bytes, rows without gaps; it is enlarged to
// 4000 x 3000. Prints one line of JSON with the medians.
#include <algorithm>
#include <chrono>
#include <cstdio>
#include <cstdlib>
#include <cstring>
#include <fstream>
#include <iterator>
#include <string>
#include <vector>

#include "image.h"
#include "zentra_vorlite.h"

namespace {

using vorlite::cli::Image;
using Clock = std::chrono::steady_clock;

double median(std::vector<double> values) {
    std::sort(values.begin(), values.end());
    return values[values.size() / 2];
}

double seconds_since(Clock::time_point start) {
    return std::chrono::duration<double>(Clock::now() - start).count();
}

std::string slurp(const char* path) {
    std::ifstream in(path, std::ios::binary);
    return std::string(std::istreambuf_iterator<char>(in), std::istreambuf_iterator<char>());
}

// Nanoseconds a pixel for the look, a fresh copy of the photo each time.
double time_look(const Image& photo, const std::string& text, int repetitions) {
    VLPLEffectDocument* document = VLPLLoadEffect(text.c_str());
    if (document == nullptr) {
        std::fprintf(stderr, "vorlite_web_bench: the document does not load\n");
        std::exit(1);
    }
    VLPLRunOptions options;
    VorEffectInitParams(&options);
    options.seed = 1;
    std::vector<double> times;
    for (int r = 0; r < repetitions; ++r) {
        Image work = photo;
        VorBitmap bitmap = work.bitmap();
        const Clock::time_point start = Clock::now();
        VLPLRunEffect(document, &bitmap, &options);
        times.push_back(seconds_since(start) * 1e9 / (static_cast<double>(photo.width) * photo.height));
    }
    VLPLUnloadEffect(&document);
    return median(times);
}

// Milliseconds for one VorToolRenderPreviewBox of the rectangle a stroke
// segment of radius 40 reports, on the photo fitted inside 1080 x 1080.
double time_preview_box(const Image& photo, int repetitions) {
    const double scale = std::min(1080.0 / photo.width, 1080.0 / photo.height);
    Image image = vorlite::cli::reduced(photo, static_cast<uint32_t>(photo.width * scale + 0.5),
                                        static_cast<uint32_t>(photo.height * scale + 0.5));
    Image full(image.width, image.height), mask(image.width, image.height), out(image.width, image.height);
    VorToolDrawParams params;
    VorToolDrawState state;
    VorToolDrawParamsInit(&params);
    VorToolDrawStateInit(&state);
    params.kind = 3;
    state.kind = 3;
    VorBitmap b_image = image.bitmap(), b_full = full.bitmap(), b_mask = mask.bitmap(), b_out = out.bitmap();
    VorToolInit(&b_image, &b_full, &b_mask, &params, &state);
    VorPoint touches[3] = {{400, 500}, {460, 520}, {520, 500}};
    VorToolStroke stroke;
    VorToolStrokeInit(&stroke);
    stroke.points = touches;
    stroke.count = 3;
    stroke.nextIndex = 2;
    stroke.radius = 40.0;
    stroke.mode = 1;
    VorPoint low, high;
    VorToolDrawStrokeOutRect(&b_image, &b_mask, &stroke, &params, &state, &low, &high);
    constexpr int kCalls = 100;
    std::vector<double> times;
    for (int r = 0; r < repetitions; ++r) {
        const Clock::time_point start = Clock::now();
        for (int i = 0; i < kCalls; ++i) {
            VorToolRenderPreviewBox(&b_out, &b_image, &b_full, &b_mask, static_cast<int32_t>(low.x),
                                    static_cast<int32_t>(low.y), static_cast<int32_t>(high.x) + 1,
                                    static_cast<int32_t>(high.y) + 1, nullptr);
        }
        times.push_back(seconds_since(start) * 1e3 / kCalls);
    }
    return median(times);
}

}  // namespace

int main(int argc, char** argv) {
    if (argc != 6) {
        std::fprintf(stderr, "usage: vorlite_web_bench RAW WIDTH HEIGHT DOCUMENT REPETITIONS\n");
        return 2;
    }
    Image photo(static_cast<uint32_t>(std::atoi(argv[2])), static_cast<uint32_t>(std::atoi(argv[3])));
    const std::string raw = slurp(argv[1]);
    if (photo.width == 0 || photo.height == 0 || raw.size() != photo.rgba.size()) {
        std::fprintf(stderr, "vorlite_web_bench: %s does not hold %s x %s RGBA pixels\n", argv[1], argv[2], argv[3]);
        return 1;
    }
    std::memcpy(photo.rgba.data(), raw.data(), raw.size());
    const Image large = vorlite::cli::enlarged(photo, 4000, 3000);
    const int repetitions = std::max(1, std::atoi(argv[5]));
    const double look = time_look(large, slurp(argv[4]), repetitions);
    const double box = time_preview_box(large, repetitions);
    std::printf("{\"look_ns_per_pixel\": %.3f, \"preview_box_ms\": %.4f}\n", look, box);
    return 0;
}
