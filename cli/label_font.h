// The gallery's label font: 5 x 7 cells a glyph.
#pragma once

namespace vorlite::cli {

inline constexpr int k_glyph_width = 5;
inline constexpr int k_glyph_height = 7;

// Whether the cell at (column, row) of the character's glyph is set;
// characters without a glyph are blank.
bool glyph_cell(char c, int column, int row);

}  // namespace vorlite::cli
