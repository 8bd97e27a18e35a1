// Limits and how they were held, as a table, JSON and columns.
#pragma once

#include "judge/compare.h"
#include "judge/limits.h"
#include "write/flat.h"
#include "write/json_text.h"
#include "write/table_text.h"

#include <string>
#include <vector>

namespace vantrel::sheets {

int decimals_of(const LimitResult &result); // densities have three

// `places` tell where each was judged; none where it is plain.
void add_limits(Lines &lines, const std::string &title, const std::vector<LimitResult> &limits,
                const std::vector<std::string> &places = {});

// "2 of 7 limits failed, 1 could not be judged"
std::string counts_of(const std::vector<LimitResult> &limits);

std::string told(const Coverage &coverage);
Json coverage_json(const Coverage &coverage);

Json limits_json(const std::vector<LimitResult> &limits);

// The limits have to live as long as the columns.
Flat flat_of(const std::vector<LimitResult> &limits, const std::string &aims,
             const std::string &description);

// A verdict or a warning among the columns.
struct Statement {
    std::string name, verdict, note;
};
Flat flat_of(std::vector<Statement> statements, const std::string &description);

} // namespace vantrel::sheets
