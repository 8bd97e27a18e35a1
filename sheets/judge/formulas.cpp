#include "judge/formulas.h"

#include "read/measurement.h"
#include "read/text.h"

#include <fmt/format.h>

#include <algorithm>
#include <cmath>

namespace vantrel::sheets {
namespace {

// In the order of Formula.
constexpr FormulaNames names[] = {
    {"de2000", "ΔE00", "LAB_DE_2000"},
    {"cmc", "ΔE CMC", "LAB_DE_CMC"},
    {"de94", "ΔE94", "LAB_DE_94"},
    {"de76", "ΔE*ab", "LAB_DE"},
};

Formula required(std::string_view key)
{
    const auto formula = formula_named(key);
    if (!formula)
        throw RequestError{
            fmt::format("no formula {}; there are {}", in_quotes(key), formula_keys())};
    return *formula;
}

std::vector<Metric>::iterator find(std::vector<Metric> &metrics, Formula formula)
{
    return std::find_if(metrics.begin(), metrics.end(),
                        [&](const Metric &metric) { return metric.formula == formula; });
}

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

std::vector<Metric> metrics_of(const std::vector<std::string> &keys)
{
    std::vector<Metric> out;
    for (const std::string &key : keys) {
        const Formula formula = required(key);
        if (find(out, formula) != out.end())
            throw RequestError{fmt::format("the formula {} is named twice", names_of(formula).key)};
        out.push_back(usual_metric(formula));
    }
    return out;
}

void weigh(std::vector<Metric> &metrics, std::string_view key, double lightness, double chroma)
{
    const Formula formula = required(key);
    if (formula == Formula::de76)
        throw RequestError{"the formula de76 has no weights"};
    const auto metric = find(metrics, formula);
    if (metric == metrics.end())
        throw RequestError{
            fmt::format("weights of {}, a formula that is not asked for", names_of(formula).key)};
    if (!(lightness > 0 && chroma > 0 && std::isfinite(lightness) && std::isfinite(chroma)))
        throw RequestError{
            fmt::format("weights are numbers above 0, not {:g} and {:g}", lightness, chroma)};
    *metric = {formula, lightness, chroma};
}

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
