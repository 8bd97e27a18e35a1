// The golden tables: one line a case, in tests/golden/*.txt. See CONTRIBUTING.md for the grammar.
#pragma once

#include "functions.h"

#include <optional>

struct GoldenCase {
    std::string where; ///< file:line
    const Function *function = nullptr;
    std::vector<Slot> slots;
    double returns = 1;
    std::vector<std::string> outputs; ///< what the line says of each output, in order
    std::optional<double> tolerance;  ///< absolute; without one, 1e-12 relative
    std::string reported; ///< what the checking build says is violated; empty for nothing
};

/// The cases of every file; throws std::runtime_error with file and line.
std::vector<GoldenCase> read_all_golden();

/// A successful call of each function in the tables, to be spoilt one argument at a time.
std::vector<GoldenCase> one_good_call_each();

/// The ways to spoil an argument that a function checks: null, or each index just out of range.
std::vector<std::vector<Slot>> spoilt_calls(const GoldenCase &good, std::size_t argument);

/// An array literal of the tables: `50,10,-10`, `31*100`, a name of inputs.txt, an enumerator.
std::vector<double> golden_values(const std::string &literal);
