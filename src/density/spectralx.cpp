#include "density/spectralx.h"

#include "base/elementary.h"

namespace vantrel {
namespace {

// State.
constinit SpectralXConstants current = {2.0, 84.0, 1.0, 0.5, 0.1};

constexpr int kReach = 2; ///< of the window to either side
constexpr int kFirst = kReach;
constexpr int kLast = kBands - 1 - kReach;

std::array<double, 5> window()
{
    const auto &c = current;
    return {c.outer, c.inner, c.centre, c.inner, c.outer};
}

double window_sum(Spectrum refl, int first_band, std::span<const double> weights)
{
    double sum = 0;
    for (std::size_t k = 0; k < weights.size(); ++k)
        sum += refl[first_band + k] * weights[k];
    return sum;
}

double density_of_sum(double sum, std::span<const double> weights)
{
    if (sum <= 0)
        return 5;
    double total = 0;
    for (const double weight : weights)
        total += weight;
    return 0 - log10(sum / (total * 100));
}

double band_density(Spectrum refl, int band)
{
    return window_density(refl, band - kReach, window());
}

/// Within one percentage point of both neighbours, or above them.
bool is_crest(Spectrum refl, int band)
{
    return refl[band] + 1 > refl[band - 1] && refl[band] + 1 > refl[band + 1];
}

/// Where the search for peaks starts: past a blue end that rises to its first crest.
int first_searched_band(Spectrum refl)
{
    if (!(refl[0] <= refl[1] && refl[1] <= refl[2]))
        return kFirst;
    for (int band = 4; band < 10; ++band)
        if (is_crest(refl, band)) {
            while (band + 1 < 10 && is_crest(refl, band + 1))
                ++band;
            return band;
        }
    return kFirst;
}

/// Bands from `first` to before `end`, between two peaks.
struct Stretch {
    double sum;
    int crest;
};

Stretch stretch(Spectrum refl, int first, int end)
{
    Stretch result = {0, first};
    for (int band = first; band < end; ++band) {
        result.sum += refl[band];
        if (refl[band] > refl[result.crest])
            result.crest = band;
    }
    return result;
}

} // namespace

const SpectralXConstants &spectralx_constants() { return current; }

void set_spectralx_constants(const SpectralXConstants &new_constants) { current = new_constants; }

double window_density(Spectrum refl, int first_band, std::span<const double> weights)
{
    return density_of_sum(window_sum(refl, first_band, weights), weights);
}

double band_density(Spectrum refl, Paper paper, int band)
{
    return paper ? band_density(refl, band) - band_density(*paper, band) : band_density(refl, band);
}

Peaks absorption_peaks(Spectrum refl)
{
    const auto weights = window();
    const int first = first_searched_band(refl);
    double sums[kBands], densities[kBands];
    int densest = first;
    for (int band = first; band <= kLast; ++band) {
        sums[band] = window_sum(refl, band - kReach, weights);
        densities[band] = density_of_sum(sums[band], weights);
        if (densities[band] > densities[densest])
            densest = band;
    }

    // Of each run of bands near the lowest sum, the densest is a peak.
    Peaks peaks{};
    bool in_run = false;
    for (int band = first; band <= kLast; ++band) {
        const bool near = sums[densest] >= sums[band] - current.tolerance;
        if (near && !in_run)
            peaks.points[peaks.count++] = {densities[band], band};
        else if (near && densities[band] > peaks.points[peaks.count - 1].density)
            peaks.points[peaks.count - 1] = {densities[band], band};
        in_run = near;
    }
    if (peaks.count == 0)
        peaks.points[peaks.count++] = {densities[densest], densest};
    return peaks;
}

int choose_peak(Spectrum refl, std::span<const DENSITYPOINT> peaks)
{
    const int count = static_cast<int>(peaks.size());
    if (count == 1)
        return 0;
    // Stretch k ends before peak k, the last one at the end of the search.
    int brightest = 0;
    Stretch best = stretch(refl, kFirst, peaks[0].band);
    for (int k = 1; k <= count; ++k) {
        const Stretch next =
            stretch(refl, peaks[k - 1].band, k < count ? peaks[k].band : kLast + 1);
        if (next.sum > best.sum) {
            brightest = k;
            best = next;
        }
    }
    if (brightest == 0)
        return 0;
    if (brightest == count)
        return count - 1;
    const int to_previous = best.crest - peaks[brightest - 1].band;
    const int to_next = peaks[brightest].band - best.crest;
    return to_previous < to_next ? brightest - 1 : brightest;
}

int absorption_band(Spectrum refl)
{
    const Peaks peaks = absorption_peaks(refl);
    const auto found = std::span(peaks.points).first(peaks.count);
    return found[choose_peak(refl, found)].band;
}

int band_to_read(Spectrum refl, int request)
{
    return kFirst <= request && request <= kLast ? request : absorption_band(refl);
}

} // namespace vantrel
