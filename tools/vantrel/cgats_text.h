// CGATS text as instruments and programs export it, brought into the one form that every reader
// takes: LF line ends, decoration and undeclared keywords gone, counts that agree with what
// follows, every value quoted.
#ifndef VANTREL_TOOL_CGATS_TEXT_H
#define VANTREL_TOOL_CGATS_TEXT_H

#include <cstddef>
#include <string>
#include <string_view>
#include <vector>

struct PlainCgats {
    std::string text;                   // the first table with spectra
    std::size_t fields_line = 0;        // where the file names that table's fields
    std::vector<std::size_t> row_lines; // where its rows stand in the file
    std::vector<std::string> warnings;
};

// Throws InputError.
PlainCgats plain_cgats(std::string_view file);

#endif
