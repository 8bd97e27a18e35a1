// A host in C++11: the header compiles without a warning, and what only C++ sees links.
#include "layout.h"

#include <vantrel.h>

int main()
{
    double grey[VANTREL_BANDS];
    for (double &band : grey)
        band = 50.0;
    float labch[5];
    CIELABCOORD lab = {50.0, 2.5, 0.0};
    CIELCHCOORD lch;
    const ILLUM_OBS none = static_cast<ILLUM_OBS>(-1);
    return !(CalcLabch(grey, D50_2DEG, labch) == 1 && CalcLabch(grey, none, labch) == 0 &&
             CIELabToCIELCh(&lab, &lch, true) &&
             CIEDE2000().Calculate(lab, lab, 1.0, 1.0, 1.0) == 0.0 &&
             DensityRatio(grey, grey, E_STATUS) == 100.0 && Saunderson(100.0, 0.0, 0.6) == 100.0);
}
