// Aims of one paper moved to another.
#pragma once

#include <vantrel.h>

namespace vantrel::sheets {

// ISO 13655, correction for the substrate: linear in X, Y and Z, so that the aims' paper becomes
// the measured one and the darkest aim stays as it is.
class SubstrateCorrection {
public:
    SubstrateCorrection(const CIELABCOORD &aim_paper, const CIELABCOORD &darkest_aim,
                        const CIELABCOORD &paper, ILLUM_OBS illuminant);

    CIELABCOORD operator()(const CIELABCOORD &aim) const;

private:
    ILLUM_OBS illuminant;
    double slope[3]{}, offset[3]{};
};

} // namespace vantrel::sheets
