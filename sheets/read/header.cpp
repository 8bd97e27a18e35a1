#include "read/header.h"

#include "read/illuminant.h"
#include "read/text.h"

#include <fmt/format.h>

#include <algorithm>
#include <array>
#include <utility>
#include <vector>

namespace vantrel::sheets {
namespace {

bool is_word(char c)
{
    return (c >= '0' && c <= '9') || (c >= 'A' && c <= 'Z') || (c >= 'a' && c <= 'z');
}

// Takes the next word off the text, of letters and digits; empty where there is none.
std::string_view next_word(std::string_view &text)
{
    text.remove_prefix(
        static_cast<std::size_t>(std::find_if(text.begin(), text.end(), is_word) - text.begin()));
    const std::string_view word =
        text.substr(0, static_cast<std::size_t>(
                           std::find_if_not(text.begin(), text.end(), is_word) - text.begin()));
    text.remove_prefix(word.size());
    return word;
}

// What stands behind a mark, up to the next blank; empty where the mark is missing.
std::string_view behind(std::string_view text, std::string_view mark)
{
    const auto at = text.find(mark);
    if (at == std::string_view::npos)
        return {};
    const std::string_view rest = text.substr(at + mark.size());
    return rest.substr(0, rest.find_first_of(" \t,;\""));
}

// 2 or 10 degrees, the observers of 1931 and 1964.
std::optional<int> observer_in(std::string_view text)
{
    while (!text.empty()) {
        const std::string_view word = next_word(text);
        const std::string_view digits =
            word.substr(0, std::min(word.find_first_not_of("0123456789"), word.size()));
        if (digits == "2" || digits == "1931")
            return 2;
        if (digits == "10" || digits == "1964")
            return 10;
    }
    return std::nullopt;
}

// The first word that names one of the library's illuminants.
std::optional<ILLUM_OBS> illuminant_in(std::string_view text, int degrees)
{
    std::optional<ILLUM_OBS> out;
    while (!out && !text.empty())
        out = illuminant_named(fmt::format("{}_{}DEG", next_word(text), degrees));
    return out;
}

} // namespace

Condition condition_in(std::string_view text)
{
    for (std::size_t i = 0; i + 1 < text.size(); ++i)
        if ((text[i] == 'M' || text[i] == 'm') && text[i + 1] >= '0' && text[i + 1] <= '3' &&
            (i == 0 || !is_word(text[i - 1])) && (i + 2 == text.size() || !is_word(text[i + 2])))
            return text[i + 1] - '0';
    return std::nullopt;
}

namespace {

// What a text names as a condition, known or not: M0 to M9.
std::vector<std::string_view> conditions_in(std::string_view text)
{
    std::vector<std::string_view> out;
    while (!text.empty())
        if (const std::string_view word = next_word(text); word.size() == 2 &&
                                                           (word[0] == 'M' || word[0] == 'm') &&
                                                           word[1] >= '0' && word[1] <= '9')
            out.push_back(word);
    return out;
}

} // namespace

Condition condition_of_filter(std::string_view text)
{
    if (const Condition named = condition_in(text))
        return named;
    const std::string key = letters(text);
    if (key.starts_with("POL") || key.starts_with("CROSSPOL"))
        return 3;
    constexpr std::array without_uv = {"UVCUT",     "UVEXCLUDED", "UVEXCLUDE",  "UVEX", "UVFILTER",
                                       "UVBARRIER", "UVBLOCK",    "UVFREE",     "NOUV", "WITHOUTUV",
                                       "OHNEUV",    "SANSUV",     "UVCUTFILTER"};
    if (std::find(without_uv.begin(), without_uv.end(), key) != without_uv.end())
        return 2;
    return std::nullopt;
}

namespace {

bool tells_no_filter(std::string_view text)
{
    constexpr std::array words = {"", "NONE", "NO", "NOFILTER", "OFF", "FALSE", "0", "UNFILTERED",
                                  "OPEN", "NA", "N/A", "OHNE", "KEIN", "KEINER", "AUCUN", "SANS",
                                  "UVINCLUDED", "REFLECTIVE", "REFLECTANCE", "REFLECTION", "SPOT",
                                  "SCAN", "STRIP",
                                  // filters of a density, and their status
                                  "V", "VISUAL", "C", "CYAN", "M", "MAGENTA", "Y", "YELLOW", "K",
                                  "BLACK", "RED", "GREEN", "BLUE", "A", "E", "I", "T", "AUTO", "-"};
    return std::find(words.begin(), words.end(), letters(text)) != words.end();
}

bool names_condition(std::string_view key)
{
    constexpr std::array parts = {"MEASUREMENT", "ILLUMINATION", "CONDITION", "FILTER", "TESTMODE"};
    return std::any_of(parts.begin(), parts.end(),
                       [&](std::string_view part) { return contains(key, part); });
}

bool affirms(std::string_view text)
{
    const std::string key = letters(text);
    return key == "YES" || key == "ON" || key == "TRUE" || key == "1" || key == "CROSSED";
}

} // namespace

Condition Header::condition_told(std::string_view text, std::string_view key)
{
    if (affirms(text) && (key.starts_with("POL") || contains(key, "UV")))
        return key.starts_with("POL") ? 3 : 2;
    const Condition named = condition_of_filter(text);
    if (contains(key, "ILLUMINATION"))
        return named; // its other words are of light sources
    if (!named && !tells_no_filter(text) && !upper(text).starts_with("STATUS"))
        unknown_filter = text;
    return named;
}

// A later table may name another condition; two texts of one header contradict each other.
void Header::keep_condition(const std::string &key, std::string_view value)
{
    const bool polarisation = key.starts_with("POLARI");
    if (!polarisation && !names_condition(key))
        return;
    const std::string_view text = trimmed(value);
    const Condition named = polarisation || contains(key, "FILTER") ? condition_told(text, key)
                            : contains(key, "CONDITION")            ? condition_of_filter(text)
                                                                    : condition_in(value);
    if (contains(key, "CONDITION"))
        for (const std::string_view word : conditions_in(text)) {
            if (!condition_in(word))
                unknown_filter = text;
            else if (condition_in(word) != named)
                several_conditions = text;
        }
    if (!named)
        return;
    if (condition && condition != named && named_condition) {
        other_condition = text;
        return;
    }
    condition = named;
    named_condition = true;
}

void Header::keep_of_row(Condition given, Condition own, bool by_keyword)
{
    if (!told_apart && given && own && given != own)
        told_apart = {given, own, by_keyword};
}

void Header::take(std::string_view keyword, std::string_view value)
{
    const std::string key = letters(keyword);
    const auto keep = [](std::string &field, std::string_view text) {
        if (field.empty())
            field = printable(trimmed(text));
    };
    constexpr std::array<std::pair<std::string_view, std::string Origin::*>, 15> texts = {{
        {"ORIGINATOR", &Origin::originator},
        {"CREATOR", &Origin::originator},
        {"OPERATOR", &Origin::originator},
        {"DESCRIPTOR", &Origin::descriptor},
        {"FILEDESCRIPTOR", &Origin::descriptor},
        {"DESCRIPTION", &Origin::descriptor},
        {"CREATED", &Origin::created},
        {"CREATIONDATE", &Origin::created},
        {"MEASUREMENTDATE", &Origin::created},
        {"DATE", &Origin::created},
        {"INSTRUMENTATION", &Origin::instrument},
        {"INSTRUMENT", &Origin::instrument},
        {"TARGETINSTRUMENT", &Origin::instrument},
        {"JOB", &Origin::job},
        {"JOBNAME", &Origin::job},
    }};
    for (const auto &[name, field] : texts)
        if (key == name)
            keep(origin.*field, value);

    if (key == "QUANTITY" || key == "MEASTYPE" || key == "MEASUREMENTTYPE")
        keep(quantity, upper(value));

    if (const std::string_view text = trimmed(value); !text.empty() && text != "-") {
        const bool of_backing = contains(key, "BACKING");
        if (of_backing || contains(key, "GEOMETR")) {
            (of_backing ? backing : geometry) = printable(text);
            ++setups_told;
        }
    }
    keep_condition(key, value);
    if (names_condition(key) && condition_in(value))
        return;
    const std::string words = upper(value);
    if (key == "WEIGHTINGFUNCTION" && words.starts_with("ILLUMINANT"))
        keep_illuminant(value.substr(std::min(value.find_first_not_of(" ,", 10), value.size())));
    else if (key == "WEIGHTINGFUNCTION" && words.starts_with("OBSERVER"))
        keep_observer(value.substr(std::min(value.find_first_not_of(" ,", 8), value.size())));
    else if (key == "ILLUMINATIONNAME" || key == "ILLUMINANT" ||
             (key == "WEIGHTINGFUNCTION" && illuminant_in(value, 2)))
        keep_illuminant(value);
    else if (key == "OBSERVERANGLE" || key == "OBSERVER")
        keep_observer(value);
    else if (key == "MEASUREMENTSOURCE") {
        keep_illuminant(behind(words, "ILLUMINATION="));
        keep_observer(behind(words, "OBSERVERANGLE="));
    }
}

void Header::end_table(bool read)
{
    named_condition = false;
    has_read = has_read || read;
}

void Header::keep_illuminant(std::string_view value)
{
    const std::string stated = printable(trimmed(value));
    if (illuminant.empty() && has_read) {
        if (illuminant_in(stated, 2) != D50_2DEG)
            later_illuminant = stated;
    } else if (illuminant.empty()) {
        illuminant = stated;
    } else if (illuminant_in(stated, 2) &&
               illuminant_in(stated, 2) != illuminant_in(illuminant, 2)) {
        other_illuminant = stated;
    }
}

void Header::keep_observer(std::string_view value)
{
    const std::string stated = printable(trimmed(value));
    if (observer.empty())
        observer = stated;
    else if (observer_in(stated) && observer_in(stated) != observer_in(observer))
        other_observer = stated;
}

std::string Header::setup() const
{
    return fmt::format("{}{}{}{}{}", backing.empty() ? "" : "Backing ", backing,
                       backing.empty() || geometry.empty() ? "" : "; ",
                       geometry.empty() ? "" : "Geometry ", geometry);
}

bool Header::transmission() const { return contains(quantity, "TRANSMI"); }
bool Header::reflection() const { return contains(quantity, "REFLECT"); }

bool Header::light() const
{
    return contains(quantity, "EMISS") || contains(quantity, "RADIAN") ||
           contains(quantity, "AMBIENT");
}

Colours Header::colours() const
{
    Colours out;
    out.stated = illuminant.empty() && !observer.empty()
                     ? "observer " + observer
                     : illuminant + (observer.empty() ? "" : ", ") + observer;
    const auto degrees =
        observer.empty() ? observer_in(illuminant).value_or(2) : observer_in(observer);
    if (degrees)
        out.illuminant = illuminant_in(illuminant.empty() ? "D50" : illuminant, *degrees);
    if (out.stated.empty())
        out.illuminant.reset();
    return out;
}

} // namespace vantrel::sheets
