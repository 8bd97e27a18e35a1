#include "report.h"

namespace {

CIELABCOORD lab_of(const Spectrum &refl, ILLUM_OBS illuminant)
{
    double lab[3];
    ReflToCIELAB(refl.data(), illuminant, lab);
    return {lab[0], lab[1], lab[2]};
}

CIELCHCOORD lch_of(const CIELABCOORD &lab)
{
    const double from[3] = {lab.L, lab.a, lab.b};
    double lch[3];
    CIELabToCIELCH(from, lch);
    return {lch[0], lch[1], lch[2]};
}

PatchReport patch_report(const Patch &patch, ILLUM_OBS illuminant, const CIELABCOORD &paper)
{
    PatchReport row;
    row.id = patch.id;
    row.name = patch.name;
    row.device = patch.device;
    row.lab = lab_of(patch.refl, illuminant);
    row.lch = lch_of(row.lab);
    LabToDE2000(&paper, &row.lab, 1, 1, &row.to_paper);
    unsigned int rgb = 0;
    ReflToRGB(patch.refl.data(), illuminant, &rgb);
    row.red = rgb & 0xFF;
    row.green = rgb >> 8 & 0xFF;
    row.blue = rgb >> 16 & 0xFF;
    return row;
}

} // namespace

Report report_of(const Measurement &sheet, const std::string &file, ILLUM_OBS illuminant,
                 const Patch &paper)
{
    Report report{.file = file,
                  .illuminant = illuminant,
                  .paper = paper.name,
                  .source = sheet.source,
                  .patches = {}};
    const CIELABCOORD paper_lab = lab_of(paper.refl, illuminant);
    for (const Patch &patch : sheet.patches)
        report.patches.push_back(patch_report(patch, illuminant, paper_lab));
    return report;
}
