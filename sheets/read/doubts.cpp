#include "read/doubts.h"

#include "read/labels.h"
#include "read/shades.h"
#include "read/text.h"

#include <fmt/format.h>

#include <algorithm>
#include <array>
#include <bit>
#include <cmath>
#include <cstdint>
#include <map>
#include <optional>
#include <string_view>
#include <utility>

namespace vantrel::sheets {
namespace {

constexpr double kLeastRange = 5;     // of the reflectances in a band of a sheet that is printed on
constexpr double kDeadRange = 0.01;   // of those in a band that measures nothing
constexpr double kNoise = 0.5;        // of an instrument near black
constexpr double kSpike = 10;         // of a band beyond both its neighbours; brightener reaches 6
constexpr double kFullTint = 50;      // from which on an ink shows its colour
constexpr double kMostFraction = 1.5; // of paper with brightener
constexpr double kMostPercent = 300;
constexpr double kLeastPercent = 20;   // of the lightest patch
constexpr double kBlackest = 0.1;      // percent, which no print is below throughout
constexpr double kMostLightness = 110; // L*; of a fluorescent paper
constexpr double kCoat = 25;           // C*: more than black has
constexpr double kPi = 3.14159265358979323846;
constexpr double kMostOfBlack = 0.6; // between the densities of a black
constexpr double kLeastOfInk = 0.1;  // between those of two filters, beyond what paper and noise do

std::string nm_of(std::size_t band) { return fmt::format("{} nm", 400 + 10 * band); }

void doubt_bands(const std::vector<Patch> &patches, std::vector<Doubt> &out)
{
    Spectrum least = patches.front().refl, most = least;
    for (const Patch &patch : patches)
        for (std::size_t band = 0; band < least.size(); ++band) {
            least[band] = std::min(least[band], patch.refl[band]);
            most[band] = std::max(most[band], patch.refl[band]);
        }
    double range = 0;
    for (std::size_t band = 0; band < least.size(); ++band)
        range = std::max(range, most[band] - least[band]);
    if (patches.size() < 3 || range < kLeastRange)
        return;
    for (std::size_t band = 0; band < least.size(); ++band)
        if (most[band] - least[band] <= kDeadRange)
            out.push_back({0, fmt::format("the band at {} reads {:g} % in every patch", nm_of(band),
                                          least[band])});
}

// Bands beside each other that read alike everywhere, but for those at the ends where a value is
// held.
void doubt_alike(const std::vector<Patch> &patches, bool held, std::vector<Doubt> &out)
{
    constexpr std::size_t bands = VANTREL_BANDS;
    std::vector<bool> as_before(bands);
    for (std::size_t band = 1; band < bands; ++band)
        as_before[band] =
            std::all_of(
                patches.begin(), patches.end(),
                [&](const Patch &patch) { return patch.refl[band] == patch.refl[band - 1]; }) &&
            std::any_of(patches.begin(), patches.end(), [&](const Patch &patch) {
                return std::abs(patch.refl[band] - patches[0].refl[band]) > kDeadRange;
            });
    std::size_t begin = 1, end = bands;
    while (held && begin < end && as_before[begin])
        ++begin;
    while (held && end > begin && as_before[end - 1])
        --end;
    while (begin < end && !as_before[begin])
        ++begin;
    if (patches.size() >= 3 && begin < end)
        out.push_back({0, fmt::format("the bands at {} and {} read alike in every patch",
                                      nm_of(begin - 1), nm_of(begin))});
}

void doubt_zeros(const std::vector<Patch> &patches, Named &named, std::vector<Doubt> &out)
{
    const Patch *first = nullptr;
    std::size_t count = 0;
    for (const Patch &patch : patches)
        if (std::all_of(patch.refl.begin(), patch.refl.end(), [](double v) { return v == 0; })) {
            first = first ? first : &patch;
            named.insert(&patch);
            ++count;
        }
    if (first)
        out.push_back({first->line, fmt::format("{} reads 0 % in every band{}: was it measured?",
                                                in_quotes(first->name), and_more(count))});
}

void doubt_signs(const std::vector<Patch> &patches, std::vector<Doubt> &out)
{
    const Patch *first = nullptr;
    std::size_t count = 0;
    for (const Patch &patch : patches)
        if (*std::min_element(patch.refl.begin(), patch.refl.end()) < -kNoise) {
            first = first ? first : &patch;
            ++count;
        }
    if (!first)
        return;
    const auto *const least = std::min_element(first->refl.begin(), first->refl.end());
    out.push_back(
        {first->line,
         fmt::format("{} reflects {:g} % at {}, less than nothing{}", in_quotes(first->name),
                     *least, nm_of(static_cast<std::size_t>(least - first->refl.begin())),
                     and_more(count))});
}

// FNV-1a over the values, of which -0 is 0.
std::uint64_t hash_of(const Spectrum &refl)
{
    std::uint64_t hash = 14695981039346656037u;
    for (const double value : refl)
        hash = (hash ^ std::bit_cast<std::uint64_t>(value + 0.0)) * 1099511628211u;
    return hash;
}

// No paper reflects as much as the perfect white in every band.
void doubt_whites(const std::vector<Patch> &patches, std::vector<Doubt> &out)
{
    constexpr double kLikeWhite = 0.5;
    const auto white = std::find_if(patches.begin(), patches.end(), [](const Patch &patch) {
        return std::all_of(patch.refl.begin(), patch.refl.end(),
                           [](double v) { return std::abs(v - 100) <= kLikeWhite; });
    });
    if (white != patches.end())
        out.push_back({white->line, fmt::format("{} reads 100 % in every band: are the spectra "
                                                "relative to the paper?",
                                                in_quotes(white->name))});
}

// A band that stands out of the two beside it: reflectances change slowly along the spectrum.
void doubt_spikes(const std::vector<Patch> &patches, std::vector<Doubt> &out)
{
    const Patch *first = nullptr;
    std::size_t count = 0, place = 0;
    for (const Patch &patch : patches)
        for (std::size_t band = 1; band + 1 < patch.refl.size(); ++band) {
            const auto [low, high] = std::minmax(patch.refl[band - 1], patch.refl[band + 1]);
            const double apart = std::max(kSpike, high / 10);
            if (patch.refl[band] >= low - apart && patch.refl[band] <= high + apart)
                continue;
            if (!first) {
                first = &patch;
                place = band;
            }
            ++count;
            break;
        }
    if (first)
        out.push_back(
            {first->line,
             fmt::format("{} reads {:.4g} % at {}, but {:.4g} and {:.4g} % beside it{}",
                         in_quotes(first->name), first->refl[place], nm_of(place),
                         first->refl[place - 1], first->refl[place + 1], and_more(count))});
}

// No instrument reads two patches alike to the last digit of every band.
void doubt_copies(const std::vector<Patch> &patches, std::vector<Doubt> &out)
{
    struct Copies {
        std::optional<std::pair<std::size_t, std::size_t>> first;
        std::size_t count = 0;
    } strangers, repeats; // of other device values; of the same, or none
    std::vector<std::pair<std::uint64_t, std::size_t>> hashes;
    hashes.reserve(patches.size());
    for (std::size_t i = 0; i < patches.size(); ++i)
        hashes.emplace_back(hash_of(patches[i].refl), i);
    std::sort(hashes.begin(), hashes.end());
    for (std::size_t i = 1; i < hashes.size(); ++i) {
        const std::pair both{hashes[i - 1].second, hashes[i].second};
        const Patch &one = patches[both.first], &other = patches[both.second];
        if (hashes[i - 1].first != hashes[i].first || one.refl != other.refl)
            continue;
        Copies &copies = one.device == other.device ? repeats : strangers;
        copies.first = std::min(copies.first.value_or(both), both);
        ++copies.count;
    }
    if (strangers.first)
        out.push_back({patches[strangers.first->second].line,
                       fmt::format("{} and {} have different device values, but the same spectrum "
                                   "to the last digit{}",
                                   in_quotes(patches[strangers.first->first].name),
                                   in_quotes(patches[strangers.first->second].name),
                                   and_more(strangers.count))});
    if (repeats.first)
        out.push_back(
            {patches[repeats.first->second].line,
             fmt::format("{} has the spectrum of {} to the last digit{}: is a "
                         "measurement here twice?",
                         in_quotes(patches[repeats.first->second].name),
                         in_quotes(patches[repeats.first->first].name), and_more(repeats.count))});
}

// L* from 0 to 1, or above what anything reflects.
void doubt_lightness(const std::vector<Patch> &patches, std::vector<Doubt> &out)
{
    const Patch *lightest = nullptr;
    double coat = 0;
    for (const Patch &patch : patches) {
        if (!patch.lab)
            continue;
        lightest = !lightest || patch.lab->L > lightest->lab->L ? &patch : lightest;
        coat = std::max(coat, std::hypot(patch.lab->a, patch.lab->b));
    }
    if (lightest && (lightest->lab->L > kMostLightness ||
                     (lightest->lab->L <= 1 && (coat > kCoat || patches.size() >= 3))))
        out.push_back({lightest->line, fmt::format("the largest L*, of {}, is {:g}: is it of "
                                                   "another scale?",
                                                   in_quotes(lightest->name), lightest->lab->L)});
}

struct Ink {
    std::string_view field, name;
};
constexpr std::array<Ink, 4> kInks = {{{"CMYK_K", "black"},
                                       {"CMYK_C", "cyan"},
                                       {"CMYK_M", "magenta"},
                                       {"CMYK_Y", "yellow"}}}; // in the order of the responses

// The only ink of a patch, if it is one of the four and covers enough; its place among them.
std::optional<std::size_t> only_ink(const Patch &patch)
{
    std::optional<std::size_t> out;
    for (const auto &device : patch.device) {
        if (device.second == 0)
            continue;
        const auto *const ink = std::find_if(
            kInks.begin(), kInks.end(), [&](const Ink &one) { return one.field == device.first; });
        if (out || ink == kInks.end() || device.second < kFullTint)
            return std::nullopt;
        out = static_cast<std::size_t>(ink - kInks.begin());
    }
    return out;
}

// The ink that a colour looks like instead, by the nearest of the usual hues.
std::optional<std::size_t> other_ink(const CIELABCOORD &lab, std::size_t ink)
{
    if (std::hypot(lab.a, lab.b) < kCoat)
        return std::nullopt;
    constexpr std::array<double, 4> hues = {0, 233, 355, 93};
    const double hue = std::atan2(lab.b, lab.a) * 180 / kPi;
    const auto apart = [&](std::size_t other) {
        return std::abs(std::remainder(hue - hues[other], 360));
    };
    std::size_t nearest = 1;
    for (std::size_t other = 2; other < hues.size(); ++other)
        if (apart(other) < apart(nearest))
            nearest = other;
    return nearest == ink ? std::nullopt : std::optional(nearest);
}

// The ink that a patch of one ink looks like instead: an ink is densest through the filter of the
// other colour, black through all alike.
std::optional<std::size_t> other_ink(const Patch &patch, std::size_t ink, Kind kind)
{
    if (kind == Kind::colours)
        return patch.lab ? other_ink(*patch.lab, ink) : std::nullopt;
    std::array<double, 4> density{};
    for (const int response : {RED_RESPONSE, GREEN_RESPONSE, BLUE_RESPONSE})
        ReflToDensity(patch.refl.data(), nullptr, E_STATUS, response,
                      &density[static_cast<std::size_t>(response)]);
    const auto [least, most] = std::minmax_element(density.begin() + 1, density.end());
    const bool other =
        ink == VISUAL_RESPONSE ? *most - *least > kMostOfBlack : *most - density[ink] > kLeastOfInk;
    return other ? std::optional(static_cast<std::size_t>(most - density.begin())) : std::nullopt;
}

void doubt_inks(const std::vector<Patch> &patches, Kind kind, Named &named, std::vector<Doubt> &out)
{
    const Patch *first = nullptr;
    std::size_t count = 0;
    for (const Patch &patch : patches) {
        const auto ink = only_ink(patch);
        if (!ink || !other_ink(patch, *ink, kind))
            continue;
        first = first ? first : &patch;
        named.insert(&patch);
        ++count;
    }
    if (!first)
        return;
    const std::size_t ink = *only_ink(*first);
    out.push_back(
        {first->line, fmt::format("{} looks {}, but is {} by its device values{}: are "
                                  "rows or columns exchanged?",
                                  in_quotes(first->name), kInks[*other_ink(*first, ink, kind)].name,
                                  kInks[ink].name, and_more(count))});
}

// Whether the patch is dark in percent where it cannot be: with no or little ink, of one colour
// without any of another, or wholly black.
bool is_fraction(const Patch &patch, double least, double most)
{
    double ink = 0;
    bool known = false, cmy = true;
    for (const auto &[field, percent] : patch.device)
        if (is_ink(field)) {
            known = true;
            ink += percent;
            cmy = cmy && (percent == 0 || (field.starts_with("CMYK_") && field != "CMYK_K"));
        }
    return (known && (ink <= kFullTint || (cmy && ink <= 100))) ||
           (least < kBlackest && most > 5 * least) || most < kBlackest;
}

// "12, 14 to 20", and … where there are more.
std::string lines_of(const std::vector<std::size_t> &lines)
{
    std::string out;
    std::size_t parts = 0;
    for (std::size_t begin = 0; begin < lines.size();) {
        std::size_t end = begin + 1;
        while (end < lines.size() && lines[end] == lines[end - 1] + 1)
            ++end;
        if (++parts > 4)
            return out + ", …";
        out += fmt::format("{}{}", out.empty() ? "" : ", ", lines[begin]);
        if (end > begin + 1)
            out += fmt::format(" to {}", lines[end - 1]);
        begin = end;
    }
    return out;
}

// Rows of another scale than the others.
void doubt_scales(const std::vector<Patch> &patches, Named &named, std::vector<Doubt> &out)
{
    double largest = 0;
    for (const Patch &patch : patches)
        largest = std::max(largest, *std::max_element(patch.refl.begin(), patch.refl.end()));
    const double unit = largest > kMostPercent ? 100 : 1;
    std::vector<std::size_t> lines;
    const Patch *low = nullptr, *high = nullptr;
    double most_low = 0, most_high = 0;
    bool certain = false;
    for (const Patch &patch : patches) {
        const auto [least, most] = std::minmax_element(patch.refl.begin(), patch.refl.end());
        if (*least == 0 && *most == 0)
            continue;
        if (*most <= kMostFraction * unit) {
            certain = certain || is_fraction(patch, *least / unit, *most / unit);
            named.insert(&patch);
            lines.push_back(patch.line);
            if (!low || *most > most_low) {
                low = &patch;
                most_low = *most;
            }
        } else if (!high || *most > most_high) {
            high = &patch;
            most_high = *most;
        }
    }
    if (!certain || most_high < kLeastPercent * unit) {
        named.clear();
        return;
    }
    out.push_back(
        {low->line,
         fmt::format("{} reads {:.3g} % at most, and {} {:.4g} %: are {} of {} "
                     "rows fractions, and the others percentages? ({} {})",
                     in_quotes(low->name), most_low, in_quotes(high->name), most_high, lines.size(),
                     patches.size(), lines.size() == 1 ? "line" : "lines", lines_of(lines))});
}

// On another scale the device values are no tints: nothing is printed at 100 %.
void doubt_percentages(const std::vector<Patch> &patches, std::vector<Doubt> &out)
{
    double largest = 0, least = 0;
    std::map<std::string_view, double> most; // of each ink
    for (const Patch &patch : patches)
        for (const auto &[field, percent] : patch.device)
            if (is_ink(field)) {
                largest = std::max(largest, percent);
                least = std::min(least, percent);
                most[field] = std::max(most[field], percent);
            }
    constexpr double kPercentages = 20; // no fractions
    for (const auto &[ink, percent] : most)
        if (largest >= kPercentages && percent > 0 && percent <= 1)
            out.push_back({0, fmt::format("the largest value of {} is {:g}, and of another ink "
                                          "{:g}; they are taken for percentages",
                                          ink, percent, largest)});
    if (largest > 100 || (largest > 0 && largest <= 1))
        out.push_back({0, fmt::format("the largest ink value is {:g}; they are taken for "
                                      "percentages",
                                      largest)});
    if (least < 0)
        out.push_back({0, fmt::format("the smallest ink value is {:g}", least)});
}

} // namespace

std::vector<Doubt> doubts_about(const std::vector<Patch> &patches, Kind kind, bool held)
{
    std::vector<Doubt> out;
    doubt_percentages(patches, out);
    Named named;
    if (kind != Kind::colours) {
        if (kind == Kind::reflectance) {
            doubt_scales(patches, named, out);
            doubt_whites(patches, out);
        }
        doubt_zeros(patches, named, out);
        doubt_bands(patches, out);
        doubt_alike(patches, held, out);
        doubt_signs(patches, out);
        doubt_spikes(patches, out);
    }
    if (kind == Kind::colours)
        doubt_lightness(patches, out);
    doubt_labels(patches, out);
    if (kind != Kind::colours)
        doubt_copies(patches, out);
    doubt_inks(patches, kind, named, out);
    doubt_order(patches, kind, named, out);
    return out;
}

} // namespace vantrel::sheets
