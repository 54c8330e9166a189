#include "peers.h"

#include <opencv2/core/utility.hpp>
#include <opencv2/imgproc.hpp>
#include <thread>
#include <vips/vips.h>

namespace vorlite::bench {

namespace {

int all_cores() {
    const unsigned n = std::thread::hardware_concurrency();
    return n == 0 ? 1 : static_cast<int>(n);
}

// Owns one reference to a libvips image.
class VipsHandle {
  public:
    explicit VipsHandle(VipsImage* image = nullptr) : image_(image) {}
    VipsHandle(const VipsHandle&) = delete;
    VipsHandle& operator=(const VipsHandle&) = delete;
    ~VipsHandle() {
        if (image_ != nullptr) g_object_unref(image_);
    }
    VipsImage* get() const { return image_; }
    VipsImage** out() { return &image_; }

  private:
    VipsImage* image_;
};

// A libvips image over the matrix's own pixels, without copying them.
VipsImage* wrap(const cv::Mat& image) {
    return vips_image_new_from_memory(image.data, image.total() * image.elemSize(), image.cols, image.rows,
                                      image.channels(), VIPS_FORMAT_UCHAR);
}

// Computes result's pixels straight into dst's memory, as a caller holding
// its own output buffer would.
bool write_into(VipsImage* result, cv::Mat& dst) {
    if (result == nullptr) return false;
    VipsHandle target(wrap(dst));
    return target.get() != nullptr && vips_image_write(result, target.get()) == 0;
}

}  // namespace

bool start_vips(const char* program) {
    if (VIPS_INIT(program) != 0) return false;
    vips_cache_set_max(0);
    return true;
}

void set_peer_threads(bool all) {
    cv::setNumThreads(all ? all_cores() : 1);
    vips_concurrency_set(all ? all_cores() : 1);
}

int opencv_threads() { return cv::getNumThreads(); }

int vips_threads() { return vips_concurrency_get(); }

cv::Mat opencv_lut(const VorHistMap& map) {
    cv::Mat lut(1, 256, CV_8UC4);
    for (int i = 0; i < 256; ++i) {
        lut.at<cv::Vec4b>(0, i) = cv::Vec4b(map.map[0][i], map.map[1][i], map.map[2][i], static_cast<uchar>(i));
    }
    return lut;
}

void lut_opencv(cv::Mat& image, const cv::Mat& lut) { cv::LUT(image, lut, image); }

bool lut_vips(const cv::Mat& src, const cv::Mat& lut, cv::Mat& dst) {
    VipsHandle in(wrap(src));
    VipsHandle table(wrap(lut));
    VipsHandle out;
    if (in.get() == nullptr || table.get() == nullptr) return false;
    if (vips_maplut(in.get(), out.out(), table.get(), nullptr) != 0) return false;
    return write_into(out.get(), dst);
}

cv::Mat opencv_mix_matrix(const float matrix[12]) {
    cv::Mat m = cv::Mat::zeros(4, 5, CV_32F);
    for (int row = 0; row < 3; ++row) {
        for (int col = 0; col < 3; ++col) m.at<float>(row, col) = matrix[row * 4 + col];
        m.at<float>(row, 4) = matrix[row * 4 + 3];
    }
    m.at<float>(3, 3) = 1.0f;
    return m;
}

void mix_opencv(cv::Mat& image, const cv::Mat& matrix) { cv::transform(image, image, matrix); }

bool mix_vips(const cv::Mat& src, const float matrix[12], cv::Mat& dst) {
    // vips_recomb has no offset column: the offsets follow in vips_linear,
    // which also rounds back to 8 bits.
    double rows[16] = {};
    double gains[4] = {1.0, 1.0, 1.0, 1.0};
    double offsets[4] = {};
    for (int row = 0; row < 3; ++row) {
        for (int col = 0; col < 3; ++col) rows[row * 4 + col] = matrix[row * 4 + col];
        offsets[row] = matrix[row * 4 + 3];
    }
    rows[15] = 1.0;
    VipsHandle in(wrap(src));
    VipsHandle recomb_matrix(vips_image_new_matrix_from_array(4, 4, rows, 16));
    VipsHandle mixed;
    VipsHandle out;
    if (in.get() == nullptr || recomb_matrix.get() == nullptr) return false;
    if (vips_recomb(in.get(), mixed.out(), recomb_matrix.get(), nullptr) != 0) return false;
    if (vips_linear(mixed.get(), out.out(), gains, offsets, 4, "uchar", TRUE, nullptr) != 0) return false;
    return write_into(out.get(), dst);
}

void lab_opencv(const cv::Mat& src, cv::Mat& dst) { cv::cvtColor(src, dst, cv::COLOR_RGB2Lab); }

void unsharp_opencv(const cv::Mat& src, cv::Mat& blurred, cv::Mat& dst, double sigma) {
    cv::GaussianBlur(src, blurred, cv::Size(0, 0), sigma);
    cv::addWeighted(src, 1.5, blurred, -0.5, 0.0, dst);
}

bool gaussblur_vips(const cv::Mat& src, cv::Mat& dst, double sigma) {
    VipsHandle in(wrap(src));
    VipsHandle out;
    if (in.get() == nullptr) return false;
    if (vips_gaussblur(in.get(), out.out(), sigma, nullptr) != 0) return false;
    return write_into(out.get(), dst);
}

void blend_opencv(cv::Mat& dst, const cv::Mat& over, double opacity) {
    cv::addWeighted(dst, 1.0 - opacity, over, opacity, 0.0, dst);
}

void noise_opencv(cv::Mat& image, cv::Mat& noise) {
    noise.create(image.size(), CV_8UC4);
    // Spans of 64 (and 1 for alpha, which gets no noise): powers of two,
    // which randu draws on its fastest path.
    cv::randu(noise, cv::Scalar(0.0, 0.0, 0.0, 0.0), cv::Scalar(64.0, 64.0, 64.0, 1.0));
    cv::add(image, noise, image);
}

}  // namespace vorlite::bench
