// What `vantrel list` prints: the names that the program knows, and the library's tables.
#pragma once

#include "write/flat.h"

#include <optional>
#include <string>
#include <vector>

namespace vantrel::sheets {

struct List {
    std::string what;
    Flat flat;
};

List list_illuminants();
List list_tristimulus_weights(ILLUM_OBS illuminant);
List list_statuses();
List list_responses(const std::optional<int> &wanted); // of one status, or of all
// Filters scaled to a peak of 100, all of a status or one; throws RequestError where there is none.
List list_weights(int status, const std::optional<int> &wanted);

// The output formats.
void write_table(const List &list, const Sink &sink, bool colour);
void write_json(const List &list, const Sink &sink);
std::vector<Flat> flat_of(const List &list);

} // namespace vantrel::sheets
