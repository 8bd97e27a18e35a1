/* The rivals that a host would write itself: plain C loops, compiled like the library. */
#ifndef VANTREL_BENCH_PLAIN_H
#define VANTREL_BENCH_PLAIN_H

#include <stdint.h>

#ifdef __cplusplus
extern "C" {
#endif

/* XYZ of a spectrum by three sums over integer weights [3][31]; 0 for a null pointer. */
int plain_xyz(const double *refl, const int (*weights)[31], double *xyz);

/* Density of a spectrum over a paper: two sums over integer weights [31] and log10. */
int plain_density(const double *refl, const double *paper, const int64_t *weights, double *density);

#ifdef __cplusplus
}
#endif

#endif
