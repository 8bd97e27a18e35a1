// A result of judging in the format that a user names.
#pragma once

#include "write/html.h"
#include "write/page_choice.h"
#include "write/result.h"

#include <array>
#include <string_view>

namespace vantrel::sheets {

inline constexpr std::array kFormats = {"table", "csv", "json", "cgats", "html"};

// `format` is one of them. Throws RequestError.
template <typename Result>
void write_as(std::string_view format, const Result &result, const Sink &sink,
              const TableStyle &style = {})
{
    if (format == "json")
        write_json(result, sink);
    else if (format == "html")
        write_html([&](const Sink &page) { write_json(result, page); }, sink);
    else if (format == "table")
        write_table(result, sink, style);
    else if (format == "csv")
        write_csv(flat_of(result), sink);
    else
        write_cgats(flat_of(result), sink);
}

} // namespace vantrel::sheets
