// Which inks a patch was printed with, as its device values tell.
#pragma once

#include "judge/zones.h"
#include "read/measurement.h"

#include <cstddef>
#include <map>
#include <optional>
#include <string>
#include <string_view>
#include <tuple>
#include <vector>

namespace vantrel::sheets {

struct Tint {
    std::size_t ink; // counted in the order of printing
    double percent;  // nominal, above 0

    friend bool operator<(const Tint &first, const Tint &second)
    {
        return std::tie(first.ink, first.percent) < std::tie(second.ink, second.percent);
    }
    friend bool operator==(const Tint &, const Tint &) = default;
};
using Tints = std::vector<Tint>; // in the order of printing; empty for bare paper

std::string ink_title(const std::string &field); // Magenta of CMYK_M; else the field itself
bool is_process_ink(const std::string &title);   // cyan, magenta, yellow or black

class Inks {
public:
    // Patches without device values that are named by percentages alone, from 0 to 100, and darken
    // with them are the ramp of one ink.
    //
    // Inks print in the order of the file's device fields, after those that `order` names by field
    // or by solid; throws RequestError.
    Inks(const Measurement &sheet, const std::vector<std::string> &order);

    // The device fields in the order of printing.
    const std::vector<std::string> &names() const { return fields; }

    bool is_ramp() const { return ramp; }

    // Nothing where the patch has no device values, or they are no inks or not from 0 to 100.
    std::optional<Tints> tints_of(const Patch &patch) const;

    // The first patch of this combination, null where there is none.
    const Patch *measured(const Tints &tints) const;

    // The mean of the ink's solids, under the name of the first; null where there is none.
    const Patch *solid(std::size_t ink) const
    {
        return solids[ink] ? &solids[ink]->all.patch : nullptr;
    }

    // With the solid of each zone; nothing where there is none.
    const std::optional<Zones> &solids_of(std::size_t ink) const { return solids[ink]; }

    // The ink of which a patch is a solid; nothing where it is none.
    std::optional<std::size_t> ink_of_solid(const Patch &patch) const;
    static std::optional<std::size_t> ink_of_solid(const Tints &tints);

    // The ink by its device field or by its solid's name or id; nothing where there is none.
    std::optional<std::size_t> named(std::string_view name) const;

private:
    bool names_are_tints() const;

    const Measurement &sheet;
    bool ramp = false; // by the names of the patches
    std::vector<std::string> fields;
    std::map<std::string, std::size_t> numbers; // of the fields, in the order of printing
    std::vector<std::optional<Zones>> solids;   // of each ink
};

} // namespace vantrel::sheets
