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
    Pixels(uint32_t width, uint32_t height, uint32_t seed = 1) {
        VorBitmapBuild(&bitmap, width, height);
        uint32_t s = seed;
        for (size_t i = 0; i < size_t{width} * height * 4; ++i) {
            s = s * 1103515245u + 12345u;
            const uint8_t v = static_cast<uint8_t>(s >> 16);
            bitmap.data[i] = (i % 4 == 3) ? static_cast<uint8_t>(42 + i / 4) : (v < 16 ? 0 : v > 240 ? 255 : v);
        }
        before.assign(bitmap.data, bitmap.data + size_t{width} * height * 4);
    }
    ~Pixels() { VorBitmapFree(&bitmap); }
    bool unchanged() const { return std::memcmp(bitmap.data, before.data(), before.size()) == 0; }
    bool alpha_unchanged() const {
        for (size_t i = 3; i < before.size(); i += 4) {
            if (bitmap.data[i] != before[i]) return false;
        }
        return true;
    }
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
    return R"({"r":)" + json_array(m.map[0]) + R"(,"g":)" + json_array(m.map[1]) +
           R"(,"b":)" + json_array(m.map[2]) + "}";
}

struct Json {
    yajl_val tree;
    explicit Json(const std::string& text) {
        char error[128];
        tree = yajl_tree_parse(text.c_str(), error, sizeof error);
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

TEST(HistMaps, FadeMovesTowardIdentityRoundingHalfUp) {
    const VorHistMap original = sample_map();
    VorHistMap m = original;
    VorHistMapFade(&m, 1.0);
    EXPECT_EQ(std::memcmp(&m, &original, sizeof m), 0);

    VorHistMap identity;
    VorHistMapSetIdentity(&identity);
    m = original;
    VorHistMapFade(&m, 0.0);
    EXPECT_EQ(std::memcmp(&m, &identity, sizeof m), 0);

    struct Case {
        double amount;
        uint8_t entry, level, expected;
    };
    const Case cases[] = {
        {0.5, 255, 0, 128},   // 127.5 rounds up
        {0.5, 0, 255, 128},   // 127.5 from the identity side
        {0.5, 10, 11, 11},    // 10.5 rounds up
        {2.0, 255, 0, 255},   // extrapolation clamps above
        {2.0, 0, 255, 0},     // and below
        {-1.0, 100, 50, 0},   // -100 + 100 = 0
    };
    for (const Case& c : cases) {
        VorHistMapSetIdentity(&m);
        m.map[1][c.level] = c.entry;
        VorHistMapFade(&m, c.amount);
        EXPECT_EQ(m.map[1][c.level], c.expected) << c.amount << " " << int{c.entry};
    }
}

TEST(HistMaps, ComposeAndTransformMapEachChannelAndKeepAlpha) {
    VorHistMap m = sample_map();
    VorHistMap invert;
    for (int c = 0; c < 3; ++c) {
        for (int i = 0; i < 256; ++i) invert.map[c][i] = static_cast<uint8_t>(255 - i);
    }
    VorHistMap composed = m;
    VorHistMapMap(&composed, &invert);  // m first, then invert
    for (const auto& [w, h] : {std::pair{7u, 13u}, std::pair{1u, 31u}, std::pair{29u, 1u}}) {
        Pixels p(w, h);
        VorBitmapHistogramTransform(&p.bitmap, &composed);
        for (size_t i = 0; i < p.before.size(); i += 4) {
            for (int c = 0; c < 3; ++c) ASSERT_EQ(p.bitmap.data[i + c], 255 - m.map[c][p.before[i + c]]);
        }
        EXPECT_TRUE(p.alpha_unchanged());
    }
    // A bitmap without pixels is left alone by every function.
    VorBitmap empty{nullptr, 0, 5};
    VorBitmapHistogramTransform(&empty, &m);
    VorBitmapIntensityMap(&empty, &m, VOR_BLEND_COLOR, 1.0);
    VorBitmapIntensityMap(&empty, &m, VOR_BLEND_NORMAL, 1.0);
    VorBitmapContrastCurve(&empty, 2.0f);
    VorBitmapGamma(&empty, 2.0f);
    VorHistogram hist{}, zero{};
    VorHistogramBuild(&empty, &hist);
    EXPECT_EQ(std::memcmp(&hist, &zero, sizeof hist), 0);
}

TEST(Histograms, BuildAddsToExistingCounts) {
    Pixels p(11, 7);
    VorHistogram h{};
    VorHistogramBuild(&p.bitmap, &h);
    VorHistogram expected{};
    for (size_t i = 0; i < p.before.size(); i += 4) {
        for (int c = 0; c < 3; ++c) ++expected.count[c][p.before[i + c]];
    }
    EXPECT_EQ(std::memcmp(&h, &expected, sizeof h), 0);
    VorHistogramBuild(&p.bitmap, &h);
    for (int c = 0; c < 3; ++c) {
        for (int i = 0; i < 256; ++i) ASSERT_EQ(h.count[c][i], 2 * expected.count[c][i]);
    }
    EXPECT_TRUE(p.unchanged());
}

TEST(CumulativeDistributions, NormaliseOrFallBackToUniform) {
    VorHistogram h{};
    h.count[0][0] = 1;
    h.count[0][255] = 3;
    h.count[2][10] = 5;
    VorCDF cdf;
    VorHistogram2CDF(&h, &cdf);
    EXPECT_EQ(cdf.cdf[0][0], 0.25);
    EXPECT_EQ(cdf.cdf[0][254], 0.25);
    EXPECT_EQ(cdf.cdf[0][255], 1.0);
    EXPECT_EQ(cdf.cdf[2][9], 0.0);
    EXPECT_EQ(cdf.cdf[2][10], 1.0);
    // Green counted nothing: the uniform ramp i / 255.
    for (int i = 0; i < 256; ++i) EXPECT_DOUBLE_EQ(cdf.cdf[1][i], i / 255.0);
    for (double p : {0.1, 0.37, 0.5, 0.999}) EXPECT_NEAR(VorCDFINV(cdf.cdf[1], p), p * 255, 1e-9);
}

TEST(CumulativeDistributions, InverseHandlesEveryRangeOfP) {
    double cdf[256];
    cdf[0] = 0.2;
    for (int i = 1; i < 256; ++i) cdf[i] = 0.5 + (i - 1) * (0.4999 / 254);  // ends at 0.9999
    EXPECT_EQ(VorCDFINV(cdf, 0.0), 0.0);
    EXPECT_EQ(VorCDFINV(cdf, -3.0), 0.0);
    EXPECT_EQ(VorCDFINV(cdf, 1.0), 255.0);
    EXPECT_EQ(VorCDFINV(cdf, 7.0), 255.0);
    EXPECT_DOUBLE_EQ(VorCDFINV(cdf, 0.1), 0.5);           // below the first entry: p / cdf[0]
    EXPECT_DOUBLE_EQ(VorCDFINV(cdf, 0.35), 0.5);          // halfway from 0.2 to cdf[1]
    EXPECT_DOUBLE_EQ(VorCDFINV(cdf, cdf[7]), 7.0);        // an entry itself
    EXPECT_EQ(VorCDFINV(cdf, 0.99995), 255.0);            // above the last entry, below 1
}

TEST(HistMapJson, DecodesAndRejectsMalformedMaps) {
    const VorHistMap expected = sample_map();
    VorHistMap m;
    {
        Json j(json_map(expected));
        ASSERT_EQ(VLPLHistMapfromHistMapVal(j.tree, &m), 1);
        EXPECT_EQ(std::memcmp(&m, &expected, sizeof m), 0);
    }
    // Only the low 32 bits of an integer count.
    std::string wrapped = json_map(expected);
    wrapped.replace(wrapped.find("[255"), 4, "[4294967551");
    {
        Json j(wrapped);
        ASSERT_EQ(VLPLHistMapfromHistMapVal(j.tree, &m), 1);
        EXPECT_EQ(m.map[0][0], 255);
    }
    const std::string ramp = json_array(expected.map[1]);
    const std::string r = R"({"r":)" + ramp + R"(,"g":)" + ramp + R"(,"b":)";
    const std::string bad[] = {
        r + json_array(expected.map[1], 255) + "}",  // 255 elements
        r + ramp.substr(0, ramp.size() - 1) + ",0]}",  // 257 elements
        r + "[256" + ramp.substr(ramp.find(',')) + "}",
        r + "[-1" + ramp.substr(ramp.find(',')) + "}",
        r + "[3.5" + ramp.substr(ramp.find(',')) + "}",
        r + "[1e1" + ramp.substr(ramp.find(',')) + "}",
        r + "[\"1\"" + ramp.substr(ramp.find(',')) + "}",
        r + "{}}",
        R"({"r":)" + ramp + R"(,"b":)" + ramp + "}",  // no "g"
        "[" + ramp + "]",
    };
    for (const std::string& text : bad) {
        Json j(text);
        EXPECT_EQ(VLPLHistMapfromHistMapVal(j.tree, &m), 0) << text.substr(0, 80);
    }
    EXPECT_EQ(VLPLHistMapfromHistMapVal(nullptr, &m), 0);
}

TEST(IntensityMap, PicksTheMapColourAtTheRoundedLuminance) {
    // Normal mode at full opacity lays the mapped colour down exactly.
    const VorHistMap m = sample_map();
    struct Case {
        VorColor pixel;
        int level;
    };
    const Case cases[] = {
        {{255, 0, 0, 7}, 54},     // 54.231
        {{0, 255, 0, 8}, 182},    // 182.366
        {{0, 0, 255, 9}, 18},     // 18.403
        {{200, 200, 200, 10}, 200},
        {{255, 255, 255, 12}, 255},
        {{0, 1, 0, 14}, 1},       // 0.715 rounds up
        {{2, 0, 0, 15}, 0},       // 0.425 rounds down
    };
    for (const Case& c : cases) {
        VorColor px = c.pixel;
        VorBitmap b{reinterpret_cast<uint8_t*>(&px), 1, 1};
        VorBitmapIntensityMap(&b, &m, VOR_BLEND_NORMAL, 1.0);
        EXPECT_EQ(px.r, m.map[0][c.level]) << c.level;
        EXPECT_EQ(px.g, m.map[1][c.level]) << c.level;
        EXPECT_EQ(px.b, m.map[2][c.level]) << c.level;
        EXPECT_EQ(px.a, c.pixel.a);
    }
}

TEST(IntensityMap, EqualsBlendingTheMappedColourOntoEachPixel) {
    const VorHistMap m = sample_map();
    for (uint32_t mode = 0; mode <= 7; ++mode) {
        for (double alpha : {1.0, 0.37, 0.0, 1.5}) {
            Pixels p(61, 19, mode + 3);
            VorBitmapIntensityMap(&p.bitmap, &m, mode, alpha);
            for (size_t i = 0; i < p.before.size(); i += 4) {
                VorColor base;
                std::memcpy(&base, &p.before[i], 4);
                const float y = (base.g * 0.71516f + base.r * 0.212671f) + base.b * 0.072169f;
                const int level = y <= 254.5f ? static_cast<int>(static_cast<double>(y) + 0.5) : 255;
                const VorColor layer{m.map[0][level], m.map[1][level], m.map[2][level], 255};
                VorColorBlend(&base, &layer, mode, static_cast<float>(alpha));
                ASSERT_EQ(std::memcmp(&p.bitmap.data[i], &base, 4), 0)
                    << "mode " << mode << " alpha " << alpha << " pixel " << i / 4;
            }
        }
    }
}

TEST(MapProcessors, StrengthFadesTheMapAndScalesTheIntensityOpacity) {
    const VorHistMap m = sample_map();
    const std::string map = json_map(m);
    Json mapping(R"({"histMap":)" + map + "}");
    Json intensity(R"({"blendMode": "overlay", "alpha": 0.8, "histMap":)" + map + "}");
    for (double strength : {1.0, 0.5, 0.0, 1.7}) {
        const VLPLRunOptions o = at_strength(strength);
        VorHistMap faded = m;
        VorHistMapFade(&faded, strength);
        Pixels got(9, 5), expected(9, 5);
        ASSERT_EQ(VLPLRunHistogramMappingProcessor(mapping.tree, &got.bitmap, &o), 1);
        VorBitmapHistogramTransform(&expected.bitmap, &faded);
        EXPECT_EQ(std::memcmp(got.bitmap.data, expected.bitmap.data, got.before.size()), 0);

        Pixels got2(9, 5), expected2(9, 5);
        ASSERT_EQ(VLPLRunIntensityMapProcessor(intensity.tree, &got2.bitmap, &o), 1);
        VorBitmapIntensityMap(&expected2.bitmap, &faded, VOR_BLEND_OVERLAY, 0.8 * strength);
        EXPECT_EQ(std::memcmp(got2.bitmap.data, expected2.bitmap.data, got2.before.size()), 0);
        // Strength 0: an identity map at opacity 0 changes nothing.
        EXPECT_EQ(strength == 0.0, got.unchanged() && got2.unchanged()) << strength;
    }
}

TEST(MapProcessors, MissingOrMalformedKeysFailBeforeAnyPixel) {
    const std::string map = json_map(sample_map());
    std::string broken = map;
    broken.replace(broken.rfind(']') - 3, 3, "256");  // last blue entry out of range
    using Adapter = int (*)(const yajl_val, VorBitmap*, const VLPLRunOptions*);
    const Adapter mapping = VLPLRunHistogramMappingProcessor, intensity = VLPLRunIntensityMapProcessor;
    const std::pair<Adapter, std::string> cases[] = {
        {mapping, R"({})"},
        {mapping, R"({"histMap": []})"},
        {mapping, R"({"histMap":)" + broken + "}"},
        {mapping, R"([1])"},
        {intensity, R"({"alpha": 1})"},
        {intensity, R"({"histMap":)" + map + "}"},
        {intensity, R"({"histMap":)" + map + R"(, "alpha": "1"})"},
        {intensity, R"({"histMap":)" + broken + R"(, "alpha": 1})"},
        {intensity, R"([])"},
    };
    const VLPLRunOptions o = at_strength(1.0);
    for (const auto& [adapter, text] : cases) {
        Json j(text);
        Pixels p(4, 3);
        EXPECT_EQ(adapter(j.tree, &p.bitmap, &o), 0) << text.substr(0, 60);
        EXPECT_TRUE(p.unchanged());
    }
    Pixels p(4, 3);
    EXPECT_EQ(mapping(nullptr, &p.bitmap, &o), 0);
    EXPECT_EQ(intensity(nullptr, &p.bitmap, &o), 0);
    // An absent, unknown or non-string blend mode is normal blending.
    for (const char* mode : {"", R"("blendMode": "Multiply",)", R"("blendMode": 3,)"}) {
        Json j(std::string("{") + mode + R"("alpha": 1, "histMap":)" + map + "}");
        Pixels got(4, 3), expected(4, 3);
        const VorHistMap m = sample_map();
        VorBitmapIntensityMap(&expected.bitmap, &m, VOR_BLEND_NORMAL, 1.0);
        EXPECT_EQ(intensity(j.tree, &got.bitmap, &o), 1) << mode;
        EXPECT_EQ(std::memcmp(got.bitmap.data, expected.bitmap.data, got.before.size()), 0) << mode;
    }
}

}  // namespace
