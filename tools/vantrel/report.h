// What `vantrel report` says about a sheet.
#ifndef VANTREL_TOOL_REPORT_H
#define VANTREL_TOOL_REPORT_H

#include <cstdint>
#include <string>
#include <vector>

#include "measurement.h"

struct PatchReport {
    std::string id;
    std::string name;
    std::vector<std::pair<std::string, double>> device; // as in Patch
    std::uint8_t red = 0, green = 0, blue = 0;          // screen preview
    CIELABCOORD lab{};
    CIELCHCOORD lch{};
    double to_paper = 0; // ΔE00
};

struct Report {
    std::string file;
    ILLUM_OBS illuminant;
    std::string paper; // the paper patch by name
    Source source;
    std::vector<PatchReport> patches;
};

Report report_of(const Measurement &sheet, const std::string &file, ILLUM_OBS illuminant,
                 const Patch &paper);

// The output formats; each gives the whole text.
std::string as_table(const Report &report, bool colour);
std::string as_csv(const Report &report);
std::string as_json(const Report &report);

#endif
