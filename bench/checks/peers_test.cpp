// A comparison is only fair if both sides do the same job: these checks hold
// each peer's output against the library's on the same picture, and the
// sample loader to the library's byte order.
#include <gtest/gtest.h>

#include <cstdio>
#include <cstring>
#include <opencv2/imgcodecs.hpp>
#include <opencv2/imgproc.hpp>
#include <string>

#include "peers.h"
#include "photo.h"
#include "workload.h"

namespace {

using namespace vorlite::bench;

class PeersDoTheSameWork : public ::testing::Test {
  protected:
    static void SetUpTestSuite() { ASSERT_TRUE(start_vips("vorlite_bench_tests")); }

    // A photo-like picture: smooth colour fields with fine texture, every
    // level of each channel represented, and a distinctive alpha.
    static cv::Mat picture() {
        cv::Mat texture(96, 128, CV_8UC4);
        cv::RNG rng(7);
        rng.fill(texture, cv::RNG::UNIFORM, 0, 256);
        cv::GaussianBlur(texture, texture, cv::Size(0, 0), 1.5);
        cv::normalize(texture, texture, 0, 255, cv::NORM_MINMAX);
        for (int y = 0; y < texture.rows; ++y) {
            for (int x = 0; x < texture.cols; ++x) {
                cv::Vec4b& p = texture.at<cv::Vec4b>(y, x);
                p[0] = static_cast<uchar>((p[0] + x * 2) / 2);
                p[3] = 42;
            }
        }
        return texture;
    }

    static int max_difference(const cv::Mat& a, const cv::Mat& b) {
        cv::Mat difference;
        cv::absdiff(a, b, difference);
        double largest = 0.0;
        cv::minMaxLoc(difference.reshape(1), nullptr, &largest);
        return static_cast<int>(largest);
    }

    static cv::Mat channel(const cv::Mat& image, int index) {
        cv::Mat plane;
        cv::extractChannel(image, plane, index);
        return plane;
    }

    static cv::Mat colour(const cv::Mat& image) {
        cv::Mat rgb;
        cv::cvtColor(image, rgb, cv::COLOR_RGBA2RGB);
        return rgb;
    }

    static double mean_difference(const cv::Mat& a, const cv::Mat& b) {
        cv::Mat difference;
        cv::absdiff(colour(a), colour(b), difference);
        const cv::Scalar m = cv::mean(difference);
        return (m[0] + m[1] + m[2]) / 3.0;
    }
};

TEST(SamplePhoto, LoadsScaledInTheLibraryByteOrder) {
    const std::string path = ::testing::TempDir() + "vorlite_bench_sample.png";
    // OpenCV writes blue, green, red: this pixel is mostly red.
    ASSERT_TRUE(cv::imwrite(path, cv::Mat(30, 40, CV_8UC3, cv::Scalar(10, 20, 200))));
    const cv::Mat photo = load_photo(path, 64, 48);
    std::remove(path.c_str());
    ASSERT_EQ(photo.type(), CV_8UC4);
    EXPECT_EQ(photo.cols, 64);
    EXPECT_EQ(photo.rows, 48);
    EXPECT_TRUE(photo.isContinuous());
    EXPECT_EQ(photo.at<cv::Vec4b>(20, 30), cv::Vec4b(200, 20, 10, 255));
    EXPECT_TRUE(load_photo(path, 64, 48).empty());
}

TEST_F(PeersDoTheSameWork, ToneMapGivesTheSameBytes) {
    const cv::Mat source = picture();
    const VorHistMap map = tone_map();
    const cv::Mat lut = opencv_lut(map);

    cv::Mat ours = source.clone();
    VorBitmap bitmap = as_bitmap(ours);
    VorBitmapHistogramTransform(&bitmap, &map);
    cv::Mat opencv = source.clone();
    lut_opencv(opencv, lut);
    cv::Mat vips(source.size(), source.type());
    ASSERT_TRUE(lut_vips(source, lut, vips));

    EXPECT_EQ(max_difference(ours, source) > 10, true) << "the map must change the picture";
    EXPECT_EQ(max_difference(ours, opencv), 0);
    EXPECT_EQ(max_difference(ours, vips), 0);
}

TEST_F(PeersDoTheSameWork, ColorMatrixAgreesWithinRounding) {
    const cv::Mat source = picture();
    VorColorMatrix matrix;
    std::memcpy(&matrix, kMixMatrix, sizeof matrix);

    cv::Mat ours = source.clone();
    VorBitmap bitmap = as_bitmap(ours);
    VorBitmapColorMatrixTransform(&bitmap, &matrix);
    cv::Mat opencv = source.clone();
    mix_opencv(opencv, opencv_mix_matrix(kMixMatrix));
    cv::Mat vips(source.size(), source.type());
    ASSERT_TRUE(mix_vips(source, kMixMatrix, vips));

    EXPECT_LE(max_difference(ours, opencv), 1);
    EXPECT_LE(max_difference(ours, vips), 1);
    EXPECT_EQ(max_difference(channel(opencv, 3), channel(source, 3)), 0);
    EXPECT_EQ(max_difference(channel(vips, 3), channel(source, 3)), 0);
}

TEST_F(PeersDoTheSameWork, LabAgreesUpToThePackingOffsets) {
    const cv::Mat source = picture();
    cv::Mat ours = source.clone();
    VorBitmap bitmap = as_bitmap(ours);
    VorBitmapConvertRGBToLAB(&bitmap);
    cv::Mat opencv;
    lab_opencv(source, opencv);
    ASSERT_EQ(opencv.type(), CV_8UC3);

    // Both pack L* 0..100 into 0..255; the library offsets a* and b* by 127
    // and truncates, the peer offsets them by 128 and rounds.
    cv::Mat opencv_shifted;
    opencv.convertTo(opencv_shifted, CV_16SC3);
    opencv_shifted -= cv::Scalar(0, 1, 1);
    cv::Mat ours_wide;
    colour(ours).convertTo(ours_wide, CV_16SC3);
    EXPECT_LE(max_difference(ours_wide, opencv_shifted), 3);
}

TEST_F(PeersDoTheSameWork, UnsharpMaskWithTheSameSigmaSharpensAlike) {
    const cv::Mat source = picture();
    const float amount = 200.0f;
    const double sigma = sharpen_sigma(static_cast<std::uint32_t>(source.cols),
                                       static_cast<std::uint32_t>(source.rows), amount);
    cv::Mat ours = source.clone();
    VorBitmap bitmap = as_bitmap(ours);
    VorConvolutionEffectKipSharpen(&bitmap, amount);
    cv::Mat blurred;
    cv::Mat opencv;
    unsharp_opencv(source, blurred, opencv, sigma);
    cv::Mat vips(source.size(), source.type());
    ASSERT_TRUE(gaussblur_vips(source, vips, sigma));

    // Two one-dimensional passes are not one two-dimensional mask, so only
    // the size of the change is compared: a peer with the wrong sigma
    // changes the picture by a clearly different amount.
    const double ours_change = mean_difference(ours, source);
    const double peer_change = mean_difference(opencv, source);
    ASSERT_GT(ours_change, 2.0);
    EXPECT_NEAR(peer_change / ours_change, 1.0, 0.5);
    EXPECT_LT(mean_difference(ours, opencv), ours_change);
    // libvips cuts its kernel earlier and extends edges differently, so its
    // blur is only closest to OpenCV's at the same sigma.
    const double same = mean_difference(vips, blurred);
    for (const double other : {sigma * 0.5, sigma * 2.0}) {
        cv::Mat reference;
        cv::GaussianBlur(source, reference, cv::Size(0, 0), other);
        EXPECT_LT(same, mean_difference(vips, reference)) << "sigma " << other;
    }
}

TEST_F(PeersDoTheSameWork, BlendAgreesWithinRounding) {
    const cv::Mat source = picture();
    cv::Mat over;
    cv::flip(source, over, 1);
    cv::Mat ours = source.clone();
    VorBitmap bitmap = as_bitmap(ours);
    const VorBitmap over_bitmap = as_bitmap(over);
    VorBitmapBlendBitmap(&bitmap, &over_bitmap, VOR_BLEND_NORMAL, kBlendOpacity);
    cv::Mat opencv = source.clone();
    blend_opencv(opencv, over, kBlendOpacity);

    EXPECT_LE(max_difference(colour(ours), colour(opencv)), 1);
}

TEST_F(PeersDoTheSameWork, NoiseTouchesEveryColourChannelOfEveryPixel) {
    // Mid-grey, so that no offset is cut off at black or white. The peer
    // draws over [0, 64), the span its generator draws fastest; ours draws
    // -a..a: both a uniform offset per channel, alpha left alone by the peer.
    const cv::Mat source(96, 128, CV_8UC4, cv::Scalar(128, 128, 128, 255));
    cv::Mat ours = source.clone();
    VorBitmap bitmap = as_bitmap(ours);
    VorBitmapAddNoise(&bitmap, kNoiseIntensity, kNoiseSeed);
    cv::Mat noise;
    cv::Mat opencv = source.clone();
    noise_opencv(opencv, noise);

    const int amplitude = static_cast<int>(kNoiseIntensity * 255.0f);
    EXPECT_NEAR(max_difference(colour(ours), colour(source)), amplitude, 1);
    EXPECT_NEAR(mean_difference(ours, source), amplitude / 2.0, 1.5);
    EXPECT_NEAR(max_difference(colour(opencv), colour(source)), 63, 1);
    EXPECT_NEAR(mean_difference(opencv, source), 31.5, 1.5);
    EXPECT_EQ(max_difference(channel(opencv, 3), channel(source, 3)), 0);
}

}  // namespace
