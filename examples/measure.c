/*
 * Measures a solid, its 50 % tint and the paper, as a press operator does: the densities in the
 * response of the ink, and how far the dots have grown. Once with the readings of an instrument
 * without a polarisation filter, and once as an instrument with one would read the same patches.
 *
 *     cc measure.c $(pkg-config --cflags --libs vantrel) && ./a.out
 *
 *                         unfiltered  polarised
 *     density, solid           0.915      0.938
 *     density, 50 % tint       0.353      0.356
 *     dot gain, percent         3.46       3.20
 *
 * The patches are of a blue-green spot ink; from a tint ramp published under the MIT licence,
 * (c) 2014 T. Sprinzing.
 */
#include <vantrel.h>

#include <stdio.h>

/* Reflectance in percent from 400 nm to 700 nm. */
static const double solid[VANTREL_BANDS] = {
    14.6182, 18.5483, 21.4333, 24.0277, 26.6598, 29.1979, 31.3950, 32.5199,
    33.3499, 35.5227, 37.7989, 37.3283, 33.4949, 28.6146, 24.2717, 19.6999,
    14.9754, 11.5178, 9.8411,  9.2668,  8.6053,  8.0224,  7.9019,  8.0497,
    8.3993,  9.0819,  9.9605,  10.5103, 10.4043, 9.8745,  9.0769};
static const double tint[VANTREL_BANDS] = {
    23.6808, 30.1056, 35.6497, 39.8305, 43.0139, 45.6174, 47.7513, 49.0419,
    49.9454, 51.5498, 53.0565, 52.9991, 50.9827, 47.9357, 44.8159, 41.1502,
    36.9845, 33.7017, 31.8228, 31.0970, 30.2671, 29.7852, 30.3765, 31.5032,
    32.7958, 34.2880, 35.8984, 36.8480, 36.8407, 36.1892, 35.0544};
static const double paper[VANTREL_BANDS] = {
    31.2105, 40.1500, 48.5367, 54.3177, 57.9028, 60.3711, 62.2557, 63.5980,
    64.5866, 65.5322, 66.2949, 66.7344, 66.9915, 66.8157, 66.3573, 65.6697,
    65.1547, 65.4500, 65.6007, 65.7238, 66.0150, 67.5877, 70.9681, 75.1066,
    78.5796, 80.8390, 82.2435, 82.9419, 83.3173, 83.5547, 83.9279};

static const int status = E_STATUS;
static const int response = RED_RESPONSE; /* the one that measures a cyan or blue-green ink */
static const double n_factor = 1.7;       /* n of Yule and Nielsen */
static const int nominal = 50;            /* percent, what the tint has in the data */

struct reading {
    double solid_density, tint_density, dot_gain;
};

static int measure(struct reading *reading)
{
    return ReflToDensity(solid, paper, status, response, &reading->solid_density) &&
           ReflToDensity(tint, paper, status, response, &reading->tint_density) &&
           ReflToDotGain(solid, tint, paper, status, response, n_factor, nominal,
                         &reading->dot_gain);
}

/* The channels in which the filter instrument reads: red, green and two blues. */
static double channels[4][VANTREL_BANDS];
static const POLWEIGHTSTRUCT weights = {channels[0], channels[1], channels[2], channels[3]};

static int choose_channels(void)
{
    return GetNormalizedDensityWeights(E_STATUS, RED_RESPONSE, channels[0], NULL, NULL, NULL) &&
           GetNormalizedDensityWeights(E_STATUS, GREEN_RESPONSE, channels[1], NULL, NULL, NULL) &&
           GetNormalizedDensityWeights(E_STATUS, BLUE_RESPONSE, channels[2], NULL, NULL, NULL) &&
           GetNormalizedDensityWeights(T_STATUS, BLUE_RESPONSE, channels[3], NULL, NULL, NULL);
}

/*
 * What the filter instrument reads on a patch. A host has these four readings from such an
 * instrument; here its filter is taken to remove the light that the surface reflects, half a
 * percent of reflectance in every band.
 */
static void filter_readings(const double *refl, double targets[4])
{
    const double surface = 0.5;
    for (int channel = 0; channel < 4; ++channel) {
        targets[channel] = 0.0;
        for (int band = 0; band < VANTREL_BANDS; ++band)
            targets[channel] += channels[channel][band] * (refl[band] - surface);
    }
}

static int measure_polarised(struct reading *reading)
{
    double solid_targets[4], tint_targets[4], paper_targets[4];
    filter_readings(solid, solid_targets);
    filter_readings(tint, tint_targets);
    filter_readings(paper, paper_targets);
    return PolReflToDensity(solid, solid_targets, paper, paper_targets, &weights, status, response,
                            &reading->solid_density) &&
           PolReflToDensity(tint, tint_targets, paper, paper_targets, &weights, status, response,
                            &reading->tint_density) &&
           PolReflToDotGain(solid, solid_targets, tint, tint_targets, paper, paper_targets,
                            &weights, status, response, n_factor, nominal, &reading->dot_gain);
}

int main(void)
{
    struct reading plain, polarised;
    if (!measure(&plain) || !choose_channels() || !measure_polarised(&polarised)) {
        fprintf(stderr, "the patches could not be measured\n");
        return 1;
    }
    printf("                    unfiltered  polarised\n");
    printf("density, solid      %10.3f %10.3f\n", plain.solid_density, polarised.solid_density);
    printf("density, %d %% tint  %10.3f %10.3f\n", nominal, plain.tint_density,
           polarised.tint_density);
    printf("dot gain, percent   %10.2f %10.2f\n", plain.dot_gain, polarised.dot_gain);
    return 0;
}
