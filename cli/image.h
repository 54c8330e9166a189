// Photos in memory, their files, and the errors the tool reports.
#pragma once

#include <cstdint>
#include <filesystem>
#include <optional>
#include <stdexcept>
#include <string>
#include <vector>

#include "zentra_vorlite.h"

namespace vorlite::cli {

// A processing failure: one line for standard error, already naming the
// file it concerns; the tool exits with status 1.
class Failure : public std::runtime_error {
public:
    using std::runtime_error::runtime_error;
};

// A usage error, found from the arguments alone; the tool exits with status 2.
class UsageError : public std::runtime_error {
public:
    using std::runtime_error::runtime_error;
};

// The library's pixel layout: 4 bytes a pixel, red, green, blue, alpha,
// rows without gaps.
struct Image {
    uint32_t width = 0;
    uint32_t height = 0;
    std::vector<uint8_t> rgba;

    Image() = default;
    Image(uint32_t w, uint32_t h) : width(w), height(h), rgba(std::size_t{4} * w * h) {}
    VorBitmap bitmap() { return VorBitmap{rgba.data(), width, height}; }
    uint8_t* pixel(uint32_t x, uint32_t y) { return rgba.data() + 4 * (std::size_t{y} * width + x); }
    const uint8_t* pixel(uint32_t x, uint32_t y) const {
        return rgba.data() + 4 * (std::size_t{y} * width + x);
    }
};

enum class Format { png, jpeg };

// The format a file name asks for: .png, .jpg or .jpeg in any case.
std::optional<Format> format_for_path(const std::filesystem::path& path);
// The format of a file name, or a usage error naming it.
Format require_format(const std::filesystem::path& path);

// True when every pixel is opaque, so a PNG needs no alpha channel.
bool is_opaque(const Image& image);

// Turns a photo stored in EXIF orientation 1..8 upright; other values
// leave it as it is.
Image orient_upright(const Image& image, int exif_orientation);

// The two images next to each other on a white ground with a thin gap,
// tops aligned.
Image side_by_side(const Image& left, const Image& right);

// Area-average reduction to width x height, each at most the image's own
// and at least 1: every source pixel counts toward the one it falls in.
Image reduced(const Image& image, uint32_t width, uint32_t height);
// Bilinear enlargement of all four bytes to width x height, each at least
// the image's own, with pixel centres aligned: a premultiplied layer stays
// premultiplied.
Image enlarged(const Image& image, uint32_t width, uint32_t height);

// Reads a PNG or JPEG (by extension) into RGBA; JPEGs are turned upright
// by their EXIF orientation. Throws Failure with a line naming the file.
Image read_image(const std::filesystem::path& path);
// Writes a PNG (with alpha only when some pixel needs it) or a JPEG at the
// given quality (1..100), by extension. Throws Failure naming the file.
void write_image(const Image& image, const std::filesystem::path& path, int quality);

// PNGs are written with the Paeth filter and run-length coding unless a
// zlib level 0..9 is set, which writes them with libpng's adaptive filters
// at that level (9 for the smallest files).
void set_png_level(std::optional<int> level);
std::optional<int> png_level();

// Whole file contents; throws Failure naming the file.
std::string read_file(const std::filesystem::path& path);

}  // namespace vorlite::cli
