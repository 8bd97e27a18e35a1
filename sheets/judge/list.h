// The names under which the library's tables are known, and the tables.
#pragma once

#include <vantrel.h>

#include <cstddef>
#include <optional>
#include <string>
#include <variant>
#include <vector>

namespace vantrel::sheets {

struct ListColumn {
    std::string name;
    std::string cgats;                                                  // its name in CGATS text
    std::variant<std::vector<std::string>, std::vector<double>> values; // for each row
};

struct List {
    std::string what;
    std::vector<ListColumn> columns; // equally long
    std::size_t rows() const;
};

List list_illuminants();
List list_tristimulus_weights(ILLUM_OBS illuminant);
List list_statuses();
List list_responses(const std::optional<int> &wanted); // of one status, or of all
// Filters scaled to a peak of 100, all of a status or one; throws RequestError where there is none.
List list_weights(int status, const std::optional<int> &wanted);

} // namespace vantrel::sheets
