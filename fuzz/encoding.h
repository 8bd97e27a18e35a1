// How bytes spell calls of the functions in tests/functions.cpp, one call after the other; bytes
// that are missing at the end are 0.
//
//   call      one byte, the index of the function (past the last one: a new weight in den_weight),
//             then every argument
//   double    eight bytes
//   int       one byte; after kWideInt four bytes
//   input     one byte, an InputForm, then its values
//   output    one byte, an OutputForm
#pragma once

#include <cstdint>

enum InputForm : std::uint8_t {
    kEachValue,  ///< every value as a double
    kOneValue,   ///< one double for all
    kHalves,     ///< every value as a byte, in steps of 0.5
    kAsBefore,   ///< equal to the array before it that has the same size
    kNullInput,  ///< null, where the function checks or allows it
    kInputForms, ///< how many there are
};

enum OutputForm : std::uint8_t {
    kOwn,
    kNullOutput,
    kInPlace, ///< in the array of an input of the same size; the other bits choose one
    kOutputForms = 4,
};

inline constexpr std::int8_t kWideInt = -128;
