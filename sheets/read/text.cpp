#include "read/text.h"

#include <algorithm>
#include <array>
#include <cerrno>
#include <charconv>
#include <cmath>
#include <cstdint>
#include <cstdlib>

namespace vantrel::sheets {
namespace {

char upper_letter(char c) { return c >= 'a' && c <= 'z' ? static_cast<char>(c - 'a' + 'A') : c; }

struct CodePoint {
    char32_t value;
    std::size_t bytes;
};

// The code point that the text begins with; a byte that begins no UTF-8 sequence is Latin-1.
CodePoint first_code_point(std::string_view text)
{
    const auto lead = static_cast<unsigned char>(text[0]);
    const std::size_t bytes = lead >= 0xF0 ? 4 : lead >= 0xE0 ? 3 : lead >= 0xC2 ? 2 : 1;
    constexpr char32_t smallest[] = {0, 0, 0x80, 0x800, 0x10000};
    if (bytes == 1 || lead > 0xF4 || text.size() < bytes)
        return {lead, 1};
    char32_t value = lead & (0x7Fu >> bytes);
    for (std::size_t i = 1; i < bytes; ++i) {
        const auto next = static_cast<unsigned char>(text[i]);
        if ((next & 0xC0) != 0x80)
            return {lead, 1};
        value = value << 6 | (next & 0x3Fu);
    }
    if (value < smallest[bytes] || value > 0x10FFFF || (value >= 0xD800 && value <= 0xDFFF))
        return {lead, 1};
    return {value, bytes};
}

bool unprintable(char32_t c)
{
    return c < 0x20 || (c >= 0x7F && c < 0xA0) || c == 0x061C || (c >= 0x200B && c <= 0x200F) ||
           (c >= 0x2028 && c <= 0x202E) || (c >= 0x2060 && c <= 0x206F) || c == 0xFEFF;
}

void append_utf8(std::string &out, char32_t c)
{
    const auto tail = [&](int shift) { out += static_cast<char>(0x80 | ((c >> shift) & 0x3F)); };
    if (c < 0x80) {
        out += static_cast<char>(c);
    } else if (c < 0x800) {
        out += static_cast<char>(0xC0 | (c >> 6));
        tail(0);
    } else if (c < 0x10000) {
        out += static_cast<char>(0xE0 | (c >> 12));
        tail(6);
        tail(0);
    } else {
        out += static_cast<char>(0xF0 | (c >> 18));
        tail(12);
        tail(6);
        tail(0);
    }
}

// The number of at most 15 digits that the whole text is, as most are. Those digits and the power
// of ten below them are doubles, so that their quotient is the double nearest to the number.
std::optional<double> short_decimal(std::string_view text)
{
    static constexpr std::array powers = {1e0, 1e1, 1e2,  1e3,  1e4,  1e5,  1e6,  1e7,
                                          1e8, 1e9, 1e10, 1e11, 1e12, 1e13, 1e14, 1e15};
    const bool negative = text.starts_with('-');
    text.remove_prefix(negative);
    const std::size_t point = std::min(text.find('.'), text.size());
    const std::string_view whole = text.substr(0, point),
                           places = text.substr(std::min(point + 1, text.size()));
    if (whole.size() + places.size() == 0 || whole.size() + places.size() >= powers.size())
        return std::nullopt;
    std::uint64_t digits = 0;
    for (const std::string_view part : {whole, places})
        for (const char c : part) {
            if (c < '0' || c > '9')
                return std::nullopt;
            digits = 10 * digits + static_cast<std::uint64_t>(c - '0');
        }
    const double value = static_cast<double>(digits) / powers[places.size()];
    return negative ? -value : value;
}

// The decimal number that the whole text is; otherwise not finite.
double decimal(std::string_view text)
{
#ifdef __cpp_lib_to_chars
    double value = 0;
    const char *end = text.data() + text.size();
    const auto [last, error] = std::from_chars(text.data(), end, value);
    return last == end && error == std::errc() ? value : NAN;
#else // libc++ has from_chars() of integers alone
    if (text.empty() || text[0] == '+' ||
        text.find_first_not_of("0123456789.eE+-") != std::string_view::npos)
        return NAN;
    const std::string number(text);
    char *last = nullptr;
    errno = 0;
    const double value = std::strtod(number.c_str(), &last);
    const bool underflow = value == 0 && errno == ERANGE;
    return *last == '\0' && !underflow ? value : NAN;
#endif
}

} // namespace

std::string upper(std::string_view text)
{
    std::string out(text);
    std::transform(out.begin(), out.end(), out.begin(), upper_letter);
    return out;
}

bool equal_ignoring_case(std::string_view first, std::string_view second)
{
    return std::equal(first.begin(), first.end(), second.begin(), second.end(),
                      [](char a, char b) { return upper_letter(a) == upper_letter(b); });
}

std::string letters(std::string_view field)
{
    std::string out = upper(field);
    std::erase_if(out, [](char c) { return c == '_' || c == ' ' || c == '-'; });
    return out;
}

bool contains(std::string_view text, std::string_view part)
{
    return text.find(part) != std::string_view::npos;
}

std::string_view trimmed(std::string_view text)
{
    const auto blank = [](char c) { return c == ' ' || c == '\t'; };
    while (!text.empty() && blank(text.front()))
        text.remove_prefix(1);
    while (!text.empty() && blank(text.back()))
        text.remove_suffix(1);
    return text;
}

std::optional<double> number_in(std::string_view text)
{
    if (const auto number = short_decimal(text))
        return number;
    text = trimmed(text);
    if (text.size() > 1 && text[0] == '+' && text[1] != '-')
        text.remove_prefix(1);
    const double value = decimal(text);
    if (std::isfinite(value))
        return value;
    const auto comma = text.find(',');
    if (comma == std::string_view::npos || text.find('.') != std::string_view::npos)
        return std::nullopt;
    std::string with_point(text);
    with_point[comma] = '.';
    return text[0] == '+' ? std::nullopt : number_in(with_point);
}

std::string printable(std::string_view text)
{
    if (std::all_of(text.begin(), text.end(), [](char c) { return c >= ' ' && c <= '~'; }))
        return std::string(text);
    std::string out;
    while (!text.empty()) {
        const CodePoint next = first_code_point(text);
        if (next.value == '\t' || next.value == '\n' || next.value == '\r')
            out += ' ';
        else
            append_utf8(out, unprintable(next.value) ? U'\uFFFD' : next.value);
        text.remove_prefix(next.bytes);
    }
    return out;
}

std::string utf8_of_utf16(std::string_view bytes)
{
    const std::size_t high = bytes[0] == '\xFE' ? 0 : 1; // which byte of a pair
    const auto unit = [&](std::size_t i) -> char32_t {
        return static_cast<unsigned char>(bytes[i + high]) * 256u +
               static_cast<unsigned char>(bytes[i + 1 - high]);
    };
    std::string out;
    for (std::size_t i = 2; i + 1 < bytes.size(); i += 2) {
        char32_t value = unit(i);
        if (value >= 0xD800 && value < 0xDC00 && i + 3 < bytes.size() &&
            (unit(i + 2) & 0xFC00) == 0xDC00) {
            i += 2;
            value = 0x10000 + ((value & 0x3FF) << 10) + (unit(i) & 0x3FF);
        }
        append_utf8(out, value >= 0xD800 && value < 0xE000 ? U'\uFFFD' : value);
    }
    return out;
}

std::string cut(const std::string &text, std::size_t most)
{
    std::size_t characters = 0;
    for (std::size_t i = 0; i < text.size(); ++i)
        if ((text[i] & 0xC0) != 0x80 && ++characters > most)
            return text.substr(0, i) + "…";
    return text;
}

std::string and_more(std::size_t count)
{
    return count > 1 ? ", and " + std::to_string(count - 1) + " more" : "";
}

std::string listed(const std::vector<std::string> &names, std::string_view separator,
                   std::size_t most)
{
    std::string out;
    for (std::size_t i = 0; i < std::min(most, names.size()); ++i)
        out.append(i ? separator : "").append(names[i]);
    if (names.size() > most)
        out += " and " + std::to_string(names.size() - most) + " more";
    return out;
}

std::string in_quotes(std::string_view text)
{
    return '"' + cut(printable(text.substr(0, 400)), 40) + '"';
}

} // namespace vantrel::sheets
