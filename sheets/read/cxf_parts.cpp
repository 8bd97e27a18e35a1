#include "read/cxf_parts.h"

#include "read/text.h"

#include <fmt/format.h>

#include <algorithm>
#include <utility>
#include <vector>

namespace vantrel::sheets {
namespace {

bool contains_any_case(std::string_view text, std::string_view part)
{
    return upper(text).find(part) != std::string::npos;
}

// What visit makes of the elements below one, in their order, until it is something.
template <typename Visit> auto first_below(const Node &top, Visit visit)
{
    decltype(visit(top)) found{};
    static_cast<void>(top.find_node([&](const Node &node) {
        found = visit(node);
        return found != decltype(found){};
    }));
    return found;
}

// What tells a condition by its name, and is none that is known.
std::string_view unknown_condition_of(const Node &node)
{
    const std::string_view name = local_name(node.name());
    const bool told = name == "MeasurementCondition" || name == "MeasurementMode";
    return told && !condition_in(node.child_value()) ? trimmed(node.child_value())
                                                     : std::string_view();
}

// The names and texts of an element and those below it: "Backing White".
std::string description_of(const Node &top)
{
    std::string out;
    const auto add = [&](const Node &node) {
        if (node.type() != pugi::node_element)
            return false;
        const std::string_view text = trimmed(node.child_value());
        const bool blank = text.find_first_not_of(" \t\r\n") == std::string_view::npos;
        out += fmt::format("{}{}{}{}", out.empty() ? "" : " ", local_name(node.name()),
                           blank ? "" : " ", blank ? "" : text);
        return false;
    };
    if (top) {
        add(top);
        static_cast<void>(top.find_node(add));
    }
    return out.empty() ? out : out + "; ";
}

// The condition that one element below a ColorSpecification tells.
Condition condition_of(const Node &node)
{
    const std::string_view name = local_name(node.name());
    if (contains_any_case(name, "ILLUMINATION") || contains_any_case(name, "CONDITION") ||
        name == "MeasurementMode")
        return condition_in(node.child_value());
    if (contains_any_case(attribute(node, "Name"), "CONDITION")) {
        const std::string_view value = attribute(node, "Value");
        return condition_in(value.empty() ? node.child_value() : value);
    }
    return std::nullopt;
}

// A Tag of the object's TagCollections.
std::string_view tag_of(const Node &object, std::string_view name)
{
    for (const Node &collection : object.children())
        if (is(collection, "TagCollection"))
            for (const Node &tag : collection.children())
                if (attribute(tag, "Name") == name)
                    return trimmed(attribute(tag, "Value"));
    return {};
}

} // namespace

Settings settings_in(const Node &stated)
{
    Settings out;
    const Node measurement = child(stated, "MeasurementSpec");
    const Node range = child(measurement, "WavelengthRange");
    out.first_nm = number_in(attribute(range, "StartWL"));
    out.step_nm = number_in(attribute(range, "Increment"));
    const Node tristimulus = child(stated, "TristimulusSpec");
    out.illuminant = child(tristimulus, "Illuminant").child_value();
    out.observer = child(tristimulus, "Observer").child_value();
    out.quantity = child(measurement, "MeasurementType").child_value();
    const Node device = child(measurement, "Device");
    if (trimmed(child(device, "DevicePolarization").child_value()) == "true")
        out.condition = 3;
    else
        out.condition = first_below(stated, condition_of);
    const Node filter = child(device, "DeviceFilter");
    std::string_view of_filter = trimmed(filter.child_value());
    if (of_filter.starts_with("Filter_"))
        of_filter.remove_prefix(7);
    if (!out.condition)
        out.condition = condition_of_filter(of_filter);
    for (const char *name : {"Name", "Id"})
        if (!out.condition)
            out.condition = condition_in(attribute(stated, name));
    for (const Node &node : measurement.children())
        if (contains_any_case(local_name(node.name()), "BACKING"))
            out.setup += description_of(node);
    if (!out.condition) {
        out.unknown = of_filter.empty() ? first_below(stated, unknown_condition_of) : of_filter;
        out.setup += description_of(child(device, "DeviceIllumination")) + description_of(filter);
    }
    for (const Node &geometry : child(measurement, "GeometryChoice").children())
        out.setup += description_of(geometry);
    out.setup.resize(out.setup.size() - std::min<std::size_t>(out.setup.size(), 2));
    return out;
}

std::map<std::string_view, TintStep> tint_steps(const Node &custom_resources)
{
    struct Place {
        Node node;
        std::string_view ink;
        bool on_black;
    };
    std::map<std::string_view, TintStep> out;
    std::vector<Place> open = {{custom_resources, {}, false}};
    while (!open.empty()) {
        Place place = open.back();
        open.pop_back();
        std::string_view object, tint;
        const auto take = [&](std::string_view name, std::string_view value) {
            if (contains_any_case(name, "TINT") || contains_any_case(name, "PERCENT"))
                tint = value;
            else if (contains_any_case(name, "OBJECT") || contains_any_case(name, "REF"))
                object = value;
            else if (name == "SpotInkName")
                place.ink = value;
            else if (name == "Background")
                place.on_black = contains_any_case(value, "BLACK");
        };
        for (const auto &attribute : place.node.attributes())
            take(local_name(attribute.name()), attribute.value());
        for (const Node &below : place.node.children())
            if (below.first_child().type() == pugi::node_pcdata && !below.first_attribute())
                take(local_name(below.name()), trimmed(below.child_value()));
        if (!object.empty() && !tint.empty() && !trimmed(place.ink).empty() && !place.on_black)
            out.try_emplace(object, TintStep{place.node, trimmed(place.ink), tint});
        for (Node below = place.node.last_child(); below; below = below.previous_sibling())
            open.push_back({below, place.ink, place.on_black});
    }
    return out;
}

std::string place_of(const Node &object)
{
    if (const auto sample = tag_of(object, "SampleID"); !sample.empty())
        return std::string(sample);
    const auto page = tag_of(object, "Page"), row = tag_of(object, "Row"),
               column = tag_of(object, "Column");
    if (row.empty() || column.empty())
        return "";
    return fmt::format("{}{}row {} column {}", page.empty() ? "" : "page ",
                       page.empty() ? "" : std::string(page) + ' ', row, column);
}

std::string sample_name_of(const Node &object) { return printable(tag_of(object, "SampleName")); }

} // namespace vantrel::sheets
