/* What the package has to come close to: the library's functions in plain loops. */
#include "vantrel.h"

void loop_xyz(const double *refl, long rows, int illum_obs, double *xyz)
{
    for (long i = 0; i < rows; ++i)
        ReflToXYZ(refl + i * VANTREL_BANDS, illum_obs, xyz + 3 * i);
}

void loop_de2000(const CIELABCOORD *first, const CIELABCOORD *second, long rows, double *delta_e)
{
    for (long i = 0; i < rows; ++i)
        LabToDE2000(first + i, second + i, 1, 1, delta_e + i);
}

void loop_density(const double *refl, const double *paper, long rows, int status, int response,
                  double *density)
{
    for (long i = 0; i < rows; ++i)
        ReflToDensity(refl + i * VANTREL_BANDS, paper, status, response, density + i);
}
