#pragma once

#include "base/spectrum.h"

namespace vantrel {

/// How far the Status E reflectance of a spectrum lies above that of three densities, in hundredths
/// of a percent, in the response that measures the spectrum: the visual one gives the mean of red,
/// green and blue.
std::optional<double> polarisation_intercept(Spectrum refl, double Dr, double Dg, double Db);

} // namespace vantrel
