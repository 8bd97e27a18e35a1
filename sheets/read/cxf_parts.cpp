#include "read/cxf_parts.h"

#include "read/text.h"

#include <fmt/format.h>

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
        return bool(found);
    }));
    return found;
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
    if (!out.condition &&
        contains_any_case(child(device, "DeviceFilter").child_value(), "UVEXCLUDED"))
        out.condition = 2;
    for (const char *name : {"Name", "Id"})
        if (!out.condition)
            out.condition = condition_in(attribute(stated, name));
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
