// The device values of two sheets beside each other.
#pragma once

#include "read/measurement.h"

#include <string>
#include <vector>

namespace vantrel::sheets {

// Inks compare where the sheets have one in common: an ink that a sheet does not name is not on it.
// RGB compares where both have it.
class DeviceValues {
public:
    DeviceValues(const Measurement &first, const Measurement &second);

    bool comparable() const { return !fields.empty(); }

    // Equal for equal values, to a hundredth; empty where the patch has none or nothing compares.
    std::string key_of(const Patch &patch) const;

    // Whether all values are less than a rounded percent apart, or a patch has none.
    bool agree(const Patch &first, const Patch &second) const;

private:
    double value_of(const Patch &patch, const std::string &field) const;

    std::vector<std::string> fields; // that compare
};

// "CMYK_C 100, CMYK_M 40", "no ink" or "no device values"
std::string told(const Patch &patch);

} // namespace vantrel::sheets
