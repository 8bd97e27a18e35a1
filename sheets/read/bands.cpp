#include "read/bands.h"

#include <fmt/format.h>

#include <algorithm>
#include <cmath>
#include <initializer_list>

namespace vantrel::sheets {
namespace {

constexpr double kHalfWidth = 10;
constexpr double kTolerance = 0.001; // of a wavelength, in nm
constexpr double kWideStep = 20;
constexpr double kFirst = 410, kLast = 680; // what a range holds at least

double centre_of(std::size_t band) { return 400 + 10 * static_cast<double>(band); }

// Why these wavelengths, in ascending order, do not give every band; empty where they do.
std::string fault_of(const std::vector<double> &nm)
{
    if (nm.size() < 2 || nm.front() > kFirst + kTolerance || nm.back() < kLast - kTolerance)
        return "the range is too short";
    double narrowest = kWideStep, widest = 0;
    for (std::size_t i = 1; i < nm.size(); ++i) {
        narrowest = std::min(narrowest, nm[i] - nm[i - 1]);
        widest = std::max(widest, nm[i] - nm[i - 1]);
    }
    const double most = narrowest < kWideStep - kTolerance ? kHalfWidth : kWideStep;
    for (std::size_t i = 1; i < nm.size(); ++i)
        if (nm[i] - nm[i - 1] > most + kTolerance)
            return fmt::format("no value between {:g} and {:g} nm", nm[i - 1], nm[i]);
    if (widest - narrowest > 1 + kTolerance) // names may be rounded: 380, 383, 387, 390 nm
        return fmt::format("the steps are uneven, {:g} to {:g} nm", narrowest, widest);
    const double off = std::fmod(nm.front(), 10);
    if (widest > kHalfWidth - kTolerance && std::min(off, 10 - off) > kTolerance)
        return fmt::format("no value at 400 nm, but at {:g} and {:g} nm", nm[0], nm[1]);
    return "";
}

} // namespace

Bands::Bands(std::vector<double> wavelengths, std::size_t line)
    : nm(std::move(wavelengths)), order(nm.size())
{
    for (std::size_t i = 0; i < nm.size(); ++i)
        order[i] = i;
    std::sort(order.begin(), order.end(), [&](auto a, auto b) { return nm[a] < nm[b]; });
    std::vector<double> near; // those that any band can need
    for (std::size_t i = 0; i < order.size(); ++i) {
        const double wavelength = nm[order[i]];
        if (i > 0 && wavelength - nm[order[i - 1]] < kTolerance)
            throw InputError{line, fmt::format("{:g} nm occurs twice in a spectrum", wavelength)};
        if (wavelength > 400 - 2 * kWideStep && wavelength < 700 + 2 * kWideStep)
            near.push_back(wavelength);
    }
    if (const std::string fault = fault_of(near); !fault.empty())
        throw InputError{
            line,
            fmt::format("{} in spectra of {} values, wavelengths {:g} to {:g} nm; every 10 or "
                        "20 nm from 400 to 700 is needed, or finer steps",
                        fault, nm.size(), nm.empty() ? 0 : nm[order.front()],
                        nm.empty() ? 0 : nm[order.back()])};
    step = (near.back() - near.front()) / static_cast<double>(near.size() - 1);

    const auto clamped = [&](double wavelength) {
        return std::clamp(wavelength, 10 * std::ceil((near.front() - kTolerance) / 10),
                          10 * std::floor((near.back() + kTolerance) / 10));
    };
    for (std::size_t band = 0; band < parts.size(); ++band) {
        const double centre = clamped(centre_of(band));
        parts[band] = step > kHalfWidth + kTolerance   ? between(centre)
                      : step > kHalfWidth - kTolerance ? value_at(centre)
                                                       : corrected(centre);
        for (const Part &part : parts[band])
            needed.push_back(part.value);
    }
    std::sort(needed.begin(), needed.end(), [&](auto a, auto b) { return nm[a] < nm[b]; });
    needed.erase(std::unique(needed.begin(), needed.end()), needed.end());
}

// On the line between the two nearest values.
Bands::Parts Bands::value_at(double wavelength) const
{
    const auto after = std::lower_bound(order.begin(), order.end(), wavelength - kTolerance,
                                        [&](std::size_t i, double at) { return nm[i] < at; });
    if (after == order.begin() || nm[*after] < wavelength + kTolerance)
        return {{*after, 1}};
    const std::size_t before = *(after - 1);
    const double share = (wavelength - nm[before]) / (nm[*after] - nm[before]);
    return {{before, 1 - share}, {*after, share}};
}

// Empty where the range does not hold all of the triangle.
Bands::Parts Bands::triangle(double centre) const
{
    const double edge = kHalfWidth - step - 0.5; // names may be rounded to 1 nm
    if (nm[order.front()] > centre - edge || nm[order.back()] < centre + edge)
        return {};
    Parts out;
    double sum = 0;
    for (const std::size_t i : order) {
        const double weight = 1 - std::abs(nm[i] - centre) / kHalfWidth;
        if (weight < kTolerance / kHalfWidth)
            continue;
        out.push_back({i, weight});
        sum += weight;
    }
    for (Part &part : out)
        part.weight /= sum;
    return out;
}

Bands::Parts Bands::corrected(double centre) const
{
    const Parts below = triangle(centre - 10), own = triangle(centre),
                above = triangle(centre + 10);
    if (below.empty() || own.empty() || above.empty())
        return value_at(centre);
    Parts out;
    for (const auto &[parts, factor] : {std::pair{&below, -0.083}, {&own, 1.166}, {&above, -0.083}})
        for (const Part &part : *parts) {
            const auto same = std::find_if(out.begin(), out.end(),
                                           [&](const Part &p) { return p.value == part.value; });
            if (same == out.end())
                out.push_back({part.value, factor * part.weight});
            else
                same->weight += factor * part.weight;
        }
    return out;
}

// Half way between steps of 20 nm.
Bands::Parts Bands::between(double wavelength) const
{
    Parts near = value_at(wavelength);
    if (near.size() == 1)
        return near;
    const auto left = std::find(order.begin(), order.end(), near[0].value);
    const bool first = left == order.begin(), last = left + 2 == order.end();
    if (first && last)
        return near;
    if (first)
        return {{left[0], 3 / 8.0}, {left[1], 6 / 8.0}, {left[2], -1 / 8.0}};
    if (last)
        return {{left[-1], -1 / 8.0}, {left[0], 6 / 8.0}, {left[1], 3 / 8.0}};
    return {{left[-1], -1 / 16.0}, {left[0], 9 / 16.0}, {left[1], 9 / 16.0}, {left[2], -1 / 16.0}};
}

Spectrum Bands::of(const std::vector<double> &values) const
{
    Spectrum out{};
    for (std::size_t band = 0; band < out.size(); ++band)
        for (const Part &part : parts[band])
            out[band] += part.weight * values[part.value];
    return out;
}

std::optional<std::pair<double, double>> Bands::out_of_order() const
{
    std::size_t rises = 0;
    for (std::size_t i = 1; i < nm.size(); ++i)
        rises += nm[i] > nm[i - 1];
    const bool ascending = 2 * rises >= nm.size();
    for (std::size_t i = 1; i < nm.size(); ++i)
        if ((nm[i] > nm[i - 1]) != ascending)
            return std::pair{nm[i - 1], nm[i]};
    return std::nullopt;
}

Source Bands::source() const
{
    Source out;
    out.first_nm = nm[order.front()];
    out.last_nm = nm[order.back()];
    out.step_nm = step;
    out.bands = nm.size();
    out.averaged = step < kHalfWidth - kTolerance;
    out.interpolated = step > kHalfWidth + kTolerance;
    out.held = out.first_nm > 400 + kTolerance || out.last_nm < 700 - kTolerance;
    return out;
}

} // namespace vantrel::sheets
