/* The rivals that a host would write itself: plain C loops, compiled like the library. */
#ifndef VANTREL_BENCH_PLAIN_H
#define VANTREL_BENCH_PLAIN_H

#ifdef __cplusplus
extern "C" {
#endif

/* XYZ of a spectrum by three sums over integer weights [3][31]; 0 for a null pointer. */
int plain_xyz(const double *refl, const int (*weights)[31], double *xyz);

#ifdef __cplusplus
}
#endif

#endif
