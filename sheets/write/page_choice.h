// What of a large result the page of --format html holds.
#pragma once

#include "judge/compare.h"
#include "judge/report.h"

#include <cstddef>
#include <vector>

namespace vantrel::sheets {

// A page of so many patches is there in a few seconds (docs/quality.md).
constexpr std::size_t kMostOnPage = 50'000;

// Leaves at most so many patches of all sheets, or pairs: those that are out of the ordinary, for
// which half of the room is kept, and of the others an even choice. `left_out` says what is
// missing.
void choose_for_page(std::vector<Report> &sheets, std::size_t most = kMostOnPage);
void choose_for_page(Comparison &comparison, std::size_t most = kMostOnPage);
template <typename Result> void choose_for_page(Result &) {} // which never is large

} // namespace vantrel::sheets
