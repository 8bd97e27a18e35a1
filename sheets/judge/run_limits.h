// Which readings of a run the limits of single sheets bound, and to what.
#pragma once

#include "judge/run.h"
#include "judge/tolerances.h"

namespace vantrel::sheets {

bool is_about(const Tolerance &limit, const Measurand &measurand);

// Takes the limit's own aim and the stricter of its bounds and those that the series has, where it
// is about it.
void bound(RunSeries &series, const Tolerance &limit);

} // namespace vantrel::sheets
