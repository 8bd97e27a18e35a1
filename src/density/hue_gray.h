#pragma once

#include "density/density_set.h"

namespace vantrel {

/// The two measures of the GATF colour diagram, in percent.
struct HueGray {
    double grayness, hue_error;
};

/// Grayness and hue error of the colour densities of a set (all but the visual one). Densities of
/// exactly 0 are no lowest density; a set without densities has a highest of 0 and a lowest of 100.
HueGray hue_gray(const Densities &set);

/// The status that the measures are taken in: HiFi and Hexachrome share the colours of Status E.
inline int process_status(int status)
{
    return status == HIFI_STATUS || status == HEXACHROME_STATUS ? E_STATUS : status;
}

} // namespace vantrel
