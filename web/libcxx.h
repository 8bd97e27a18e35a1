// What Emscripten's C++ library lacks of C++20, put before every file that is compiled with it.
#pragma once

#include <cerrno>
#include <charconv>
#include <cmath>
#include <cstdlib>
#include <string>
#include <version>

namespace std {

#ifndef __cpp_lib_bit_cast
template <typename To, typename From> constexpr To bit_cast(const From &from) noexcept
{
    return __builtin_bit_cast(To, from);
}
#endif

#ifndef __cpp_lib_to_chars
// Decimal numbers alone, which is what measurement files hold.
inline from_chars_result from_chars(const char *first, const char *last, double &value)
{
    const string text(first, last);
    const string number = text.substr(0, text.find_first_not_of("0123456789.eE+-"));
    char *end = nullptr;
    errno = 0;
    const double read = strtod(number.c_str(), &end);
    const char *stop = first + (end - number.c_str());
    if (stop == first || number[0] == '+')
        return {first, errc::invalid_argument};
    if (errno == ERANGE && (read == 0 || read == HUGE_VAL || read == -HUGE_VAL))
        return {stop, errc::result_out_of_range};
    value = read;
    return {stop, errc{}};
}
#endif

} // namespace std
