#include "functions.h"

#include <sstream>

// A row of a name alone is the file of the functions after it.
const std::vector<Function> kRows = {
    {"src/colorimetry/vantrel.cpp"},
    {"GetNumIlluminantObservers", call(GetNumIlluminantObservers), ""},
    {"ReflToXYZ", call(ReflToXYZ), "31 k >3"},
    {"ReflToXYZs", call(ReflToXYZs), "31 k >31 >31 >31"},
    {"ReflToCIELAB", call(ReflToCIELAB), "31 k >3"},
    {"XYZToCIELab", call(XYZToCIELab), "3 k >3"},
    {"ReflToCIELCH", call(ReflToCIELCH), "31 k >3"},
    {"XYZToCIELCH", call(XYZToCIELCH), "3 k >3"},
    {"CIELabToCIELCH", call(CIELabToCIELCH), "3 >3"},
    {"CIELabToCIELChEx", call(CIELabToCIELChEx), "3 >3 i"},
    {"CIELabToCIELCh", call(CIELabToCIELCh), "3 >3 i"},
    {"CIELChToCIELab", call(CIELChToCIELab), "3 >3"},
    {"ReflToCIELUV", call(ReflToCIELUV), "31 k >3"},
    {"XYZToCIELUV", call(XYZToCIELUV), "3 k >3"},
    {"ReflToCIEYxy", call(ReflToCIEYxy), "31 k >3"},
    {"XYZToCIEYxy", call(XYZToCIEYxy), "3 k >3"},
    {"XYZToxyz", call(XYZToxyz), "3 >1 >1 >1"},
    {"ReflToHunterLAB", call(ReflToHunterLAB), "31 k >3"},
    {"LabToXYZ", call(LabToXYZ), "3 k >3"},
    {"ReflToRGB", call(ReflToRGB), "31 k >1"},
    {"XYZtoRGB", call(XYZtoRGB), "3 >1"},
    {"CalcLabch", call(CalcLabch), "31 k >5"},
    {"VerbalColorDifference", call(VerbalColorDifference), "31 31 k i >11 >11 >11"},
    {"src/difference/vantrel.cpp"},
    {"LabToDElab", call(LabToDElab), "3 3 >1"},
    {"LabToDH", call(LabToDH), "3 3 >1"},
    {"LabToDEcmc", call(LabToDEcmc), "3 3 d d >1"},
    {"src/difference/cie94.cpp"},
    {"LabToDE94", call(LabToDE94), "3 3 d d >1"},
    {"CIELChToDE94", call(CIELChToDE94), "3 3 d d >1"},
    {"ReflToDIN6172", call(ReflToDIN6172), "31 31 k k >1"},
    {"src/difference/ciede2000.cpp"},
    {"LabToDE2000", call(LabToDE2000), "3 3 d d >1"},
    {"LabToDE2000Ex", call(LabToDE2000Ex), "3 3 d d d >1"},
    {"CIEDE2000::Calculate",
     call(+[](const CIELABCOORD *first, const CIELABCOORD *second, double kL, double kC,
              double kH) { return CIEDE2000().Calculate(*first, *second, kL, kC, kH); }),
     "3! 3! d d d"},
    {"CIEDE2000::IsZero",
     call(+[](double value, double tolerance) { return CIEDE2000().IsZero(value, tolerance); }),
     "d d"},
    {"CIEDE2000::ConvertToDegrees",
     call(+[](double radians) { return CIEDE2000().ConvertToDegrees(radians); }), "d"},
    {"CIEDE2000::ConvertToRadians",
     call(+[](double degrees) { return CIEDE2000().ConvertToRadians(degrees); }), "d"},
    {"src/density/dencalc.cpp"},
    {"GetNumStatuses", call(GetNumStatuses), ""},
    {"GetNumResponses", call(GetNumResponses), ""},
    {"GetNumStatusResponses", call(GetNumStatusResponses), "s=FALSE"},
    {"GetNormalizedDensityWeights", call(GetNormalizedDensityWeights), "s r >31 >1? >1? >1?"},
    {"ReflToDensity", call(ReflToDensity), "31 31? s i >1"},
    {"ReflToReflDensity", call(ReflToReflDensity), "31 s r >1"},
    {"CalculateSpectralDensity", call(CalculateSpectralDensity), "d"},
    {"AdjustForPaperRefls", call(AdjustForPaperRefls), "31! 31! >31!"},
    {"ReflToDensities", call(ReflToDensities), "31 31? s >9"},
    {"ReflToDensitiesNoPaper", call(ReflToDensitiesNoPaper), "31 s >9"},
    {"DetermineDensityResponse", call(DetermineDensityResponse), "31 s 31?"},
    {"FindDensityMax", call(FindDensityMax), "9! >1! >1! i"},
    {"FindDensityMin", call(FindDensityMin), "9! >1! >1! i"},
    {"CalculateCCRDensities", call(CalculateCCRDensities), "31 31? s >9"},
    {"SetHiFiConstants", call(SetHiFiConstants), "3! 7? 7? 7?"},
    {"GetHiFiConstants", call(GetHiFiConstants), ">3? >7? >7? >7?"},
    {"SetHexachromeConstants", call(SetHexachromeConstants), "2! 7? 7?"},
    {"GetHexachromeConstants", call(GetHexachromeConstants), ">2? >7? >7?"},
    {"src/density/specx.cpp"},
    {"CalculateSpectralXDensity", call(CalculateSpectralXDensity), "31 31? i >1? >1?"},
    // densities and bands of the first three peaks
    {"FindMaxDensityPoints",
     call(+[](const double *refl, double *densities, int *bands, int *count) {
         DENSITYPOINT points[VANTREL_BANDS] = {};
         const int result =
             FindMaxDensityPoints(refl, densities && bands ? points : nullptr, count);
         for (int i = 0; result && i < 3; ++i) {
             densities[i] = points[i].density;
             bands[i] = points[i].band;
         }
         return result;
     }),
     "31 >3 >3 >1"},
    // the bands of up to three peaks
    {"ChooseBPWavelen", call(+[](const double *refl, const int *bands, int count) {
         DENSITYPOINT points[3] = {};
         for (int i = 0; bands && i < 3; ++i)
             points[i].band = bands[i];
         return ChooseBPWavelen(refl, bands ? points : nullptr, std::min(count, 3));
     }),
     "31 3 i"},
    // five weights, and zeros up to any width that fits into a spectrum
    {"CalculateSpecialDensity",
     call(+[](const double *refl, int centre, double *weights, int width) {
         double all[VANTREL_BANDS] = {};
         if (weights)
             std::copy(weights, weights + 5, all);
         return CalculateSpecialDensity(refl, centre, weights ? all : nullptr, width);
     }),
     "31 i 5 i"},
    {"SetSpectralXConstants", call(SetSpectralXConstants), "1! 1! 1! 1! 1!"},
    {"GetSpectralXConstants", call(GetSpectralXConstants), ">1? >1? >1? >1? >1?"},
    {"IsChromatic", call(IsChromatic), "31 i"},
    {"IsChromaticLCH", call(IsChromaticLCH), "3"},
    {"SetAChromaticConstants", call(SetAChromaticConstants), "1! 1! 1! 1!"},
    {"GetAChromaticConstants", call(GetAChromaticConstants), ">1! >1! >1! >1!"},
    {"src/paper/paper.cpp"},
    {"ReflToBrightness", call(ReflToBrightness), "31=Refl >1=pBrightness"},
    {"Metamerism", call(Metamerism), "31=StdRefls 31=SampRefls k k >1=pMetamerism"},
    {"ReflToWhiteE313_98", call(ReflToWhiteE313_98), "31 k >1"},
    {"CIEYxyToWhiteE313_98", call(CIEYxyToWhiteE313_98), "3 k >1"},
    {"src/inks/inks.cpp"},
    {"Saunderson", call(Saunderson), "d d d"},
    {"UnSaunderson", call(UnSaunderson), "d d d"},
    {"EstimateReflsForThickness", call(EstimateReflsForThickness), "31! d 31! >31!"},
    {"EstimateReflsForTintColorForBestVisualColor",
     call(EstimateReflsForTintColorForBestVisualColor), "31! i 31! >31!"},
    {"EstimateReflsForTintColor", call(EstimateReflsForTintColor), "31! i 31! >31!"},
    {"CombineInkColors", call(CombineInkColors), "31 31 >31"},
    {"Combine3InkColors", call(Combine3InkColors), "31 31 31 >31"},
    {"CombineInkColorsEx", call(CombineInkColorsEx), "3 3 >3"},
    {"Combine3InkColorsEx", call(Combine3InkColorsEx), "3 3 3 >3"},
    {"EstimateRefls", call(EstimateRefls), "i 93 3=piPercent 31=pdPaperRefls >31=pdEstimatedRefls"},
    {"EstimateReflsForBestVisualColor", call(EstimateReflsForBestVisualColor),
     "i 93 3=piPercent 31=pdPaperRefls >31=pdEstimatedRefls"},
    {"EstimateReflsEx", call(EstimateReflsEx),
     "i 31 31? 31? 3=piPercent 31=pdPaperRefls >31=pdEstimatedRefls"},
    {"EstimateReflsExForBestVisualColor", call(EstimateReflsExForBestVisualColor),
     "i 31 31? 31? 3=piPercent 31=pdPaperRefls >31=pdEstimatedRefls"},
    {"EstimateColor", call(EstimateColor), "i 9 3 3 >3"},
    {"EstimateTintColor", call(EstimateTintColor), "3 i 3 >3"},
    {"CalculateTintColor", call(CalculateTintColor), "31 31 i k >1"},
    {"ReflToABErrorWeights", call(ReflToABErrorWeights), "31 31 k >31? >31?"},
    {"src/print/dencalc.cpp"},
    {"DensityToDotArea", call(DensityToDotArea), "d d d >1"},
    {"DensityFromDotArea", call(DensityFromDotArea), "d d d >1=-"},
    {"ReflToDotArea", call(ReflToDotArea), "31 31 31? s r d >1"},
    {"ReflToDotGain", call(ReflToDotGain), "31 31 31? s r d i >1"},
    {"DensityToPrintContrast", call(DensityToPrintContrast), "d d >1=-"},
    {"ReflToPrintContrast", call(ReflToPrintContrast), "31 31 31? s r=- >1"},
    {"DensityToTrap", call(DensityToTrap), "d d d >1=-"},
    {"ReflToTrap", call(ReflToTrap), "31 31 31 31? s r=- >1"},
    {"DensityToHueGray", call(DensityToHueGray), "d d d >1 >1"},
    {"ReflToHueGray", call(ReflToHueGray), "31 31? s >1 >1"},
    {"DensitytoIntegratedRefl", call(DensitytoIntegratedRefl), "d s r >1=-"},
    {"ReflToPolIntercept", call(ReflToPolIntercept), "31 d d d >1"},
    {"DensityRatio", call(DensityRatio), "31! 31! s=-"},
    {"ColorAtEquivalentDensity", call(ColorAtEquivalentDensity), "31! 31! i >31!"},
    {"src/polarisation/polfcns.cpp"},
    {"PolReflAdjust", call(PolReflAdjust), "31! i 4! >31! 124!"},
    {"PolReflAutoAdjust", call(PolReflAutoAdjust), "31! 4! >31! 124!"},
    {"PolDetermineDensityResponse", call(PolDetermineDensityResponse), "31! 4! s 31? 4! 124!"},
    {"PolReflToDensity", call(PolReflToDensity), "31! 4! 31? 4! 124! s r=- >1"},
    {"PolReflToDensities", call(PolReflToDensities), "31 4! 31? 4! 124! s >9"},
    {"PolReflToHueGray", call(PolReflToHueGray), "31 4! 31? 4! 124! s >1 >1"},
    {"PolReflToDotArea", call(PolReflToDotArea), "31! 4! 31! 4! 31? 4! 124! s r=- d >1"},
    {"PolReflToDotGain", call(PolReflToDotGain), "31! 4! 31! 4! 31? 4! 124! s r=- d i >1"},
    {"PolReflToPrintContrast", call(PolReflToPrintContrast), "31! 4! 31! 4! 31? 4! 124! s r=- >1"},
    {"PolReflToTrap", call(PolReflToTrap), "31! 4! 31! 4! 31! 4! 31? 4! 124! s r=- >1"},
};

Function::Function(const char *name_, std::function<double(std::vector<Slot> &)> call_,
                   const char *signature)
    : name(name_), call(std::move(call_))
{
    std::istringstream tokens(signature);
    for (std::string token; tokens >> token;) {
        Argument &argument = arguments.emplace_back();
        if (const std::size_t at = token.find('='); at != std::string::npos) {
            argument.reported = token.substr(at + 1);
            token.resize(at);
        }
        argument.output = token.front() == '>';
        argument.nullable = token.back() == '?';
        argument.unchecked = token.back() == '!';
        const std::string core = token.substr(argument.output ? 1 : 0);
        if (std::isalpha(static_cast<unsigned char>(core.front())))
            argument.kind = core.front();
        else
            argument.count = std::stoul(core);
    }
}

std::vector<Slot> Function::slots() const
{
    std::vector<Slot> slots(arguments.size());
    for (std::size_t i = 0; i < slots.size(); ++i) {
        slots[i].output = arguments[i].output;
        slots[i].values.assign(arguments[i].count, 0.0);
    }
    return slots;
}

const std::vector<Function> &functions()
{
    static const std::vector<Function> all = [] {
        std::vector<Function> found;
        for (std::string file; const Function &row : kRows) {
            if (!row.call)
                file = row.name;
            else
                found.emplace_back(row).file = file;
        }
        return found;
    }();
    return all;
}

const Function *find_function(const std::string &name)
{
    const auto &all = functions(); // libc++ 14 has no std::ranges::find
    const auto it =
        std::find_if(all.begin(), all.end(), [&](const Function &f) { return f.name == name; });
    return it != all.end() ? &*it : nullptr;
}
