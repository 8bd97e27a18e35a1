#pragma once

#include "base/spectrum.h"

namespace vantrel {

/// Yule-Nielsen dot area in percent of a tint of density Dt beside its solid of density Ds; with
/// n = 1 it is Murray-Davies. A solid of density 0 has 100.
double dot_area(double Ds, double Dt, double n);

/// Its inverse: the tint density of a dot area in percent.
double tint_density(double Ds, double dot_area, double n);

/// The dot area of a measured tint; nothing where a density cannot be measured or n is 0.
std::optional<double> dot_area(Spectrum solid, Spectrum tint, Paper paper, int status, int response,
                               double n);

/// What a measured tint has over its nominal dot area, not below 0; nothing as for dot_area.
std::optional<double> dot_gain(Spectrum solid, Spectrum tint, Paper paper, int status, int response,
                               double n, int nominal);

} // namespace vantrel
