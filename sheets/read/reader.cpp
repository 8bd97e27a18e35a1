#include "read/reader.h"

#include "read/cgats.h"
#include "read/csv.h"
#include "read/cxf.h"
#include "read/lines.h"
#include "read/sheet.h"
#include "read/text.h"

namespace vantrel::sheets {
namespace {

bool is_cgats(std::string_view text)
{
    if (text.find("BEGIN_DATA_FORMAT") == std::string_view::npos &&
        text.find("begin_data_format") == std::string_view::npos)
        return false; // without going through a long file line by line
    while (!text.empty()) {
        const std::string_view line = trimmed(next_line(text));
        if (equal_ignoring_case(line.substr(0, 17), "BEGIN_DATA_FORMAT"))
            return true;
    }
    return false;
}

} // namespace

Measurement read_measurement(std::string_view bytes, const Reading &reading)
{
    std::string converted;
    if (bytes.starts_with("\xFF\xFE") || bytes.starts_with("\xFE\xFF")) {
        converted = utf8_of_utf16(bytes);
        bytes = converted;
    } else if (bytes.starts_with("\xEF\xBB\xBF")) {
        bytes.remove_prefix(3);
    }
    if (bytes.find('\0') != std::string_view::npos)
        throw InputError{0, "not a text file"};
    const auto begin = bytes.find_first_not_of(" \t\r\n");
    if (begin == std::string_view::npos)
        throw InputError{0, "the file is empty"};

    Sheet sheet(reading);
    if (bytes[begin] == '<')
        read_cxf(bytes, sheet);
    else if (is_cgats(bytes))
        read_cgats(bytes, sheet);
    else
        read_csv(bytes, sheet);
    return sheet.measurement();
}

} // namespace vantrel::sheets
