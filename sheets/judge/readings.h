// What a press operator reads off a sheet: of the mean of its zones, and zone by zone.
#pragma once

#include "judge/compare.h"
#include "judge/inks.h"
#include "read/measurement.h"

#include <map>
#include <optional>
#include <string>
#include <string_view>
#include <tuple>
#include <vector>

namespace vantrel::sheets {

enum class Attribute {
    density,    // of a solid, over the paper, in the response that reads it
    tone_value, // of a tint: dot area by density, or the spot colour tone value (ISO 20654)
    contrast,
    trap,
    paper,    // ΔE00 to the paper of the aims
    solid,    // ΔE00 to the aim
    delta_ch, // √(Δa*² + Δb*²) of a near-neutral to its aim
    delta_l,  // ΔL* of a near-neutral to its aim, signed
    neutral,  // visual density of a near-neutral or a tint of black, over the paper
    mean_de00,
    max_de00,
};

std::string_view key_of(Attribute attribute); // density, …
int decimals_of(Attribute attribute);
// By how much a reading differs from others at the least to be worth a word.
double apart_by(Attribute attribute);

struct Measurand {
    Attribute attribute = Attribute::density;
    std::string subject;  // the ink, or inks as C 50 M 40 Y 40; empty for the whole sheet
    double nominal = 100; // of a tint
    bool sctv = false;    // a tone value of ISO 20654

    std::string title() const; // "Magenta 40 % tone value"
    friend bool operator==(const Measurand &, const Measurand &) = default;
    friend bool operator<(const Measurand &first, const Measurand &second)
    {
        return std::tie(first.attribute, first.subject, first.nominal, first.sctv) <
               std::tie(second.attribute, second.subject, second.nominal, second.sctv);
    }
};

struct ZoneReading {
    Measurand measurand;
    double value = 0; // of the mean of the zones
    std::optional<double> aim{};
    std::map<int, double> zones{}; // by number; empty where the sheet has no zones

    friend bool operator==(const ZoneReading &, const ZoneReading &) = default;
};

struct SheetReadings {
    std::vector<ZoneReading> readings;
    Coverage coverage;
    std::vector<std::string> unserved; // aims without a patch
    std::vector<LimitResult> limits;   // on the means of the zones
    std::optional<Verdict> verdict;    // of compare()
    std::vector<SolidAdvice> advice;
    std::vector<std::string> warnings;
};

// Takes the number of the zone out of the name: 5 of "M100 Z5"; 0 where there is none.
int take_zone(Patch &patch);

// The patches that an aim serves are its zones: their numbers end the names, or are those of their
// places where most aims have the same number of patches. The names of the aims are without zones.
// `request` is as compare() takes it, with an illuminant; `order` is that of printing. Throws
// RequestError.
SheetReadings readings_of(const Measurement &aims, Measurement measured, CompareRequest request,
                          const std::vector<std::string> &order);

} // namespace vantrel::sheets
