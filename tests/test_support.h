// Shared scaffolding for the library tests: bitmaps that own their pixels,
// a snapshot to compare against, a byte checksum for golden values and a
// JSON-parameters runner for processor adapters.
#pragma once

#include <array>
#include <cstddef>
#include <cstdint>
#include <string>
#include <vector>

#include "zentra_vorlite.h"

namespace vorlite::test {

constexpr uint8_t kAlpha = 42;  // no tool writes 42 into alpha by accident

// w x h pixels owning their bytes; `before` is the snapshot the comparisons use.
struct TestBitmap {
    uint32_t width, height;
    std::vector<uint8_t> bytes, before;
    VorBitmap bitmap;

    // Bytes from a seeded generator, a quarter each at 0 and 255 (where
    // clamping and rounding turn), the rest spread; alpha kAlpha.
    explicit TestBitmap(uint32_t w, uint32_t h, uint32_t seed = 1)
        : width(w), height(h), bytes(std::size_t{w} * h * 4), bitmap{bytes.data(), w, h} {
        uint32_t s = seed * 2654435761u + w * 31u + h;
        for (std::size_t i = 0; i < bytes.size(); ++i) {
            s = s * 1103515245u + 12345u;
            const uint32_t pick = (s >> 16) & 3, level = s >> 24;
            bytes[i] = i % 4 == 3 ? kAlpha : pick == 0 ? 0 : pick == 1 ? 255 : static_cast<uint8_t>(level);
        }
        before = bytes;
    }
    // Every pixel the colour c.
    TestBitmap(uint32_t w, uint32_t h, VorColor c) : TestBitmap(w, h) {
        for (std::size_t i = 0; i < bytes.size(); ++i) bytes[i] = (&c.r)[i % 4];
        before = bytes;
    }
    TestBitmap(const TestBitmap& o)
        : width(o.width), height(o.height), bytes(o.bytes), before(o.before), bitmap{bytes.data(), width, height} {}
    TestBitmap& operator=(const TestBitmap&) = delete;

    VorBitmap* get() { return &bitmap; }
    uint8_t& at(uint32_t x, uint32_t y, int channel) { return bytes[(std::size_t{y} * width + x) * 4 + channel]; }
    VorColor pixel(std::size_t i) const { return {bytes[4 * i], bytes[4 * i + 1], bytes[4 * i + 2], bytes[4 * i + 3]}; }

    void snapshot() { before = bytes; }
    bool unchanged() const { return bytes == before; }
    bool alpha_kept() const {
        for (std::size_t i = 3; i < bytes.size(); i += 4)
            if (bytes[i] != before[i]) return false;
        return true;
    }
    bool operator==(const TestBitmap& o) const { return width == o.width && bytes == o.bytes; }
};

// The four channels as numbers, so that a failed comparison prints them.
inline std::array<int, 4> rgba(const VorColor& c) { return {c.r, c.g, c.b, c.a}; }

// FNV-1a over the bytes: one number that changes with any byte, for golden values.
inline uint32_t checksum(const uint8_t* data, std::size_t n) {
    uint32_t h = 2166136261u;
    for (std::size_t i = 0; i < n; ++i) h = (h ^ data[i]) * 16777619u;
    return h;
}
inline uint32_t checksum(const std::vector<uint8_t>& bytes) { return checksum(bytes.data(), bytes.size()); }
inline uint32_t checksum(const TestBitmap& b) { return checksum(b.bytes); }

// A parsed JSON text, freed with the scope; null when the text does not parse.
struct Json {
    yajl_val value;
    explicit Json(const std::string& text) : value(yajl_tree_parse(text.c_str(), nullptr, 0)) {}
    Json(const Json&) = delete;
    Json& operator=(const Json&) = delete;
    ~Json() { yajl_tree_free(value); }
};

inline VLPLRunOptions run_options(double strength = 1.0, uint32_t seed = 0) {
    VLPLRunOptions o;
    VorEffectInitParams(&o);
    o.strength = strength;
    o.seed = seed;
    return o;
}

// A histogram map of saturated colours that change from level to level,
// so that every blend mode, the colour mode included, moves the pixels.
inline VorHistMap sample_map() {
    VorHistMap m;
    for (int i = 0; i < 256; ++i) {
        m.map[0][i] = static_cast<uint8_t>(255 - i);
        m.map[1][i] = static_cast<uint8_t>(i / 2);
        m.map[2][i] = static_cast<uint8_t>(i * 7 + 3);
    }
    return m;
}

using Adapter = int (*)(const yajl_val, VorBitmap*, const VLPLRunOptions*);

// Runs a processor adapter on a JSON parameters text; -1 when the text does not parse.
inline int run(Adapter adapter, const std::string& parameters, VorBitmap* bitmap, double strength = 1.0,
               uint32_t seed = 0) {
    const Json json(parameters);
    if (json.value == nullptr) return -1;
    const VLPLRunOptions o = run_options(strength, seed);
    return adapter(json.value, bitmap, &o);
}

}  // namespace vorlite::test
