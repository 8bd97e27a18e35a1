#include "cgats_text.h"

#include <algorithm>
#include <optional>
#include <utility>

#include <fmt/format.h>

#include "measurement.h"
#include "table.h"
#include "text.h"

namespace {

constexpr std::size_t most_fields = 32766; // per table, as for rows: the limits of Little CMS
constexpr std::size_t most_rows = 32766;

// Takes the next line off the text; a line ends with LF, CRLF or CR.
std::string_view next_line(std::string_view &text)
{
    const auto end = text.find_first_of("\r\n");
    const std::string_view line = text.substr(0, end);
    if (end == std::string_view::npos)
        text = {};
    else
        text.remove_prefix(end + (text.substr(end, 2) == "\r\n" ? 2 : 1));
    return line;
}

// Takes a quoted string off the text; within it a doubled quote stands for one.
std::string next_string(std::string_view &text, std::size_t line)
{
    std::string out;
    for (std::size_t i = 1; i < text.size(); ++i) {
        if (text[i] == '"') {
            if (text.substr(i, 2) != "\"\"") {
                text.remove_prefix(i + 1);
                return out;
            }
            ++i;
        }
        out += text[i];
    }
    throw InputError{line, "a quoted text is not closed"};
}

// The values of a line, at most `most` and one more. Tabs separate them, empty ones too, or else
// any white space does.
std::vector<std::string> split(std::string_view text, bool tabs, std::size_t most, std::size_t line)
{
    const std::string_view separators = tabs ? "\t" : " \t";
    std::vector<std::string> values;
    while (values.size() <= most) {
        text.remove_prefix(std::min(text.find_first_not_of(tabs ? " " : " \t"), text.size()));
        if (!tabs && (text.empty() || text[0] == '#'))
            break;
        std::string value = text.starts_with('"') ? next_string(text, line) : "";
        const std::string_view rest = text.substr(0, text.find_first_of(separators));
        text.remove_prefix(rest.size());
        value += trimmed(rest);
        values.push_back(std::move(value));
        if (tabs && text.empty())
            break;
        if (tabs)
            text.remove_prefix(1);
    }
    while (tabs && !values.empty() && values.back().empty())
        values.pop_back();
    return values;
}

// A row has as many values as there are fields. Where tabs separate the fields' names they separate
// the values; otherwise they do if the number of values comes out, or else any white space does.
std::vector<std::string> row_of(std::string_view text, std::size_t fields, bool tabs,
                                std::size_t line)
{
    std::vector<std::string> values;
    const auto in_line = static_cast<std::size_t>(std::count(text.begin(), text.end(), '\t'));
    if (in_line > 0) {
        values = split(text, true, fields, line);
        if (values.size() < fields && in_line + 1 >= fields)
            values.resize(fields); // empty columns at the end
    }
    if (values.size() != fields && !(tabs && in_line > 0))
        values = split(text, false, fields, line);
    if (values.size() != fields)
        throw InputError{
            line,
            fmt::format("{} values in a row of {} fields",
                        values.size() > fields ? "more" : fmt::to_string(values.size()), fields)};
    return values;
}

// A field's name in the letters that an identifier may have; one cannot begin with a digit.
std::string identifier(std::string_view field)
{
    if (const auto wavelength = wavelength_of(field))
        return fmt::format("SPECTRAL_NM{:g}", *wavelength);
    std::string out(field);
    for (char &c : out)
        if (!(c >= '0' && c <= '9') && !(c >= 'A' && c <= 'Z') && !(c >= 'a' && c <= 'z'))
            c = '_';
    return out.empty() || (out[0] >= '0' && out[0] <= '9') ? '_' + out : out;
}

// Little CMS reads an empty string as the value before it; a space stands for one.
std::string string_literal(std::string_view value)
{
    if (value.empty())
        return "\" \"";
    if (value.find('"') == std::string_view::npos)
        return fmt::format("\"{}\"", value);
    std::string out(value);
    std::erase(out, '\'');
    return '\'' + out + '\'';
}

// Goes through the file line by line.
class Plainer {
public:
    PlainCgats read(std::string_view file);

private:
    void header(std::string_view text);
    void name_fields(std::string_view text);
    void begin_rows();
    void row(std::string_view text);
    void end_rows();

    // A count that the header states, and where.
    struct Count {
        std::string_view keyword;
        std::optional<double> stated;
        std::size_t line;
    };
    void check(const Count &count, std::size_t found);

    enum class Place { header, fields, rows } place = Place::header;
    std::size_t line = 0;
    std::string norm; // the SPECTRAL_NORM line, where there is one
    Count field_count{"NUMBER_OF_FIELDS", std::nullopt, 0};
    Count row_count{"NUMBER_OF_SETS", std::nullopt, 0};
    std::vector<std::string> fields; // of the table that is being read
    std::size_t fields_line = 0;
    bool tabs = false;   // tabs separate their names
    bool wanted = false; // this table is the one to hand on
    bool more_tables = false;
    std::string rows;
    PlainCgats out;
};

void Plainer::check(const Count &count, std::size_t found)
{
    if (count.stated && *count.stated != static_cast<double>(found))
        out.warnings.push_back(fmt::format("{}: {} is {:g}, but {} follow", count.line,
                                           count.keyword, *count.stated, found));
}

void Plainer::header(std::string_view text)
{
    const std::string_view name = text.substr(0, text.find_first_of(" \t"));
    std::string_view value = trimmed(text.substr(name.size()));
    const std::string keyword = upper(name);
    if (keyword == "BEGIN_DATA_FORMAT") {
        place = Place::fields;
        fields.clear();
        fields_line = line + 1;
        tabs = false;
    } else if (keyword == "BEGIN_DATA") {
        begin_rows();
    }
    if (value.size() > 1 && value.front() == '"' && value.back() == '"')
        value = value.substr(1, value.size() - 2);
    for (Count *count : {&field_count, &row_count})
        if (keyword == count->keyword) {
            count->stated = number_in(value);
            count->line = line;
        }
    if (keyword == "SPECTRAL_NORM") {
        const auto number = number_in(value);
        if (!number || *number <= 0)
            throw InputError{line, fmt::format("SPECTRAL_NORM is {}", in_quotes(value))};
        norm = fmt::format("SPECTRAL_NORM \"{}\"\n", *number);
    }
}

void Plainer::name_fields(std::string_view text)
{
    if (equal_ignoring_case(text, "END_DATA_FORMAT")) {
        place = Place::header;
        return;
    }
    tabs = tabs || text.find('\t') != std::string_view::npos;
    for (std::string &field : split(text, tabs, most_fields, line))
        fields.push_back(std::move(field));
    if (fields.size() > most_fields)
        throw InputError{line, fmt::format("more than {} fields", most_fields)};
}

void Plainer::begin_rows()
{
    place = Place::rows;
    if (fields.empty())
        throw InputError{line, "BEGIN_DATA without named fields before it"};
    wanted = out.row_lines.empty() && has_spectra(fields);
    if (!wanted && has_spectra(fields) && !std::exchange(more_tables, true))
        out.warnings.push_back(
            fmt::format("{}: further spectra are left out, from this table on", line));
}

void Plainer::row(std::string_view text)
{
    if (equal_ignoring_case(text, "END_DATA")) {
        end_rows();
        return;
    }
    if (!wanted)
        return;
    if (out.row_lines.size() == most_rows)
        throw InputError{line, fmt::format("more than {} patches", most_rows)};
    for (const std::string &value : row_of(text, fields.size(), tabs, line))
        rows += string_literal(value) + ' ';
    rows += '\n';
    out.row_lines.push_back(line);
}

void Plainer::end_rows()
{
    place = Place::header;
    if (wanted && !out.row_lines.empty()) {
        check(field_count, fields.size());
        check(row_count, out.row_lines.size());
        out.fields_line = fields_line;
        out.text = fmt::format("CGATS.17\n{}NUMBER_OF_FIELDS {}\nBEGIN_DATA_FORMAT\n", norm,
                               fields.size());
        for (const std::string &field : fields)
            out.text += identifier(field) + ' ';
        out.text +=
            fmt::format("\nEND_DATA_FORMAT\nNUMBER_OF_SETS {}\nBEGIN_DATA\n", out.row_lines.size());
        out.text += rows + "END_DATA\n";
        rows.clear();
    }
    field_count.stated.reset();
    row_count.stated.reset();
}

PlainCgats Plainer::read(std::string_view file)
{
    if (file.find('\0') != std::string_view::npos)
        throw InputError{0, "not a text file"};
    if (file.starts_with("\xEF\xBB\xBF"))
        file.remove_prefix(3);
    bool any_fields = false;
    while (!file.empty()) {
        ++line;
        const std::string_view whole = next_line(file);
        const std::string_view text = trimmed(whole);
        if (text.empty() || text[0] == '#')
            continue;
        if (place == Place::header)
            header(text);
        else if (place == Place::fields)
            name_fields(equal_ignoring_case(text, "END_DATA_FORMAT") ? text : whole);
        else
            row(equal_ignoring_case(text, "END_DATA") ? text : whole);
        any_fields = any_fields || !fields.empty();
    }
    if (!any_fields)
        throw InputError{0, "not CGATS text: no fields are named (BEGIN_DATA_FORMAT)"};
    if (place == Place::rows)
        throw InputError{line, "the file ends before END_DATA"};
    if (out.row_lines.empty())
        throw InputError{0, "no spectra in this file"};
    return std::move(out);
}

} // namespace

PlainCgats plain_cgats(std::string_view file) { return Plainer().read(file); }
