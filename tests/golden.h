// The golden tables: one line a case, in tests/golden/*.txt. See CONTRIBUTING.md for the grammar.
#pragma once

#include "functions.h"

#include <filesystem>
#include <optional>

/// One expected output: numbers, text, or how it is left.
struct Expected {
    enum Kind { numbers, text, unwritten, anything, null_output } kind = numbers;
    std::vector<double> values;
    std::string words;
};

struct GoldenCase {
    std::string where; ///< file:line
    const Function *function = nullptr;
    std::vector<Slot> slots;
    double returns = 1;
    std::vector<Expected> outputs;
    std::optional<double> tolerance; ///< absolute; without one, 1e-12 relative
};

/// The cases of a file; throws std::runtime_error with file and line.
std::vector<GoldenCase> read_golden(const std::filesystem::path &file);

/// The cases of every file.
std::vector<GoldenCase> read_all_golden();

/// A successful call of each function in the tables, to be spoilt one argument at a time.
std::vector<GoldenCase> one_good_call_each();

/// The ways to spoil an argument that a function checks: null, or each index just out of range.
std::vector<std::vector<Slot>> spoilt_calls(const GoldenCase &good, std::size_t argument);

/// An array literal of the tables: `50,10,-10`, `31*100`, a name of inputs.txt, an enumerator.
std::vector<double> golden_values(const std::string &literal);
