// Helpers the legacy effects share: the local date the camera displays
// stamp, and the dot-matrix type's measures.
#ifndef VORLITE_LEGACY_INTERNAL_H
#define VORLITE_LEGACY_INTERNAL_H

#include <cstdint>
#include <string>

#include "zentra_vorlite.h"

namespace vorlite::legacy {

// A calendar day as the displays print it.
struct LocalDate {
    int year;     // e.g. 2026
    int month;    // 1..12
    int day;      // 1..31
    int weekday;  // 0 Sunday .. 6 Saturday
};

// Today in the local time zone: the only input of the legacy effects that
// is not an argument. A test fixes it with set_date_for_tests.
LocalDate current_date();
// While date is non-null, current_date returns it; null restores the clock.
void set_date_for_tests(const LocalDate* date);

// The date as "%a %b %d %Y" prints it in the C locale, in capitals for the
// dot-matrix font: "TUE NOV 24 2026".
std::string date_text(const LocalDate& date);

// Dot-matrix glyphs are 5 dots wide and 7 high; a character advances 6
// dots. Text width in dots for n characters.
inline constexpr int k_glyph_columns = 5;
inline constexpr int k_glyph_rows = 7;
inline constexpr int k_glyph_advance = 6;
inline float text_width(std::size_t characters, float pitch) {
    return characters == 0 ? 0.0f
                           : (static_cast<float>(characters) * k_glyph_advance - 1.0f) * pitch;
}

// Whether the glyph of c has a dot at (column, row); characters outside
// the font have none, lower-case letters other than f and s read as
// capitals.
bool glyph_dot(char c, int column, int row);
// Whether c has a glyph of its own in the font (space counts as one).
bool in_font(char c);

}  // namespace vorlite::legacy

#endif
