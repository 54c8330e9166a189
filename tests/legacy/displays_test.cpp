#include <gtest/gtest.h>

#include <cmath>
#include <cstring>
#include <limits>
#include <set>
#include <string>
#include <vector>

#include "legacy/legacy_internal.h"
#include "tests/test_support.h"
#include "zentra_vorlite.h"

namespace {

using vorlite::test::checksum;
using vorlite::test::Json;
using vorlite::test::run_options;
using vorlite::test::TestBitmap;

constexpr const char* k_font = "%&~{}^><:-+./*|@ABCDEFGHIJKLMNOPQRSTUVWXYZfs1234567890";

std::string glyph_of(char c) {
    std::string dots;
    for (int row = 0; row < vorlite::legacy::k_glyph_rows; ++row)
        for (int column = 0; column < vorlite::legacy::k_glyph_columns; ++column)
            dots += vorlite::legacy::glyph_dot(c, column, row) ? '#' : '.';
    return dots;
}

// Holds the displays' clock at one day while a test runs.
class FixedDay {
public:
    explicit FixedDay(vorlite::legacy::LocalDate date) : date_(date) { vorlite::legacy::set_date_for_tests(&date_); }
    ~FixedDay() { vorlite::legacy::set_date_for_tests(nullptr); }
    FixedDay(const FixedDay&) = delete;
    FixedDay& operator=(const FixedDay&) = delete;

private:
    vorlite::legacy::LocalDate date_;
};

int run_named(const std::string& name, VorBitmap* bitmap, uint32_t seed = 7) {
    const Json json("{\"legacyName\": \"" + name + "\"}");
    VLPLRunOptions options = run_options(1.0, seed);
    options.bordersEnabled = 1;
    return VLPLRunLegacyProcessor(json.value, bitmap, &options);
}

// The box of pixels an overlay changed, as shares of the picture's sides.
struct Extent {
    double left, top, right, bottom;
};

Extent changed_extent(const TestBitmap& b) {
    uint32_t x0 = b.width, y0 = b.height, x1 = 0, y1 = 0;
    for (uint32_t y = 0; y < b.height; ++y)
        for (uint32_t x = 0; x < b.width; ++x) {
            const std::size_t i = (std::size_t{y} * b.width + x) * 4;
            if (std::memcmp(&b.bytes[i], &b.before[i], 4) == 0) continue;
            x0 = std::min(x0, x);
            y0 = std::min(y0, y);
            x1 = std::max(x1, x);
            y1 = std::max(y1, y);
        }
    return {double(x0) / b.width, double(y0) / b.height, double(x1 + 1) / b.width, double(y1 + 1) / b.height};
}

TEST(DotMatrix, EveryCharacterOfTheFontHasAGlyphOfItsOwn) {
    std::set<std::string> seen;
    for (const char* c = k_font; *c != '\0'; ++c) {
        EXPECT_TRUE(vorlite::legacy::in_font(*c)) << *c;
        const std::string dots = glyph_of(*c);
        EXPECT_NE(dots.find('#'), std::string::npos) << *c;
        EXPECT_TRUE(seen.insert(dots).second) << "glyph of " << *c << " repeats another";
    }
    // Lower case reads as capitals, except the two letters the font draws small.
    EXPECT_EQ(glyph_of('k'), glyph_of('K'));
    EXPECT_NE(glyph_of('f'), glyph_of('F'));
    EXPECT_NE(glyph_of('s'), glyph_of('S'));
    EXPECT_FALSE(vorlite::legacy::in_font('#'));
    EXPECT_EQ(glyph_of('#'), std::string(35, '.'));
}

TEST(DotMatrix, TextLinesAndDotsClipAtEveryEdge) {
    const VorColor ink{250, 10, 10, 255};
    const float places[] = {-1e9f, -40.0f, -3.5f, 0.0f, 7.0f, 30.5f, 1e9f,
                            std::numeric_limits<float>::quiet_NaN(), std::numeric_limits<float>::infinity()};
    for (const float p : places) {
        TestBitmap b(31, 17);
        VorDotMatrix(b.get(), "WED NOV 25 2026 %&~{}^><:-+./*|@", p, p * 0.5f, 2.0f, &ink, VOR_BLEND_NORMAL);
        VorDotMatrixDot(b.get(), p, 8.0f, 6.0f, &ink, VOR_BLEND_SCREEN);
        VorDrawLine(b.get(), p, -p, 15.0f, 8.0f, 3.0f, &ink, VOR_BLEND_MULTIPLY);
        EXPECT_TRUE(b.alpha_kept()) << p;
    }
    for (const float pitch : {0.0f, -2.0f, std::numeric_limits<float>::quiet_NaN(), 1e30f}) {
        TestBitmap b(31, 17);
        VorDotMatrix(b.get(), "8", 0.0f, 0.0f, pitch, &ink, VOR_BLEND_NORMAL);
        EXPECT_TRUE(b.unchanged()) << pitch;
    }
}

TEST(DotMatrix, TextIsSetInTheGlyphsAtItsPitch) {
    // On white, a dot of normal-blended black at pitch 4 darkens its centre
    // fully; the centre of a blank dot stays white.
    TestBitmap b(64, 40, VorColor{255, 255, 255, 255});
    const VorColor black{0, 0, 0, 255};
    VorDotMatrix(b.get(), "4", 10.0f, 8.0f, 4.0f, &black, VOR_BLEND_NORMAL);
    for (int row = 0; row < vorlite::legacy::k_glyph_rows; ++row)
        for (int column = 0; column < vorlite::legacy::k_glyph_columns; ++column) {
            const uint8_t level = b.at(10 + column * 4, 8 + row * 4, 0);
            EXPECT_EQ(level, vorlite::legacy::glyph_dot('4', column, row) ? 0 : 255) << column << "," << row;
        }
}

TEST(DisplayClock, DatesPrintAsTheCLocaleInCapitals) {
    EXPECT_EQ(vorlite::legacy::date_text({2026, 11, 24, 2}), "TUE NOV 24 2026");
    EXPECT_EQ(vorlite::legacy::date_text({1999, 1, 5, 0}), "SUN JAN 05 1999");
    // A clock gone wrong still prints a date of the same shape.
    EXPECT_EQ(vorlite::legacy::date_text({-4, 13, 0, 9}), "SUN JAN 01 1970");
}

TEST(DisplayClock, TheDateStampFollowsTheClockAndNothingElse) {
    for (const char* name : {"veskBorder", "lanaiBorder"}) {
        TestBitmap a(240, 160, VorColor{90, 120, 150, 255}), b = a, c = a;
        {
            const FixedDay day({2026, 11, 24, 2});
            run_named(name, a.get());
            run_named(name, b.get());
        }
        {
            const FixedDay day({2027, 3, 1, 1});
            run_named(name, c.get());
        }
        EXPECT_TRUE(a == b) << name;
        EXPECT_FALSE(a == c) << name;
    }
}

TEST(CameraDisplays, EveryOverlayKeepsItsPlaceAtEverySize) {
    const FixedDay day({2026, 11, 24, 2});
    const char* const names[] = {"narwBorder", "kairoBorder", "colosBorder", "lanaiBorder",
                                 "claretBorder", "umbraBorder", "veskBorder", "rubraBorder"};
    for (const char* name : names) {
        TestBitmap small(320, 240, VorColor{128, 128, 128, 255});
        TestBitmap large(1280, 960, VorColor{128, 128, 128, 255});
        run_named(name, small.get());
        run_named(name, large.get());
        const Extent s = changed_extent(small), l = changed_extent(large);
        // Within two percent of the picture: the same relative size, not
        // the same pixel size.
        EXPECT_NEAR(s.left, l.left, 0.02) << name;
        EXPECT_NEAR(s.top, l.top, 0.02) << name;
        EXPECT_NEAR(s.right, l.right, 0.02) << name;
        EXPECT_NEAR(s.bottom, l.bottom, 0.02) << name;
    }
}

// Every entry of the catalogue on a small picture, with the clock held:
// the looks decided after seeing them on photos. A change here is a
// change of design.
TEST(LegacyLooks, EveryEntryKeepsTheLookItWasDesignedWith) {
    const FixedDay day({2026, 11, 24, 2});
    const struct {
        const char* name;
        uint32_t sum;
    } looks[] = {
        {"mar_tessaBorder", 1360301979u},
        {"kip_coolBorder", 1984550687u},
        {"veskBorder", 534904326u},
        {"skarnBorder", 4145797715u},
        {"nerioBorder", 2888224508u},
        {"kvantBorder", 539872498u},
        {"holmvaleBorder", 1246507934u},
        {"duskoBorder", 2458347656u},
        {"rubraBorder", 4080034476u},
        {"bi_chromeBorder", 2096905517u},
        {"pallorBorder", 1616930930u},
        {"corvaleBorder", 3853192335u},
        {"emberlyBorder", 2388326833u},
        {"terrowBorder", 3586926169u},
        {"zenitBorder", 1312217760u},
        {"old_kvantBorder", 3567216676u},
        {"lira_griffinBorder", 610966523u},
        {"tawnetBorder", 1297771992u},
        {"narwBorder", 1111116654u},
        {"kairoBorder", 2691994362u},
        {"colosBorder", 4065545559u},
        {"lanaiBorder", 667736478u},
        {"claretBorder", 2296583504u},
        {"umbraBorder", 1350036823u},
        {"corvaleFlare", 2161165457u},
        {"emberlyFlare", 3658749302u},
        {"soft_focus", 3189236610u},
        {"mar_tessaAutoColors", 3310201568u},
        {"glimmoBWBorder", 602680060u},
        {"glimmoTintypeBorder", 3567378244u},
        {"glimmoTintypeColorMatrixTransform", 1652951264u},
        {"glimmoTintypeDiamondSquare", 1424607527u},
        {"glimmoVintageColorMatrixTransform", 939245228u},
        {"murmelGrittyPSSat", 3029648389u},
        {"murmelGrittyDots", 947271591u},
        {"murmelBWPSSat", 110255788u},
        {"murmelCinematicPSSat", 3715921565u},
        {"clarityEnhance", 4007428203u},
    };
    for (const auto& look : looks) {
        TestBitmap b(160, 120, 11);
        ASSERT_EQ(run_named(look.name, b.get(), 2026), 1) << look.name;
        EXPECT_EQ(checksum(b), look.sum) << look.name;
    }
}

}  // namespace
