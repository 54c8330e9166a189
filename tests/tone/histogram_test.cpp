#include <gtest/gtest.h>

#include <cstring>
#include <string>
#include <vector>

#include "zentra_vorlite.h"

namespace {

// A bitmap whose bytes lean toward 0 and 255, with a distinctive alpha.
struct Pixels {
    VorBitmap bitmap{};
    std::vector<uint8_t> before;
    Pixels(uint32_t width, uint32_t height) {
        VorBitmapBuild(&bitmap, width, height);
        uint32_t s = 1;
        for (size_t i = 0; i < size_t{width} * height * 4; ++i) {
            s = s * 1103515245u + 12345u;
            const uint8_t v = static_cast<uint8_t>(s >> 16);
            bitmap.data[i] = (i % 4 == 3) ? static_cast<uint8_t>(42 + i / 4) : (v < 16 ? 0 : v > 240 ? 255 : v);
        }
        before.assign(bitmap.data, bitmap.data + size_t{width} * height * 4);
    }
    ~Pixels() { VorBitmapFree(&bitmap); }
    bool unchanged() const { return std::memcmp(bitmap.data, before.data(), before.size()) == 0; }
};

VorHistMap sample_map() {
    VorHistMap m;
    for (int i = 0; i < 256; ++i) {
        m.map[0][i] = static_cast<uint8_t>(255 - i);
        m.map[1][i] = static_cast<uint8_t>(i / 2);
        m.map[2][i] = static_cast<uint8_t>(i * 7 + 3);
    }
    return m;
}

std::string json_array(const uint8_t* levels, int count = 256) {
    std::string s = "[";
    for (int i = 0; i < count; ++i) {
        if (i > 0) s += ',';
        s += std::to_string(levels[i]);
    }
    return s + "]";
}

std::string json_map(const VorHistMap& m) {
    return R"({"r":)" + json_array(m.map[0]) + R"(,"g":)" + json_array(m.map[1]) + R"(,"b":)" +
           json_array(m.map[2]) + "}";
}

struct Json {
    yajl_val tree;
    explicit Json(const std::string& text) : tree(yajl_tree_parse(text.c_str(), nullptr, 0)) {
        EXPECT_NE(tree, nullptr) << text;
    }
    ~Json() { yajl_tree_free(tree); }
};

VLPLRunOptions at_strength(double strength) {
    VLPLRunOptions o;
    VorEffectInitParams(&o);
    o.strength = strength;
    return o;
}

TEST(HistMaps, FadeMovesTowardIdentityRoundingHalfUpAndClamping) {
    VorHistMap m;
    const struct {
        double amount;
        uint8_t entry, level, expected;
    } cases[] = {{0.5, 255, 0, 128}, {0.5, 10, 11, 11}, {2.0, 255, 0, 255}, {2.0, 0, 255, 0}};
    for (const auto& c : cases) {
        VorHistMapSetIdentity(&m);
        m.map[1][c.level] = c.entry;
        VorHistMapFade(&m, c.amount);
        EXPECT_EQ(m.map[1][c.level], c.expected) << c.amount << " " << int{c.entry};
    }
}

TEST(HistMaps, ComposeTransformAndBuildTouchEachColourChannelOnly) {
    const VorHistMap m = sample_map();
    VorHistMap invert, composed = m;
    for (int c = 0; c < 3; ++c) {
        for (int i = 0; i < 256; ++i) invert.map[c][i] = static_cast<uint8_t>(255 - i);
    }
    VorHistMapMap(&composed, &invert);  // m first, then invert
    Pixels p(7, 13);
    VorHistogram h{}, expected{};
    VorHistogramBuild(&p.bitmap, &h);
    VorHistogramBuild(&p.bitmap, &h);  // adds to the counts already there
    VorBitmapHistogramTransform(&p.bitmap, &composed);
    for (size_t i = 0; i < p.before.size(); i += 4) {
        for (int c = 0; c < 3; ++c) {
            expected.count[c][p.before[i + c]] += 2;
            ASSERT_EQ(p.bitmap.data[i + c], 255 - m.map[c][p.before[i + c]]);
        }
        ASSERT_EQ(p.bitmap.data[i + 3], p.before[i + 3]);
    }
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

TEST(IntensityMap, PicksTheMapColourAtTheRoundedLuminance) {
    const VorHistMap m = sample_map();
    const struct {
        VorColor pixel;
        int level;
    } cases[] = {{{255, 0, 0, 7}, 54}, {{0, 255, 0, 8}, 182}, {{255, 255, 255, 12}, 255},
                 {{0, 1, 0, 14}, 1}, {{2, 0, 0, 15}, 0}};  // 0.715 rounds up, 0.425 down
    for (const auto& c : cases) {
        VorColor px = c.pixel;
        VorBitmap b{reinterpret_cast<uint8_t*>(&px), 1, 1};
        VorBitmapIntensityMap(&b, &m, VOR_BLEND_NORMAL, 1.0);
        EXPECT_EQ((std::vector<int>{px.r, px.g, px.b, px.a}),
                  (std::vector<int>{m.map[0][c.level], m.map[1][c.level], m.map[2][c.level], c.pixel.a}));
    }
}

TEST(MapProcessors, StrengthFadesTheMapAndScalesTheIntensityOpacity) {
    const VorHistMap m = sample_map();
    Json mapping(R"({"histMap":)" + json_map(m) + "}");
    Json intensity(R"({"blendMode": "overlay", "alpha": 0.8, "histMap":)" + json_map(m) + "}");
    for (double strength : {1.0, 0.5, 0.0}) {
        const VLPLRunOptions o = at_strength(strength);
        VorHistMap faded = m;
        VorHistMapFade(&faded, strength);
        Pixels got(9, 5), expected(9, 5), got2(9, 5), expected2(9, 5);
        ASSERT_EQ(VLPLRunHistogramMappingProcessor(mapping.tree, &got.bitmap, &o), 1);
        VorBitmapHistogramTransform(&expected.bitmap, &faded);
        EXPECT_EQ(std::memcmp(got.bitmap.data, expected.bitmap.data, got.before.size()), 0);
        ASSERT_EQ(VLPLRunIntensityMapProcessor(intensity.tree, &got2.bitmap, &o), 1);
        VorBitmapIntensityMap(&expected2.bitmap, &faded, VOR_BLEND_OVERLAY, 0.8 * strength);
        EXPECT_EQ(std::memcmp(got2.bitmap.data, expected2.bitmap.data, got2.before.size()), 0);
        EXPECT_EQ(strength == 0.0, got.unchanged() && got2.unchanged()) << strength;
    }
}

TEST(MapProcessors, MissingOrMalformedKeysFailBeforeAnyPixel) {
    const std::string map = json_map(sample_map());
    const std::string ramp = json_array(sample_map().map[1]), tail = ramp.substr(ramp.find(',')) + "}}";
    const std::string r = R"({"histMap": {"r":)" + ramp + R"(,"g":)" + ramp + R"(,"b":)";
    using Adapter = int (*)(const yajl_val, VorBitmap*, const VLPLRunOptions*);
    const Adapter mapping = VLPLRunHistogramMappingProcessor, intensity = VLPLRunIntensityMapProcessor;
    const std::pair<Adapter, std::string> cases[] = {
        {mapping, r + json_array(sample_map().map[1], 255) + "}}"},  // 255 elements
        {mapping, r + ramp.substr(0, ramp.size() - 1) + ",0]}}"},     // 257 elements
        {mapping, r + "[256" + tail}, {mapping, r + "[-1" + tail}, {mapping, r + "[3.5" + tail},
        {mapping, r + "[\"1\"" + tail}, {mapping, R"({"histMap": {"r":)" + ramp + R"(,"b":)" + ramp + "}}"},
        {mapping, R"({})"}, {mapping, R"([1])"},
        {intensity, R"({"histMap":)" + map + "}"}, {intensity, R"({"histMap":)" + map + R"(, "alpha": "1"})"},
        {intensity, r + "[256" + tail.substr(0, tail.size() - 1) + R"(, "alpha": 1})"},
    };
    const VLPLRunOptions o = at_strength(1.0);
    for (const auto& [adapter, text] : cases) {
        Json j(text);
        Pixels p(4, 3);
        EXPECT_EQ(adapter(j.tree, &p.bitmap, &o), 0) << text.substr(0, 60);
        EXPECT_TRUE(p.unchanged());
    }
}

}  // namespace
