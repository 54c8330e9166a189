// The sample photograph every benchmark works on: a real photo scaled up to
// the benchmark size, so that branches and tables see natural content rather
// than a flat colour.
#ifndef VORLITE_BENCH_PHOTO_H
#define VORLITE_BENCH_PHOTO_H

#include <opencv2/core.hpp>
#include <string>

#include "catalogue.h"
#include "zentra_vorlite.h"

namespace vorlite::bench {

// Decodes the photo at path and scales it to width x height; RGBA in the
// library's byte order (red first), alpha 255. An empty matrix if the file
// cannot be read.
cv::Mat load_photo(const std::string& path, std::uint32_t width, std::uint32_t height);

// The photo every benchmark uses; set once before the first sample() call.
void set_photo_path(const std::string& path);
const std::string& photo_path();

// The photo at a benchmark size, decoded and scaled once per process.
// Throws std::runtime_error if the photo cannot be read.
const cv::Mat& sample(const BitmapSize& size);

// A second, different picture of the same size (the sample mirrored left to
// right), for operations that combine two bitmaps.
const cv::Mat& second_sample(const BitmapSize& size);

// The library's view of a continuous CV_8UC4 matrix.
inline VorBitmap as_bitmap(cv::Mat& image) {
    return VorBitmap{image.data, static_cast<std::uint32_t>(image.cols), static_cast<std::uint32_t>(image.rows)};
}

}  // namespace vorlite::bench

#endif
