// The loops that compute several rows side by side.
#pragma once

#include "operand.h"

#include <span>

/// What a loop has computed.
enum class Done {
    nothing, ///< none is written: the rows or arguments ask for one row after the other
    rows,
    finite_rows, ///< and every input of every row is finite
};

struct LaneLoop {
    const char *name; ///< of the ufunc
    Done (*run)(const Operand *operands, npy_intp rows);
    /// Whether it may find that the inputs are finite, by the sums that it makes of them.
    bool finds_finite = false;
};

struct LaneLoops {
    std::span<const LaneLoop> loops;
    bool (*all_finite)(const double *values, npy_intp count) = nullptr;
};

/// Of 2, 4 and 8 rows: for any processor, and for x86-64 with AVX2 and with AVX-512.
LaneLoops lane_loops_2();
LaneLoops lane_loops_4();
LaneLoops lane_loops_8();

/// Of as many rows as this processor has lanes, or as the variable VANTREL_LANES in the environment
/// says: off, 2, 4 or 8. Where the processor does not have them, `fault` says so.
LaneLoops lane_loops(const char *&fault);
