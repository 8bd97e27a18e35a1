#include "boundary/calls.h"

#include "judge/names.h"
#include "read/reader.h"
#include "read/sheet.h"
#include "read/text.h"
#include "write/format.h"

#include <fmt/format.h>
#include <fmt/ranges.h>
#include <nlohmann/json.hpp>

#include <algorithm>
#include <cmath>
#include <optional>
#include <utility>

namespace vantrel::sheets {
namespace {

using Value = nlohmann::json;

[[noreturn]] void refuse(const char *name, std::string_view wanted)
{
    throw RequestError{fmt::format("the option {} takes {}", name, wanted)};
}

// Each option is asked for once by its name; null stands for none. finish() refuses what nobody
// asked for.
class Options {
public:
    explicit Options(std::string_view json) : left(Value::parse(json, nullptr, false))
    {
        if (!left.is_object())
            throw RequestError{"the options are no JSON object"};
    }

    Value take(const char *name)
    {
        const auto found = left.find(name);
        if (found == left.end())
            return {};
        Value value = std::move(*found);
        left.erase(found);
        return value;
    }

    std::string text(const char *name, const char *otherwise = "")
    {
        const Value value = take(name);
        if (value.is_null())
            return otherwise;
        if (!value.is_string())
            refuse(name, "a text");
        return value.get<std::string>();
    }

    std::string one_of(const char *name, const std::vector<std::string> &choices) // or the first
    {
        std::string value = text(name, choices.front().c_str());
        if (std::find(choices.begin(), choices.end(), value) == choices.end())
            refuse(name,
                   fmt::format("one of {}", fmt::join(choices.begin() + choices.front().empty(),
                                                      choices.end(), ", ")));
        return value;
    }

    bool flag(const char *name)
    {
        const Value value = take(name);
        if (!value.is_null() && !value.is_boolean())
            refuse(name, "true or false");
        return value == true;
    }

    template <typename Item> std::vector<Item> list(const char *name, const char *wanted)
    {
        const Value values = take(name);
        const auto fits = [](const Value &value) {
            return std::is_same_v<Item, double> ? value.is_number() : value.is_string();
        };
        if (!values.is_null() &&
            !(values.is_array() && std::all_of(values.begin(), values.end(), fits)))
            refuse(name, wanted);
        return values.is_null() ? std::vector<Item>() : values.get<std::vector<Item>>();
    }

    std::vector<std::string> texts(const char *name)
    {
        return list<std::string>(name, "a list of texts");
    }

    std::optional<double> number(const char *name)
    {
        const Value value = take(name);
        if (value.is_null())
            return std::nullopt;
        if (!value.is_number())
            refuse(name, "a number");
        return value.get<double>();
    }

    std::optional<ILLUM_OBS> illuminant(const char *name = "illuminant")
    {
        const std::string wish = text(name);
        const auto illuminant = illuminant_named(wish);
        if (!wish.empty() && !illuminant)
            refuse(name, "one of " + illuminant_names());
        return illuminant;
    }

    int status()
    {
        const auto status = status_named(text("status", "E_STATUS"));
        if (!status)
            refuse("status", "one of " + status_names());
        return *status;
    }

    void finish() const
    {
        if (!left.empty())
            throw RequestError{
                fmt::format("there is no option {} here", in_quotes(left.begin().key()))};
    }

private:
    Value left;
};

Reading reading_of(Options &options)
{
    Reading reading;
    const std::string scale = options.one_of("scale", {"auto", "percent", "fraction"});
    if (scale != "auto")
        reading.scale = scale == "percent" ? Scale::percent : Scale::fraction;
    reading.condition = options.one_of("condition", {"", "M0", "M1", "M2", "M3"});
    reading.colours = true;
    return reading;
}

// Reads under a name; every complaint begins with it.
template <typename Read> Measurement named(std::string_view name, const Read &read)
{
    const std::string file = printable(name);
    try {
        Measurement sheet = read();
        sheet.file = file;
        return sheet;
    } catch (const InputError &error) {
        throw RequestError{complaint_of(file, error)};
    }
}

void require_spectra(const Measurement &sheet)
{
    if (sheet.kind == Kind::colours)
        throw RequestError{sheet.file + ": colours alone, no spectra"};
}

std::vector<Metric> chosen_metrics(Options &options)
{
    std::vector<std::string> formulas = options.texts("formula");
    if (formulas.empty())
        formulas = {"de2000"};
    std::vector<Metric> metrics = metrics_of(formulas);
    const Value weights = options.take("weights");
    const char *wanted = "an object with two numbers for a formula";
    if (!weights.is_null() && !weights.is_object())
        refuse("weights", wanted);
    for (const auto &[formula, pair] : weights.items()) {
        if (!pair.is_array() || pair.size() != 2 || !pair[0].is_number() || !pair[1].is_number())
            refuse("weights", wanted);
        weigh(metrics, formula, pair[0].get<double>(), pair[1].get<double>());
    }
    return metrics;
}

PairingRequest pairing_of(Options &options)
{
    std::vector<std::string> names;
    for (const Pairing pairing : kPairings)
        names.emplace_back(name_of(pairing));
    const std::string name = options.one_of("pair", names);
    const Pairing by = kPairings[static_cast<std::size_t>(
        std::find(names.begin(), names.end(), name) - names.begin())];
    const PairingRequest out{.by = by,
                             .force = options.flag("force_pairs"),
                             .each = options.one_of("repeats", {"mean", "each"}) == "each"};
    if (out.force && by == Pairing::automatic)
        throw RequestError{"the option force_pairs goes with a key that the option pair names"};
    return out;
}

std::optional<double> tolerance_of(Options &options)
{
    const auto tolerance = options.number("tolerance");
    if (tolerance && !(*tolerance >= 0 && std::isfinite(*tolerance)))
        refuse("tolerance", "a number from 0 up");
    return tolerance;
}

// TOML text, and a name for limits that have none of their own.
Tolerances tolerances_of(Options &options)
{
    const std::string text = options.text("tolerances");
    const std::string name = printable(options.text("tolerances_name", "tolerances"));
    if (text.empty())
        return {};
    try {
        Tolerances tolerances = read_tolerances(text);
        if (tolerances.name.empty())
            tolerances.name = name;
        return tolerances;
    } catch (const InputError &error) {
        throw RequestError{complaint_of(name, error)};
    }
}

std::vector<InkTint> ink_tints(Options &options)
{
    std::vector<InkTint> out;
    const Value tints = options.take("ink");
    const char *wanted = "a list of pairs of a name and a whole percentage from 0 to 100";
    if (!tints.is_null() && !tints.is_array())
        refuse("ink", wanted);
    for (const Value &tint : tints) {
        if (!tint.is_array() || tint.size() != 2 || !tint[0].is_string() || !tint[1].is_number())
            refuse("ink", wanted);
        const auto percent = tint[1].get<double>();
        if (!(percent >= 0 && percent <= 100) || percent != std::floor(percent))
            refuse("ink", wanted);
        out.push_back({tint[0].get<std::string>(), static_cast<int>(percent)});
    }
    return out;
}

// The device values of each patch: lists of numbers, null for none, by field.
void add_device_values(std::vector<Patch> &patches, const Value &device)
{
    const char *wanted = "lists of percentages or null by field, one for each patch";
    if (!device.is_null() && !device.is_object())
        refuse("device", wanted);
    for (const auto &[field, values] : device.items()) {
        if (!values.is_array() || values.size() != patches.size())
            refuse("device", wanted);
        for (std::size_t i = 0; i < patches.size(); ++i) {
            if (!values[i].is_null() && !values[i].is_number())
                refuse("device", wanted);
            if (values[i].is_number())
                patches[i].device.emplace_back(printable(field), values[i].get<double>());
        }
    }
}

template <typename Result>
std::string written(Result result, const std::string &format, const Tell &tell = {})
{
    if (format == "html" || format == "page")
        choose_for_page(result);
    std::string out;
    write_as(format == "page" ? "json" : format, result,
             {[&](std::string_view text) { out += text; }, tell});
    return out;
}

std::string format_of(Options &options)
{
    return options.one_of("format", {"json", "page", "html", "csv", "cgats", "table"});
}

} // namespace

Measurement open_file(std::string_view file, std::string_view bytes, std::string_view options,
                      const Tell &tell)
{
    Options given(options);
    Reading reading = reading_of(given);
    reading.tell = tell;
    given.finish();
    return named(file, [&] { return read_measurement(bytes, reading); });
}

Measurement open_spectra(std::string_view file, const Rows &rows, std::string_view options)
{
    Options given(options);
    const Reading reading = reading_of(given);
    auto wavelengths = given.list<double>("wavelengths", "a list of numbers");
    const Value device = given.take("device");
    given.finish();
    if (wavelengths.empty() && rows.bands == VANTREL_BANDS)
        for (int band = 0; band < VANTREL_BANDS; ++band)
            wavelengths.push_back(400 + 10 * band);
    if (wavelengths.size() != rows.bands)
        throw RequestError{
            fmt::format("{} wavelengths for spectra of {} values", wavelengths.size(), rows.bands)};
    return named(file, [&] {
        Sheet sheet(reading);
        const Bands &bands = sheet.bands_at(wavelengths, 0);
        std::vector<Patch> patches(rows.patches);
        add_device_values(patches, device);
        for (std::size_t i = 0; i < rows.patches; ++i) {
            const double *row = rows.values + i * rows.bands;
            if (!rows.names.empty())
                patches[i].name = printable(rows.names[i]);
            for (std::size_t band = 0; band < rows.bands; ++band)
                if (!(std::abs(row[band]) <= kLargest))
                    throw InputError{
                        0, fmt::format("patch {}: {} is no reflectance", i + 1, row[band])};
            patches[i].refl = bands.of({row, row + rows.bands});
            sheet.add(std::move(patches[i]), {}, 0);
        }
        return sheet.measurement();
    });
}

std::string about(const Measurement &sheet)
{
    std::vector<std::string> warnings;
    for (const std::string &warning : sheet.warnings) // LINE: and what there is to say
        warnings.push_back(warning.substr(warning.find_first_not_of(' ')));
    const nlohmann::ordered_json out = {
        {"file", sheet.file}, {"patches", sheet.patches.size()}, {"warnings", warnings}};
    return out.dump();
}

std::string report(const std::vector<const Measurement *> &sheets, const Measurement *second_sheet,
                   std::string_view options, const Tell &tell, const Measurement *aims)
{
    Options given(options);
    const ReportRequest request{
        .illuminant = given.illuminant(),
        .status = given.status(),
        .paper = given.text("paper"),
        .n_factor = given.number("n_factor").value_or(1),
        .order = given.texts("order"),
        .second_paper = given.text("second_paper"),
        .second_sheet = second_sheet,
        .second_illuminant = given.illuminant("second_illuminant"),
        .aims = aims,
        .tell = tell,
    };
    const std::string format = format_of(given);
    given.finish();
    if (!(request.n_factor > 0) || !std::isfinite(request.n_factor))
        refuse("n_factor", "a number above 0");
    if (sheets.empty())
        throw RequestError{"there is no sheet"};
    std::vector<Report> reports;
    for (const Measurement *sheet : sheets)
        reports.push_back(report_of(*sheet, request));
    return written(std::move(reports), format, tell);
}

std::string compare(const Measurement &reference, const Measurement &sample,
                    std::string_view options, const Tell &tell)
{
    Options given(options);
    const CompareRequest request{
        .pairing = pairing_of(given),
        .allow_missing = given.flag("allow_missing"),
        .metrics = chosen_metrics(given),
        .illuminant = given.illuminant(),
        .second_illuminant = given.illuminant("second_illuminant"),
        .status = given.status(),
        .words_of_hue = given.one_of("words", {"ab", "hue"}) == "hue",
        .tolerance = tolerance_of(given),
        .tolerances = tolerances_of(given),
        .substrate_corrected = given.flag("substrate_corrected"),
        .advice = given.flag("advice"),
        .paper = given.text("paper"),
        .tell = tell,
    };
    const std::string format = format_of(given);
    given.finish();
    return written(compare(reference, sample, request), format, tell);
}

std::string run(const std::vector<const Measurement *> &sheets, const Measurement &aims,
                std::string_view options)
{
    Options given(options);
    const RunRequest request{
        .illuminant = given.illuminant(),
        .status = given.status(),
        .paper = given.text("paper"),
        .order = given.texts("order"),
        .tolerances = tolerances_of(given),
    };
    const std::vector<std::string> unread = given.texts("unread");
    const std::string format = format_of(given);
    given.finish();
    RunJudge judge(aims, request);
    for (const Measurement *sheet : sheets) {
        try {
            require_spectra(*sheet);
            judge.add(*sheet);
        } catch (const RequestError &error) {
            judge.add_unread(error.message);
        }
    }
    for (const std::string &reason : unread)
        judge.add_unread(printable(reason));
    return written(judge.result(), format);
}

std::string predict(const Measurement &sheet, std::string_view options)
{
    Options given(options);
    const PredictRequest request{
        .illuminant = given.illuminant(),
        .status = given.status(),
        .paper = given.text("paper"),
        .order = given.texts("order"),
        .inks = ink_tints(given),
    };
    const std::string format = format_of(given);
    given.finish();
    require_spectra(sheet);
    return written(predict(sheet, request), format);
}

std::string ink(const Measurement &sheet, std::string_view options)
{
    Options given(options);
    const InkRequest request{
        .patch = given.text("patch"),
        .against = given.text("against"),
        .illuminant = given.illuminant(),
        .status = given.status(),
        .paper = given.text("paper"),
        .order = given.texts("order"),
    };
    const std::string format = format_of(given);
    given.finish();
    require_spectra(sheet);
    return written(study_of(sheet, request), format);
}

} // namespace vantrel::sheets
