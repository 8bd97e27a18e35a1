#include "judge/run_limits.h"

namespace vantrel::sheets {
namespace {

// The reading of a single patch that a limit bounds on each sheet; nothing where it bounds none.
std::optional<Attribute> attribute_of(const Tolerance &limit)
{
    using enum Quantity;
    const bool solids = limit.group == Group::solids || limit.group == Group::spots;
    const Metric &metric = limit.metric;
    const bool de00 = limit.quantity == colour_difference && metric.formula == Formula::de2000 &&
                      metric.lightness == 1 && metric.chroma == 1;
    if (de00 && limit.group == Group::all && limit.statistic == Statistic::mean)
        return Attribute::mean_de00;
    if (limit.statistic != Statistic::maximum)
        return std::nullopt;
    if (limit.quantity == density && solids)
        return Attribute::density;
    if (limit.quantity == gain && limit.group == Group::tints)
        return Attribute::tone_value;
    if (limit.group == Group::neutrals && limit.quantity == neutral_chroma)
        return Attribute::delta_ch;
    if (limit.group == Group::neutrals && limit.quantity == lightness)
        return Attribute::delta_l;
    if (!de00)
        return std::nullopt;
    return limit.group == Group::paper ? std::optional(Attribute::paper)
           : solids                    ? std::optional(Attribute::solid)
           : limit.group == Group::all ? std::optional(Attribute::max_de00)
                                       : std::nullopt;
}

// The aim of a gain is over the nominal value.
std::optional<double> aim_of(const Tolerance &limit, const Measurand &measurand)
{
    if (!limit.aim)
        return std::nullopt;
    return measurand.attribute == Attribute::tone_value ? measurand.nominal + *limit.aim
                                                        : *limit.aim;
}

// Nothing where there is no aim to stay by.
std::optional<Limits> limits_of(const Measurand &measurand, const std::optional<double> &aim,
                                double limit)
{
    switch (measurand.attribute) {
    case Attribute::density:
    case Attribute::tone_value:
        return aim ? std::optional(Limits{*aim - limit, *aim + limit}) : std::nullopt;
    case Attribute::delta_l:
        return Limits{-limit, limit};
    default: // differences
        return Limits{{}, limit};
    }
}

// The stricter on each side.
Limits both(const Limits &first, const Limits &second)
{
    Limits out = first;
    if (second.low && (!out.low || *second.low > *out.low))
        out.low = second.low;
    if (second.high && (!out.high || *second.high < *out.high))
        out.high = second.high;
    return out;
}

} // namespace

bool is_about(const Tolerance &limit, const Measurand &measurand)
{
    return attribute_of(limit) == measurand.attribute &&
           (limit.ink.empty() || ink_title(limit.ink) == measurand.subject) &&
           (limit.group != Group::spots || !is_process_ink(measurand.subject)) &&
           (!limit.nominal || *limit.nominal == measurand.nominal);
}

void bound(RunSeries &series, const Tolerance &limit)
{
    if (!is_about(limit, series.measurand))
        return;
    if (const auto aim = aim_of(limit, series.measurand))
        series.aim = aim;
    if (const auto limits = limits_of(series.measurand, series.aim, limit.limit))
        series.limits = series.limits ? both(*series.limits, *limits) : *limits;
}

} // namespace vantrel::sheets
