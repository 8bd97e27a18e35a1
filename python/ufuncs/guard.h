// What stands around the loop of every function: the settings of its thread, and the rows that hold
// what is no reading.
#pragma once

#include "lanes/lanes.h"
#include "loop.h"

#include <string>

struct Guard {
    decltype(Row::loop) loop = nullptr;
    const LaneLoop *lanes = nullptr; ///< several rows side by side, where it can
    decltype(LaneLoops::all_finite) all_finite = nullptr;
    Layout layout = {};
    int inputs = 0;
    int core_dimensions = 0; ///< of different names
    std::string types = {};  ///< of every operand
};

/// A row with a not-a-number among its inputs, or a whole number beyond an int, is missing in every
/// output, and so is one with an infinity that would give a finite result. `data` is the Guard.
void guarded(char **rows, const npy_intp *dimensions, const npy_intp *steps, void *data);
