// XYZ of many spectra under one illuminant.
#pragma once

#include "loop.h"

/// The loop of refl_to_xyz. Eight spectra go side by side where they can: each sum runs in the
/// order of ReflToXYZ(), one addition waiting for the other, and eight sums wait no longer than
/// one.
void many_xyz(char **rows, const npy_intp *dimensions, const npy_intp *steps, void *data);
