#include "read/cxf.h"

#include "read/cxf_parts.h"
#include "read/text.h"

#include <fmt/format.h>

#include <algorithm>
#include <array>
#include <cmath>
#include <map>
#include <utility>

namespace vantrel::sheets {
namespace {

using Devices = std::vector<std::pair<std::string, double>>;

constexpr std::ptrdiff_t kMostSigns = 32'000'000; // bounds the memory that the parsed text takes

class CxfReader {
public:
    CxfReader(std::string_view text, Sheet &sheet) : text(text), sheet(sheet) {}
    void read();

private:
    std::size_t line_at(std::size_t offset);
    std::size_t line_of(const Node &node)
    {
        return line_at(static_cast<std::size_t>(std::max<std::ptrdiff_t>(node.offset_debug(), 0)));
    }
    double number(const Node &node, std::string_view value);
    void read_about(const Node &root);
    void read_target(const Node &object);
    void read_object(const Node &object);
    void name(Patch &patch, const Node &object);
    Devices device_values(const Node &object);
    std::vector<double> wavelengths(const Node &spectrum, const Settings &settings,
                                    std::size_t count);
    void read_spectrum(const Node &spectrum, const Settings &settings, Patch &patch);
    std::array<double, 3> coordinates(const Node &colour, const std::array<const char *, 3> &names);
    bool is_of_other_illuminant(const Settings &settings);
    std::optional<CIELABCOORD> read_colour(const Node &colour);
    std::vector<Node> objects(const Node &collection) const;

    const Settings &settings_of(const Node &values)
    {
        return all_settings[attribute(values, "ColorSpecification")];
    }

    // What a place on the printed chart was asked to be.
    struct Target {
        std::string name;
        Devices device;
        bool used = false;
    };

    std::string_view text;
    Sheet &sheet;
    pugi::xml_document document;
    std::map<std::string_view, Settings> all_settings;  // by Id
    std::map<std::string_view, TintStep> tints;         // by the object's Id
    std::map<std::string, Target> targets;              // by place
    using Measured = std::pair<Condition, std::size_t>; // setup
    std::vector<std::pair<Patch, Measured>> colours;    // of objects with no spectrum
    std::map<Measured, std::string_view> preferred;     // ColorSpecification of several
    bool step_missing = false, start_told_twice = false;
    // by first wavelength and step, spectra and the line of the first of each number of values
    std::map<std::pair<double, double>, std::map<std::size_t, std::pair<std::size_t, std::size_t>>>
        lengths;
    std::size_t without = 0;      // objects with no spectrum
    std::size_t repeated = 0;     // spectra of an object under a condition that it has already
    std::string_view repeated_of; // ColorSpecification that is read instead of the first
    std::optional<std::pair<std::string_view, std::string_view>>
        first_stated;                   // illuminant, observer
    std::size_t of_others = 0;          // colours for others than these
    std::vector<std::size_t> line_ends; // once a line is asked for
};

std::size_t CxfReader::line_at(std::size_t offset)
{
    if (line_ends.empty()) {
        for (std::size_t i = 0; i < text.size(); ++i)
            if (text[i] == '\n')
                line_ends.push_back(i);
        line_ends.push_back(text.size());
    }
    const auto end = std::lower_bound(line_ends.begin(), line_ends.end(), offset);
    return static_cast<std::size_t>(end - line_ends.begin()) + 1;
}

double CxfReader::number(const Node &node, std::string_view value)
{
    const auto number = number_in(value);
    if (!number)
        throw InputError{line_of(node), fmt::format("{} holds {}, not a number",
                                                    in_quotes(local_name(node.name())),
                                                    in_quotes(trimmed(value)))};
    return *number;
}

// The first colour of DeviceColorValues that consists of inks, or else of red, green and blue.
Devices CxfReader::device_values(const Node &object)
{
    constexpr std::pair<std::string_view, const char *> process[] = {
        {"Cyan", "CMYK_C"},  {"Magenta", "CMYK_M"}, {"Yellow", "CMYK_Y"},
        {"Black", "CMYK_K"}, {"Orange", "ORANGE"},  {"Green", "GREEN"}};
    Devices inks, rgb;
    for (const Node &colour : child(object, "DeviceColorValues").children()) {
        for (const Node &part : colour.children()) {
            const std::string_view name = local_name(part.name());
            const auto *const ink =
                std::find_if(std::begin(process), std::end(process),
                             [&](const auto &row) { return row.first == name; });
            if (ink != std::end(process)) {
                inks.emplace_back(ink->second, number(part, part.child_value()));
            } else if (name == "SpotColor") {
                const Node spot = child(part, "Name"), percent = child(part, "Percentage");
                const std::string_view called =
                    spot ? std::string_view(spot.child_value()) : attribute(part, "Name");
                inks.emplace_back(
                    ink_name(trimmed(called)),
                    number(part, percent ? percent.child_value() : attribute(part, "Percentage")));
            } else if (is(colour, "ColorRGB") && (name == "R" || name == "G" || name == "B")) {
                rgb.emplace_back(fmt::format("RGB_{}", name), number(part, part.child_value()));
            }
        }
        if (!inks.empty())
            return inks;
    }
    if (rgb.empty())
        if (const auto tint = tints.find(attribute(object, "Id")); tint != tints.end())
            return {{ink_name(tint->second.ink), number(tint->second.node, tint->second.percent)}};
    return rgb;
}

std::vector<double> CxfReader::wavelengths(const Node &spectrum, const Settings &settings,
                                           std::size_t count)
{
    const std::string_view stated = attribute(spectrum, "StartWL");
    const auto first = stated.empty() ? settings.first_nm : std::optional(number(spectrum, stated));
    if (first && settings.first_nm && *first != *settings.first_nm &&
        !std::exchange(start_told_twice, true))
        sheet.warn(line_of(spectrum),
                   fmt::format("StartWL is {:g}, and {:g} in its ColorSpecification: {:g} is taken",
                               *first, *settings.first_nm, *first));
    const std::string_view own_step = attribute(spectrum, "Increment");
    auto step = own_step.empty() ? settings.step_nm : std::optional(number(spectrum, own_step));
    const double last = first.value_or(0) + 10 * static_cast<double>(count - 1);
    if (first && !step && last >= 700 && last <= 830) {
        step = 10;
        if (!std::exchange(step_missing, true))
            sheet.warn(line_of(spectrum),
                       "no Increment of the wavelengths is stated, 10 nm is taken");
    }
    if (!first || !step || !(*first >= 100 && *first <= 5000 && *step > 0))
        throw InputError{line_of(spectrum),
                         fmt::format("ColorSpecification {} gives this spectrum no StartWL and "
                                     "Increment of its wavelengths",
                                     in_quotes(attribute(spectrum, "ColorSpecification")))};
    auto &[spectra, line] = lengths[{*first, *step}][count];
    line = spectra++ ? line : line_of(spectrum);
    std::vector<double> nm(count);
    for (std::size_t i = 0; i < count; ++i)
        nm[i] = *first + *step * static_cast<double>(i);
    return nm;
}

void CxfReader::read_spectrum(const Node &spectrum, const Settings &settings, Patch &patch)
{
    std::vector<double> values;
    const std::string content = text_of(spectrum);
    std::string_view rest = content;
    constexpr const char *blanks = " \t\r\n";
    for (auto begin = rest.find_first_not_of(blanks); begin != std::string_view::npos;
         begin = rest.find_first_not_of(blanks)) {
        rest.remove_prefix(begin);
        const std::string_view value = rest.substr(0, rest.find_first_of(blanks));
        values.push_back(number(spectrum, value));
        rest.remove_prefix(value.size());
    }
    if (values.empty())
        throw InputError{line_of(spectrum), "a ReflectanceSpectrum without values"};
    patch.refl = sheet.bands_at(wavelengths(spectrum, settings, values.size()), line_of(spectrum))
                     .of(values);
}

std::array<double, 3> CxfReader::coordinates(const Node &colour,
                                             const std::array<const char *, 3> &names)
{
    std::array<double, 3> out{};
    for (std::size_t i = 0; i < 3; ++i) {
        const Node node = child(colour, names[i]);
        out[i] = number(node ? node : colour, node.child_value());
        if (std::abs(out[i]) > kLargest)
            throw InputError{line_of(colour), "a colour is too large"};
    }
    return out;
}

// Colours of a second illuminant or observer are counted and left out.
bool CxfReader::is_of_other_illuminant(const Settings &settings)
{
    if (settings.illuminant.empty() && settings.observer.empty())
        return false;
    const std::pair stated{settings.illuminant, settings.observer};
    if (!first_stated) {
        first_stated = stated;
        sheet.header.take("ILLUMINANT", settings.illuminant);
        sheet.header.take("OBSERVER", settings.observer);
    }
    if (*first_stated == stated)
        return false;
    ++of_others;
    return true;
}

// L*a*b*, or X, Y and Z under the illuminant that the file states, or else D50 and 2 degrees.
std::optional<CIELABCOORD> CxfReader::read_colour(const Node &colour)
{
    const bool xyz = is(colour, "ColorCIEXYZ");
    if ((!xyz && !is(colour, "ColorCIELab")) || is_of_other_illuminant(settings_of(colour)))
        return std::nullopt;
    std::array<double, 3> out =
        xyz ? coordinates(colour, {"X", "Y", "Z"}) : coordinates(colour, {"L", "A", "B"});
    if (xyz) {
        const std::array<double, 3> values = out;
        XYZToCIELab(values.data(), sheet.header.colours().illuminant.value_or(D50_2DEG),
                    out.data());
    } else
        sheet.colour_space = "L*a*b*";
    return CIELABCOORD{out[0], out[1], out[2]};
}

void CxfReader::read_target(const Node &object)
{
    const std::string place = place_of(object);
    if (!place.empty() && !child(object, "ColorValues"))
        if (Devices device = device_values(object); !device.empty())
            targets.try_emplace(place, Target{sample_name_of(object), std::move(device), false});
}

// By the object itself; an object whose name only counts those of its type ("M0_Measurement7") is
// named by its place on the chart.
void CxfReader::name(Patch &patch, const Node &object)
{
    patch.id = printable(trimmed(attribute(object, "Id")));
    patch.name = printable(trimmed(attribute(object, "Name")));
    patch.device = device_values(object);
    const std::string place = place_of(object);
    const auto target = targets.find(place);
    if (target != targets.end())
        target->second.used = true;
    if (target != targets.end() && patch.device.empty())
        patch.device = target->second.device;
    const std::string_view type = attribute(object, "ObjectType");
    if (!place.empty() && !type.empty() && attribute(object, "Name").starts_with(type)) {
        patch.id = printable(place);
        patch.name = sample_name_of(object);
        if (patch.name.empty() && target != targets.end())
            patch.name = target->second.name;
    }
}

void CxfReader::read_object(const Node &object)
{
    const Node values = child(object, "ColorValues");
    if (!values && targets.contains(place_of(object)))
        return;
    Patch patch;
    name(patch, object);

    // the object's own colours, one for a condition and setup
    struct Own {
        CIELABCOORD lab;
        Measured measured;
    };
    std::vector<Own> own;
    for (const Node &node : values.children())
        if (const auto lab = read_colour(node)) {
            const Settings &settings = settings_of(node);
            const Measured measured{settings.condition, settings.setup_number};
            if (std::none_of(own.begin(), own.end(),
                             [&](const Own &other) { return other.measured == measured; }))
                own.push_back({*lab, measured});
        }
    const auto own_of = [&](const Measured &measured) -> std::optional<CIELABCOORD> {
        const auto [condition, setup] = measured;
        for (const Own &colour : own)
            if ((colour.measured.first == condition || !colour.measured.first) &&
                (colour.measured.second == setup || colour.measured.second == 0))
                return colour.lab;
        return std::nullopt;
    };

    std::vector<std::pair<Measured, Node>> spectra;
    for (const Node &node : values.children()) {
        if (!is(node, "ReflectanceSpectrum") && !is(node, "TransmittanceSpectrum"))
            continue;
        const Settings &settings = settings_of(node);
        const Measured measured{settings.condition ? settings.condition
                                                   : condition_in(attribute(node, "Name")),
                                settings.setup_number};
        const auto same = std::find_if(spectra.begin(), spectra.end(),
                                       [&](const auto &it) { return it.first == measured; });
        if (same == spectra.end()) {
            spectra.emplace_back(measured, node);
            continue;
        }
        const auto before =
            preferred.try_emplace(measured, attribute(same->second, "ColorSpecification")).first;
        if (attribute(node, "ColorSpecification") == before->second)
            same->second = node;
        repeated_of = repeated++ ? repeated_of : before->second;
    }
    for (const auto &[measured, spectrum] : spectra) {
        const Settings &settings = settings_of(spectrum);
        if (is(spectrum, "TransmittanceSpectrum") ||
            settings.quantity.find("Transmi") != std::string_view::npos)
            sheet.kind = Kind::transmission;
        if (const std::string quantity = upper(settings.quantity);
            contains(quantity, "EMISS") || contains(quantity, "RADIAN"))
            throw InputError{line_of(spectrum), fmt::format("light ({}), not reflectances",
                                                            in_quotes(settings.quantity))};
        read_spectrum(spectrum, settings, patch);
        patch.lab = own_of(measured);
        sheet.add(patch, measured.first, line_of(spectrum), measured.second);
    }
    if (!spectra.empty())
        return;
    ++without;
    patch.line = line_of(object);
    for (const auto &[lab, measured] : own) {
        patch.lab = lab;
        colours.emplace_back(patch, measured);
    }
}

// Charts are measured in an order of their own; where all places have numbers the objects stand by
// these, as in other files of the same chart.
std::vector<Node> CxfReader::objects(const Node &collection) const
{
    std::vector<Node> out;
    std::vector<std::pair<double, std::size_t>> order;
    for (const Node &object : collection.children())
        if (is(object, "Object")) {
            const auto number = number_in(place_of(object));
            if (number)
                order.emplace_back(*number, out.size());
            out.push_back(object);
        }
    if (order.size() != out.size())
        return out;
    std::sort(order.begin(), order.end());
    std::vector<Node> sorted;
    for (const auto &[number, place] : order)
        sorted.push_back(out[place]);
    return sorted;
}

void CxfReader::read_about(const Node &root)
{
    for (const Node &node : child(root, "FileInformation").children())
        sheet.header.take(local_name(node.name()), node.child_value());
    for (const Node &node :
         child(child(root, "Resources"), "ColorSpecificationCollection").children()) {
        Settings settings = settings_in(node);
        settings.setup_number = sheet.setup_number(settings.setup);
        if (!settings.unknown.empty())
            sheet.header.condition_told(settings.unknown);
        all_settings.try_emplace(attribute(node, "Id"), std::move(settings));
        const Node device = child(child(node, "MeasurementSpec"), "Device");
        sheet.header.take("INSTRUMENT", child(device, "Model").child_value());
    }
    sheet.header.condition.reset(); // each spectrum has its own
}

void CxfReader::read()
{
    if (std::count_if(text.begin(), text.end(), [](char c) { return c == '<' || c == '='; }) >
        kMostSigns)
        throw InputError{0, "more elements than a sheet can have"};
    const auto parsed =
        document.load_buffer(text.data(), text.size(), pugi::parse_default, pugi::encoding_utf8);
    if (!parsed)
        throw InputError{line_at(static_cast<std::size_t>(parsed.offset)),
                         fmt::format("not well-formed XML: {}", parsed.description())};
    const Node root = document.document_element();
    const Node resources = child(root, "Resources");
    if (!is(root, "CxF") || !resources)
        throw InputError{line_of(root),
                         fmt::format("not CxF3: {} has no Resources", in_quotes(root.name()))};
    read_about(root);
    tints = tint_steps(child(root, "CustomResources"));

    std::vector<Node> all;
    for (const Node &collection : resources.children())
        if (is(collection, "ObjectCollection")) {
            const std::vector<Node> more = objects(collection);
            all.insert(all.end(), more.begin(), more.end());
        }
    for (const Node &object : all)
        read_target(object);
    const Work work{sheet.tell(), "Reading", all.size()};
    for (std::size_t i = 0; i < all.size(); ++i) {
        read_object(all[i]);
        work.done(i);
    }
    work.left(0);
    if (without > 0 && !sheet.patches.empty())
        sheet.warn(0, fmt::format("objects without a reflectance spectrum: {}", without));
    if (sheet.patches.empty() && !colours.empty()) {
        sheet.kind = Kind::colours;
        for (auto &[patch, measured] : colours) {
            const std::size_t at = patch.line;
            sheet.add(std::move(patch), measured.first, at, measured.second);
        }
    }
    for (const auto &[range, counts] : lengths) {
        const auto usual =
            std::max_element(counts.begin(), counts.end(), [](const auto &a, const auto &b) {
                return a.second.first < b.second.first;
            });
        for (const auto &[count, spectra] : counts)
            if (2 * spectra.first <= usual->second.first)
                sheet.warn(
                    spectra.second,
                    fmt::format("a spectrum of {} values{}, most from {:g} nm on have {}: is "
                                "one lost, and are the others shifted?",
                                count, and_more(spectra.first), range.first, usual->first));
    }
    const auto unused = std::count_if(targets.begin(), targets.end(),
                                      [](const auto &row) { return !row.second.used; });
    if (unused > 0)
        sheet.warn(0, fmt::format("target objects without a measurement: {}", unused));
    sheet.collection = std::all_of(sheet.patches.begin(), sheet.patches.end(),
                                   [](const Patch &patch) { return patch.device.empty(); });
    if (of_others > 0)
        sheet.warn(0,
                   fmt::format("colours for another illuminant or observer than {}, left out: {}",
                               in_quotes(sheet.header.colours().stated), of_others));
    if (repeated > 0)
        sheet.warn(0, fmt::format("further spectra of an object under the same condition, left "
                                  "out: {}; ColorSpecification {} is read",
                                  repeated, in_quotes(repeated_of)));
}

} // namespace

void read_cxf(std::string_view text, Sheet &sheet)
{
    sheet.fractions = true;
    sheet.colour_space = "XYZ"; // until there is any L*a*b*
    CxfReader(text, sheet).read();
}

} // namespace vantrel::sheets
