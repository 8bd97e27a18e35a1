#include "plain.h"

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
