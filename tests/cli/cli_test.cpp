// The vorlite tool: its image files, and the built binary as a user runs it.
#include <gtest/gtest.h>
#include <libexif/exif-data.h>
#include <unistd.h>

#include <algorithm>
#include <cstdlib>
#include <fstream>
#include <map>
#include <sstream>
#include <string>
#include <vector>

#include "effect.h"
#include "image.h"
#include "label_font.h"

namespace fs = std::filesystem;
using vorlite::cli::Failure;
using vorlite::cli::Format;
using vorlite::cli::Image;

namespace {

struct Outcome {
    int status;
    std::string out;
    std::string err;
};

std::string slurp(const fs::path& path) {
    std::ifstream in(path, std::ios::binary);
    std::stringstream text;
    text << in.rdbuf();
    return text.str();
}

void spill(const fs::path& path, const std::string& bytes) {
    std::ofstream(path, std::ios::binary) << bytes;
}

// A photo-like image: gradients and a distinctive alpha.
Image sample(uint32_t w, uint32_t h, bool opaque) {
    Image image(w, h);
    for (uint32_t y = 0; y < h; ++y) {
        for (uint32_t x = 0; x < w; ++x) {
            uint8_t* p = image.pixel(x, y);
            p[0] = static_cast<uint8_t>(x * 255 / std::max(w - 1, 1u));
            p[1] = static_cast<uint8_t>(y * 255 / std::max(h - 1, 1u));
            p[2] = static_cast<uint8_t>((x + y) * 3);
            p[3] = opaque ? 255 : static_cast<uint8_t>(42 + x % 7);
        }
    }
    return image;
}

class Vorlite : public testing::Test {
protected:
    void SetUp() override {
        const auto* test = testing::UnitTest::GetInstance()->current_test_info();
        dir_ = fs::temp_directory_path() /
               ("vorlite-cli-" + std::to_string(getpid()) + "-" + test->test_suite_name() + "-" + test->name());
        fs::remove_all(dir_);
        fs::create_directories(dir_);
    }
    void TearDown() override { fs::remove_all(dir_); }

    fs::path file(const std::string& name) const { return dir_ / name; }

    fs::path document(const std::string& name, const std::string& text) const {
        spill(file(name), text);
        return file(name);
    }

    Outcome run(const std::string& arguments) const {
        const std::string command = std::string(VORLITE_TOOL) + " " + arguments + " >" +
                                    file("stdout").string() + " 2>" + file("stderr").string();
        const int raw = std::system(command.c_str());
        return {WIFEXITED(raw) ? WEXITSTATUS(raw) : -1, slurp(file("stdout")), slurp(file("stderr"))};
    }

    fs::path dir_;
};

std::size_t lines(const std::string& text) { return static_cast<std::size_t>(std::count(text.begin(), text.end(), '\n')); }

const char* const kNoise = R"({"identifier": "t", "processors": [
  {"name": "original", "parameters": {}},
  {"name": "noise", "parameters": {"intensity": 0.2}}]})";

}  // namespace

// ---- image files -------------------------------------------------------

TEST(CliImageFiles, ExtensionChoosesTheFormatInAnyCase) {
    const std::pair<const char*, std::optional<Format>> cases[] = {
        {"a.png", Format::png}, {"b.PNG", Format::png}, {"c.jpg", Format::jpeg},
        {"d.JpEg", Format::jpeg}, {"e.gif", std::nullopt}, {"png", std::nullopt}, {"f.png.txt", std::nullopt}};
    for (const auto& [name, format] : cases) EXPECT_EQ(vorlite::cli::format_for_path(name), format) << name;
}

TEST_F(Vorlite, PngRoundTripKeepsEveryByteWithOrWithoutAlphaAtEveryLevel) {
    const std::optional<int> levels[] = {std::nullopt, 0, 1, 6, 9};
    for (const std::optional<int> level : levels) {
        vorlite::cli::set_png_level(level);
        for (bool opaque : {false, true}) {
            const Image original = sample(13, 7, opaque);
            vorlite::cli::write_image(original, file("round.png"), 90);
            const Image back = vorlite::cli::read_image(file("round.png"));
            ASSERT_EQ(back.width, 13u);
            ASSERT_EQ(back.height, 7u);
            EXPECT_EQ(back.rgba, original.rgba) << (opaque ? "opaque" : "with alpha") << " " << level.value_or(-1);
        }
    }
    vorlite::cli::set_png_level(std::nullopt);
}

TEST_F(Vorlite, JpegRoundTripStaysCloseAndComesBackOpaque) {
    const Image original = sample(64, 48, false);
    vorlite::cli::write_image(original, file("round.jpg"), 95);
    const Image back = vorlite::cli::read_image(file("round.jpg"));
    ASSERT_EQ(back.width, 64u);
    ASSERT_EQ(back.height, 48u);
    long error = 0;
    for (std::size_t i = 0; i < back.rgba.size(); i += 4) {
        EXPECT_EQ(back.rgba[i + 3], 255);
        for (int c = 0; c < 3; ++c) error += std::abs(back.rgba[i + c] - original.rgba[i + c]);
    }
    EXPECT_LT(error / (64 * 48 * 3), 3);
}

TEST(CliOrientation, EveryExifOrientationComesOutUpright) {
    // A 3 x 2 photo stored with pixel values 0..5; each row gives the upright
    // result row by row for the EXIF orientation.
    Image stored(3, 2);
    for (uint32_t i = 0; i < 6; ++i) stored.rgba[4 * i] = static_cast<uint8_t>(i);
    const std::pair<int, std::vector<uint8_t>> cases[] = {
        {1, {0, 1, 2, 3, 4, 5}}, {2, {2, 1, 0, 5, 4, 3}}, {3, {5, 4, 3, 2, 1, 0}},
        {4, {3, 4, 5, 0, 1, 2}}, {5, {0, 3, 1, 4, 2, 5}}, {6, {3, 0, 4, 1, 5, 2}},
        {7, {5, 2, 4, 1, 3, 0}}, {8, {2, 5, 1, 4, 0, 3}}, {9, {0, 1, 2, 3, 4, 5}}};
    for (const auto& [orientation, expected] : cases) {
        const Image upright = vorlite::cli::orient_upright(stored, orientation);
        EXPECT_EQ(upright.width, orientation >= 5 && orientation <= 8 ? 2u : 3u) << orientation;
        std::vector<uint8_t> reds;
        for (std::size_t i = 0; i < upright.rgba.size(); i += 4) reds.push_back(upright.rgba[i]);
        EXPECT_EQ(reds, expected) << "orientation " << orientation;
    }
}

TEST_F(Vorlite, PhoneJpegTurnedByItsExifTagIsReadUpright) {
    // Left half red, right half blue, stored turned: orientation 6 asks for a
    // quarter turn clockwise, which puts the red half on top.
    Image stored(32, 16);
    for (uint32_t y = 0; y < 16; ++y) {
        for (uint32_t x = 0; x < 32; ++x) {
            uint8_t* p = stored.pixel(x, y);
            p[0] = x < 16 ? 255 : 0;
            p[2] = x < 16 ? 0 : 255;
            p[3] = 255;
        }
    }
    vorlite::cli::write_image(stored, file("plain.jpg"), 95);
    const std::string jpeg = slurp(file("plain.jpg"));

    ExifData* exif = exif_data_new();
    exif_data_set_byte_order(exif, EXIF_BYTE_ORDER_INTEL);
    ExifEntry* entry = exif_entry_new();
    exif_content_add_entry(exif->ifd[EXIF_IFD_0], entry);
    exif_entry_initialize(entry, EXIF_TAG_ORIENTATION);
    exif_set_short(entry->data, EXIF_BYTE_ORDER_INTEL, 6);
    unsigned char* payload = nullptr;
    unsigned int size = 0;
    exif_data_save_data(exif, &payload, &size);
    const std::string app1 = std::string("\xFF\xE1", 2) + static_cast<char>((size + 2) >> 8) +
                             static_cast<char>((size + 2) & 0xFF) +
                             std::string(reinterpret_cast<const char*>(payload), size);
    std::free(payload);
    exif_entry_unref(entry);
    exif_data_unref(exif);
    spill(file("phone.jpg"), jpeg.substr(0, 2) + app1 + jpeg.substr(2));

    const Image upright = vorlite::cli::read_image(file("phone.jpg"));
    ASSERT_EQ(upright.width, 16u);
    ASSERT_EQ(upright.height, 32u);
    EXPECT_GT(upright.pixel(8, 4)[0], 200);
    EXPECT_LT(upright.pixel(8, 4)[2], 60);
    EXPECT_GT(upright.pixel(8, 27)[2], 200);
    EXPECT_LT(upright.pixel(8, 27)[0], 60);
}

TEST_F(Vorlite, UnreadableFilesFailWithALineNamingThem) {
    vorlite::cli::write_image(sample(40, 30, true), file("whole.jpg"), 90);
    const std::string whole = slurp(file("whole.jpg"));
    spill(file("cut.jpg"), whole.substr(0, whole.size() / 2));
    spill(file("text.jpg"), "not a photo");
    spill(file("text.png"), "not a photo either");
    for (const char* name : {"cut.jpg", "text.jpg", "text.png", "missing.png"}) {
        try {
            vorlite::cli::read_image(file(name));
            ADD_FAILURE() << name << " was read";
        } catch (const Failure& error) {
            EXPECT_EQ(std::string(error.what()).rfind(file(name).string() + ": ", 0), 0u) << error.what();
        }
    }
}

// ---- check -------------------------------------------------------------

TEST_F(Vorlite, CheckExplainsExactlyWhyADocumentWillNotRun) {
    const std::pair<const char*, std::string> cases[] = {
        {"{\n  \"identifier\": \"t\",\n  \"processors\": [x]\n}", "line 3, column 18: invalid JSON (lexical error"},
        {"{\"identifier\": \"t\", \"processors\": [", "line 1, column 36: invalid JSON (parse error: premature EOF)"},
        {"[1, 2]", "the document is an array, not a JSON object"},
        {"{\"processors\": []}", "has no \"identifier\" string"},
        {"{\"identifier\": 7, \"processors\": []}", "\"identifier\" is a number, not a string"},
        {"{\"identifier\": \"t\", \"processors\": {}}", "\"processors\" is an object, not an array"},
        {"{\"identifier\": \"t\", \"processors\": [3]}", "processor 1 is a number, not an object"},
        {"{\"identifier\": \"t\", \"processors\": [{\"parameters\": {}}]}", "processor 1: has no \"name\" string"},
        {"{\"identifier\": \"t\", \"processors\": [{\"name\": \"original\", \"parameters\": []}]}",
         "processor 1 (\"original\"): \"parameters\" is an array, not an object"},
        {"{\"identifier\": \"t\", \"processors\": [{\"name\": \"original\", \"parameters\": {}},"
         " {\"name\": \"noize\", \"parameters\": {}}]}",
         "processor 2 (\"noize\"): unknown processor"},
        {"{\"identifier\": \"t\", \"processors\": [{\"name\": \"original\", \"parameters\": {}},"
         " {\"name\": \"noise\", \"parameters\": {\"intensity\": \"high\"}}]}",
         "processor 2 (\"noise\"): rejected its parameters {\"intensity\": \"high\"}"},
    };
    // A rejected 768-entry map still fits on one line.
    std::string ramp;
    for (int i = 0; i < 256; ++i) ramp += (i ? ", " : "") + std::to_string(i);
    const std::string short_map = "{\"identifier\": \"t\", \"processors\": [{\"name\": \"histogramMapping\", "
                                  "\"parameters\": {\"histMap\": {\"r\": [" + ramp + "], \"g\": [" + ramp +
                                  "], \"b\": [" + ramp.substr(0, ramp.rfind(',')) + "]}}}]}";
    std::vector<std::pair<std::string, std::string>> all(std::begin(cases), std::end(cases));
    all.emplace_back(short_map, "processor 1 (\"histogramMapping\"): rejected its parameters "
                                "{\"histMap\": {\"r\": [0, 1, 2, 3, ... 256 items], \"g\": [0, 1, 2, 3, ... 256 items], "
                                "\"b\": [0, 1, 2, 3, ... 255 items]}}");
    for (const auto& [text, message] : all) {
        const fs::path path = document("broken.json", text);
        const Outcome outcome = run("check " + path.string());
        EXPECT_EQ(outcome.status, 1) << text;
        EXPECT_EQ(outcome.err.rfind("vorlite: " + path.string() + ": " + message, 0), 0u)
            << "got: " << outcome.err;
        EXPECT_EQ(lines(outcome.err), 1u) << outcome.err;
    }
    // A device has no length; read as it comes, it is an empty document.
    const Outcome empty = run("check /dev/null");
    EXPECT_EQ(empty.status, 1);
    EXPECT_EQ(empty.err, "vorlite: /dev/null: line 1, column 1: invalid JSON (parse error: premature EOF)\n");
}

TEST_F(Vorlite, CheckPassesARunnableDocumentAndListsItsProcessors) {
    const Outcome outcome = run("check " + document("fine.json", kNoise).string());
    EXPECT_EQ(outcome.status, 0) << outcome.err;
    EXPECT_NE(outcome.out.find("runs; 2 processors (original, noise)"), std::string::npos) << outcome.out;
}

TEST(BundledLooks, EveryLookRunsWithTheProcessorsThatExist) {
    VLPLRunOptions options;
    VorEffectInitParams(&options);
    std::size_t looks = 0;
    for (const auto& entry : fs::directory_iterator(VORLITE_EFFECTS_DIR)) {
        if (entry.path().extension() != ".json") continue;
        ++looks;
        const auto verdict = vorlite::cli::check_effect(slurp(entry.path()), options);
        EXPECT_FALSE(verdict.error) << entry.path() << ": " << verdict.error.value_or("");
    }
    EXPECT_GE(looks, 8u);
}

// ---- apply, adjust, auto -----------------------------------------------

TEST_F(Vorlite, ApplyIsReproducibleFromItsSeedAndComparesSideBySide) {
    vorlite::cli::write_image(sample(40, 30, true), file("in.png"), 90);
    const std::string effect = document("noise.json", kNoise).string();
    const std::string in = file("in.png").string();
    ASSERT_EQ(run("apply " + effect + " " + in + " " + file("a.png").string() + " --seed 7").status, 0);
    ASSERT_EQ(run("apply " + effect + " " + in + " " + file("b.png").string() + " --seed 7").status, 0);
    ASSERT_EQ(run("apply " + effect + " " + in + " " + file("c.png").string() + " --seed 8").status, 0);
    EXPECT_EQ(slurp(file("a.png")), slurp(file("b.png")));
    EXPECT_NE(slurp(file("a.png")), slurp(file("c.png")));

    ASSERT_EQ(run("apply " + effect + " " + in + " " + file("pair.png").string() + " --seed 7 --compare").status, 0);
    const Image pair = vorlite::cli::read_image(file("pair.png"));
    const Image result = vorlite::cli::read_image(file("a.png"));
    const Image original = vorlite::cli::read_image(file("in.png"));
    ASSERT_EQ(pair.height, 30u);
    ASSERT_GT(pair.width, 80u);
    EXPECT_TRUE(std::equal(original.pixel(0, 5), original.pixel(40, 5), pair.pixel(0, 5)));
    EXPECT_TRUE(std::equal(result.pixel(0, 5), result.pixel(40, 5), pair.pixel(pair.width - 40, 5)));
}

TEST_F(Vorlite, ApplyWithABrokenDocumentWritesNothing) {
    vorlite::cli::write_image(sample(8, 8, true), file("in.png"), 90);
    const Outcome outcome =
        run("apply " + document("bad.json", "{").string() + " " + file("in.png").string() + " " + file("out.png").string());
    EXPECT_EQ(outcome.status, 1);
    EXPECT_EQ(lines(outcome.err), 1u);
    EXPECT_FALSE(fs::exists(file("out.png")));
}

TEST_F(Vorlite, AdjustAndAutoKeepAPngsTransparency) {
    vorlite::cli::write_image(sample(40, 30, false), file("in.png"), 90);
    const Image original = vorlite::cli::read_image(file("in.png"));
    const std::string in = file("in.png").string();
    ASSERT_EQ(run("adjust " + in + " " + file("grey.png").string() + " --saturation -100").status, 0);
    ASSERT_EQ(run("auto " + in + " " + file("clear.png").string() + " --clarity --enhance 1").status, 0);
    const Image grey = vorlite::cli::read_image(file("grey.png"));
    const Image clear = vorlite::cli::read_image(file("clear.png"));
    for (std::size_t i = 0; i < original.rgba.size(); i += 4) {
        EXPECT_EQ(grey.rgba[i], grey.rgba[i + 1]);
        EXPECT_EQ(grey.rgba[i + 1], grey.rgba[i + 2]);
        EXPECT_EQ(grey.rgba[i + 3], original.rgba[i + 3]);
        EXPECT_EQ(clear.rgba[i + 3], original.rgba[i + 3]);
    }
}

// ---- batch -------------------------------------------------------------

TEST_F(Vorlite, BatchGoesOnPastAnUnreadablePhotoAndExitsWith1) {
    fs::create_directories(file("in"));
    for (const char* name : {"a.png", "b.jpg", "c.JPEG"}) {
        vorlite::cli::write_image(sample(24, 16, true), file("in") / name, 90);
    }
    spill(file("in") / "broken.jpg", "not a photo");
    spill(file("in") / "notes.txt", "ignored");
    const Outcome outcome = run("batch " + document("noise.json", kNoise).string() + " " + file("in").string() +
                                " " + file("out").string() + " --jobs 3");
    EXPECT_EQ(outcome.status, 1);
    for (const char* name : {"a.png", "b.jpg", "c.JPEG"}) EXPECT_TRUE(fs::exists(file("out") / name)) << name;
    EXPECT_FALSE(fs::exists(file("out") / "broken.jpg"));
    EXPECT_FALSE(fs::exists(file("out") / "notes.txt"));
    EXPECT_EQ(lines(outcome.err), 1u) << outcome.err;
    EXPECT_NE(outcome.err.find((file("in") / "broken.jpg").string() + ": "), std::string::npos) << outcome.err;
    EXPECT_EQ(lines(outcome.out), 4u) << outcome.out;  // three photos and the summary
    EXPECT_NE(outcome.out.find("3 of 4 photos written"), std::string::npos) << outcome.out;
}

TEST_F(Vorlite, BatchOnEightThreadsWritesTheSerialBytes) {
    fs::create_directories(file("in"));
    for (int i = 0; i < 12; ++i) {
        vorlite::cli::write_image(sample(40 + i, 30, true), file("in") / ("p" + std::to_string(i) + ".png"), 90);
    }
    const std::string look = std::string(VORLITE_EFFECTS_DIR) + "/warm-crisp-grain.json";
    ASSERT_EQ(run("batch " + look + " " + file("in").string() + " " + file("serial").string() + " --jobs 1").status, 0);
    ASSERT_EQ(run("batch " + look + " " + file("in").string() + " " + file("eight").string() + " --jobs 8").status, 0);
    for (int i = 0; i < 12; ++i) {
        const std::string name = "p" + std::to_string(i) + ".png";
        EXPECT_EQ(vorlite::cli::read_image(file("eight") / name).rgba, vorlite::cli::read_image(file("serial") / name).rgba)
            << name;
    }
}

// ---- usage -------------------------------------------------------------

TEST_F(Vorlite, UsageErrorsExitWith2OnOneLine) {
    vorlite::cli::write_image(sample(8, 8, true), file("in.png"), 90);
    const std::string effect = document("noise.json", kNoise).string();
    const std::string in = file("in.png").string();
    const std::string cases[] = {
        "",
        "frobnicate",
        "apply " + effect,
        "apply " + effect + " " + in + " " + file("out.png").string() + " --strength nan",
        "apply " + effect + " " + in + " " + file("out.jpg").string() + " --quality 0",
        "apply " + effect + " " + in + " " + file("out.gif").string(),
        "apply " + effect + " " + in + " " + file("out.png").string() + " --png-level 10",
        "adjust " + in + " " + file("out.png").string(),
        "adjust " + in + " " + file("out.png").string() + " --warmth 101",
        "auto " + in + " " + file("out.png").string() + " --enhance 4",
        "batch " + effect + " " + dir_.string() + " " + dir_.string(),
        "batch " + effect + " " + dir_.string() + " " + file("out").string() + " --jobs 0",
        "info --verbose",
        "gallery",
        "gallery " + file("sheets").string() + " --photo " + file("photo.gif").string(),
        "gallery " + file("sheets").string() + " --format gif",
        "gallery " + file("sheets").string() + " --width 10",
    };
    for (const std::string& arguments : cases) {
        const Outcome outcome = run(arguments);
        EXPECT_EQ(outcome.status, 2) << arguments;
        EXPECT_EQ(lines(outcome.err), 1u) << arguments << "\n" << outcome.err;
        EXPECT_EQ(outcome.err.rfind("vorlite", 0), 0u) << outcome.err;
    }
    EXPECT_FALSE(fs::exists(file("out.png")));
}

TEST_F(Vorlite, HelpAndInfoSucceed) {
    for (const char* command : {"--help", "apply --help", "check --help", "adjust --help", "auto --help",
                                "batch --help", "info --help", "gallery --help"}) {
        const Outcome outcome = run(command);
        EXPECT_EQ(outcome.status, 0) << command;
        EXPECT_NE(outcome.out.find("Usage"), std::string::npos) << command;
    }
    const Outcome info = run("info");
    EXPECT_EQ(info.status, 0);
    EXPECT_NE(info.out.find("libzentra_vorlite 2.0.0"), std::string::npos) << info.out;
    EXPECT_NE(info.out.find("effect document format 1.0.1"), std::string::npos) << info.out;
    EXPECT_NE(info.out.find(" colorMatrixTransform "), std::string::npos) << info.out;
}

// ---- gallery -----------------------------------------------------------

TEST(CliLabelFont, EveryLabelCharacterHasItsOwnInkedGlyph) {
    const std::string characters =
        "abcdefghijklmnopqrstuvwxyzABCDEFGHIJKLMNOPQRSTUVWXYZ0123456789_-()";
    std::vector<std::string> glyphs;
    for (const char c : characters) {
        std::string cells;
        for (int row = 0; row < vorlite::cli::k_glyph_height; ++row) {
            for (int column = 0; column < vorlite::cli::k_glyph_width; ++column) {
                cells += vorlite::cli::glyph_cell(c, column, row) ? '#' : '.';
            }
        }
        EXPECT_NE(cells.find('#'), std::string::npos) << "blank glyph for '" << c << "'";
        for (std::size_t i = 0; i < glyphs.size(); ++i) {
            EXPECT_NE(cells, glyphs[i]) << "'" << c << "' drawn like '" << characters[i] << "'";
        }
        glyphs.push_back(cells);
    }
    EXPECT_FALSE(vorlite::cli::glyph_cell(' ', 2, 3));
    EXPECT_FALSE(vorlite::cli::glyph_cell('A', 5, 0));
}

TEST_F(Vorlite, GalleryDrawsEveryFamilyAsALabelledSheet) {
    // A photo narrower than a tile is drawn on as it is: tiles of 64 x 48 in
    // rows of four, 8 pixels apart, each over a 22-pixel label strip.
    constexpr uint32_t w = 64, h = 48, margin = 8, label = 22, columns = 4;
    const Image photo = sample(w, h, true);
    vorlite::cli::write_image(photo, file("photo.png"), 90);
    const Outcome outcome = run("gallery " + file("sheets").string() + " --photo " + file("photo.png").string());
    ASSERT_EQ(outcome.status, 0) << outcome.err;
    EXPECT_EQ(lines(outcome.out), 4u) << outcome.out;

    // 16 border styles (15 through VorBorders, the instant print); 19 flare
    // types, the ring and the two presets; 3 gradient shapes; the 38 legacy
    // effects. Every tile but the flare type that has no light differs from
    // the photo.
    struct Family {
        const char* sheet;
        std::size_t tiles;
        std::vector<std::size_t> unchanged;
    };
    const Family families[] = {{"borders.png", 16, {}}, {"flares.png", 22, {8}}, {"gradients.png", 3, {}}, {"legacy.png", 38, {}}};
    for (const Family& family : families) {
        const Image sheet = vorlite::cli::read_image(file("sheets") / family.sheet);
        const uint32_t rows = static_cast<uint32_t>((family.tiles + columns - 1) / columns);
        ASSERT_EQ(sheet.width, columns * (w + margin) + margin) << family.sheet;
        ASSERT_EQ(sheet.height, rows * (h + label + margin) + margin) << family.sheet;
        for (std::size_t i = 0; i < family.tiles; ++i) {
            const uint32_t left = margin + static_cast<uint32_t>(i % columns) * (w + margin);
            const uint32_t top = margin + static_cast<uint32_t>(i / columns) * (h + label + margin);
            std::size_t changed = 0;
            for (uint32_t y = 0; y < h; ++y) {
                for (uint32_t x = 0; x < w; ++x) {
                    changed += !std::equal(photo.pixel(x, y), photo.pixel(x, y) + 3, sheet.pixel(left + x, top + y));
                }
            }
            const bool drawn = std::find(family.unchanged.begin(), family.unchanged.end(), i) == family.unchanged.end();
            EXPECT_EQ(changed > 0, drawn) << family.sheet << ", tile " << i << ": " << changed << " pixels changed";
            // The label is dark ink on the light strip under the tile.
            std::size_t ink = 0;
            for (uint32_t y = top + h; y < top + h + label; ++y) {
                for (uint32_t x = left; x < left + w; ++x) ink += sheet.pixel(x, y)[0] < 100;
            }
            EXPECT_GT(ink, 20u) << family.sheet << ", label of tile " << i;
        }
    }

    // Scaled down and as JPEG, for pages that show them.
    const Outcome small = run("gallery " + file("small").string() + " --photo " + file("photo.png").string() +
                              " --width 160 --format jpg");
    ASSERT_EQ(small.status, 0) << small.err;
    for (const char* name : {"borders.jpg", "flares.jpg", "gradients.jpg"}) {
        EXPECT_EQ(vorlite::cli::read_image(file("small") / name).width, 160u) << name;
    }

    EXPECT_EQ(run("gallery " + file("sheets").string() + " --photo " + file("missing.png").string()).status, 1);
    // A file where the folder should be.
    EXPECT_EQ(run("gallery " + file("photo.png").string() + " --photo " + file("photo.png").string()).status, 1);
}

// ---- paint ---------------------------------------------------------------

TEST(CliScaling, ReductionAveragesAndEnlargementKeepsFlatAreas) {
    Image checker(4, 2);
    for (uint32_t i = 0; i < 8; ++i) checker.rgba[4 * i] = (i % 2) != 0 ? 200 : 100;
    const Image half = vorlite::cli::reduced(checker, 2, 1);
    EXPECT_EQ(half.rgba[0], 150);
    EXPECT_EQ(half.rgba[4], 150);
    Image flat(3, 2);
    std::fill(flat.rgba.begin(), flat.rgba.end(), uint8_t{77});
    const Image big = vorlite::cli::enlarged(flat, 31, 17);
    EXPECT_TRUE(std::all_of(big.rgba.begin(), big.rgba.end(), [](uint8_t b) { return b == 77; }));
    Image ramp(2, 1);
    ramp.rgba[0] = 0;
    ramp.rgba[4] = 255;
    const Image wide = vorlite::cli::enlarged(ramp, 8, 1);
    EXPECT_EQ(wide.rgba[0], 0) << "the outer pixels stay the source's";
    EXPECT_EQ(wide.rgba[28], 255);
    for (int x = 1; x < 8; ++x) EXPECT_GE(wide.rgba[4 * x], wide.rgba[4 * (x - 1)]);
}

TEST_F(Vorlite, PaintReplaysEveryExampleScriptReproducibly) {
    // A stand-in photo large enough for every script's coordinates, edited
    // on a small preview: each script's output is locked by its checksum.
    vorlite::cli::write_image(sample(640, 512, true), file("photo.png"), 90);
    std::map<std::string, uint32_t> sums;
    for (const auto& entry : fs::directory_iterator(VORLITE_TOOLS_DIR)) {
        if (entry.path().extension() != ".json") continue;
        const std::string name = entry.path().stem().string();
        const Outcome outcome = run("paint " + entry.path().string() + " " + file("photo.png").string() + " " +
                                    file(name + ".png").string() + " --preview-size 200x200");
        ASSERT_EQ(outcome.status, 0) << name << ": " << outcome.err;
        const Image out = vorlite::cli::read_image(file(name + ".png"));
        ASSERT_EQ(out.width, 640u);
        uint32_t h = 2166136261u;
        for (const uint8_t b : out.rgba) h = (h ^ b) * 16777619u;
        sums[name] = h;
    }
    const std::map<std::string, uint32_t> expected = {
        {"blur", 3404345282u},       {"blur-brush", 3645727101u}, {"darken", 1736301178u},
        {"desaturate-except", 3330077070u}, {"paint", 1617571091u}, {"red-eye", 1561416138u},
        {"sharpen", 2349510539u},    {"soften", 1981392263u},     {"tint-amber", 3875781411u},
        {"tint-rose", 2599914264u},  {"tint-warm", 2485482u},     {"whiten", 2259208467u},
    };
    EXPECT_EQ(sums, expected);
}

TEST_F(Vorlite, PaintWritesAFramePerGestureAtThePreviewSize) {
    vorlite::cli::write_image(sample(300, 200, true), file("photo.png"), 90);
    const fs::path script = document("s.json", R"({"tool": "blur-brush", "gestures": [
        {"type": "stroke", "radius": 12, "points": [[20, 20], [80, 40], [150, 30], [220, 90]]},
        {"type": "stroke", "radius": 12, "mode": "erase", "points": [[100, 35]]},
        {"type": "radial", "center": [150, 100], "radius": 40}]})");
    const Outcome outcome = run("paint " + script.string() + " " + file("photo.png").string() + " " +
                                file("out.png").string() + " --preview-size 150x150 --frames " + file("frames").string());
    ASSERT_EQ(outcome.status, 0) << outcome.err;
    std::vector<std::string> names;
    for (const auto& entry : fs::directory_iterator(file("frames"))) names.push_back(entry.path().filename().string());
    std::sort(names.begin(), names.end());
    EXPECT_EQ(names, (std::vector<std::string>{"frame-001.png", "frame-002.png", "frame-003.png"}));
    const Image frame = vorlite::cli::read_image(file("frames") / "frame-001.png");
    EXPECT_EQ(frame.width, 150u);
    EXPECT_EQ(frame.height, 100u);
    EXPECT_NE(slurp(file("frames") / "frame-001.png"), slurp(file("frames") / "frame-003.png"));
}

TEST_F(Vorlite, PaintRefusesEveryBadScriptWithOneLineAndWritesNothing) {
    vorlite::cli::write_image(sample(100, 80, true), file("photo.png"), 90);
    const std::string stroke = R"({"type": "stroke", "radius": 5, "points": [[10, 10]]})";
    const std::pair<const char*, std::string> cases[] = {
        {"line 1", "{\"tool\": "},
        {"expected an object", "[1, 2]"},
        {"unknown tool", R"({"tool": "smudge", "gestures": [)" + stroke + "]}"},
        {"gestures", R"({"tool": "paint", "gestures": []})"},
        {"gestures", R"({"tool": "paint"})"},
        {"unknown key", R"({"tool": "paint", "speed": 2, "gestures": [)" + stroke + "]}"},
        {"outside", R"({"tool": "paint", "gestures": [{"type": "stroke", "radius": 5, "points": [[10, 10], [100, 5]]}]})"},
        {"outside", R"({"tool": "paint", "gestures": [{"type": "stroke", "radius": 5, "points": [[-1, 10]]}]})"},
        {"radius", R"({"tool": "paint", "gestures": [{"type": "stroke", "radius": 0, "points": [[10, 10]]}]})"},
        {"radius", R"({"tool": "paint", "gestures": [{"type": "stroke", "radius": -3, "points": [[10, 10]]}]})"},
        {"radius", R"({"tool": "paint", "gestures": [{"type": "stroke", "radius": 1e400, "points": [[10, 10]]}]})"},
        {"points[0][0]", R"({"tool": "paint", "gestures": [{"type": "stroke", "radius": 5, "points": [["a", 10]]}]})"},
        {"points", R"({"tool": "paint", "gestures": [{"type": "stroke", "radius": 5, "points": []}]})"},
        {"unknown mode", R"({"tool": "paint", "gestures": [{"type": "stroke", "radius": 5, "mode": "color-aware", "points": [[1, 1]]}]})"},
        {"unknown gesture", R"({"tool": "paint", "gestures": [{"type": "spray"}]})"},
        {"shapes", R"({"tool": "tint-rose", "gestures": [)" + stroke + "]}"},
        {"strokes", R"({"tool": "paint", "gestures": [{"type": "radial", "center": [5, 5], "radius": 9}]})"},
        {"angle", R"({"tool": "blur", "gestures": [{"type": "linear", "center": [5, 5], "width": 9, "angle": 1e9}]})"},
        {"strength", R"({"tool": "paint", "strength": 2, "gestures": [)" + stroke + "]}"},
        {"color", R"({"tool": "paint", "color": {"r": 300}, "gestures": [)" + stroke + "]}"},
    };
    for (const auto& [fragment, text] : cases) {
        const fs::path script = document("bad.json", text);
        const Outcome outcome = run("paint " + script.string() + " " + file("photo.png").string() + " " +
                                    file("out.png").string());
        EXPECT_EQ(outcome.status, 2) << text;
        EXPECT_EQ(lines(outcome.err), 1u) << text << "\n" << outcome.err;
        EXPECT_NE(outcome.err.find(fragment), std::string::npos) << text << "\n" << outcome.err;
        EXPECT_FALSE(fs::exists(file("out.png"))) << text;
    }
    // A stroke of a thousand touches is a defined edit, not an error.
    std::string many = R"({"tool": "whiten", "gestures": [{"type": "stroke", "radius": 3, "points": [)";
    for (int i = 0; i < 1000; ++i) many += (i ? ", [" : "[") + std::to_string(i % 97) + ", " + std::to_string(i % 79) + "]";
    many += "]}]}";
    EXPECT_EQ(run("paint " + document("many.json", many).string() + " " + file("photo.png").string() + " " +
                  file("many.png").string())
                  .status,
              0);
}
