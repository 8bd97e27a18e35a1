#include "judge/dates.h"

#include "read/text.h"

#include <algorithm>
#include <cctype>
#include <charconv>
#include <chrono>
#include <iterator>
#include <string>
#include <utility>
#include <vector>

namespace vantrel::sheets {
namespace {

// A number, a word in capitals, or a sign.
struct Token {
    std::string text;
    int value = -1; // of a number

    bool number(std::size_t fewest, std::size_t most) const
    {
        return value >= 0 && text.size() >= fewest && text.size() <= most;
    }
};
using Tokens = std::vector<Token>;

Tokens tokens_of(std::string_view text)
{
    const auto kind = [](char c) {
        const auto byte = static_cast<unsigned char>(c);
        return std::isdigit(byte) ? 'n' : std::isalpha(byte) ? 'w' : c;
    };
    Tokens out;
    for (std::size_t i = 0; i < text.size();) {
        std::size_t end = i + 1;
        while (end < text.size() && kind(text[end]) == kind(text[i]) &&
               (kind(text[i]) == 'n' || kind(text[i]) == 'w'))
            ++end;
        Token token{upper(std::string(text.substr(i, end - i)))};
        if (kind(text[i]) == 'n' && end - i < 9)
            std::from_chars(text.data() + i, text.data() + end, token.value);
        if (text[i] != ' ')
            out.push_back(std::move(token));
        i = end;
    }
    return out;
}

// Takes the tokens of a time out of those of a date.
class Time {
public:
    explicit Time(Tokens &tokens) : tokens(tokens)
    {
        for (first = 0; first + 2 < tokens.size(); ++first)
            if (tokens[first + 1].text == ":" && tokens[first].number(1, 2) &&
                tokens[first + 2].number(2, 2))
                break;
        if (first + 2 >= tokens.size())
            return;
        kind = Date::Kind::local;
        next = first + 3;
        const int hour = take_half_day(take_seconds(tokens[first].value));
        const int minute = tokens[first + 2].value;
        is_valid = is_valid && hour < 24 && minute < 60 && seconds < 60;
        seconds += 3600 * hour + 60 * minute;
        take_zone();
        if (first > 0 && tokens[first - 1].text == "T")
            --first;
        tokens.erase(tokens.begin() + static_cast<std::ptrdiff_t>(first),
                     tokens.begin() + static_cast<std::ptrdiff_t>(next));
    }

    Date::Kind kind = Date::Kind::day;
    double seconds = 0;
    bool is_valid = true;

private:
    bool at(std::string_view text) const
    {
        return next < tokens.size() && tokens[next].text == text;
    }

    bool at_number(std::size_t ahead, std::size_t fewest, std::size_t most) const
    {
        return next + ahead < tokens.size() && tokens[next + ahead].number(fewest, most);
    }

    int take_seconds(int hour)
    {
        if (!at(":") || !at_number(1, 2, 2))
            return hour;
        seconds = tokens[next + 1].value;
        next += 2;
        if ((at(".") || at(",")) && at_number(1, 1, 8)) {
            seconds += number_in("0." + tokens[next + 1].text).value_or(0);
            next += 2;
        }
        return hour;
    }

    // 12 AM is midnight, 12 PM noon.
    int take_half_day(int hour)
    {
        if (!at("AM") && !at("PM"))
            return hour;
        is_valid = hour >= 1 && hour <= 12;
        return hour % 12 + (tokens[next++].text == "PM" ? 12 : 0);
    }

    // Z, UTC, GMT+1, +01, +0100, +01:00
    void take_zone()
    {
        if (at("Z") || at("UTC") || at("GMT")) {
            kind = Date::Kind::universal;
            ++next;
        }
        if ((!at("+") && !at("-")) || !at_number(1, 1, 4))
            return;
        const Token &offset = tokens[next + 1];
        const int sign = at("+") ? 1 : -1;
        int hours = offset.text.size() > 2 ? offset.value / 100 : offset.value;
        int minutes = offset.text.size() > 2 ? offset.value % 100 : 0;
        next += 2;
        if (at(":") && at_number(1, 2, 2)) {
            minutes = tokens[next + 1].value;
            next += 2;
        }
        is_valid = is_valid && hours <= 14 && minutes < 60;
        kind = Date::Kind::universal;
        seconds -= sign * (3600 * hours + 60 * minutes);
    }

    Tokens &tokens;
    std::size_t first = 0, next = 0;
};

// 1 to 12 by its name in English or its first three letters; 0 of other words.
unsigned month_of(const std::string &word)
{
    constexpr std::string_view names[] = {"JANUARY",   "FEBRUARY", "MARCH",    "APRIL",
                                          "MAY",       "JUNE",     "JULY",     "AUGUST",
                                          "SEPTEMBER", "OCTOBER",  "NOVEMBER", "DECEMBER"};
    for (unsigned i = 0; i < std::size(names); ++i)
        if (word == names[i] || word == names[i].substr(0, 3))
            return i + 1;
    return 0;
}

bool is_weekday(const std::string &word)
{
    constexpr std::string_view names[] = {"MONDAY", "TUESDAY",  "WEDNESDAY", "THURSDAY",
                                          "FRIDAY", "SATURDAY", "SUNDAY"};
    return std::any_of(std::begin(names), std::end(names), [&](std::string_view name) {
        return word == name || word == name.substr(0, 3);
    });
}

struct Day {
    int year = 0;
    unsigned month = 0, day = 0;
};

Day day_of(const Token &year, unsigned month, const Token &day)
{
    return {year.value, month, static_cast<unsigned>(day.value)};
}

// Of what remains without the time.
std::optional<Day> day_in(Tokens tokens, bool month_first)
{
    std::erase_if(tokens, [](const Token &t) { return t.text == "," || is_weekday(t.text); });
    const bool named =
        std::any_of(tokens.begin(), tokens.end(), [](const Token &t) { return month_of(t.text); });
    std::string separator;
    if (named)
        std::erase_if(tokens, [](const Token &t) { return t.text == "-" || t.text == "."; });
    else if (tokens.size() == 5 && tokens[1].text == tokens[3].text) {
        separator = tokens[1].text;
        tokens = {tokens[0], tokens[2], tokens[4]};
    }
    if (tokens.size() != 3)
        return std::nullopt;
    const Token &a = tokens[0], &b = tokens[1], &c = tokens[2];
    const auto month = [](const Token &t) { return static_cast<unsigned>(t.value); };
    if (named && a.number(1, 2) && c.number(4, 4)) // 2 March 2026
        return day_of(c, month_of(b.text), a);
    if (named && b.number(1, 2) && c.number(4, 4)) // March 2 2026
        return day_of(c, month_of(a.text), b);
    if (separator != "-" && separator != "/" && separator != ".")
        return std::nullopt;
    if (a.number(4, 4) && b.number(1, 2) && c.number(1, 2))
        return day_of(a, month(b), c);
    if (!a.number(1, 2) || !b.number(1, 2) || !c.number(4, 4))
        return std::nullopt;
    return month_first && separator != "." ? day_of(c, month(a), b) : day_of(c, month(b), a);
}

} // namespace

std::array<std::optional<Date>, 2> dates_in(std::string_view text)
{
    Tokens tokens = tokens_of(text);
    const Time time(tokens);
    std::array<std::optional<Date>, 2> out;
    for (std::size_t i = 0; i < out.size(); ++i) {
        const auto day = day_in(tokens, i == 1);
        if (!day || !time.is_valid)
            continue;
        const std::chrono::year_month_day date{std::chrono::year(day->year),
                                               std::chrono::month(day->month),
                                               std::chrono::day(day->day)};
        if (date.ok())
            out[i] = Date{time.kind,
                          86400.0 * static_cast<double>(
                                        std::chrono::sys_days(date).time_since_epoch().count()) +
                              time.seconds};
    }
    for (std::size_t i = 0; i < out.size(); ++i)
        if (!out[i])
            out[i] = out[1 - i];
    return out;
}

} // namespace vantrel::sheets
