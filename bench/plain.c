#include "plain.h"

#include <math.h>
#include <stddef.h>

int plain_xyz(const double *refl, const int (*weights)[31], double *xyz)
{
    if (refl == NULL || xyz == NULL)
        return 0;
    double x = 0, y = 0, z = 0;
    for (int i = 0; i < 31; ++i) {
        x += refl[i] * weights[0][i];
        y += refl[i] * weights[1][i];
        z += refl[i] * weights[2][i];
    }
    xyz[0] = x / 100000;
    xyz[1] = y / 100000;
    xyz[2] = z / 100000;
    return 1;
}

static double density_of(const double *refl, const int64_t *weights)
{
    double sum = 0;
    for (int i = 0; i < 31; ++i)
        sum += refl[i] * (double)weights[i];
    sum *= 1e-7;
    return -log10(sum < 1e-5 ? 1e-5 : sum);
}

int plain_density(const double *refl, const double *paper, const int64_t *weights, double *density)
{
    if (refl == NULL || density == NULL)
        return 0;
    *density = density_of(refl, weights);
    if (paper != NULL)
        *density -= density_of(paper, weights);
    return 1;
}
