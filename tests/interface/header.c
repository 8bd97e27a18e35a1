/* A host in C99: the header compiles without a warning, and a function of every group links. */
#include "layout.h"

#include <vantrel.h>

int main(void)
{
    double grey[VANTREL_BANDS], refl[VANTREL_BANDS], xyz[3], result[3], value, other;
    double targets[4] = {0.0, 0.0, 0.0, 0.0};
    const CIELABCOORD first = {50.0, 2.5, 0.0}, second = {50.0, 0.0, -2.5};
    const POLWEIGHTSTRUCT weights = {grey, grey, grey, grey};
    DENSITYSTRUCT densities;
    DENSITYPOINT points[VANTREL_BANDS];
    wchar_t lightness[11], colour1[11], colour2[11];
    unsigned int rgb;
    int count;
    for (int band = 0; band < VANTREL_BANDS; ++band)
        grey[band] = 50.0;

    return !(GetNumIlluminantObservers() == NUM_ILLUM_OBS && ReflToXYZ(grey, D50_2DEG, xyz) &&
             XYZToCIELab(xyz, D50_2DEG, result) && XYZToCIELUV(xyz, D50_2DEG, result) &&
             XYZtoRGB(xyz, &rgb) && LabToDE2000(&first, &second, 1.0, 1.0, &value) &&
             VerbalColorDifference(grey, grey, D50_2DEG, 0, lightness, colour1, colour2) &&
             den_weight[E_STATUS][RED_RESPONSE][20] == 29979 && GetNumStatuses() == NUM_STATUSES &&
             ReflToDensities(grey, NULL, E_STATUS, &densities) &&
             densities.density[HIFI1_RESPONSE] == 0.0 &&
             FindMaxDensityPoints(grey, points, &count) && points[0].band == 9 &&
             !IsChromatic(grey, D65_10DEG) && DensityToDotArea(1.4, 0.3, 1.0, &value) &&
             DensityToTrap(1.2, 1.0, 0.4, &value) &&
             DensityToHueGray(1.3, 0.5, 0.2, &value, &other) &&
             PolReflAdjust(grey, RED_RESPONSE, targets, refl, &weights) &&
             ReflToBrightness(grey, &value) && CombineInkColors(grey, grey, refl));
}
