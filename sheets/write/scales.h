// Tone values and grey scales of a comparison, as a table, JSON and columns.
#pragma once

#include "judge/scales.h"
#include "write/flat.h"
#include "write/json_text.h"
#include "write/table_text.h"

#include <vector>

namespace vantrel::sheets {

void add_tones(Lines &lines, const std::vector<ToneStep> &tones);
void add_greys(Lines &lines, const std::vector<GreyStep> &greys);

Json tones_json(const std::vector<ToneStep> &tones);
Json greys_json(const std::vector<GreyStep> &greys);

// The steps have to live as long as the columns.
Flat flat_of(const std::vector<ToneStep> &tones);
Flat flat_of(const std::vector<GreyStep> &greys);

} // namespace vantrel::sheets
