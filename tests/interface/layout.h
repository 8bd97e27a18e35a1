/* Size and layout of every public record, in C99 and in C++: a program built against one version of
 * the header runs with the library of another. */
#include <vantrel.h>

#ifdef __cplusplus
#define LAYOUT(name, condition) static_assert(condition, #name)
#else
#define LAYOUT(name, condition) typedef char layout_of_##name[(condition) ? 1 : -1]
#endif
#define MEMBER(record, member, offset, size)                                                       \
    LAYOUT(record##_##member,                                                                      \
           offsetof(record, member) == (offset) && sizeof(((record *)0)->member) == (size))

LAYOUT(ILLUM_OBS, sizeof(ILLUM_OBS) == sizeof(int));

LAYOUT(CIELABCOORD, sizeof(CIELABCOORD) == 24);
MEMBER(CIELABCOORD, L, 0, 8);
MEMBER(CIELABCOORD, a, 8, 8);
MEMBER(CIELABCOORD, b, 16, 8);

LAYOUT(CIELCHCOORD, sizeof(CIELCHCOORD) == 24);
MEMBER(CIELCHCOORD, L, 0, 8);
MEMBER(CIELCHCOORD, C, 8, 8);
MEMBER(CIELCHCOORD, h, 16, 8);

LAYOUT(DENSITYSTRUCT, sizeof(DENSITYSTRUCT) == 72);
MEMBER(DENSITYSTRUCT, density, 0, 72);

LAYOUT(POLWEIGHTSTRUCT, sizeof(POLWEIGHTSTRUCT) == 4 * sizeof(void *));
MEMBER(POLWEIGHTSTRUCT, RedWeights, 0, sizeof(void *));
MEMBER(POLWEIGHTSTRUCT, GreenWeights, sizeof(void *), sizeof(void *));
MEMBER(POLWEIGHTSTRUCT, BlueWeights, 2 * sizeof(void *), sizeof(void *));
MEMBER(POLWEIGHTSTRUCT, BlueWeights2, 3 * sizeof(void *), sizeof(void *));

LAYOUT(DENSITYPOINT, sizeof(DENSITYPOINT) == 16);
MEMBER(DENSITYPOINT, density, 0, 8);
MEMBER(DENSITYPOINT, band, 8, 4);

LAYOUT(den_weight, sizeof den_weight == 10 * 9 * 31 * 8);

#ifdef __cplusplus
LAYOUT(CIEDE2000, sizeof(CIEDE2000) == 8);
#endif
