// What speaks against a comparison: warnings.
#pragma once

#include "judge/compare.h"

#include <optional>
#include <string>
#include <vector>

namespace vantrel::sheets {

void warn_of_conditions(const Measurement &reference, const Measurement &sample,
                        std::vector<std::string> &warnings);

// Where most aims serve several patches, one in each zone, say, and some another number that is no
// multiple of it, or where they stand more often themselves.
void warn_of_uneven(const Pairs &pairs, const Measurement &reference, const Measurement &sample,
                    std::vector<std::string> &warnings);

// Zones differ, though not as other patches do.
void warn_of_wide_means(const std::optional<Means> &means, bool of_zones, const std::string &file,
                        std::vector<std::string> &warnings);

// Two measurements of one patch never agree to the last digit, nor does a second one to the last
// digit that a rounded one has.
void warn_of_same(Comparison &out);

// As those of a sheet and of another's aims do; paper and process differ by less.
void warn_of_misfit(Comparison &out);

// Where the sample would agree far better if its wavelengths, its illuminant or its white were
// another one: what nothing in a file tells. Whether it would.
bool warn_of_better_fit(Comparison &out);

// Papers that differ in the brightener's light alone.
void warn_of_brightener(Comparison &out, const Spectrum &reference, const Spectrum &sample);

// Of the worst pairs those that would agree if their samples changed places, each with one other.
void warn_of_exchanged(Comparison &out);

} // namespace vantrel::sheets
