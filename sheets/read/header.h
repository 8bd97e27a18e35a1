// What the keywords of a file say about all of its patches.
#pragma once

#include "read/measurement.h"

#include <cstddef>
#include <optional>
#include <string>
#include <string_view>

namespace vantrel::sheets {

// A measurement condition of ISO 13655, 0 to 3 for M0 to M3.
using Condition = std::optional<int>;

// The condition that a text names as a word: "M1", "M1_Daylight", "CS_M1".
Condition condition_in(std::string_view text);

// The condition of a filter: M2 without ultraviolet, M3 through polarisers ("UV cut", "Pol").
Condition condition_of_filter(std::string_view text);

struct Header {
    Origin origin;
    std::string quantity; // what was measured: "REFLECTIVE", "TRANSMITTANCE", "EMISSION"
    std::string illuminant, observer;             // of the file's own colours
    std::string other_illuminant, other_observer; // that the file states too
    std::string later_illuminant;   // of a later table, where that of the first is not stated
    Condition condition;            // the one that was named last
    std::string other_condition;    // and one under another keyword
    std::string several_conditions; // in one text
    struct Apart {
        Condition given, own; // the latter is taken
        bool by_keyword;      // the former
    };
    std::optional<Apart> told_apart; // conditions of one patch, the first such
    std::string unknown_filter;
    std::string backing, geometry; // the last that were named
    std::size_t setups_told = 0;   // how often one of them was

    // The condition that a text tells under a key such as FILTER, POLARIZATION or MODE; what tells
    // neither a condition nor that there is no filter is kept.
    Condition condition_told(std::string_view text, std::string_view key = {});

    // The condition that a column tells of a patch, beside that of the keywords or other columns.
    void keep_of_row(Condition given, Condition own, bool by_keyword);

    // "Backing black; Geometry 45/0", what is known of it.
    std::string setup() const;

    // The first to say something is believed, but for the condition, backing and geometry.
    void take(std::string_view keyword, std::string_view value);

    // What follows is of another table; patches of this one were read or not.
    void end_table(bool read);

    bool transmission() const;
    bool reflection() const;
    bool light() const;

    // Without an observer it is that of 2 degrees, without an illuminant D50 (ISO 13655).
    Colours colours() const;

private:
    void keep_condition(const std::string &key, std::string_view value);
    void keep_illuminant(std::string_view value);
    void keep_observer(std::string_view value);

    bool named_condition = false; // in this header, which may be of one table
    bool has_read = false;        // patches of a table before
};

} // namespace vantrel::sheets
