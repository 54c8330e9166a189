#include <gtest/gtest.h>

#include <cstring>

#include "zentra_vorlite.h"

namespace {

// Parses a JSON value for a decoder; freed at the end of the scope.
struct Json {
    yajl_val value;
    explicit Json(const char* text) : value(yajl_tree_parse(text, nullptr, 0)) {}
    ~Json() { yajl_tree_free(value); }
};

TEST(ColorDecoder, AcceptsIntegersInRangeAndRejectsTheRest) {
    struct Case {
        const char* json;
        bool ok;
    };
    const Case cases[] = {
        {R"({"r": 1, "g": 2, "b": 3, "a": 255})", true},
        {R"({"a": 0, "b": 0, "g": 0, "r": 0, "x": "extra"})", true},
        {R"({"r": 1, "g": 2, "b": 3, "a": 256})", false},
        {R"({"r": -1, "g": 2, "b": 3, "a": 4})", false},
        {R"({"r": 1, "g": 2, "b": 3})", false},
        {R"({"r": 1, "g": "2", "b": 3, "a": 4})", false},
        {R"({"r": 1.5, "g": 2, "b": 3, "a": 4})", false},  // fractions are out of integer range
        {R"({"r": 1e2, "g": 2, "b": 3, "a": 4})", false},
        {R"({"r": 99999999999999999999, "g": 2, "b": 3, "a": 4})", false},
        {R"({"r": -99999999999999999999, "g": 2, "b": 3, "a": 4})", false},
        {R"([1, 2, 3, 4])", false},
    };
    for (const Case& c : cases) {
        Json j(c.json);
        ASSERT_NE(j.value, nullptr) << c.json;
        VorColor out{9, 9, 9, 9};
        EXPECT_EQ(VLPLColorFromColorVal(j.value, &out), c.ok ? 1 : 0) << c.json;
        if (!c.ok) {
            const VorColor untouched{9, 9, 9, 9};
            EXPECT_EQ(std::memcmp(&out, &untouched, 4), 0) << c.json;
        }
    }
    Json j(R"({"r": 1, "g": 2, "b": 3, "a": 255})");
    VorColor out{};
    ASSERT_EQ(VLPLColorFromColorVal(j.value, &out), 1);
    EXPECT_EQ(out.r, 1);
    EXPECT_EQ(out.g, 2);
    EXPECT_EQ(out.b, 3);
    EXPECT_EQ(out.a, 255);
    EXPECT_EQ(VLPLColorFromColorVal(nullptr, &out), 0);
}

TEST(BlendModeDecoder, UnknownOrMissingMeansNormalAndNeverFails) {
    struct Case {
        const char* json;
        int mode;
    };
    const Case cases[] = {
        {R"("normal")", 0},   {R"("overlay")", 1}, {R"("color")", 2},   {R"("screen")", 3},
        {R"("darken")", 4},   {R"("multiply")", 5}, {R"("Multiply")", 0}, {R"("softLight")", 0},
        {R"("")", 0},         {"5", 0},             {R"({"mode": "screen"})", 0},
    };
    for (const Case& c : cases) {
        Json j(c.json);
        int mode = -1;
        EXPECT_EQ(VLPLBlendModeFromBlendModeVal(j.value, &mode), 1) << c.json;
        EXPECT_EQ(mode, c.mode) << c.json;
    }
    int mode = -1;
    EXPECT_EQ(VLPLBlendModeFromBlendModeVal(nullptr, &mode), 1);
    EXPECT_EQ(mode, 0);
}

TEST(BlendAroundIdentity, PullsTowardTheIdentityInSinglePrecision) {
    EXPECT_EQ(VLPLBlendAroundIdentity(2.0f, 1.0f, 0.5f), 1.5f);
    EXPECT_EQ(VLPLBlendAroundIdentity(2.0f, 1.0f, 0.0f), 1.0f);
    EXPECT_EQ(VLPLBlendAroundIdentity(0.3f, 1.0f, 1.0f), 0.3f);
    EXPECT_EQ(VLPLBlendAroundIdentity(2.0f, 1.0f, 2.0f), 3.0f);  // strength extrapolates
}

}  // namespace
