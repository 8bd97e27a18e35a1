/* A host in C99: the header compiles without a warning, and a function of every group links. */
#include <vantrel.h>

int main(void)
{
    double grey[VANTREL_BANDS], xyz[3], result[3], delta;
    const CIELABCOORD first = {50.0, 2.5, 0.0}, second = {50.0, 0.0, -2.5};
    unsigned int rgb;
    for (int band = 0; band < VANTREL_BANDS; ++band)
        grey[band] = 50.0;

    return !(GetNumIlluminantObservers() == NUM_ILLUM_OBS && ReflToXYZ(grey, D50_2DEG, xyz) &&
             XYZToCIELab(xyz, D50_2DEG, result) && XYZToCIELUV(xyz, D50_2DEG, result) &&
             XYZtoRGB(xyz, &rgb) && LabToDE2000(&first, &second, 1.0, 1.0, &delta) &&
             ReflToBrightness(grey, &delta) && CombineInkColors(grey, grey, grey));
}
