#include "read/cgats.h"

#include "read/lines.h"
#include "read/table.h"
#include "read/text.h"

#include <fmt/format.h>

#include <algorithm>
#include <memory>
#include <utility>

namespace vantrel::sheets {
namespace {

// The values of a line, at most `most` and one more. Tabs separate them, empty ones too, or else
// any white space does.
void split(std::string_view text, bool tabs, std::size_t most, std::size_t line, Row &row)
{
    const auto ends = [&](char c) { return c == '\t' || (c == ' ' && !tabs); };
    row.clear();
    while (row.values.size() <= most) {
        text.remove_prefix(std::min(text.find_first_not_of(tabs ? " " : " \t"), text.size()));
        if (!tabs && (text.empty() || text[0] == '#'))
            break;
        std::string_view quoted;
        if (text.starts_with('"')) {
            const auto string = next_string(text, row);
            if (!string)
                throw InputError{line, "a quoted text is not closed"};
            quoted = *string;
        }
        const std::string_view rest = before(text, ends);
        text.remove_prefix(rest.size());
        row.add(quoted, trimmed(rest));
        if (tabs && text.empty())
            break;
        if (tabs)
            text.remove_prefix(1);
    }
    while (tabs && !row.values.empty() && row.values.back().empty())
        row.values.pop_back();
}

// A row has as many values as there are fields. Where tabs separate the fields' names they separate
// the values; otherwise they do if the number of values comes out, or else any white space does.
void read_row(std::string_view text, std::size_t fields, bool tabs, std::size_t line, Row &row)
{
    const auto in_line = static_cast<std::size_t>(std::count(text.begin(), text.end(), '\t'));
    row.clear();
    if (in_line > 0) {
        split(text, true, fields, line, row);
        if (row.values.size() < fields && in_line + 1 >= fields)
            row.values.resize(fields); // empty columns at the end
    }
    if (row.values.size() != fields && !(tabs && in_line > 0))
        split(text, false, fields, line, row);
    const std::size_t count = row.values.size();
    if (count != fields)
        throw InputError{line,
                         fmt::format("{} values in a row of {} fields",
                                     count > fields ? "more" : fmt::to_string(count), fields)};
}

// The kinds of files that a first word names.
constexpr struct {
    std::string_view word;
    std::string_view holds; // empty where it may hold reflectances
} kinds[] = {
    {"CCSS", "the light of a display"},
    {"CMF", "the colour matching functions of an observer"},
    {"CCMX", "a correction of a display's colours"},
    {"SPECT", ""},
};

// Whether the words before the first '=' are a keyword with blanks, not one keyword and its value.
bool begun_by_words(std::string_view text)
{
    const std::string_view words = text.substr(0, std::min(text.find('='), text.size()));
    return words.find_first_of("\"\t_") == std::string_view::npos && upper(words) != words &&
           words.size() < 40;
}

// Goes through the file line by line.
class CgatsReader {
public:
    // The first table that holds spectra, or else colours, with the later ones of the same fields.
    CgatsReader(Sheet &sheet, bool spectra) : sheet(sheet), spectra(spectra) {}
    void read(std::string_view text);

private:
    void first_word(std::string_view text);
    void header(std::string_view text);
    void refuse_light() const;
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

    Sheet &sheet;
    bool spectra;
    std::string kind;         // the first word of the file
    std::string device_class; // of DEVICE_CLASS
    enum class Place { header, fields, rows } place = Place::header;
    std::size_t line = 0;
    Count field_count{"NUMBER_OF_FIELDS", std::nullopt, 0};
    Count row_count{"NUMBER_OF_SETS", std::nullopt, 0};
    std::vector<std::string> fields; // of the table that is being read
    std::size_t fields_line = 0;
    bool tabs = false;   // tabs separate their names
    bool fresh = false;  // and not looked at yet
    bool wanted = false; // this table holds patches
    bool left_out = false;
    std::size_t rows = 0;
    Row values; // of a row
    std::unique_ptr<Table> table;
};

void CgatsReader::check(const Count &count, std::size_t found)
{
    if (count.stated && *count.stated != static_cast<double>(found))
        sheet.warn(count.line,
                   fmt::format("{} is {:g}, but {} follow", count.keyword, *count.stated, found));
}

void CgatsReader::header(std::string_view text)
{
    const std::string_view name = text.substr(0, text.find_first_of(" \t"));
    std::string_view value = trimmed(text.substr(name.size()));
    if (value.size() > 1 && value.front() == '"' && value.back() == '"')
        value = value.substr(1, value.size() - 2);
    const std::string keyword = upper(name);
    if (keyword == "BEGIN_DATA_FORMAT") {
        place = Place::fields;
        fields.clear();
        fresh = true;
        fields_line = line + 1;
        tabs = false;
    } else if (keyword == "BEGIN_DATA") {
        begin_rows();
    }
    for (Count *count : {&field_count, &row_count})
        if (keyword == count->keyword) {
            count->stated = number_in(value);
            count->line = line;
        }
    if (keyword == "SPECTRAL_NORM") {
        const auto number = number_in(value);
        if (!number || *number <= 0)
            throw InputError{line, fmt::format("SPECTRAL_NORM is {}", in_quotes(value))};
        sheet.set_full_scale(*number, keyword, line);
    }
    if (keyword == "COLLECTION")
        sheet.collection = equal_ignoring_case(value, "yes");
    if (keyword == "DEVICE_CLASS")
        device_class = upper(value);
    // "Measurement Condition=M0" has a blank in its keyword
    const auto equals = begun_by_words(text) ? text.find('=') : std::string_view::npos;
    if (equals != std::string_view::npos)
        sheet.header.take(text.substr(0, equals), text.substr(equals + 1));
    else
        sheet.header.take(name, value);
}

void CgatsReader::first_word(std::string_view text)
{
    kind = upper(text.substr(0, text.find_first_of(" \t")));
    if (kind == "CTI3")
        sheet.set_usual_scale(100, kind);
    if (kind == "IT8.7/1")
        sheet.kind = Kind::transmission;
}

void CgatsReader::refuse_light() const
{
    const Header &header = sheet.header;
    for (const auto &[word, holds] : kinds)
        if (kind == word && !holds.empty())
            throw InputError{0, fmt::format("{} ({}), not reflectances", holds, word)};
    if (header.light())
        throw InputError{0,
                         fmt::format("light ({}), not reflectances", in_quotes(header.quantity))};
    if (kind == "CTI3" && device_class == "DISPLAY")
        throw InputError{0, "the light of a display (CTI3, DEVICE_CLASS \"DISPLAY\"), not "
                            "reflectances"};
    if (kind != "SPECT" || header.reflection() || header.transmission())
        return;
    const std::string descriptor = upper(header.origin.descriptor);
    for (const char *word : {"REFLECT", "TEST COL", "TCS", "PATCH", "PAPER", "PAINT"})
        if (descriptor.find(word) != std::string::npos)
            return;
    throw InputError{
        0, fmt::format("the spectrum of a light (SPECT{}), not reflectances; with "
                       "MEAS_TYPE \"REFLECTIVE\" it would be read",
                       descriptor.empty() ? "" : ", " + in_quotes(header.origin.descriptor))};
}

void CgatsReader::name_fields(std::string_view text)
{
    if (equal_ignoring_case(trimmed(text), "END_DATA_FORMAT")) {
        place = Place::header;
        return;
    }
    tabs = tabs || text.find('\t') != std::string_view::npos;
    split(text, tabs, text.size(), line, values);
    fields.insert(fields.end(), values.values.begin(), values.values.end());
}

void CgatsReader::begin_rows()
{
    place = Place::rows;
    rows = 0;
    if (fields.empty())
        throw InputError{line, "BEGIN_DATA without named fields before it"};
    if (!std::exchange(fresh, false)) // the same fields again
        return;
    wanted = spectra ? has_spectra(fields) : has_colours(fields);
    if (!wanted)
        return;
    refuse_light();
    if (sheet.header.transmission())
        sheet.kind = Kind::transmission;
    if (!table)
        table = std::make_unique<Table>(sheet, fields, fields_line);
    wanted = std::equal(fields.begin(), fields.end(), table->fields.begin(), table->fields.end(),
                        equal_ignoring_case);
    if (!wanted && !std::exchange(left_out, true))
        sheet.warn(line, fmt::format("{} in other fields than those before are left out",
                                     spectra ? "spectra" : "colours"));
}

void CgatsReader::row(std::string_view text)
{
    if (equal_ignoring_case(trimmed(text), "END_DATA")) {
        end_rows();
        return;
    }
    ++rows;
    if (!wanted)
        return;
    read_row(text, fields.size(), tabs, line, values);
    table->add(values, sheet.header.condition, line);
}

void CgatsReader::end_rows()
{
    place = Place::header;
    sheet.header.end_table(wanted);
    if (wanted) {
        check(field_count, fields.size());
        check(row_count, rows);
    }
    field_count.stated.reset();
    row_count.stated.reset();
}

void CgatsReader::read(std::string_view text)
{
    const Work work{sheet.tell(), "Reading", text.size()};
    while (!text.empty()) {
        ++line;
        const std::string_view whole = next_line(text);
        const std::string_view begun = trimmed(whole);
        if (begun.empty() || begun[0] == '#')
            continue;
        if (kind.empty())
            first_word(begun);
        if (place == Place::header)
            header(begun);
        else if (place == Place::fields)
            name_fields(whole);
        else
            row(whole);
        work.left(text.size());
    }
    work.left(0);
    if (place == Place::rows)
        throw InputError{line, "the file ends before END_DATA"};
    if (place == Place::fields)
        throw InputError{line, "the file ends before END_DATA_FORMAT"};
    if (table)
        table->finish();
}

} // namespace

void read_cgats(std::string_view text, Sheet &sheet)
{
    CgatsReader(sheet, true).read(text);
    if (!sheet.patches.empty())
        return;
    sheet.header = {};
    CgatsReader(sheet, false).read(text);
}

} // namespace vantrel::sheets
