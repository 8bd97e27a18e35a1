#include <array>
#include <iterator>
#include <optional>

#include <fmt/format.h>

#include "names.h"
#include "predict.h"
#include "report.h"

namespace {

// RFC 4180: quoted where it holds a separator or a quote, quotes doubled.
std::string field(const std::string &text)
{
    if (text.find_first_of(",\"") == std::string::npos)
        return text;
    std::string out = "\"";
    for (const char c : text)
        out += c == '"' ? "\"\"" : std::string(1, c);
    return out + '"';
}

// Comma first; empty where there is no value.
std::string optional_field(const std::optional<double> &value)
{
    return value ? fmt::format(",{:.4f}", *value) : ",";
}

std::string colour_fields(const Colour &colour)
{
    return fmt::format(",{},{:.4f},{:.4f},{:.4f}", hex(colour.rgb), colour.lab.L, colour.lab.a,
                       colour.lab.b);
}

} // namespace

std::string as_csv(const Report &report)
{
    std::string out = "id,name,rgb,L,a,b,C,h,dE00_paper,response,density,dot_area,dot_gain,"
                      "print_contrast,hue_error,grayness,trap\n";
    for (const PatchReport &patch : report.patches) {
        fmt::format_to(std::back_inserter(out), "{},{}{},{:.4f},{:.4f},{:.4f},{}", field(patch.id),
                       field(patch.name), colour_fields(patch.colour), patch.lch.C, patch.lch.h,
                       patch.to_paper,
                       patch.response ? response_name(report.status, *patch.response) : "");
        for (const auto &value :
             {patch.density, patch.dot_area, patch.dot_gain, patch.print_contrast, patch.hue_error,
              patch.grayness, patch.trap})
            out += optional_field(value);
        out += '\n';
    }
    return out;
}

std::string as_csv(const Predictions &predictions)
{
    std::string out = "ink1,percent1,ink2,percent2,ink3,percent3,"
                      "halftone_rgb,halftone_L,halftone_a,halftone_b,halftone_dE00,"
                      "film_rgb,film_L,film_a,film_b,film_dE00,"
                      "measured,measured_rgb,measured_L,measured_a,measured_b\n";
    for (const Prediction &prediction : predictions.all) {
        for (std::size_t i = 0; i < 3; ++i)
            out += i < prediction.inks.size()
                       ? fmt::format("{}{},{}", i ? "," : "", field(prediction.inks[i].name),
                                     prediction.inks[i].percent)
                       : ",,";
        for (const Estimate *estimate : {&prediction.halftone, &prediction.film})
            out += colour_fields(estimate->colour) + optional_field(estimate->to_measured);
        out += ',';
        out += prediction.measured
                   ? field(prediction.measured->patch) + colour_fields(prediction.measured->colour)
                   : ",,,,";
        out += '\n';
    }
    return out;
}
