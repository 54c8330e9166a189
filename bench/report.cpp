#include "report.h"

#include <algorithm>
#include <cctype>
#include <cstdio>
#include <memory>
#include <set>
#include <sstream>
#include <vector>
#include <yajl/yajl_tree.h>

#include "catalogue.h"

namespace vorlite::bench::report {

namespace {

using Tree = std::unique_ptr<std::remove_pointer_t<yajl_val>, decltype(&yajl_tree_free)>;

yajl_val field(yajl_val object, const char* key, yajl_type type) {
    const char* path[] = {key, nullptr};
    return yajl_tree_get(object, path, type);
}

std::string string_field(yajl_val object, const char* key) {
    const yajl_val value = field(object, key, yajl_t_string);
    return value != nullptr ? YAJL_GET_STRING(value) : "";
}

bool number_field(yajl_val object, const char* key, double& out) {
    const yajl_val value = field(object, key, yajl_t_number);
    if (value == nullptr) return false;
    out = YAJL_GET_DOUBLE(value);
    return true;
}

double nanoseconds_per(const std::string& unit) {
    if (unit == "ns") return 1.0;
    if (unit == "us") return 1e3;
    if (unit == "ms") return 1e6;
    if (unit == "s") return 1e9;
    return 0.0;
}

// "lut/ours/12MP/min_time:0.300/real_time" -> "lut/ours/12MP".
std::string key_of(const std::string& run_name) {
    size_t end = 0;
    for (int parts = 0; parts < 3; ++parts) {
        end = run_name.find('/', end);
        if (end == std::string::npos) return parts == 2 ? run_name : "";
        ++end;
    }
    return run_name.substr(0, end - 1);
}

std::string key(const std::string& operation, const std::string& side, const BitmapSize& size) {
    return operation + "/" + side + "/" + size.label;
}

const Median* find(const Run& run, const std::string& k) {
    const auto it = run.medians.find(k);
    return it == run.medians.end() ? nullptr : &it->second;
}

std::string fixed(double value, int decimals) {
    char text[64];
    std::snprintf(text, sizeof text, "%.*f", decimals, value);
    return text;
}

std::string per_pixel(const Median* m) { return m != nullptr ? fixed(m->cpu_ns_per_pixel, 2) : "n/a"; }

std::string wall_per_pixel(const Median* m) { return m != nullptr ? fixed(m->wall_ns_per_pixel, 2) : "n/a"; }

// Milliseconds per call on the large bitmap, by CPU time.
std::string large_ms(const Median* m) {
    return m != nullptr ? fixed(m->cpu_ns_per_pixel * m->pixels * 1e-6, 1) : "n/a";
}

// a / b by CPU time, when both were measured.
bool cpu_ratio(const Median* a, const Median* b, double& ratio) {
    if (a == nullptr || b == nullptr || b->cpu_ns_per_pixel <= 0.0) return false;
    ratio = a->cpu_ns_per_pixel / b->cpu_ns_per_pixel;
    return true;
}

std::string met(bool ok) { return ok ? "yes" : "**no**"; }

std::string context_entry(const Run& run, const char* name) {
    const auto it = run.context.find(name);
    return it == run.context.end() ? "" : it->second;
}

bool is_document(const std::string& operation) { return operation.rfind("doc_", 0) == 0; }

// The library's operations, each once, in name order.
std::vector<std::string> our_operations(const Run& run) {
    std::vector<std::string> operations;
    std::set<std::string> seen;
    for (const auto& [k, median] : run.medians) {
        const size_t first = k.find('/');
        const size_t second = k.find('/', first + 1);
        if (k.substr(first + 1, second - first - 1) != kOurs) continue;
        const std::string operation = k.substr(0, first);
        if (seen.insert(operation).second) operations.push_back(operation);
    }
    return operations;
}

// The index of the generated family an operation belongs to, or -1.
int generated_family(const std::string& operation) {
    int index = 0;
    for (const char* prefix : kGeneratedPrefixes) {
        if (operation.rfind(prefix, 0) == 0) return index;
        ++index;
    }
    return -1;
}

bool is_generated(const std::string& operation) { return generated_family(operation) >= 0; }

bool is_half_size(const std::string& operation) {
    const std::string suffix = kHalfSizeSuffix;
    return operation.size() > suffix.size() &&
           operation.compare(operation.size() - suffix.size(), suffix.size(), suffix) == 0;
}

// "flare2" before "flare10": runs of digits compare by their value.
bool natural_less(const std::string& a, const std::string& b) {
    size_t i = 0;
    size_t j = 0;
    while (i < a.size() && j < b.size()) {
        if (std::isdigit(static_cast<unsigned char>(a[i])) && std::isdigit(static_cast<unsigned char>(b[j]))) {
            size_t i_end = i;
            size_t j_end = j;
            while (i_end < a.size() && std::isdigit(static_cast<unsigned char>(a[i_end]))) ++i_end;
            while (j_end < b.size() && std::isdigit(static_cast<unsigned char>(b[j_end]))) ++j_end;
            const std::string x = a.substr(i, i_end - i);
            const std::string y = b.substr(j, j_end - j);
            if (x.size() != y.size()) return x.size() < y.size();
            if (x != y) return x < y;
            i = i_end;
            j = j_end;
        } else {
            if (a[i] != b[j]) return a[i] < b[j];
            ++i;
            ++j;
        }
    }
    return a.size() - i < b.size() - j;
}

// The generated effects measured in the run, family by family, each family
// in natural name order; the half-size flares are left to the flare table.
std::vector<std::string> generated_operations(const Run& run) {
    std::vector<std::string> operations;
    for (const std::string& operation : our_operations(run)) {
        if (is_generated(operation) && !is_half_size(operation)) operations.push_back(operation);
    }
    std::sort(operations.begin(), operations.end(), [](const std::string& a, const std::string& b) {
        const int fa = generated_family(a);
        const int fb = generated_family(b);
        return fa != fb ? fa < fb : natural_less(a, b);
    });
    return operations;
}

bool in_pairs(const std::string& operation) {
    for (const Comparison& row : kComparisons) {
        if (operation == row.operation) return true;
    }
    return operation == kSharpenSmallAmount || operation == kSharpenLargeAmount;
}

void heading(std::ostringstream& out, const Inputs& in) {
    const Run& run = in.single;
    out << "# Benchmark results\n\n";
    out << "Measured " << in.date << " on " << in.machine << ".\n\n";
    out << "Medians of " << run.repetitions << " repetitions, in nanoseconds per pixel. Figures on one thread "
        << "are the process's CPU time, which other programs sharing the machine disturb least; the last "
        << "column is wall-clock time. Every operation works on the sample photo (`" << context_entry(run, "photo") << "`) scaled to "
        << kLarge.width << " x " << kLarge.height << " (" << kLarge.label << ") and " << kSmall.width << " x "
        << kSmall.height << " (" << kSmall.label << "), RGBA; the library's calls work in place on a fresh "
        << "copy each time (the copy is not timed). The peers run on one thread (OpenCV "
        << context_entry(run, "opencv") << "; libvips " << context_entry(run, "libvips")
        << "), as the library owns none; the last column repeats them on every core (OpenCV "
        << context_entry(in.multi, "opencv") << "; libvips " << context_entry(in.multi, "libvips")
        << ") for information. Ratios compare medians of the same run.\n\n";
}

void pairs_table(std::ostringstream& out, const Inputs& in) {
    out << "## The library against its peers\n\n";
    out << "| operation | peer | size | ours | peer | ours / peer | goal | met | peer, every core |\n";
    out << "|---|---|---|---:|---:|---:|---:|---|---:|\n";
    for (const Comparison& row : kComparisons) {
        for (const BitmapSize& size : kSizes) {
            const Median* ours = find(in.single, key(row.operation, kOurs, size));
            const Median* peer = find(in.single, key(row.operation, row.peer, size));
            const Median* multi = find(in.multi, key(row.operation, row.peer, size));
            const bool has_goal = row.goal > 0.0 && (!row.large_only || (size.width == kLarge.width && size.height == kLarge.height));
            std::string ratio = "n/a";
            std::string goal = has_goal ? "<= " + fixed(row.goal, 2) : "-";
            std::string verdict = has_goal ? "n/a" : "-";
            double r = 0.0;
            if (cpu_ratio(ours, peer, r)) {
                ratio = fixed(r, 2);
                if (has_goal) verdict = met(r <= row.goal);
            }
            out << "| " << row.ours_label << " | " << row.peer_label << " | " << size.label << " | "
                << per_pixel(ours) << " | " << per_pixel(peer) << " | " << ratio << " | " << goal << " | "
                << verdict << " | " << wall_per_pixel(multi) << " |\n";
        }
    }
    out << "\n";
}

void growth_table(std::ostringstream& out, const Inputs& in) {
    out << "## Growth\n\n";
    double floor_growth = 0.0;
    const bool have_floor =
        cpu_ratio(find(in.single, key("lut", "memcpy", kLarge)), find(in.single, key("lut", "memcpy", kSmall)),
                  floor_growth);
    const bool have_cold = !in.cold.medians.empty();
    out << "Right after its untimed fresh copy, the " << kSmall.label << " bitmap (4 MB) is still in the core's "
        << "own cache and the " << kLarge.label << " one (48 MB) is not, so an operation that streams the bitmap "
        << "runs faster per pixel on the small one for that reason alone";
    if (have_floor) out << ": memcpy of the same bytes grows " << fixed(floor_growth, 2) << " times";
    out << ". ";
    if (have_cold) {
        out << "The library's operations were therefore timed again with each fresh copy first pushed out of "
            << "the core's caches, so both sizes start alike, as a photo decoded a while before would; the "
            << "verdict is taken on those figures, and the first column keeps the growth from the warm start.";
    } else {
        out << "The last column divides each growth by memcpy's.";
    }
    out << "\n\n";
    out << "| check | warm start | cold start | goal | met | warm over memcpy's growth |\n"
        << "|---|---:|---:|---:|---|---:|\n";
    const Median* small_amount = find(in.single, key(kSharpenSmallAmount, kOurs, kLarge));
    const Median* large_amount = find(in.single, key(kSharpenLargeAmount, kOurs, kLarge));
    out << "| sharpening, amount 400 over amount 50, " << kLarge.label << " | ";
    double r = 0.0;
    if (cpu_ratio(large_amount, small_amount, r)) {
        out << fixed(r, 2) << " | - | <= " << fixed(kSharpenGrowthGoal, 2) << " | " << met(r <= kSharpenGrowthGoal);
    } else {
        out << "n/a | - | <= " << fixed(kSharpenGrowthGoal, 2) << " | n/a";
    }
    out << " | - |\n";
    if (have_floor) {
        out << "| for reference, memcpy of the same bytes: per pixel, " << kLarge.label << " over " << kSmall.label
            << " | " << fixed(floor_growth, 2) << " | - | - | - | 1.00 |\n";
    }
    for (const std::string& operation : our_operations(in.single)) {
        const Median* small = find(in.single, key(operation, kOurs, kSmall));
        const Median* large = find(in.single, key(operation, kOurs, kLarge));
        if (!cpu_ratio(large, small, r)) continue;
        double cold = 0.0;
        const bool measured_cold = cpu_ratio(find(in.cold, key(operation, kOurs, kLarge)),
                                             find(in.cold, key(operation, kOurs, kSmall)), cold);
        const double judged = have_cold ? cold : r;
        const std::string verdict = have_cold && !measured_cold ? "n/a" : met(judged <= kSizeGrowthGoal);
        out << "| " << large->label << ": per pixel, " << kLarge.label << " over " << kSmall.label << " | "
            << fixed(r, 2) << " | " << (measured_cold ? fixed(cold, 2) : std::string("n/a")) << " | <= "
            << fixed(kSizeGrowthGoal, 2) << " | " << verdict << " | "
            << (have_floor ? fixed(r / floor_growth, 2) : std::string("n/a")) << " |\n";
    }
    out << "\n";
}

void solo_table(std::ostringstream& out, const Inputs& in) {
    out << "## Without a peer\n\n";
    out << "| operation | " << kSmall.label << " ns/px | " << kLarge.label << " ns/px | " << kLarge.label
        << " ms |\n|---|---:|---:|---:|\n";
    for (const std::string& operation : our_operations(in.single)) {
        if (in_pairs(operation) || is_document(operation) || is_generated(operation)) continue;
        const Median* small = find(in.single, key(operation, kOurs, kSmall));
        const Median* large = find(in.single, key(operation, kOurs, kLarge));
        if (small == nullptr && large == nullptr) continue;  // measured at another size only
        const std::string& label = large != nullptr ? large->label : small->label;
        out << "| " << label << " | " << per_pixel(small) << " | " << per_pixel(large) << " | "
            << large_ms(large) << " |\n";
    }
    out << "\n";
}

// The tool engine's calls on the preview a phone edits, in milliseconds a
// call: a touch (a dab, a stroke segment, the box it re-renders) has to fit
// a 120 Hz frame with room for a slower phone, and a tool's set-up must not
// be felt.
constexpr const char* kToolPreviewSize = "1080";

void tool_table(std::ostringstream& out, const Inputs& in) {
    std::vector<std::pair<std::string, const Median*>> rows;
    for (const std::string& operation : our_operations(in.single)) {
        const Median* m = find(in.single, operation + "/" + kOurs + "/" + kToolPreviewSize);
        if (operation.rfind("tool_", 0) == 0 && m != nullptr) rows.emplace_back(operation, m);
    }
    if (rows.empty()) return;
    std::sort(rows.begin(), rows.end(), [](const auto& a, const auto& b) { return natural_less(a.first, b.first); });
    out << "## Interactive tools\n\n";
    out << "The tool engine's calls on a " << kToolPreviewSize << " x " << kToolPreviewSize
        << " preview, one thread, milliseconds a call by CPU time.\n\n";
    out << "| call | ms | goal | met |\n|---|---:|---:|---|\n";
    for (const auto& [operation, m] : rows) {
        const double ms = m->cpu_ns_per_pixel * m->pixels * 1e-6;
        double goal = 0.0;
        if (operation.rfind("tool_init_", 0) == 0) goal = 50.0;
        if (operation.rfind("tool_dab_", 0) == 0 || operation == "tool_segment" || operation == "tool_preview_box") {
            goal = 1.0;
        }
        out << "| " << m->label << " | " << fixed(ms, ms < 1.0 ? 3 : 1) << " | "
            << (goal > 0.0 ? "< " + fixed(goal, 0) : std::string("-")) << " | "
            << (goal > 0.0 ? met(ms < goal) : std::string("-")) << " |\n";
    }
    out << "\n";
}

// Each generated effect with its time against memcpy of the same bytes.
void generated_table(std::ostringstream& out, const Inputs& in) {
    const std::vector<std::string> operations = generated_operations(in.single);
    if (operations.empty()) return;
    const Median* floor_small = find(in.single, key(kGeneratedFloor, "memcpy", kSmall));
    const Median* floor_large = find(in.single, key(kGeneratedFloor, "memcpy", kLarge));
    out << "## Generated effects\n\n";
    out << "Each effect drawn alone on the photo; memcpy of the same bytes is " << per_pixel(floor_small)
        << " ns per pixel at " << kSmall.label << " and " << per_pixel(floor_large) << " at " << kLarge.label
        << " in this run. Their growth with size is judged in the growth table.\n\n";
    out << "| operation | " << kSmall.label << " ns/px | " << kLarge.label << " ns/px | " << kLarge.label
        << " ms | over memcpy, " << kSmall.label << " | over memcpy, " << kLarge.label << " | " << kLarge.label
        << " / " << kSmall.label << " |\n|---|---:|---:|---:|---:|---:|---:|\n";
    for (const std::string& operation : operations) {
        const Median* small = find(in.single, key(operation, kOurs, kSmall));
        const Median* large = find(in.single, key(operation, kOurs, kLarge));
        const Median* any = large != nullptr ? large : small;
        double r = 0.0;
        const std::string over_small = cpu_ratio(small, floor_small, r) ? fixed(r, 2) : "n/a";
        const std::string over_large = cpu_ratio(large, floor_large, r) ? fixed(r, 2) : "n/a";
        const std::string growth = cpu_ratio(large, small, r) ? fixed(r, 2) : "n/a";
        out << "| " << any->label << " | " << per_pixel(small) << " | " << per_pixel(large) << " | "
            << large_ms(large) << " | " << over_small << " | " << over_large << " | " << growth << " |\n";
    }
    out << "\n";
}

// A flare's time per pixel of its work box, at its size and at half of it.
void flare_box_table(std::ostringstream& out, const Inputs& in) {
    std::vector<std::pair<const Median*, const Median*>> rows;
    for (const std::string& operation : generated_operations(in.single)) {
        const Median* full = find(in.single, key(operation, kOurs, kLarge));
        const Median* half = find(in.single, key(operation + kHalfSizeSuffix, kOurs, kLarge));
        if (full != nullptr && half != nullptr && full->box_pixels > 0.0 && half->box_pixels > 0.0) {
            rows.emplace_back(full, half);
        }
    }
    if (rows.empty()) return;
    out << "## Flares and their work boxes\n\n";
    out << "Each flare is drawn centred on the " << kLarge.label << " photo at its size and at half of it, where "
        << "its work box (the area the type may light, as documented) is about a quarter as large. Time per box "
        << "pixel is the median time over the box's pixel count; where the box shrinks, that time should not "
        << "grow: the cost follows the box, not the photo. A box of the whole photo at both sizes has nothing "
        << "to follow.\n\n";
    out << "| flare | box, share of the photo | ns per box pixel | half size: box share | ns per box pixel | "
        << "half over full | goal | met |\n|---|---:|---:|---:|---:|---:|---:|---|\n";
    for (const auto& [full, half] : rows) {
        const double full_ns = full->cpu_ns_per_pixel * full->pixels / full->box_pixels;
        const double half_ns = half->cpu_ns_per_pixel * half->pixels / half->box_pixels;
        const double r = half_ns / full_ns;
        const bool judged = half->box_pixels < full->box_pixels;
        out << "| " << full->label << " | " << fixed(100.0 * full->box_pixels / full->pixels, 1) << " % | "
            << fixed(full_ns, 2) << " | " << fixed(100.0 * half->box_pixels / half->pixels, 1) << " % | "
            << fixed(half_ns, 2) << " | " << fixed(r, 2) << " | "
            << (judged ? "<= " + fixed(kFlareBoxGoal, 2) : std::string("-")) << " | "
            << (judged ? met(r <= kFlareBoxGoal) : std::string("-")) << " |\n";
    }
    out << "\n";
}

void document_table(std::ostringstream& out, const Inputs& in) {
    const std::string name = context_entry(in.single, "document");
    out << "## Effect document\n\n";
    if (name.empty()) {
        out << "No effect document with five processors was measured.\n\n";
        return;
    }
    out << "`" << name << "`, run with seed 7 and strength 1; each processor timed on the output of the ones "
        << "before it.\n\n";
    out << "| step | " << kSmall.label << " ns/px | " << kLarge.label << " ns/px | " << kLarge.label
        << " ms |\n|---|---:|---:|---:|\n";
    std::vector<std::string> steps;
    for (const std::string& operation : our_operations(in.single)) {
        if (is_document(operation) && operation != "doc_total") steps.push_back(operation);
    }
    steps.push_back("doc_total");
    for (const std::string& operation : steps) {
        const Median* small = find(in.single, key(operation, kOurs, kSmall));
        const Median* large = find(in.single, key(operation, kOurs, kLarge));
        const Median* any = large != nullptr ? large : small;
        if (any == nullptr) continue;
        out << "| " << any->label << " | " << per_pixel(small) << " | " << per_pixel(large) << " | "
            << large_ms(large) << " |\n";
    }
    out << "\n";
}

void memory_section(std::ostringstream& out, const Inputs& in) {
    out << "## Memory\n\n";
    const Memory& memory = in.memory;
    if (!memory.measured || memory.bitmap_bytes <= 0.0) {
        out << "Not measured: " << (memory.note.empty() ? "no figure was given" : memory.note) << ".\n";
        return;
    }
    const double r = memory.peak_bytes / memory.bitmap_bytes;
    out << "| measure | value |\n|---|---:|\n";
    out << "| peak resident memory | " << fixed(memory.peak_bytes / 1e6, 1) << " MB |\n";
    out << "| decoded bitmap | " << fixed(memory.bitmap_bytes / 1e6, 1) << " MB |\n";
    out << "| ratio (goal <= " << fixed(kMemoryGoal, 1) << ") | " << fixed(r, 2) << " (" << met(r <= kMemoryGoal)
        << ") |\n";
    if (!memory.note.empty()) out << "\n" << memory.note << ".\n";
}

}  // namespace

bool read_run(const std::string& json, Run& run, std::string& error) {
    char message[256] = {};
    Tree tree(yajl_tree_parse(json.c_str(), message, sizeof message), &yajl_tree_free);
    if (!tree) {
        error = std::string("not JSON: ") + message;
        return false;
    }
    const yajl_val benchmarks = field(tree.get(), "benchmarks", yajl_t_array);
    const yajl_val context = field(tree.get(), "context", yajl_t_object);
    if (benchmarks == nullptr || context == nullptr) {
        error = "no \"context\" object and \"benchmarks\" array: not a benchmark report";
        return false;
    }
    for (size_t i = 0; i < context->u.object.len; ++i) {
        const yajl_val value = context->u.object.values[i];
        if (YAJL_IS_STRING(value)) run.context[context->u.object.keys[i]] = YAJL_GET_STRING(value);
    }
    for (size_t i = 0; i < benchmarks->u.array.len; ++i) {
        const yajl_val entry = benchmarks->u.array.values[i];
        if (string_field(entry, "run_type") != "aggregate" || string_field(entry, "aggregate_name") != "median") {
            continue;
        }
        if (field(entry, "error_occurred", yajl_t_true) != nullptr) continue;
        const std::string k = key_of(string_field(entry, "run_name"));
        const double scale = nanoseconds_per(string_field(entry, "time_unit"));
        double cpu_time = 0.0;
        double real_time = 0.0;
        double pixels = 0.0;
        double repetitions = 0.0;
        if (k.empty() || scale == 0.0 || !number_field(entry, "cpu_time", cpu_time) ||
            !number_field(entry, "real_time", real_time) || !number_field(entry, "pixels", pixels) ||
            pixels <= 0.0) {
            continue;
        }
        if (number_field(entry, "repetitions", repetitions)) run.repetitions = static_cast<int>(repetitions);
        double box_pixels = 0.0;
        number_field(entry, kBoxPixelsCounter, box_pixels);
        run.medians[k] = Median{cpu_time * scale / pixels, real_time * scale / pixels, pixels, box_pixels,
                                string_field(entry, "label")};
    }
    return true;
}

std::string render(const Inputs& inputs) {
    std::ostringstream out;
    heading(out, inputs);
    pairs_table(out, inputs);
    growth_table(out, inputs);
    solo_table(out, inputs);
    tool_table(out, inputs);
    generated_table(out, inputs);
    flare_box_table(out, inputs);
    document_table(out, inputs);
    memory_section(out, inputs);
    return out.str();
}

}  // namespace vorlite::bench::report
