// Each operation of the library against the peers' way of doing the same.
#include <cstring>

#include "peers.h"
#include "runner.h"
#include "suite.h"
#include "workload.h"

namespace vorlite::bench {

namespace {

void add_pair(const char* operation, const char* side, const BitmapSize& size,
              std::function<void(benchmark::State&)> body) {
    add_benchmark(operation, side, size, comparison_label(operation, side), std::move(body));
}

void add_lut(const BitmapSize& size) {
    add_pair("lut", kOurs, size, [size](benchmark::State& state) {
        const VorHistMap map = tone_map();
        time_in_place(state, sample(size), [&map](cv::Mat& image) {
            VorBitmap bitmap = as_bitmap(image);
            VorBitmapHistogramTransform(&bitmap, &map);
        });
    });
    add_pair("lut", "opencv", size, [size](benchmark::State& state) {
        const cv::Mat lut = opencv_lut(tone_map());
        time_in_place(state, sample(size), [&lut](cv::Mat& image) { lut_opencv(image, lut); });
    });
    add_pair("lut", "vips", size, [size](benchmark::State& state) {
        const cv::Mat& src = sample(size);
        const cv::Mat lut = opencv_lut(tone_map());
        cv::Mat dst(src.size(), src.type());
        time_as_is(state, [&] { return lut_vips(src, lut, dst); });
    });
    add_memcpy_floor("lut", size);
}

void add_matrix(const BitmapSize& size) {
    add_pair("matrix", kOurs, size, [size](benchmark::State& state) {
        VorColorMatrix matrix;
        static_assert(sizeof matrix == sizeof kMixMatrix, "a colour matrix is 12 floats");
        std::memcpy(&matrix, kMixMatrix, sizeof matrix);
        time_in_place(state, sample(size), [&matrix](cv::Mat& image) {
            VorBitmap bitmap = as_bitmap(image);
            VorBitmapColorMatrixTransform(&bitmap, &matrix);
        });
    });
    add_pair("matrix", "opencv", size, [size](benchmark::State& state) {
        const cv::Mat matrix = opencv_mix_matrix(kMixMatrix);
        time_in_place(state, sample(size), [&matrix](cv::Mat& image) { mix_opencv(image, matrix); });
    });
    add_pair("matrix", "vips", size, [size](benchmark::State& state) {
        const cv::Mat& src = sample(size);
        cv::Mat dst(src.size(), src.type());
        time_as_is(state, [&] { return mix_vips(src, kMixMatrix, dst); });
    });
}

void add_lab(const BitmapSize& size) {
    add_pair("lab", kOurs, size, [size](benchmark::State& state) {
        time_in_place(state, sample(size), [](cv::Mat& image) {
            VorBitmap bitmap = as_bitmap(image);
            VorBitmapConvertRGBToLAB(&bitmap);
        });
    });
    add_pair("lab", "opencv", size, [size](benchmark::State& state) {
        const cv::Mat& src = sample(size);
        cv::Mat dst(src.size(), CV_8UC3);
        time_as_is(state, [&] {
            lab_opencv(src, dst);
            return true;
        });
    });
}

void add_sharpen(const BitmapSize& size) {
    add_pair("sharpen", kOurs, size, [size](benchmark::State& state) {
        time_in_place(state, sample(size), [](cv::Mat& image) {
            VorBitmap bitmap = as_bitmap(image);
            VorConvolutionEffectKipSharpen(&bitmap, kSharpenAmount);
        });
    });
    const double sigma = sharpen_sigma(size.width, size.height, kSharpenAmount);
    add_pair("sharpen", "opencv", size, [size, sigma](benchmark::State& state) {
        const cv::Mat& src = sample(size);
        cv::Mat blurred(src.size(), src.type());
        cv::Mat dst(src.size(), src.type());
        time_as_is(state, [&] {
            unsharp_opencv(src, blurred, dst, sigma);
            return true;
        });
    });
    add_pair("sharpen", "vips", size, [size, sigma](benchmark::State& state) {
        const cv::Mat& src = sample(size);
        cv::Mat dst(src.size(), src.type());
        time_as_is(state, [&] { return gaussblur_vips(src, dst, sigma); });
    });
}

void add_blend(const BitmapSize& size) {
    add_pair("blend", kOurs, size, [size](benchmark::State& state) {
        cv::Mat over = second_sample(size).clone();
        const VorBitmap over_bitmap = as_bitmap(over);
        time_in_place(state, sample(size), [&over_bitmap](cv::Mat& image) {
            VorBitmap bitmap = as_bitmap(image);
            VorBitmapBlendBitmap(&bitmap, &over_bitmap, VOR_BLEND_NORMAL, kBlendOpacity);
        });
    });
    add_pair("blend", "opencv", size, [size](benchmark::State& state) {
        const cv::Mat& over = second_sample(size);
        time_in_place(state, sample(size), [&over](cv::Mat& image) { blend_opencv(image, over, kBlendOpacity); });
    });
}

void add_noise(const BitmapSize& size) {
    add_pair("noise", kOurs, size, [size](benchmark::State& state) {
        time_in_place(state, sample(size), [](cv::Mat& image) {
            VorBitmap bitmap = as_bitmap(image);
            VorBitmapAddNoise(&bitmap, kNoiseIntensity, kNoiseSeed);
        });
    });
    add_pair("noise", "opencv", size, [size](benchmark::State& state) {
        cv::Mat noise;
        time_in_place(state, sample(size), [&noise](cv::Mat& image) { noise_opencv(image, noise); });
    });
}

// The filter's cost should hardly depend on how strong it is.
void add_sharpen_amounts() {
    for (const auto& [operation, amount] : {std::pair{kSharpenSmallAmount, 50.0f}, std::pair{kSharpenLargeAmount, 400.0f}}) {
        const std::string label = "VorConvolutionEffectKipSharpen, amount " + std::to_string(static_cast<int>(amount));
        add_benchmark(operation, kOurs, kLarge, label, [amount](benchmark::State& state) {
            time_in_place(state, sample(kLarge), [amount](cv::Mat& image) {
                VorBitmap bitmap = as_bitmap(image);
                VorConvolutionEffectKipSharpen(&bitmap, amount);
            });
        });
    }
}

}  // namespace

const char* comparison_label(const char* operation, const char* side) {
    for (const Comparison& row : kComparisons) {
        if (std::strcmp(row.operation, operation) != 0) continue;
        if (std::strcmp(side, kOurs) == 0) return row.ours_label;
        if (std::strcmp(side, row.peer) == 0) return row.peer_label;
    }
    return operation;
}

// The copy reads a bitmap prepared exactly as every in-place row's is, just
// written from the sample, so the floor meets memory as the others do; a
// copy of the same buffer again and again would find part of it in cache.
void add_memcpy_floor(const char* operation, const BitmapSize& size) {
    add_pair(operation, "memcpy", size, [size](benchmark::State& state) {
        const cv::Mat& src = sample(size);
        cv::Mat dst(src.size(), src.type());
        time_in_place(state, src, [&dst](cv::Mat& image) {
            std::memcpy(dst.data, image.data, image.total() * image.elemSize());
        });
    });
}

void add_pairs() {
    for (const BitmapSize& size : kSizes) {
        add_lut(size);
        add_matrix(size);
        add_lab(size);
        add_sharpen(size);
        add_blend(size);
        add_noise(size);
    }
    add_sharpen_amounts();
}

}  // namespace vorlite::bench
