// What hosts ask of measurement files, with options as a JSON object and answers as text.
//
// Options are named as those of the program, with underscores (sheets/include/vantrel_sheets.h
// lists them); an unknown one, or a value that it does not take, is refused. Answers are JSON
// (docs/json.md), the same bytes that the program writes, or another format by the option `format`.
// All throw RequestError.
#pragma once

#include "read/measurement.h"

#include <cstddef>
#include <string>
#include <string_view>
#include <vector>

namespace vantrel::sheets {

// Reads CGATS text, CSV or CxF; `file` is its name.
Measurement open_file(std::string_view file, std::string_view bytes, std::string_view options,
                      const Tell &tell = {});

// Spectra in memory, a row of `bands` values for each patch. Without names places stand for them.
struct Rows {
    const double *values;
    std::size_t patches, bands;
    std::vector<std::string> names; // as many as patches, or none
};
Measurement open_spectra(std::string_view file, const Rows &rows, std::string_view options);

// JSON: `file`, `patches` (their number), `warnings`.
std::string about(const Measurement &sheet);

// `second_sheet` holds the second paper; null for one of each sheet itself. `aims` are those of the
// solids, for advice.
std::string report(const std::vector<const Measurement *> &sheets, const Measurement *second_sheet,
                   std::string_view options, const Tell &tell = {},
                   const Measurement *aims = nullptr);
std::string compare(const Measurement &reference, const Measurement &sample,
                    std::string_view options, const Tell &tell = {});
std::string run(const std::vector<const Measurement *> &sheets, const Measurement &aims,
                std::string_view options);
std::string predict(const Measurement &sheet, std::string_view options);
std::string ink(const Measurement &sheet, std::string_view options);

} // namespace vantrel::sheets
