// What was printed in the zones of a sheet, whose numbers end the names of patches: M100 Z5.
#pragma once

#include "judge/repeats.h"
#include "read/measurement.h"

#include <cstddef>
#include <map>
#include <set>
#include <string>
#include <vector>

namespace vantrel::sheets {

std::vector<int> zones_of(const Measurement &sheet); // of its patches; 0 for none

// Patches of one print: the mean of all, and that of each zone.
struct Zones {
    Repeats all;
    std::map<int, Patch> each; // by number; empty where the patches name no zones

    // What a zone is read beside: null where others have this print and the zone does not, the mean
    // of all where none has it on its own or the zone is 0.
    const Patch *in(int zone) const;
};

// Of the patches at these places, at least one; `zones` are of all patches of the sheet.
Zones by_zone(const Measurement &sheet, const std::vector<std::size_t> &places,
              const std::vector<int> &zones, ILLUM_OBS illuminant);

// "M100 (mean of 6)"; the name itself of one.
std::string name_of_mean(const std::string &first, std::size_t count);

// Zones whose prints of an ink have no solid to be read beside, by the ink's device field.
using LackingSolids = std::map<std::string, std::set<int>>;
void warn_of_solids(const std::string &file, const LackingSolids &lacking,
                    std::vector<std::string> &warnings);

} // namespace vantrel::sheets
