// Which columns of a table tell inks, by their names and by their values.
#pragma once

#include <cstddef>
#include <string>
#include <string_view>
#include <vector>

namespace vantrel::sheets {

// CMYK_M, CMYKOG_O, CMY_C, RGB_R, 6CLR_1: what the printer was asked for, by the standard's names.
bool is_standard_device_field(std::string_view field);

// The inks of the columns with these keys (letters()), such as cyan, magenta_pct, Yellow %, Orange
// (percent); empty where a column is none.
std::vector<std::string> inks_of(const std::vector<std::string> &keys);

// A column that nothing reads and that may hold percentages of an ink.
class DoubtfulColumn {
public:
    explicit DoubtfulColumn(std::string_view key);
    void take(std::string_view cell);
    bool may_be_ink() const;
    bool counts_rows() const { return numbers > 1 && others == 0 && steps; }

private:
    bool named;    // like an ink
    bool measured; // or placed: not by its values
    bool nameless;
    std::size_t numbers = 0, others = 0;
    double least = 0, most = 0, last = 0;
    bool counts = true; // one after the other
    bool steps = true;  // by 1 each
    bool whole = true;
};

} // namespace vantrel::sheets
