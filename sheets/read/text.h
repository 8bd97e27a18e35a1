// Small helpers on text.
#pragma once

#include <cstddef>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

namespace vantrel::sheets {

// Whether a part stands anywhere in a text.
bool contains(std::string_view text, std::string_view part);

std::string upper(std::string_view text); // ASCII letters only
bool equal_ignoring_case(std::string_view first, std::string_view second);
std::string letters(std::string_view field); // SAMPLE_ID, SampleID and Sample Id are one: SAMPLEID
std::string_view trimmed(std::string_view text); // without spaces and tabs at both ends

// A finite decimal number that fills the text; a comma is a decimal point where there is none.
std::optional<double> number_in(std::string_view text);

// Text of any origin as UTF-8 that is safe to print: bytes that are not UTF-8 are taken as Latin-1,
// a tab or the end of a line becomes a space, other control characters and those of text direction
// become U+FFFD.
std::string printable(std::string_view text);

// Text in UTF-16 that begins with a byte-order mark.
std::string utf8_of_utf16(std::string_view bytes);

// UTF-8 text cut to a number of characters, with an ellipsis after the cut.
std::string cut(const std::string &text, std::size_t most);

// ", and 3 more" after the first of 4; nothing after the first of 1.
std::string and_more(std::size_t count);

// "A, B, C and 4 more".
std::string listed(const std::vector<std::string> &names, std::string_view separator = ", ",
                   std::size_t most = 3);

// printable(), in quotes and cut to a length that fits a message.
std::string in_quotes(std::string_view text);

} // namespace vantrel::sheets
