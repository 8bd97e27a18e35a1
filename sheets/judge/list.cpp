#include "judge/list.h"

#include "judge/names.h"
#include "read/text.h"
#include "write/json_text.h"
#include "write/table_text.h"

#include <fmt/format.h>

#include <algorithm>

namespace vantrel::sheets {
namespace {

// All rows at hand.
List list_of(std::string what, std::vector<Field> fields, std::vector<Row> rows)
{
    List out{std::move(what), {}};
    out.flat.description = out.what;
    out.flat.fields = std::move(fields);
    out.flat.rows = rows.size();
    out.flat.row = [rows = std::move(rows)](std::size_t i) { return rows[i]; };
    return out;
}

// A number to four decimals, without those that are 0.
std::string shown(const std::string &text, bool is_text)
{
    const auto value = is_text ? std::nullopt : number_in(text);
    return value && text.find_first_of(".e") != std::string::npos ? fixed(value, 4) : text;
}

} // namespace

List list_illuminants()
{
    std::vector<Row> rows;
    Spectrum white;
    white.fill(100);
    for (int i = 0; i < NUM_ILLUM_OBS; ++i) {
        const auto illuminant = static_cast<ILLUM_OBS>(i);
        double xyz[3], Yxy[3];
        ReflToXYZ(white.data(), illuminant, xyz);
        ReflToCIEYxy(white.data(), illuminant, Yxy);
        rows.push_back({std::string(name_of(illuminant)), fmt::to_string(i), i % 2 ? "10" : "2",
                        exact_cell(xyz[0]), exact_cell(xyz[1]), exact_cell(xyz[2]),
                        exact_cell(Yxy[1]), exact_cell(Yxy[2])});
    }
    return list_of("illuminants",
                   {{"illuminant", "ILLUMINANT", true},
                    {"id", "ILLUMINANT_ID"},
                    {"observer", "OBSERVER"},
                    {"X", "XYZ_X"},
                    {"Y", "XYZ_Y"},
                    {"Z", "XYZ_Z"},
                    {"x_chromaticity", "XYY_X"},
                    {"y_chromaticity", "XYY_Y"}},
                   std::move(rows));
}

List list_tristimulus_weights(ILLUM_OBS illuminant)
{
    Spectrum white, x, y, z;
    white.fill(100);
    ReflToXYZs(white.data(), illuminant, x.data(), y.data(), z.data());
    std::vector<Row> rows;
    for (int band = 0; band < VANTREL_BANDS; ++band)
        rows.push_back({fmt::to_string(400 + 10 * band), exact_cell(x[band]), exact_cell(y[band]),
                        exact_cell(z[band])});
    return list_of(std::string(name_of(illuminant)),
                   {{"nm", "WAVELENGTH"}, {"X", "XYZ_X"}, {"Y", "XYZ_Y"}, {"Z", "XYZ_Z"}},
                   std::move(rows));
}

List list_statuses()
{
    std::vector<Row> rows;
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
        rows.push_back({std::string(status_name(status)), fmt::to_string(status), codes});
    }
    return list_of(
        "statuses",
        {{"status", "STATUS", true}, {"id", "STATUS_ID"}, {"responses", "RESPONSES", true}},
        std::move(rows));
}

List list_responses(const std::optional<int> &wanted)
{
    std::vector<Row> rows;
    for (int status = 0; status < NUM_STATUSES; ++status)
        for (int response = 0; response < NUM_RESPONSES; ++response) {
            double weights[VANTREL_BANDS], first = 0, peak = 0, last = 0;
            if (wanted.value_or(status) == status && has_response(status, response) &&
                GetNormalizedDensityWeights(status, response, weights, &first, &peak, &last))
                rows.push_back({std::string(status_name(status)), response_name(status, response),
                                response_code(status, response), fmt::to_string(response),
                                exact_cell(first), exact_cell(peak), exact_cell(last)});
        }
    return list_of("responses",
                   {{"status", "STATUS", true},
                    {"response", "RESPONSE", true},
                    {"code", "RESPONSE_CODE", true},
                    {"id", "RESPONSE_ID"},
                    {"first_nm", "FIRST_NM"},
                    {"peak_nm", "PEAK_NM"},
                    {"last_nm", "LAST_NM"}},
                   std::move(rows));
}

List list_weights(int status, const std::optional<int> &wanted)
{
    std::vector<Field> fields = {{"nm", "WAVELENGTH"}};
    std::vector<Row> rows;
    for (int band = 0; band < VANTREL_BANDS; ++band)
        rows.push_back({fmt::to_string(400 + 10 * band)});
    for (int response = 0; response < NUM_RESPONSES; ++response) {
        double weights[VANTREL_BANDS];
        if (wanted.value_or(response) != response || !has_response(status, response) ||
            !GetNormalizedDensityWeights(status, response, weights, nullptr, nullptr, nullptr))
            continue;
        const std::string name = response_name(status, response);
        fields.push_back({name, upper(name)});
        for (int band = 0; band < VANTREL_BANDS; ++band)
            rows[band].push_back(exact_cell(weights[band]));
    }
    if (fields.size() == 1)
        throw RequestError{fmt::format("{} has no such filter", status_name(status))};
    return list_of(std::string(status_name(status)), std::move(fields), std::move(rows));
}

void write_table(const List &list, const Sink &sink, bool)
{
    const Flat &flat = list.flat;
    std::vector<Row> rows(1);
    for (const Field &field : flat.fields)
        rows[0].push_back(field.name);
    for (std::size_t i = 0; i < flat.rows; ++i)
        rows.push_back(flat.row(i));
    std::vector<std::size_t> widths(flat.fields.size());
    for (Row &row : rows)
        for (std::size_t i = 0; i < widths.size(); ++i) {
            row[i] = shown(row[i], flat.fields[i].text);
            widths[i] = std::max(widths[i], characters(row[i]));
        }
    Lines lines(sink);
    for (const Row &row : rows) {
        std::string line;
        for (std::size_t i = 0; i < widths.size(); ++i) {
            const std::string padding(widths[i] - characters(row[i]), ' ');
            line += (i ? "  " : "") + (flat.fields[i].text ? row[i] + padding : padding + row[i]);
        }
        lines.add(line);
    }
}

void write_json(const List &list, const Sink &sink)
{
    const Json head = {{"command", "list"}, {"list", list.what}};
    const auto row_json = [&](std::size_t i) {
        const Row row = list.flat.row(i);
        Json out = Json::object();
        for (std::size_t k = 0; k < row.size(); ++k)
            out[list.flat.fields[k].name] =
                list.flat.fields[k].text ? Json(row[k]) : Json::parse(row[k]);
        return out;
    };
    write_with_array(head, "rows", list.flat.rows, row_json, sink);
    sink.write("\n");
}

std::vector<Flat> flat_of(const List &list) { return {list.flat}; }

} // namespace vantrel::sheets
