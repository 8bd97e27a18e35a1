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
Row split(std::string_view text, bool tabs, std::size_t most, std::size_t line)
{
    const auto ends = [&](char c) { return c == '\t' || (c == ' ' && !tabs); };
    Row values;
    while (values.size() <= most) {
        text.remove_prefix(std::min(text.find_first_not_of(tabs ? " " : " \t"), text.size()));
        if (!tabs && (text.empty() || text[0] == '#'))
            break;
        std::string value;
        if (text.starts_with('"')) {
            auto quoted = next_string(text);
            if (!quoted)
                throw InputError{line, "a quoted text is not closed"};
            value = std::move(*quoted);
        }
        const std::string_view rest = before(text, ends);
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
Row row_of(std::string_view text, std::size_t fields, bool tabs, std::size_t line)
{
    Row values;
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

// Goes through the file line by line.
class Reader {
public:
    explicit Reader(Sheet &sheet) : sheet(sheet) {}
    void read(std::string_view text);

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

    Sheet &sheet;
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
    Condition condition;
    std::unique_ptr<Table> table;
};

void Reader::check(const Count &count, std::size_t found)
{
    if (count.stated && *count.stated != static_cast<double>(found))
        sheet.warn(count.line,
                   fmt::format("{} is {:g}, but {} follow", count.keyword, *count.stated, found));
}

void Reader::header(std::string_view text)
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
    for (const char *part : {"MEASUREMENT", "ILLUMINATION", "CONDITION", "FILTER"})
        if (keyword.find(part) != std::string::npos)
            if (const Condition named = condition_in(value))
                condition = named;
}

void Reader::name_fields(std::string_view text)
{
    if (equal_ignoring_case(trimmed(text), "END_DATA_FORMAT")) {
        place = Place::header;
        return;
    }
    tabs = tabs || text.find('\t') != std::string_view::npos;
    for (std::string &field : split(text, tabs, text.size(), line))
        fields.push_back(std::move(field));
}

void Reader::begin_rows()
{
    place = Place::rows;
    rows = 0;
    if (fields.empty())
        throw InputError{line, "BEGIN_DATA without named fields before it"};
    if (!std::exchange(fresh, false)) // the same fields again
        return;
    wanted = has_spectra(fields);
    if (!wanted)
        return;
    if (!table)
        table = std::make_unique<Table>(sheet, fields, fields_line);
    wanted = std::equal(fields.begin(), fields.end(), table->fields.begin(), table->fields.end(),
                        equal_ignoring_case);
    if (!wanted && !std::exchange(left_out, true))
        sheet.warn(line, "spectra in other fields than those before are left out");
}

void Reader::row(std::string_view text)
{
    if (equal_ignoring_case(trimmed(text), "END_DATA")) {
        end_rows();
        return;
    }
    ++rows;
    if (wanted)
        table->add(row_of(text, fields.size(), tabs, line), condition, line);
}

void Reader::end_rows()
{
    place = Place::header;
    if (wanted) {
        check(field_count, fields.size());
        check(row_count, rows);
    }
    field_count.stated.reset();
    row_count.stated.reset();
}

void Reader::read(std::string_view text)
{
    const Work work{sheet.tell(), "Reading", text.size()};
    while (!text.empty()) {
        ++line;
        const std::string_view whole = next_line(text);
        const std::string_view begun = trimmed(whole);
        if (begun.empty() || begun[0] == '#')
            continue;
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

void read_cgats(std::string_view text, Sheet &sheet) { Reader(sheet).read(text); }

} // namespace vantrel::sheets
