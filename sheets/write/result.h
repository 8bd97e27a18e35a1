// Every result of judging, as a table for a terminal, as JSON, and as the columns of CSV and CGATS
// text; each command's result in a file of its own.
#pragma once

#include "judge/compare.h"
#include "judge/ink.h"
#include "judge/list.h"
#include "judge/predict.h"
#include "judge/report.h"
#include "judge/run.h"
#include "write/flat.h"
#include "write/sink.h"

#include <vector>

namespace vantrel::sheets {

struct TableStyle {
    bool colour = false;    // with swatches
    bool all_pairs = false; // of a comparison, not only the worst
};

// Behind a table that is read without them.
void write_warnings(const std::vector<std::string> &warnings, const Sink &sink);

void write_table(const std::vector<Report> &sheets, const Sink &sink, const TableStyle &style);
void write_table(const Comparison &comparison, const Sink &sink, const TableStyle &style);
void write_table(const Predictions &predictions, const Sink &sink, const TableStyle &style);
void write_table(const Run &run, const Sink &sink, const TableStyle &style);
void write_table(const PatchStudy &study, const Sink &sink, const TableStyle &style);
void write_table(const List &list, const Sink &sink, const TableStyle &style);

void write_json(const std::vector<Report> &sheets, const Sink &sink);
void write_json(const Comparison &comparison, const Sink &sink);
void write_json(const Predictions &predictions, const Sink &sink);
void write_json(const Run &run, const Sink &sink);
void write_json(const PatchStudy &study, const Sink &sink);
void write_json(const List &list, const Sink &sink);

// The result has to live as long as the tables.
std::vector<Flat> flat_of(const std::vector<Report> &sheets); // throws RequestError
std::vector<Flat> flat_of(const Comparison &comparison);
std::vector<Flat> flat_of(const Predictions &predictions);
std::vector<Flat> flat_of(const Run &run);
std::vector<Flat> flat_of(const PatchStudy &study);
std::vector<Flat> flat_of(const List &list);

} // namespace vantrel::sheets
