#include "judge/formulas.h"

#include "read/text.h"

#include <fmt/format.h>

namespace vantrel::sheets {
namespace {

// In the order of Formula.
constexpr FormulaNames names[] = {
    {"de2000", "ΔE00", "LAB_DE_2000"},
    {"cmc", "ΔE CMC", "LAB_DE_CMC"},
    {"de94", "ΔE94", "LAB_DE_94"},
    {"de76", "ΔE*ab", "LAB_DE"},
};

} // namespace

const FormulaNames &names_of(Formula formula) { return names[static_cast<std::size_t>(formula)]; }

std::optional<Formula> formula_named(std::string_view key)
{
    for (const FormulaNames &row : names)
        if (equal_ignoring_case(row.key, key))
            return static_cast<Formula>(&row - names);
    return std::nullopt;
}

std::string formula_keys()
{
    std::string out;
    for (const FormulaNames &row : names)
        out += fmt::format("{}{}", out.empty() ? "" : ", ", row.key);
    return out;
}

double Metric::operator()(const CIELABCOORD &reference, const CIELABCOORD &sample) const
{
    double delta_e = 0;
    switch (formula) {
    case Formula::de2000:
        LabToDE2000(&reference, &sample, lightness, chroma, &delta_e);
        break;
    case Formula::cmc:
        LabToDEcmc(&sample, &reference, lightness, chroma, &delta_e);
        break;
    case Formula::de94:
        LabToDE94(&sample, &reference, lightness, chroma, &delta_e);
        break;
    case Formula::de76:
        LabToDElab(&reference, &sample, &delta_e);
        break;
    }
    return delta_e;
}

Metric usual_metric(Formula formula) { return {formula, formula == Formula::cmc ? 2.0 : 1.0, 1}; }

std::string title_of(const Metric &metric)
{
    const std::string_view title = names_of(metric.formula).title;
    if (metric.formula == Formula::cmc)
        return fmt::format("{}({:g}:{:g})", title, metric.lightness, metric.chroma);
    if (metric.lightness == 1 && metric.chroma == 1)
        return std::string(title);
    return fmt::format("{} (kL {:g}, kC {:g})", title, metric.lightness, metric.chroma);
}

} // namespace vantrel::sheets
