#include "read/cxf.h"

#include "read/text.h"

#include <fmt/format.h>
#include <pugixml.hpp>

#include <algorithm>
#include <cstring>
#include <map>
#include <utility>

namespace vantrel::sheets {
namespace {

using Node = pugi::xml_node;
using Devices = std::vector<std::pair<std::string, double>>;

constexpr std::ptrdiff_t kMostSigns = 16'000'000; // bounds the memory that the parsed text takes
constexpr std::size_t kLongestInkName = 80;

// The name behind a prefix of a namespace, which each program chooses for itself.
std::string_view local_name(const char *name)
{
    const char *colon = std::strchr(name, ':');
    return colon ? colon + 1 : name;
}

bool is(const Node &node, std::string_view name) { return local_name(node.name()) == name; }

Node child(const Node &parent, std::string_view name)
{
    return parent.find_child([&](const Node &node) { return is(node, name); });
}

std::string_view attribute(const Node &node, const char *name)
{
    return node.attribute(name).value();
}

// All text of an element; a comment may divide it.
std::string text_of(const Node &node)
{
    std::string out;
    for (const Node &part : node.children())
        if (part.type() == pugi::node_pcdata || part.type() == pugi::node_cdata)
            out += part.value();
    return out;
}

// What visit makes of the elements below one, in their order, until it is something.
template <typename Visit> auto first_below(const Node &top, Visit visit)
{
    decltype(visit(top)) found{};
    static_cast<void>(top.find_node([&](const Node &node) {
        found = visit(node);
        return bool(found);
    }));
    return found;
}

bool contains(std::string_view text, std::string_view part)
{
    return upper(text).find(part) != std::string::npos;
}

// How a ColorSpecification was measured.
struct Settings {
    Condition condition;
    std::optional<double> first_nm, step_nm;
};

// The condition that one element below a ColorSpecification tells.
Condition condition_of(const Node &node)
{
    const std::string_view name = local_name(node.name());
    if (contains(name, "ILLUMINATION") || contains(name, "CONDITION") || name == "MeasurementMode")
        return condition_in(node.child_value());
    if (contains(attribute(node, "Name"), "CONDITION")) {
        const std::string_view value = attribute(node, "Value");
        return condition_in(value.empty() ? node.child_value() : value);
    }
    return std::nullopt;
}

Settings settings_of(const Node &node)
{
    Settings out;
    const Node measurement = child(node, "MeasurementSpec");
    const Node range = child(measurement, "WavelengthRange");
    out.first_nm = number_in(attribute(range, "StartWL"));
    out.step_nm = number_in(attribute(range, "Increment"));
    const Node device = child(measurement, "Device");
    if (trimmed(child(device, "DevicePolarization").child_value()) == "true")
        out.condition = 3;
    else
        out.condition = first_below(node, condition_of);
    if (!out.condition && contains(child(device, "DeviceFilter").child_value(), "UVEXCLUDED"))
        out.condition = 2;
    for (const char *name : {"Name", "Id"})
        if (!out.condition)
            out.condition = condition_in(attribute(node, name));
    return out;
}

class Reader {
public:
    Reader(std::string_view text, Sheet &sheet) : text(text), sheet(sheet) {}
    void read();

private:
    std::size_t line_at(std::size_t offset);
    std::size_t line_of(const Node &node)
    {
        return line_at(static_cast<std::size_t>(std::max<std::ptrdiff_t>(node.offset_debug(), 0)));
    }
    double number(const Node &node, std::string_view value);
    void read_tints(const Node &custom);
    void read_object(const Node &object);
    Devices device_values(const Node &object);
    std::vector<double> wavelengths(const Node &spectrum, const Settings &settings,
                                    std::size_t count);
    Condition read_spectrum(const Node &spectrum, Patch &patch);

    std::string_view text;
    Sheet &sheet;
    pugi::xml_document document;
    std::map<std::string_view, Settings> all_settings;                // by Id
    std::map<std::string_view, std::pair<std::string, double>> tints; // by the object's Id
    bool step_missing = false;
    std::size_t without = 0;           // objects with no spectrum
    std::size_t repeated = 0;          // spectra of an object under a condition that it has already
    std::size_t counted = 0, line = 1; // how far the lines are counted
};

// Elements are read in their order, but for a few jumps back; so the lines are counted once.
std::size_t Reader::line_at(std::size_t offset)
{
    offset = std::min(offset, text.size());
    if (offset < counted) {
        counted = 0;
        line = 1;
    }
    const std::string_view passed = text.substr(counted, offset - counted);
    line += static_cast<std::size_t>(std::count(passed.begin(), passed.end(), '\n'));
    counted = offset;
    return line;
}

double Reader::number(const Node &node, std::string_view value)
{
    const auto number = number_in(value);
    if (!number)
        throw InputError{line_of(node), fmt::format("{} holds {}, not a number",
                                                    in_quotes(local_name(node.name())),
                                                    in_quotes(trimmed(value)))};
    return *number;
}

// The tint steps of CxF/X-4: below a SpotInkCharacterisation, what names a percentage and an
// object.
void Reader::read_tints(const Node &custom)
{
    constexpr int farthest = 4; // elements between a measurement and the name of its ink
    first_below(custom, [&](const Node &node) {
        std::string_view object, tint;
        for (const auto &attribute : node.attributes()) {
            const std::string_view name = local_name(attribute.name());
            if (contains(name, "TINT") || contains(name, "PERCENT"))
                tint = attribute.value();
            else if (contains(name, "OBJECT") || contains(name, "REF"))
                object = attribute.value();
        }
        if (object.empty() || tint.empty())
            return false;
        std::string_view ink;
        Node above = node;
        for (int i = 0; i < farthest && above && ink.empty(); ++i, above = above.parent()) {
            if (contains(attribute(above, "Background"), "BLACK"))
                return false; // is no tint on paper
            ink = attribute(above, "SpotInkName");
            if (ink.empty())
                ink = child(above, "SpotInkName").child_value();
        }
        if (!trimmed(ink).empty())
            tints.try_emplace(object, cut(printable(trimmed(ink)), kLongestInkName),
                              number(node, tint));
        return false;
    });
}

// The first colour of DeviceColorValues that consists of inks, or else of red, green and blue.
Devices Reader::device_values(const Node &object)
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
                    cut(printable(trimmed(called)), kLongestInkName),
                    number(part, percent ? percent.child_value() : attribute(part, "Percentage")));
            } else if (is(colour, "ColorRGB") && name.size() == 1 && contains("RGB", name)) {
                rgb.emplace_back(fmt::format("RGB_{}", name), number(part, part.child_value()));
            }
        }
        if (!inks.empty())
            return inks;
    }
    if (rgb.empty())
        if (const auto tint = tints.find(attribute(object, "Id")); tint != tints.end())
            return {tint->second};
    return rgb;
}

std::vector<double> Reader::wavelengths(const Node &spectrum, const Settings &settings,
                                        std::size_t count)
{
    const std::string_view stated = attribute(spectrum, "StartWL");
    const auto first = stated.empty() ? settings.first_nm : std::optional(number(spectrum, stated));
    auto step = settings.step_nm;
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
    std::vector<double> nm(count);
    for (std::size_t i = 0; i < count; ++i)
        nm[i] = *first + *step * static_cast<double>(i);
    return nm;
}

Condition Reader::read_spectrum(const Node &spectrum, Patch &patch)
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
    const Settings &settings = all_settings[attribute(spectrum, "ColorSpecification")];
    patch.refl = sheet.bands_at(wavelengths(spectrum, settings, values.size()), line_of(spectrum))
                     .of(values);
    return settings.condition ? settings.condition : condition_in(attribute(spectrum, "Name"));
}

void Reader::read_object(const Node &object)
{
    Patch patch{.id = printable(trimmed(attribute(object, "Id"))),
                .name = printable(trimmed(attribute(object, "Name"))),
                .refl = {},
                .device = device_values(object),
                .lab = {},
                .line = 0};
    sheet.named = sheet.named || !patch.id.empty() || !patch.name.empty();
    if (patch.id.empty())
        patch.id = std::to_string(sheet.patches.size() + 1);
    if (patch.name.empty())
        patch.name = patch.id;
    std::vector<Condition> seen;
    for (const Node &spectrum : child(object, "ColorValues").children()) {
        if (!is(spectrum, "ReflectanceSpectrum"))
            continue;
        const Condition condition = read_spectrum(spectrum, patch);
        if (std::find(seen.begin(), seen.end(), condition) != seen.end()) {
            ++repeated;
            continue;
        }
        seen.push_back(condition);
        sheet.add(patch, condition, line_of(spectrum));
    }
    without += seen.empty();
}

void Reader::read()
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
    for (const Node &node : child(resources, "ColorSpecificationCollection").children())
        all_settings.try_emplace(attribute(node, "Id"), settings_of(node));
    read_tints(child(root, "CustomResources"));

    const Work work{sheet.tell(), "Reading", text.size()};
    for (const Node &object : child(resources, "ObjectCollection").children())
        if (is(object, "Object")) {
            read_object(object);
            work.done(counted);
        }
    work.left(0);
    if (without > 0 && !sheet.patches.empty())
        sheet.warn(0, fmt::format("objects without a reflectance spectrum: {}", without));
    if (repeated > 0)
        sheet.warn(
            0, fmt::format("further spectra of an object under the same condition, left out: {}",
                           repeated));
}

} // namespace

void read_cxf(std::string_view text, Sheet &sheet)
{
    sheet.largest_fraction = 3; // reflectances are fractions there, below 3
    Reader(text, sheet).read();
}

} // namespace vantrel::sheets
