// The library's functions over whole arrays: one row each, in the order of vantrel.h.
#pragma once

#include "loop.h"

#include <span>

std::span<const Row> colour_rows();
std::span<const Row> density_rows();

/// The words of a colour difference, in the order of the numbers that stand for them.
std::span<const wchar_t *const> difference_words();

/// A function that tells of success, and one whose result it returns.
#define ROW(c_name, name, signature) row<c_name>(#c_name, name, signature)
#define RESULT(c_name, name, signature) row<c_name, Returns::result>(#c_name, name, signature)
