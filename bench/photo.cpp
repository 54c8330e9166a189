#include "photo.h"

#include <filesystem>
#include <map>
#include <mutex>
#include <stdexcept>
#include <opencv2/imgcodecs.hpp>
#include <opencv2/imgproc.hpp>

namespace vorlite::bench {

namespace {

std::string& stored_path() {
    static std::string path;
    return path;
}

using Cache = std::map<std::pair<std::uint32_t, std::uint32_t>, cv::Mat>;

const cv::Mat& cached(Cache& cache, const BitmapSize& size, bool mirrored) {
    static std::mutex lock;
    std::lock_guard<std::mutex> guard(lock);
    cv::Mat& slot = cache[{size.width, size.height}];
    if (slot.empty()) {
        cv::Mat photo = load_photo(stored_path(), size.width, size.height);
        if (photo.empty()) throw std::runtime_error("cannot read the sample photo '" + stored_path() + "'");
        if (mirrored) cv::flip(photo, photo, 1);
        slot = photo;
    }
    return slot;
}

}  // namespace

cv::Mat load_photo(const std::string& path, std::uint32_t width, std::uint32_t height) {
    // Checked first so that a missing file is an empty result, not a
    // warning from the decoder as well.
    std::error_code error;
    if (!std::filesystem::is_regular_file(path, error)) return {};
    const cv::Mat decoded = cv::imread(path, cv::IMREAD_COLOR);
    if (decoded.empty()) return {};
    // Cubic interpolation keeps the photo's edges crisp when enlarging it
    // tenfold, rather than the softer bilinear ramps.
    cv::Mat scaled;
    cv::resize(decoded, scaled, cv::Size(static_cast<int>(width), static_cast<int>(height)), 0, 0,
               cv::INTER_CUBIC);
    cv::Mat rgba;
    cv::cvtColor(scaled, rgba, cv::COLOR_BGR2RGBA);
    return rgba;
}

void set_photo_path(const std::string& path) { stored_path() = path; }

const std::string& photo_path() { return stored_path(); }

const cv::Mat& sample(const BitmapSize& size) {
    static Cache cache;
    return cached(cache, size, false);
}

const cv::Mat& second_sample(const BitmapSize& size) {
    static Cache cache;
    return cached(cache, size, true);
}

}  // namespace vorlite::bench
