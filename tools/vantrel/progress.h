// A bar on standard error for work that takes over a second.
#pragma once

#include "read/tell.h"

namespace vantrel::program {

// Shows the bar; empty where standard error is no terminal.
sheets::Tell progress_bar();

// Before anything else is written to the terminal.
void wipe_bar();

} // namespace vantrel::program
