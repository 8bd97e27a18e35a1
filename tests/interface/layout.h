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

/* The numbers behind the names travel as int. */
#define VALUES4(a, b, c, d, first)                                                                 \
    LAYOUT(a, (a) == (first) && (b) == (first) + 1 && (c) == (first) + 2 && (d) == (first) + 3)
VALUES4(A_2DEG, A_10DEG, C_2DEG, C_10DEG, 0);
VALUES4(D50_2DEG, D50_10DEG, D65_2DEG, D65_10DEG, 4);
VALUES4(F2_2DEG, F2_10DEG, F7_2DEG, F7_10DEG, 8);
VALUES4(F11_2DEG, F11_10DEG, F12_2DEG, F12_10DEG, 12);
LAYOUT(D75_2DEG, D75_2DEG == 16 && D75_10DEG == 17 && NUM_ILLUM_OBS == 18);
VALUES4(A_STATUS, E_STATUS, I_STATUS, T_STATUS, 0);
VALUES4(SPECTRAL_STATUS, SPECTRALX_STATUS, HIFI_STATUS, HEXACHROME_STATUS, 4);
LAYOUT(CCR1_STATUS, CCR1_STATUS == 8 && CCR2_STATUS == 9 && NUM_STATUSES == 10);
VALUES4(VISUAL_RESPONSE, RED_RESPONSE, GREEN_RESPONSE, BLUE_RESPONSE, 0);
VALUES4(HIFI1_RESPONSE, HIFI2_RESPONSE, HIFI3_RESPONSE, HEXACHROME1_RESPONSE, 4);
LAYOUT(HEXACHROME2_RESPONSE, HEXACHROME2_RESPONSE == 8 && NUM_RESPONSES == 9);

#ifdef __cplusplus
LAYOUT(CIEDE2000, sizeof(CIEDE2000) == 8);
#endif
