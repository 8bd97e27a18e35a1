#pragma once

#include "base/spectrum.h"

namespace vantrel {

/// Print contrast in percent of a shadow tint of density Dt beside its solid of density Ds; nothing
/// for a solid of density 0.
std::optional<double> print_contrast(double Ds, double Dt);

/// The print contrast of measured patches; nothing also where a density cannot be measured.
std::optional<double> print_contrast(Spectrum solid, Spectrum tint, Paper paper, int status,
                                     int response);

/// Preucil's apparent trap in percent of the densities of the overprint, of the second-down and of
/// the first-down ink; nothing for a second-down ink of density 0.
std::optional<double> trap(double Dop, double D2, double D1);

/// The trap of measured patches; nothing also where a density cannot be measured.
std::optional<double> trap(Spectrum second, Spectrum first, Spectrum overprint, Paper paper,
                           int status, int response);

} // namespace vantrel
