// Camera displays laid over a photo: the date stamp of a film compact, a
// camcorder's viewfinder, an autofocus finder's read-out, a travel
// camera's place stamp, a plain date display and a digital compact's LCD.
// Every size is a share of the photo's smaller side, so a display reads
// the same at 640 x 480 and at 12 megapixels; the seed picks the numbers.
#include <algorithm>
#include <array>
#include <cmath>
#include <cstdio>
#include <string>

#include "legacy/legacy_internal.h"

namespace vorlite::legacy {

namespace {

constexpr VorColor k_white{255, 255, 255, 235};
constexpr VorColor k_shadow{0, 0, 0, 110};
constexpr VorColor k_led{255, 148, 40, 235};
constexpr VorColor k_led_glow{255, 110, 20, 70};
constexpr VorColor k_green{120, 255, 120, 235};
constexpr VorColor k_red{255, 40, 30, 255};
constexpr VorColor k_panel{0, 0, 0, 120};

// One percent of the smaller side: the unit every display is measured in.
float unit_of(const VorBitmap& b) { return static_cast<float>(std::min(b.width, b.height)) / 100.0f; }

float width_of(const VorBitmap& b) { return static_cast<float>(b.width); }
float height_of(const VorBitmap& b) { return static_cast<float>(b.height); }

VorColor faded(VorColor c, float opacity) {
    c.a = static_cast<std::uint8_t>(std::clamp(static_cast<float>(c.a) * opacity, 0.0f, 255.0f));
    return c;
}

// Two read-out fields two spaces apart, as a camera's screen sets them.
std::string two_fields(const char* first, const char* second) {
    char text[64];
    std::snprintf(text, sizeof text, "%s  %s", first, second);
    return text;
}

// Text with a soft shadow below and to the right, legible on any photo.
void shadowed_text(VorBitmap* b, const std::string& text, float x, float y, float pitch, VorColor colour) {
    const VorColor shadow = faded(k_shadow, static_cast<float>(colour.a) / 255.0f);
    const float offset = pitch * 0.6f;
    VorDotMatrix(b, text.c_str(), x + offset, y + offset, pitch, &shadow, VOR_BLEND_NORMAL);
    VorDotMatrix(b, text.c_str(), x, y, pitch, &colour, VOR_BLEND_NORMAL);
}

// Text that glows: a wide faint halo screened under each dot, as a
// light-emitting stamp exposes the film.
void glowing_text(VorBitmap* b, const std::string& text, float x, float y, float pitch, VorColor core,
                  VorColor glow) {
    for (std::size_t i = 0; i < text.size(); ++i) {
        const float left = x + static_cast<float>(i * k_glyph_advance) * pitch;
        for (int row = 0; row < k_glyph_rows; ++row) {
            for (int column = 0; column < k_glyph_columns; ++column) {
                if (!glyph_dot(text[i], column, row)) continue;
                VorDotMatrixDot(b, left + static_cast<float>(column) * pitch, y + static_cast<float>(row) * pitch,
                                pitch * 1.1f, &glow, VOR_BLEND_SCREEN);
            }
        }
    }
    VorDotMatrix(b, text.c_str(), x, y, pitch, &core, VOR_BLEND_SCREEN);
}

// A filled rectangle, clipped, blended at the colour's alpha.
void fill_rect(VorBitmap* b, float x0, float y0, float x1, float y1, VorColor colour) {
    const float h = y1 - y0;
    if (!(h > 0.0f)) return;
    VorDrawLine(b, x0 + h * 0.5f, y0 + h * 0.5f, x1 - h * 0.5f, y0 + h * 0.5f, h, &colour, VOR_BLEND_NORMAL);
}

// An outlined rectangle of lines of width w.
void outline(VorBitmap* b, float x0, float y0, float x1, float y1, float w, VorColor colour) {
    VorDrawLine(b, x0, y0, x1, y0, w, &colour, VOR_BLEND_NORMAL);
    VorDrawLine(b, x1, y0, x1, y1, w, &colour, VOR_BLEND_NORMAL);
    VorDrawLine(b, x1, y1, x0, y1, w, &colour, VOR_BLEND_NORMAL);
    VorDrawLine(b, x0, y1, x0, y0, w, &colour, VOR_BLEND_NORMAL);
}

// The four L-shaped corners of a frame, arms of the given length.
void corner_brackets(VorBitmap* b, float x0, float y0, float x1, float y1, float arm, float w, VorColor colour) {
    const std::array<std::array<float, 4>, 4> corners = {{{x0, y0, 1, 1}, {x1, y0, -1, 1}, {x0, y1, 1, -1}, {x1, y1, -1, -1}}};
    for (const auto& c : corners) {
        VorDrawLine(b, c[0], c[1], c[0] + c[2] * arm, c[1], w, &colour, VOR_BLEND_NORMAL);
        VorDrawLine(b, c[0], c[1], c[0], c[1] + c[3] * arm, w, &colour, VOR_BLEND_NORMAL);
    }
}

// A battery gauge with `bars` of three segments lit.
void battery(VorBitmap* b, float x, float y, float u, std::uint32_t bars, VorColor colour) {
    const float w = 7.0f * u, h = 3.2f * u, line = 0.35f * u;
    outline(b, x, y, x + w, y + h, line, colour);
    fill_rect(b, x + w, y + h * 0.3f, x + w + 0.7f * u, y + h * 0.7f, colour);
    const float gap = 0.5f * u;
    const float segment = (w - 4.0f * gap) / 3.0f;
    for (std::uint32_t i = 0; i < std::min(bars, 3u); ++i) {
        const float left = x + gap + static_cast<float>(i) * (segment + gap);
        fill_rect(b, left, y + gap, left + segment, y + h - gap, colour);
    }
}

std::uint32_t pick(VorRNG* rng, std::uint32_t n) { return VorRNGNextInt(rng) % n; }

std::string two_digits(std::uint32_t v) {
    char text[8];
    std::snprintf(text, sizeof text, "%02u", v % 100);
    return text;
}

bool usable(const VorBitmap* b) { return b != nullptr && b->data != nullptr && b->width > 0 && b->height > 0; }

}  // namespace

}  // namespace vorlite::legacy

extern "C" {

// A film compact's date stamp: orange LED digits burnt into the lower
// right corner, year month day of a seeded day in the late nineties.
VOR_API void VorCameraDisplay2Legacy(VorBitmap* bitmap, uint32_t seed) {
    using namespace vorlite::legacy;
    if (!usable(bitmap)) return;
    VorRNG rng;
    VorRNGSeed(&rng, seed);
    const std::uint32_t year = 88 + pick(&rng, 14);
    const std::uint32_t month = 1 + pick(&rng, 12);
    const std::uint32_t day = 1 + pick(&rng, 28);
    const std::string text = two_digits(year) + " " + std::to_string(month) + " " + std::to_string(day);
    const float u = unit_of(*bitmap);
    const float pitch = 0.6f * u;
    const float x = width_of(*bitmap) - 6.0f * u - text_width(text.size(), pitch);
    const float y = height_of(*bitmap) - 6.0f * u - 6.0f * pitch;
    glowing_text(bitmap, text, x, y, pitch, k_led, k_led_glow);
}

// A camcorder's viewfinder: the red recording lamp and REC, the tape
// speed, a battery gauge, framing corners and a running time code taken
// from the value.
VOR_API void VorCameraDisplay3Legacy(VorBitmap* bitmap, uint32_t value) {
    using namespace vorlite::legacy;
    if (!usable(bitmap)) return;
    const float u = unit_of(*bitmap);
    const float w = width_of(*bitmap), h = height_of(*bitmap);
    const float pitch = 0.55f * u;
    const float margin = 6.0f * u;
    corner_brackets(bitmap, margin, margin, w - margin, h - margin, 8.0f * u, 0.45f * u, k_white);
    const float top = margin + 2.0f * u;
    const float lamp_x = margin + 4.0f * u, lamp_y = top + 3.0f * pitch;
    VorRingFlare(bitmap, lamp_x, lamp_y, 1.6f * u, &k_red, VOR_BLEND_SCREEN);
    VorDotMatrixDot(bitmap, lamp_x, lamp_y, 1.1f * u, &k_red, VOR_BLEND_NORMAL);
    shadowed_text(bitmap, "REC", lamp_x + 2.5f * u, top, pitch, k_white);
    shadowed_text(bitmap, "SP", w - margin - 4.0f * u - text_width(2, pitch) - 11.0f * u, top, pitch, k_white);
    battery(bitmap, w - margin - 4.0f * u - 7.7f * u, top + 0.2f * u, u, 1 + value % 3, k_white);
    const std::uint32_t seconds = value % 36000u;
    const std::string code = two_digits(seconds / 3600) + ":" + two_digits(seconds / 60 % 60) + ":" +
                             two_digits(seconds % 60) + ":" + two_digits((value >> 16) % 25);
    shadowed_text(bitmap, code, w - margin - 4.0f * u - text_width(code.size(), pitch), h - margin - 2.0f * u - 7.0f * pitch,
                  pitch, k_white);
}

// An autofocus finder: the focus frame and its points in the middle, and
// a read-out of aperture, shutter speed and sensitivity on a dark strip
// below, with the focus-confirmation light. Strength sets how strongly
// the display shows.
VOR_API void VorCameraDisplay4Legacy(VorBitmap* bitmap, uint32_t seed, double strength) {
    using namespace vorlite::legacy;
    if (!usable(bitmap)) return;
    const float opacity = std::isnan(strength) ? 0.0f : static_cast<float>(std::clamp(strength, 0.0, 1.0));
    if (!(opacity > 0.0f)) return;
    VorRNG rng;
    VorRNGSeed(&rng, seed);
    static constexpr const char* k_apertures[] = {"f1.8", "f2.8", "f4", "f5.6", "f8", "f11"};
    static constexpr const char* k_speeds[] = {"1/60s", "1/125s", "1/250s", "1/500s", "1/1000s"};
    static constexpr const char* k_isos[] = {"ISO100", "ISO200", "ISO400", "ISO800"};
    static constexpr const char* k_compensation[] = {"-0.7", "-0.3", "+0.0", "+0.3", "+0.7"};
    // One draw per statement: the operands of + and of a call may be
    // evaluated in any order, and the ARM compiler picks another one.
    const char* aperture = k_apertures[pick(&rng, 6)];
    const char* speed = k_speeds[pick(&rng, 5)];
    const char* iso = k_isos[pick(&rng, 4)];
    const char* compensation = k_compensation[pick(&rng, 5)];
    const std::string readout =
        std::string(aperture) + "  " + speed + "  " + iso + "  " + compensation;
    const float u = unit_of(*bitmap);
    const float w = width_of(*bitmap), h = height_of(*bitmap);
    const VorColor green = faded(k_green, opacity);
    const VorColor frame = faded(k_white, opacity * 0.9f);
    // The focus frame and six points around it, the middle one lit.
    const float cx = w * 0.5f, cy = h * 0.5f;
    corner_brackets(bitmap, cx - 14.0f * u, cy - 10.0f * u, cx + 14.0f * u, cy + 10.0f * u, 3.5f * u, 0.35f * u, frame);
    const float points[][2] = {{-9, 0}, {9, 0}, {0, -5}, {0, 5}, {-5, 0}, {5, 0}};
    for (const auto& p : points) {
        const float x = cx + p[0] * u, y = cy + p[1] * u;
        outline(bitmap, x - 1.1f * u, y - 0.8f * u, x + 1.1f * u, y + 0.8f * u, 0.25f * u, frame);
    }
    const std::uint32_t lit = pick(&rng, 6);
    const float lx = cx + points[lit][0] * u, ly = cy + points[lit][1] * u;
    fill_rect(bitmap, lx - 1.1f * u, ly - 0.8f * u, lx + 1.1f * u, ly + 0.8f * u, faded(k_red, opacity * 0.85f));
    // The read-out strip.
    const float pitch = 0.5f * u;
    const float strip = 7.0f * pitch + 3.0f * u;
    fill_rect(bitmap, 0.0f, h - strip, w, h, faded(k_panel, opacity * 1.3f));
    const float y = h - strip + 1.5f * u;
    VorDotMatrix(bitmap, readout.c_str(), 4.0f * u, y, pitch, &green, VOR_BLEND_NORMAL);
    VorDotMatrixDot(bitmap, w - 5.0f * u, y + 3.0f * pitch, 1.0f * u, &green, VOR_BLEND_NORMAL);
}

// A travel camera's stamp: a seeded place name with its coordinates and
// height on a dark panel in the lower left, under a thin orange rule.
VOR_API void VorCameraDisplay5Legacy(VorBitmap* bitmap, uint32_t seed) {
    using namespace vorlite::legacy;
    if (!usable(bitmap)) return;
    static constexpr const char* k_places[] = {"ABERCRAVE", "ABILENE",   "AITH",        "BANFF",    "BLEAN",
                                               "CAARNDUNCAN", "CORRIEVORRIE", "COTTERSTOCK", "DALRYMPLE", "DRAFFAN",
                                               "DUBUQUE",   "EPSOM",     "FROLESWORTH", "GLASSEL",  "GOLANT",
                                               "HARPENDEN", "HASSOP",    "HOVE",        "POPCASTLE", "WINKLEY"};
    VorRNG rng;
    VorRNGSeed(&rng, seed);
    const std::string place = k_places[pick(&rng, 20)];
    char coordinates[48];
    const std::uint32_t north = 50 + pick(&rng, 8);
    const std::uint32_t north_hundredths = pick(&rng, 100);
    const std::uint32_t west = pick(&rng, 6);
    const std::uint32_t west_hundredths = pick(&rng, 100);
    std::snprintf(coordinates, sizeof coordinates, "N %u.%02u  W %u.%02u", north, north_hundredths, west,
                  west_hundredths);
    const std::string height = "ALT " + std::to_string(20 + pick(&rng, 900)) + "M";
    const float u = unit_of(*bitmap);
    const float h = height_of(*bitmap);
    const float big = 0.75f * u, small = 0.45f * u;
    const float width = std::max(text_width(place.size(), big), text_width(std::char_traits<char>::length(coordinates), small)) + 6.0f * u;
    const float panel = 7.0f * big + 2.0f * 7.0f * small + 9.0f * u;
    const float top = h - 5.0f * u - panel;
    fill_rect(bitmap, 5.0f * u, top, 5.0f * u + width, h - 5.0f * u, k_panel);
    const VorColor accent{255, 150, 50, 255};
    VorDrawLine(bitmap, 5.0f * u, top, 5.0f * u + width, top, 0.5f * u, &accent, VOR_BLEND_NORMAL);
    float y = top + 2.5f * u;
    VorDotMatrix(bitmap, place.c_str(), 8.0f * u, y, big, &k_white, VOR_BLEND_NORMAL);
    y += 7.0f * big + 2.5f * u;
    VorDotMatrix(bitmap, coordinates, 8.0f * u, y, small, &k_white, VOR_BLEND_NORMAL);
    y += 7.0f * small + 2.0f * u;
    VorDotMatrix(bitmap, height.c_str(), 8.0f * u, y, small, &accent, VOR_BLEND_NORMAL);
}

// A date display: today's date in warm white digits in the lower right.
VOR_API void VorCameraDisplay6Legacy(VorBitmap* bitmap) {
    using namespace vorlite::legacy;
    if (!usable(bitmap)) return;
    const std::string text = date_text(current_date());
    const float u = unit_of(*bitmap);
    const float pitch = 0.5f * u;
    const VorColor warm{255, 226, 160, 240};
    shadowed_text(bitmap, text, width_of(*bitmap) - 6.0f * u - text_width(text.size(), pitch),
                  height_of(*bitmap) - 6.0f * u - 7.0f * pitch, pitch, warm);
}

// A digital compact's screen: a grid of thirds, the exposure mode and
// white balance, a battery gauge, the flash-ready lamp, the shots left and
// the exposure along the bottom.
VOR_API void VorCameraDisplay7Legacy(VorBitmap* bitmap, uint32_t seed) {
    using namespace vorlite::legacy;
    if (!usable(bitmap)) return;
    VorRNG rng;
    VorRNGSeed(&rng, seed);
    const float u = unit_of(*bitmap);
    const float w = width_of(*bitmap), h = height_of(*bitmap);
    const VorColor grid{255, 255, 255, 70};
    for (int i = 1; i <= 2; ++i) {
        VorDrawLine(bitmap, w * static_cast<float>(i) / 3.0f, 0.0f, w * static_cast<float>(i) / 3.0f, h, 0.2f * u, &grid,
                    VOR_BLEND_NORMAL);
        VorDrawLine(bitmap, 0.0f, h * static_cast<float>(i) / 3.0f, w, h * static_cast<float>(i) / 3.0f, 0.2f * u, &grid,
                    VOR_BLEND_NORMAL);
    }
    static constexpr const char* k_modes[] = {"P", "A", "S", "M"};
    static constexpr const char* k_balance[] = {"AWB", "*", "~"};
    const float pitch = 0.5f * u;
    const float margin = 4.0f * u;
    const char* exposure_mode = k_modes[pick(&rng, 4)];
    const std::string mode = two_fields(exposure_mode, k_balance[pick(&rng, 3)]);
    shadowed_text(bitmap, mode, margin, margin, pitch, k_white);
    battery(bitmap, w - margin - 7.7f * u, margin, u, 1 + pick(&rng, 3), k_white);
    const VorColor lamp{255, 170, 60, 255};
    VorRingFlare(bitmap, w - margin - 12.0f * u, margin + 1.6f * u, 1.3f * u, &lamp, VOR_BLEND_SCREEN);
    const std::string shots = std::to_string(8 + pick(&rng, 400));
    static constexpr const char* k_speeds[] = {"1/30", "1/60", "1/125", "1/250"};
    static constexpr const char* k_apertures[] = {"f2.8", "f4.0", "f5.6", "f8.0"};
    const char* speed = k_speeds[pick(&rng, 4)];
    const std::string exposure = two_fields(speed, k_apertures[pick(&rng, 4)]);
    const float bottom = h - margin - 7.0f * pitch;
    shadowed_text(bitmap, exposure, margin, bottom, pitch, k_white);
    shadowed_text(bitmap, shots, w - margin - text_width(shots.size(), pitch), bottom, pitch, k_white);
}

}  // extern "C"
