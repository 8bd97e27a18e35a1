#include "write/flat.h"

#include "read/text.h"
#include "write/decimal.h"

#include <fmt/compile.h>
#include <fmt/format.h>

#include <algorithm>
#include <cmath>
#include <iterator>
#include <limits>
#include <map>
#include <memory>
#include <unordered_map>

namespace vantrel::sheets {
namespace {

// Whether a spreadsheet computes a text that begins with this: =1+1, +A1, @SUM(A1), -A1, and the
// same in the full width of East Asian type.
bool is_formula(std::string_view text)
{
    for (const std::string_view sign : {"=", "+", "-", "@", "\uff1d", "\uff0b", "\uff0d", "\uff20"})
        if (text.starts_with(sign))
            return true;
    return false;
}

// Letters, blanks and hyphens alone compute nothing: "--paper chooses".
bool is_words(std::string_view text)
{
    return std::all_of(text.begin(), text.end(),
                       [](char c) { return c == ' ' || c == '-' || (c >= 'a' && c <= 'z'); });
}

// Text with an apostrophe wherever a spreadsheet would begin a formula, be it one that takes
// semicolons for the ends of cells; text that can be printed holds no tabs. Numbers stay as they
// are, and so do words behind a semicolon.
std::string without_formulas(std::string_view text)
{
    std::string out;
    bool begins = true; // a cell
    bool first = true;  // it is this text's own
    for (std::size_t i = 0; i < text.size(); ++i) {
        const std::string_view rest = text.substr(i);
        if (begins && is_formula(rest) && !number_in(text) &&
            (first || !is_words(rest.substr(0, rest.find(';')))))
            out += '\'';
        out += text[i];
        first = first && text[i] != ';';
        begins = text[i] == ';' || (begins && (text[i] == ' ' || text[i] == '"'));
    }
    return out;
}

// Whether a text holds nothing that would have to be escaped.
bool is_plain(std::string_view text)
{
    return std::none_of(text.begin(), text.end(), [](char c) {
        return c == ',' || c == '"' || c == '\r' || c == '\n' || c == '=' || c == '+' || c == '-' ||
               c == '@' || c == '\xef'; // the first byte of a full-width sign
    });
}

std::string csv_text(std::string text)
{
    if (is_plain(text))
        return text;
    std::string safe = without_formulas(text);
    if (safe.find_first_of(",\"\r\n") == std::string::npos)
        return safe;
    std::string out = "\"";
    for (const char c : safe)
        out += c == '"' ? "\"\"" : std::string(1, c);
    return out + '"';
}

// Quoted, with doubled quotes within.
std::string cgats_text(const std::string &text)
{
    std::string out = "\"";
    for (const char c : text)
        out += c == '"' ? "\"\"" : std::string(1, c);
    return out + '"';
}

// A column's name as one word.
std::string identifier(std::string name)
{
    std::replace_if(
        name.begin(), name.end(), [](char c) { return c == ' ' || c == '"' || c == '#'; }, '_');
    return name;
}

// The columns that ISO 28178 knows; others are declared.
bool is_standard(const std::string &field)
{
    constexpr std::string_view names[] = {"SAMPLE_ID",   "SAMPLE_NAME", "LAB_L",    "LAB_A",
                                          "LAB_B",       "LAB_C",       "LAB_H",    "LAB_DE",
                                          "LAB_DE_2000", "LAB_DE_CMC",  "LAB_DE_94"};
    return std::find(std::begin(names), std::end(names), field) != std::end(names) ||
           field.starts_with("SPECTRAL_NM") || field.starts_with("CMYK_") ||
           field.starts_with("RGB_") || (field.size() > 4 && field.substr(1, 4) == "CLR_");
}

// The columns of all tables, a new one behind the one that it follows in its own table.
std::vector<const Column *> all_columns(const std::vector<Flat> &tables)
{
    std::vector<const Column *> all;
    for (const Flat &table : tables) {
        std::size_t next = 0;
        for (const Column &column : table.columns) {
            auto place = std::find_if(all.begin(), all.end(), [&](const Column *other) {
                return other->name == column.name;
            });
            if (place == all.end())
                place = all.insert(all.begin() + static_cast<std::ptrdiff_t>(next), &column);
            next = static_cast<std::size_t>(place - all.begin()) + 1;
        }
    }
    return all;
}

void write_rows(const Flat &table, const std::vector<const Column *> &columns, const Sink &sink)
{
    std::map<std::string_view, const Column *> by_name;
    for (const Column &column : table.columns)
        by_name.emplace(column.name, &column);
    std::vector<const Column *> own; // for each of the columns, null where there is none
    for (const Column *column : columns) {
        const auto found = by_name.find(column->name);
        own.push_back(found == by_name.end() ? nullptr : found->second);
    }
    const Work work{sink.tell, "Writing", table.rows};
    std::string out;
    for (std::size_t i = 0; i < table.rows; ++i) {
        out.clear();
        for (const Column *column : own) {
            if (column && column->text)
                out += csv_text(column->cell(i));
            else if (column)
                column->append(i, out);
            out += ',';
        }
        out.back() = '\n';
        sink.write(out);
        work.done(i + 1);
    }
}

void write_cgats_table(const Flat &table, const Sink &sink)
{
    std::vector<const Column *> columns;
    for (const Column &column : table.columns)
        if (!column.cgats.empty())
            columns.push_back(&column);

    std::string out = fmt::format("DESCRIPTOR\t{}\n", cgats_text(table.description));
    if (table.spectra)
        out += "SPECTRAL_NORM\t\"100\"\n";
    for (const Column *column : columns)
        if (const std::string name = identifier(column->cgats); !is_standard(name))
            out += fmt::format("KEYWORD\t\"{}\"\n", name);
    out += fmt::format("NUMBER_OF_FIELDS\t{}\nBEGIN_DATA_FORMAT\n", columns.size());
    for (const Column *column : columns)
        out += identifier(column->cgats) + '\t';
    out.back() = '\n';
    out += fmt::format("END_DATA_FORMAT\nNUMBER_OF_SETS\t{}\nBEGIN_DATA\n", table.rows);
    sink.write(out);
    const Work work{sink.tell, "Writing", table.rows};
    for (std::size_t i = 0; i < table.rows; ++i) {
        out.clear();
        for (const Column *column : columns) {
            const std::string cell = column->cell(i);
            out += column->text || cell.empty() ? cgats_text(cell) : cell;
            out += '\t';
        }
        out.back() = '\n';
        sink.write(out);
        work.done(i + 1);
    }
    sink.write("END_DATA\n");
}

void append_four_decimals(const std::optional<double> &value, std::string &out)
{
    if (!value)
        return;
    const double scaled = std::abs(*value * 1e4);
    if (scaled < kMostTenThousandths) {
        const auto k = static_cast<long long>(scaled);
        const double rest = scaled - static_cast<double>(k);
        if (std::abs(rest - 0.5) > 0.001) { // otherwise the product does not tell where it rounds
            const long long nearest = rest < 0.5 ? k : k + 1;
            append_ten_thousandths(*value < 0 ? -nearest : nearest, true, out);
            return;
        }
    }
    fmt::memory_buffer text;
    fmt::format_to(fmt::appender(text), FMT_COMPILE("{:.4f}"), *value);
    const std::string_view number(text.data(), text.size());
    out += number == "-0.0000" ? "0.0000" : number;
}

// Most of what files hold are decimals of a few places: with at most 15 digits, the one that is
// nearest to a double is the shortest that reads as it.
void append_all_digits(const std::optional<double> &value, std::string &out)
{
    if (!value)
        return;
    if (const auto k = ten_thousandths(*value)) {
        append_ten_thousandths(*k, false, out);
        return;
    }
    fmt::memory_buffer text;
    fmt::format_to(fmt::appender(text), FMT_COMPILE("{}"), *value);
    out.append(text.data(), text.size());
}

} // namespace

void Flat::text(std::string name, std::string cgats, std::function<std::string(std::size_t)> get)
{
    columns.push_back({std::move(name), std::move(cgats), true,
                       [get = std::move(get)](std::size_t i, std::string &out) { out += get(i); }});
}

void Flat::same(std::string name, std::string cgats, std::string text)
{
    columns.push_back({std::move(name), std::move(cgats), true,
                       [text = std::move(text)](std::size_t, std::string &out) { out += text; }});
}

void Flat::number(std::string name, std::string cgats,
                  std::function<std::optional<double>(std::size_t)> get)
{
    columns.push_back({std::move(name), std::move(cgats), false,
                       [get = std::move(get)](std::size_t i, std::string &out) {
                           append_four_decimals(get(i), out);
                       }});
}

void Flat::exact(std::string name, std::string cgats,
                 std::function<std::optional<double>(std::size_t)> get)
{
    columns.push_back({std::move(name), std::move(cgats), false,
                       [get = std::move(get)](std::size_t i, std::string &out) {
                           append_all_digits(get(i), out);
                       }});
}

void Flat::warnings(std::vector<std::string> texts)
{
    if (!texts.empty())
        text("warnings", "WARNINGS", [texts = std::move(texts)](std::size_t i) {
            return i == 0 ? fmt::format("{}", fmt::join(texts, "; ")) : "";
        });
}

void Flat::advice(const std::string &note,
                  const std::function<const SolidAdvice *(std::size_t)> &get)
{
    for (const auto &[name, value] : {std::pair{"dE00_aim", &Advice::de00},
                                      {"density_change", &Advice::density_change},
                                      {"dE00_after", &Advice::de00_after}})
        number(name, upper(name), [get, value = value](std::size_t i) {
            return get(i) ? std::optional(get(i)->advice.*value) : std::nullopt;
        });
    text(note, upper(note), [get](std::size_t i) {
        const SolidAdvice *solid = get(i);
        if (!solid)
            return std::string();
        return fmt::format("{}{}", solid->count > 1 ? name_of(*solid) + ": " : "",
                           words_of(solid->advice));
    });
}

void Flat::colour(const std::string &prefix, const std::function<const Colour *(std::size_t)> &get)
{
    text(prefix + "rgb", "", [get](std::size_t i) { return get(i) ? hex(get(i)->rgb) : ""; });
    for (const auto &[axis, value] :
         {std::pair{"L", &CIELABCOORD::L}, {"a", &CIELABCOORD::a}, {"b", &CIELABCOORD::b}})
        number(prefix + axis, upper(prefix) + "LAB_" + upper(axis),
               [get, value = value](std::size_t i) {
                   return get(i) ? std::optional(get(i)->lab.*value) : std::nullopt;
               });
}

void Flat::spectrum(const std::function<const Spectrum &(std::size_t)> &get)
{
    spectra = true;
    for (int band = 0; band < VANTREL_BANDS; ++band)
        exact(fmt::format("nm{}", 400 + 10 * band), fmt::format("SPECTRAL_NM{}", 400 + 10 * band),
              [get, band](std::size_t i) { return get(i)[band]; });
}

void Flat::device(const std::vector<std::string> &names,
                  const std::function<const Device &(std::size_t)> &get)
{
    struct Row {
        std::size_t place = std::numeric_limits<std::size_t>::max();
        std::unordered_map<std::string_view, double> values;
    };
    const auto row = std::make_shared<Row>(); // whose cells are asked for one after the other
    for (std::size_t at = 0; at < names.size(); ++at)
        exact(names[at], names[at], [get, name = names[at], at, row](std::size_t i) {
            const Device &device = get(i);
            if (at < device.size() && device[at].first == name) // as where every patch has all
                return std::optional(device[at].second);
            if (row->place != i) {
                *row = {i, {device.begin(), device.end()}};
            }
            const auto own = row->values.find(name);
            return own == row->values.end() ? std::nullopt : std::optional(own->second);
        });
}

Flat flat_of(const std::vector<SolidAdvice> &advice, const std::string &description)
{
    Flat flat;
    flat.description = description;
    flat.rows = advice.size();
    flat.text("name", "SOLID",
              [&advice](std::size_t i) { return "Advice for " + name_of(advice[i]); });
    flat.advice("note", [&advice](std::size_t i) { return &advice[i]; });
    return flat;
}

void write_csv(const std::vector<Flat> &tables, const Sink &sink)
{
    const std::vector<const Column *> columns = all_columns(tables);
    std::string head;
    for (const Column *column : columns)
        head += csv_text(column->name) + ',';
    head.back() = '\n';
    sink.write(head);
    for (const Flat &table : tables)
        write_rows(table, columns, sink);
}

void write_cgats(const std::vector<Flat> &tables, const Sink &sink)
{
    sink.write("CGATS.17\nORIGINATOR\t\"vantrel " VANTREL_VERSION "\"\n");
    for (const Flat &table : tables)
        write_cgats_table(table, sink);
}

} // namespace vantrel::sheets
