// When a sheet was made, as its file says it.
#pragma once

#include <array>
#include <optional>
#include <string_view>

namespace vantrel::sheets {

struct Date {
    enum class Kind { day, local, universal }; // without a time, with one, with its time zone
    Kind kind = Kind::day;
    double seconds = 0; // since 1970; of a universal one in UTC
};

// By ISO 8601 ("2026-03-02T08:21:00.5+01:00"), by names of months ("Mon Mar 02 2026 8:21 AM") or by
// numbers ("02.03.2026 08:21", "3/2/2026 8:21 PM"): with the day first, and with the month first.
// The two differ where a date with slashes or dashes has the year at its end and neither number is
// above
// 12. Nothing of other texts, and of days and times that there are not.
std::array<std::optional<Date>, 2> dates_in(std::string_view text);

} // namespace vantrel::sheets
