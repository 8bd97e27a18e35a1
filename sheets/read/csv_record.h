// What CSV consists of: records of values, and keywords above them.
#pragma once

#include "read/header.h"
#include "read/lines.h"

#include <cstddef>
#include <string_view>

namespace vantrel::sheets {

// Takes a record off the text, with the end of its last line; counts the lines that it ends. A
// quoted value may go over several. False where a quoted value is not closed.
bool next_record(std::string_view &text, char separator, std::size_t &line, Row &row);

bool is_blank(const Row &row);

// "Measurement Condition=M0", "Created: 2026-03-02", "Instrument;\"a reader\""
void take_keyword(std::string_view line, Header &header);

} // namespace vantrel::sheets
