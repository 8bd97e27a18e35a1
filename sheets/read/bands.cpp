#include "read/bands.h"

#include <fmt/format.h>

#include <algorithm>
#include <cmath>

namespace vantrel::sheets {
namespace {

constexpr double kHalfWidth = 10;
constexpr double kTolerance = 0.001; // of a wavelength, in nm

double centre(std::size_t band) { return 400 + 10 * static_cast<double>(band); }

// Why these wavelengths, in ascending order, do not give every band; empty where they do.
std::string fault_of(const std::vector<double> &nm)
{
    if (nm.empty() || nm.front() > 400 + kTolerance || nm.back() < 700 - kTolerance)
        return "the range is too short";
    double narrowest = kHalfWidth, widest = 0;
    for (std::size_t i = 1; i < nm.size(); ++i) {
        const double step = nm[i] - nm[i - 1];
        if (step > kHalfWidth + kTolerance)
            return fmt::format("no value between {:g} and {:g} nm", nm[i - 1], nm[i]);
        narrowest = std::min(narrowest, step);
        widest = std::max(widest, step);
    }
    if (widest - narrowest > 1 + kTolerance) // names may be rounded: 380, 383, 387, 390 nm
        return fmt::format("the steps are uneven, {:g} to {:g} nm", narrowest, widest);
    const double off = std::fmod(nm.front(), 10);
    if (widest > kHalfWidth - kTolerance && std::min(off, 10 - off) > kTolerance)
        return fmt::format("no value at 400 nm, but at {:g} and {:g} nm", nm[0], nm[1]);
    return "";
}

} // namespace

Bands::Bands(std::vector<double> wavelengths, std::size_t line) : nm(std::move(wavelengths))
{
    std::vector<std::size_t> order(nm.size());
    for (std::size_t i = 0; i < nm.size(); ++i)
        order[i] = i;
    std::sort(order.begin(), order.end(), [&](auto a, auto b) { return nm[a] < nm[b]; });
    std::vector<double> near;
    for (std::size_t i = 0; i < order.size(); ++i) {
        const double wavelength = nm[order[i]];
        if (i > 0 && wavelength - nm[order[i - 1]] < kTolerance)
            throw InputError{line, fmt::format("{:g} nm occurs twice in a spectrum", wavelength)};
        if (wavelength > 400 - kHalfWidth + kTolerance &&
            wavelength < 700 + kHalfWidth - kTolerance) {
            needed.push_back(order[i]);
            near.push_back(wavelength);
        }
    }
    if (const std::string fault = fault_of(near); !fault.empty())
        throw InputError{
            line, fmt::format("{} in spectra of {} values from {:g} to {:g} nm; every 10 nm from "
                              "400 to 700 is needed, or finer steps",
                              fault, nm.size(), nm.empty() ? 0 : nm[order.front()],
                              nm.empty() ? 0 : nm[order.back()])};

    for (std::size_t band = 0; band < parts.size(); ++band) {
        const auto first = std::lower_bound(near.begin(), near.end(), centre(band) - kHalfWidth);
        double sum = 0;
        for (auto at = first; at != near.end() && *at < centre(band) + kHalfWidth; ++at) {
            double weight = 1 - std::abs(*at - centre(band)) / kHalfWidth;
            if (weight > 1 - kTolerance / kHalfWidth)
                weight = 1;
            if (weight < kTolerance / kHalfWidth)
                continue;
            parts[band].push_back({needed[static_cast<std::size_t>(at - near.begin())], weight});
            sum += weight;
        }
        for (Part &part : parts[band])
            part.weight /= sum;
    }
}

Spectrum Bands::of(const std::vector<double> &values) const
{
    Spectrum out{};
    for (std::size_t band = 0; band < out.size(); ++band)
        for (const Part &part : parts[band])
            out[band] += part.weight * values[part.value];
    return out;
}

Source Bands::source() const
{
    const auto [first, last] = std::minmax_element(nm.begin(), nm.end());
    Source out;
    out.first_nm = *first;
    out.last_nm = *last;
    out.step_nm = (nm[needed.back()] - nm[needed.front()]) / static_cast<double>(needed.size() - 1);
    out.bands = nm.size();
    out.averaged = std::any_of(parts.begin(), parts.end(), [](auto &p) { return p.size() > 1; });
    return out;
}

} // namespace vantrel::sheets
