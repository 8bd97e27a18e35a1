// The colour differences that a user picks by name.
#pragma once

#include <vantrel.h>

#include <optional>
#include <string>
#include <string_view>
#include <vector>

namespace vantrel::sheets {

enum class Formula { de2000, cmc, de94, de76 };

// How a formula is called: de2000 by users and in data, ΔE00 by readers, LAB_DE_2000 by CGATS text.
struct FormulaNames {
    std::string_view key, title, cgats;
};
const FormulaNames &names_of(Formula formula);
std::optional<Formula> formula_named(std::string_view key); // in any case
std::string formula_keys();                                 // with ", " between

// A formula with its parametric factors: kL and kC, for CMC l and c; CIE 1976 has none.
struct Metric {
    Formula formula = Formula::de2000;
    double lightness = 1;
    double chroma = 1;

    double operator()(const CIELABCOORD &reference, const CIELABCOORD &sample) const;
};

// The factors that are usual: CMC(2:1), 1 otherwise.
Metric usual_metric(Formula formula);

// The metrics of formulas by their keys, with the usual factors; throws RequestError where one is
// unknown or named twice.
std::vector<Metric> metrics_of(const std::vector<std::string> &keys);

// Gives the metric of a formula other factors; throws RequestError where it is not among them, has
// none, or the factors are not above 0.
void weigh(std::vector<Metric> &metrics, std::string_view key, double lightness, double chroma);

// ΔE00, ΔE CMC(2:1), ΔE94 (kL 2, kC 1)
std::string title_of(const Metric &metric);

} // namespace vantrel::sheets
