/* A host that has a function of every name that the library exports. What the library computes is
 * its own all the same: it calls none of its functions by a name that the host could have taken. */
#include <dlfcn.h>
#include <math.h>
#include <stdio.h>
#include <vantrel.h>

/* One NAME(…) for each exported function. */
#define NAME(name)                                                                                 \
    int host_##name(void) __asm__(#name);                                                          \
    int host_##name(void) { return -42; }
#include "host_names.h"

static void *library;
#define CALL(name) (*(__typeof__(name) *)dlsym(library, #name))

static int differs(const char *name, double got, double wanted)
{
    if (fabs(got - wanted) < 1e-9)
        return 0;
    printf("%s: %.17g, not %.17g\n", name, got, wanted);
    return 1;
}

int main(int argc, char **argv)
{
    const CIELABCOORD first = {50, 2.5, 0}, second = {50, 0, -2.5};
    const int percent[] = {50};
    double ink[VANTREL_BANDS], paper[VANTREL_BANDS], refl[VANTREL_BANDS], lch[3], value;
    DENSITYSTRUCT set;
    int failures = 0;
    library = argc > 1 ? dlopen(argv[1], RTLD_LAZY) : NULL;
    if (!library || LabToDE2000(&first, &second, 1, 1, &value) != -42) {
        printf("%s\n", library ? "the host's own names are not first" : dlerror());
        return 2;
    }
    for (int i = 0; i < VANTREL_BANDS; ++i) {
        paper[i] = 80;
        ink[i] = i < 10 || i > 25 ? 80 : i < 19 ? 20 : 5;
    }
#define EXPECT(name, call, result, wanted)                                                         \
    failures += differs(#name, (CALL(name) call, result), wanted)
    EXPECT(LabToDE2000, (&first, &second, 1, 1, &value), value, 4.306482095827058);
    EXPECT(LabToDE2000Ex, (&first, &second, 1, 1, 1, &value), value, 4.306482095827058);
    EXPECT(CIELabToCIELCH, ((const double[]){50, 3, 4}, lch), lch[1], 5);
    EXPECT(ReflToDensitiesNoPaper, (paper, I_STATUS, &set), set.density[RED_RESPONSE],
           0.09691001300805639);
    EXPECT(CalculateSpectralXDensity, (paper, paper, 0, &value, NULL), value, 0);
    EXPECT(EstimateReflsEx, (1, ink, NULL, NULL, percent, paper, refl), refl[12], 50);
    EXPECT(EstimateReflsExForBestVisualColor, (1, ink, NULL, NULL, percent, ink, refl), refl[12],
           20);
    failures += differs("DetermineDensityResponse",
                        CALL(DetermineDensityResponse)(ink, HIFI_STATUS, NULL), HIFI3_RESPONSE);
    return failures;
}
