// The peers' side of each pair, written as a developer would with each
// library's ordinary calls. Every function works on continuous CV_8UC4
// matrices in the library's byte order (red first).
#ifndef VORLITE_BENCH_PEERS_H
#define VORLITE_BENCH_PEERS_H

#include <opencv2/core.hpp>

#include "zentra_vorlite.h"

namespace vorlite::bench {

// Starts libvips (once) with its operation cache off, so a repeated call
// recomputes its pixels as it would on a new photo. False if it fails.
bool start_vips(const char* program);

// One thread for both peers (the library owns none), or every core.
void set_peer_threads(bool all_cores);
int opencv_threads();
int vips_threads();

// The tone map as OpenCV's 1 x 256 four-channel table; alpha's table is the
// identity.
cv::Mat opencv_lut(const VorHistMap& map);
void lut_opencv(cv::Mat& image, const cv::Mat& lut);
bool lut_vips(const cv::Mat& src, const cv::Mat& lut, cv::Mat& dst);

// The mixing matrix as OpenCV's 4 x 5 (four output channels, four inputs
// and an offset); alpha maps to itself.
cv::Mat opencv_mix_matrix(const float matrix[12]);
void mix_opencv(cv::Mat& image, const cv::Mat& matrix);
bool mix_vips(const cv::Mat& src, const float matrix[12], cv::Mat& dst);

// RGB(A) to 8-bit L*a*b* into a three-channel dst.
void lab_opencv(const cv::Mat& src, cv::Mat& dst);

// Unsharp mask dst = 1.5 x src - 0.5 x blur, the weights of one pass of the
// library's sharpening; blurred is working storage.
void unsharp_opencv(const cv::Mat& src, cv::Mat& blurred, cv::Mat& dst, double sigma);
bool gaussblur_vips(const cv::Mat& src, cv::Mat& dst, double sigma);

// dst = (1 - opacity) x dst + opacity x over, every channel.
void blend_opencv(cv::Mat& dst, const cv::Mat& over, double opacity);

// Adds uniform noise over [0, 64) to red, green and blue, saturating: the
// power-of-two span randu draws fastest; noise is working storage.
void noise_opencv(cv::Mat& image, cv::Mat& noise);

}  // namespace vorlite::bench

#endif
