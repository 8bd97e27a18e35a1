#include "judge/list.h"

#include "judge/names.h"
#include "read/measurement.h"
#include "read/text.h"

#include <fmt/format.h>

#include <utility>

namespace vantrel::sheets {
namespace {

using Texts = std::vector<std::string>;
using Numbers = std::vector<double>;

Numbers bands()
{
    Numbers nm;
    for (int band = 0; band < VANTREL_BANDS; ++band)
        nm.push_back(400 + 10 * band);
    return nm;
}

Spectrum perfect_white()
{
    Spectrum white;
    white.fill(100);
    return white;
}

} // namespace

std::size_t List::rows() const
{
    return std::visit([](const auto &values) { return values.size(); }, columns[0].values);
}

List list_illuminants()
{
    const Spectrum white = perfect_white();
    Texts names;
    Numbers ids, observers, X, Y, Z, x, y;
    for (int i = 0; i < NUM_ILLUM_OBS; ++i) {
        const auto illuminant = static_cast<ILLUM_OBS>(i);
        double xyz[3], Yxy[3];
        ReflToXYZ(white.data(), illuminant, xyz);
        ReflToCIEYxy(white.data(), illuminant, Yxy);
        names.emplace_back(name_of(illuminant));
        ids.push_back(i);
        observers.push_back(i % 2 ? 10 : 2);
        X.push_back(xyz[0]);
        Y.push_back(xyz[1]);
        Z.push_back(xyz[2]);
        x.push_back(Yxy[1]);
        y.push_back(Yxy[2]);
    }
    return {"illuminants",
            {{"illuminant", "ILLUMINANT", names},
             {"id", "ILLUMINANT_ID", ids},
             {"observer", "OBSERVER", observers},
             {"X", "XYZ_X", X},
             {"Y", "XYZ_Y", Y},
             {"Z", "XYZ_Z", Z},
             {"x_chromaticity", "XYY_X", x},
             {"y_chromaticity", "XYY_Y", y}}};
}

List list_tristimulus_weights(ILLUM_OBS illuminant)
{
    Numbers X(VANTREL_BANDS), Y(VANTREL_BANDS), Z(VANTREL_BANDS);
    ReflToXYZs(perfect_white().data(), illuminant, X.data(), Y.data(), Z.data());
    return {
        std::string(name_of(illuminant)),
        {{"nm", "WAVELENGTH", bands()}, {"X", "XYZ_X", X}, {"Y", "XYZ_Y", Y}, {"Z", "XYZ_Z", Z}}};
}

List list_statuses()
{
    Texts names, responses;
    Numbers ids;
    for (int status = 0; status < NUM_STATUSES; ++status) {
        std::string codes = status == SPECTRAL_STATUS    ? "400 to 700 nm"
                            : status == SPECTRALX_STATUS ? "V and bands 2 to 28"
                                                         : "";
        for (int response = 0; response < NUM_RESPONSES; ++response)
            if (has_response(status, response)) {
                if (!codes.empty())
                    codes += ' ';
                codes += response_code(status, response);
            }
        names.emplace_back(status_name(status));
        ids.push_back(status);
        responses.push_back(codes);
    }
    return {"statuses",
            {{"status", "STATUS", names},
             {"id", "STATUS_ID", ids},
             {"responses", "RESPONSES", responses}}};
}

List list_responses(const std::optional<int> &wanted)
{
    Texts statuses, names, codes;
    Numbers ids, firsts, peaks, lasts;
    for (int status = 0; status < NUM_STATUSES; ++status)
        for (int response = 0; response < NUM_RESPONSES; ++response) {
            double weights[VANTREL_BANDS], first = 0, peak = 0, last = 0;
            if (wanted.value_or(status) != status || !has_response(status, response) ||
                !GetNormalizedDensityWeights(status, response, weights, &first, &peak, &last))
                continue;
            statuses.emplace_back(status_name(status));
            names.push_back(response_name(status, response));
            codes.push_back(response_code(status, response));
            ids.push_back(response);
            firsts.push_back(first);
            peaks.push_back(peak);
            lasts.push_back(last);
        }
    return {"responses",
            {{"status", "STATUS", statuses},
             {"response", "RESPONSE", names},
             {"code", "RESPONSE_CODE", codes},
             {"id", "RESPONSE_ID", ids},
             {"first_nm", "FIRST_NM", firsts},
             {"peak_nm", "PEAK_NM", peaks},
             {"last_nm", "LAST_NM", lasts}}};
}

List list_weights(int status, const std::optional<int> &wanted)
{
    List out{std::string(status_name(status)), {{"nm", "WAVELENGTH", bands()}}};
    for (int response = 0; response < NUM_RESPONSES; ++response) {
        Numbers weights(VANTREL_BANDS);
        if (wanted.value_or(response) != response || !has_response(status, response) ||
            !GetNormalizedDensityWeights(status, response, weights.data(), nullptr, nullptr,
                                         nullptr))
            continue;
        const std::string name = response_name(status, response);
        out.columns.push_back({name, upper(name), std::move(weights)});
    }
    if (out.columns.size() == 1)
        throw RequestError{fmt::format("{} has no such filter", status_name(status))};
    return out;
}

} // namespace vantrel::sheets
