#include <gtest/gtest.h>

#include <cstring>
#include <string>
#include <vector>

#include "tests/test_support.h"

namespace {

using namespace vorlite::test;


std::string json_array(const uint8_t* levels, int count = 256) {
    std::string s = "[";
    for (int i = 0; i < count; ++i) s += std::to_string(levels[i]) + ',';
    s.back() = ']';
    return s;
}

std::string json_map(const VorHistMap& m) {
    return R"({"r":)" + json_array(m.map[0]) + R"(,"g":)" + json_array(m.map[1]) + R"(,"b":)" + json_array(m.map[2]) + "}";
}

TEST(Histogram, CountsEachColourChannelAndAddsToTheCountsThere) {
    const TestBitmap b(7, 13);
    VorHistogram h{}, expected{};
    VorHistogramBuild(&b.bitmap, &h);
    VorHistogramBuild(&b.bitmap, &h);
    for (size_t i = 0; i < b.bytes.size(); i += 4)
        for (int c = 0; c < 3; ++c) expected.count[c][b.bytes[i + c]] += 2;
    EXPECT_EQ(std::memcmp(&h, &expected, sizeof h), 0);
}

TEST(CumulativeDistributions, NormaliseFallBackToUniformAndInvert) {
    VorHistogram h{};
    h.count[0][0] = 1;
    h.count[0][255] = 3;
    VorCDF cdf;
    VorHistogram2CDF(&h, &cdf);
    EXPECT_EQ(cdf.cdf[0][254], 0.25);
    EXPECT_EQ(cdf.cdf[0][255], 1.0);
    for (int i = 0; i < 256; ++i) EXPECT_DOUBLE_EQ(cdf.cdf[1][i], i / 255.0);  // counted nothing
    double c[256];
    c[0] = 0.2;
    for (int i = 1; i < 256; ++i) c[i] = 0.5 + (i - 1) * (0.4999 / 254);  // ends at 0.9999
    const double cases[][2] = {{-3.0, 0.0}, {0.1, 0.5}, {0.35, 0.5}, {c[7], 7.0}, {0.99995, 255.0}, {7.0, 255.0}};
    for (const auto& p : cases) EXPECT_DOUBLE_EQ(VorCDFINV(c, p[0]), p[1]) << p[0];
}

TEST(MapProcessors, StrengthFadesTheMapAndScalesTheIntensityOpacity) {
    const VorHistMap m = sample_map();
    const std::string mapping = R"({"histMap":)" + json_map(m) + "}";
    const std::string intensity = R"({"blendMode": "overlay", "alpha": 0.8, "histMap":)" + json_map(m) + "}";
    for (double strength : {1.0, 0.5, 0.0}) {
        VorHistMap faded = m;
        VorHistMapFade(&faded, strength);
        TestBitmap got(9, 5), expected(9, 5), got2(9, 5), expected2(9, 5);
        ASSERT_EQ(run(VLPLRunHistogramMappingProcessor, mapping, got.get(), strength), 1);
        VorBitmapHistogramTransform(expected.get(), &faded);
        EXPECT_EQ(got.bytes, expected.bytes);
        ASSERT_EQ(run(VLPLRunIntensityMapProcessor, intensity, got2.get(), strength), 1);
        VorBitmapIntensityMap(expected2.get(), &faded, VOR_BLEND_OVERLAY, 0.8 * strength);
        EXPECT_EQ(got2.bytes, expected2.bytes);
        EXPECT_EQ(strength == 0.0, got.unchanged() && got2.unchanged()) << strength;
    }
}

TEST(MapProcessors, MissingOrMalformedKeysFailBeforeAnyPixel) {
    const std::string ramp = json_array(sample_map().map[1]), tail = ramp.substr(ramp.find(',')) + "}";
    const std::string r = R"({"histMap": {"r":)" + ramp + R"(,"g":)" + ramp + R"(,"b":)";
    const Adapter mapping = VLPLRunHistogramMappingProcessor, intensity = VLPLRunIntensityMapProcessor;
    const std::pair<Adapter, std::string> cases[] = {
        {mapping, r + json_array(sample_map().map[1], 255) + "}}"},  // 255 elements
        {mapping, r + ramp.substr(0, ramp.size() - 1) + ",0]}}"},     // 257 elements
        {mapping, r + "[256" + tail + "}"}, {mapping, r + "[-1" + tail + "}"}, {mapping, r + "[3.5" + tail + "}"},
        {mapping, r + "[\"1\"" + tail + "}"}, {mapping, R"({"histMap": {"r":)" + ramp + R"(,"b":)" + ramp + "}}"},
        {mapping, R"({})"}, {mapping, R"([1])"},
        {intensity, r + "[256" + tail + R"(, "alpha": 1})"},
    };
    for (const auto& [adapter, text] : cases) {
        TestBitmap b(4, 3);
        EXPECT_EQ(run(adapter, text, b.get()), 0) << text.substr(0, 60);
        EXPECT_TRUE(b.unchanged());
    }
}

}  // namespace
