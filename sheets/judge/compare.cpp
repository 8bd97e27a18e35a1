#include "judge/compare.h"

#include "judge/densitometer.h"
#include "judge/paper.h"

#include <fmt/format.h>

#include <algorithm>
#include <utility>

namespace vantrel::sheets {
namespace {

constexpr std::size_t kMostWorst = 10;

// The parts that are off target.
std::string verbal_difference(const Spectrum &reference, const Spectrum &sample,
                              const CompareRequest &request)
{
    wchar_t words[3][16] = {};
    VerbalColorDifference(reference.data(), sample.data(), request.illuminant,
                          request.words_of_hue ? 1 : 0, words[0], words[1], words[2]);
    std::string out;
    for (const wchar_t *part : words) {
        std::string narrow; // ASCII throughout
        for (; *part; ++part)
            narrow += static_cast<char>(*part);
        if (narrow != "On Target")
            out += (out.empty() ? "" : ", ") + narrow;
    }
    return out.empty() ? "On Target" : out;
}

Side side_of(const Patch &patch, const Paper &paper, const CompareRequest &request,
             const std::optional<int> &response)
{
    Side side{patch.id, patch.name, colour_of(patch.refl, request.illuminant), patch.refl, {}};
    if (response)
        side.density = Densitometer(paper.refl, request.status).density(patch.refl, *response);
    return side;
}

PairReport pair_report(const Patch &reference, const Paper &reference_paper, const Patch &sample,
                       const Paper &sample_paper, const CompareRequest &request,
                       ILLUM_OBS second_illuminant)
{
    PairReport out;
    out.response = Densitometer(reference_paper.refl, request.status).response(reference.refl);
    out.reference = side_of(reference, reference_paper, request, out.response);
    out.sample = side_of(sample, sample_paper, request, out.response);
    for (const Metric &metric : request.metrics)
        out.delta_e.push_back(metric(out.reference.colour.lab, out.sample.colour.lab));
    out.verbal = verbal_difference(reference.refl, sample.refl, request);
    Metamerism(reference.refl.data(), sample.refl.data(), request.illuminant, second_illuminant,
               &out.metamerism);
    ReflToDIN6172(reference.refl.data(), sample.refl.data(), request.illuminant, second_illuminant,
                  &out.din6172);
    return out;
}

std::vector<double> delta_e_of(const std::vector<PairReport> &pairs, std::size_t metric)
{
    std::vector<double> out;
    for (const PairReport &pair : pairs)
        out.push_back(pair.delta_e[metric]);
    return out;
}

std::vector<std::string> names_of(const Measurement &sheet, const std::vector<std::size_t> &places)
{
    std::vector<std::string> out;
    for (const std::size_t place : places)
        out.push_back(sheet.patches[place].name);
    return out;
}

} // namespace

bool Comparison::passed() const
{
    return std::all_of(pairs.begin(), pairs.end(), [&](const PairReport &pair) {
        return !tolerance || pair.delta_e[0] <= *tolerance;
    });
}

Comparison compare(const Measurement &reference, const Measurement &sample,
                   const CompareRequest &request)
{
    std::vector<std::string> warnings = reading_warnings(reference);
    for (const std::string &warning : reading_warnings(sample))
        warnings.push_back(warning);
    const Paper reference_paper = paper_of(reference, request.paper, warnings);
    const Paper sample_paper = paper_of(sample, request.paper, warnings);
    const ILLUM_OBS second = request.second_illuminant.value_or(usual_second(request.illuminant));
    const Pairs pairs = pairs_of(reference, sample, request.pairing);
    Comparison out{.reference = reference.file,
                   .sample = sample.file,
                   .reference_paper = reference_paper.name,
                   .sample_paper = sample_paper.name,
                   .illuminant = request.illuminant,
                   .second_illuminant = second,
                   .status = request.status,
                   .paired_by = pairs.by,
                   .metrics = request.metrics,
                   .tolerance = request.tolerance,
                   .pairs = {},
                   .statistics = {},
                   .worst = {},
                   .only_reference = names_of(reference, pairs.only_reference),
                   .only_sample = names_of(sample, pairs.only_sample),
                   .warnings = std::move(warnings)};
    for (const auto &[sheet, alone] :
         {std::pair{&reference, &out.only_reference}, std::pair{&sample, &out.only_sample}})
        if (!alone->empty())
            out.warnings.push_back(fmt::format("{}: {} of {} patches have no partner", sheet->file,
                                               alone->size(), sheet->patches.size()));
    const Work work{request.tell, "Comparing", pairs.matched.size()};
    for (const auto &[in_reference, in_sample] : pairs.matched) {
        out.pairs.push_back(pair_report(reference.patches[in_reference], reference_paper,
                                        sample.patches[in_sample], sample_paper, request, second));
        work.done(out.pairs.size());
    }
    for (std::size_t metric = 0; metric < request.metrics.size(); ++metric)
        out.statistics.push_back(statistics_of(delta_e_of(out.pairs, metric)));
    out.worst = largest_first(delta_e_of(out.pairs, 0));
    out.worst.resize(std::min(out.worst.size(), kMostWorst));
    return out;
}

} // namespace vantrel::sheets
