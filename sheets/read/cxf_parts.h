// Parts of CxF3 that stand apart from the objects, and say something about them.
#pragma once

#include "read/header.h"
#include "read/xml.h"

#include <cstddef>
#include <map>
#include <optional>
#include <string>
#include <string_view>

namespace vantrel::sheets {

// How a ColorSpecification was measured, and what its colours were computed for.
struct Settings {
    Condition condition;
    std::string_view unknown; // filter or condition, where none of those known is told
    std::string setup;        // geometry and backing; without a condition the light and filter too
    std::size_t setup_number = 0;
    std::optional<double> first_nm, step_nm;
    std::string_view illuminant, observer, quantity;
};
Settings settings_in(const Node &stated);

// The tint steps of CxF/X-4 by the Id of their objects: below a SpotInkCharacterisation, what names
// a percentage and an object, as attributes or as elements. Those on black are left out.
struct TintStep {
    Node node;
    std::string_view ink, percent;
};
std::map<std::string_view, TintStep> tint_steps(const Node &custom_resources);

// The place of an object on a chart: the sample's number, or else page, row and column; empty where
// it has none.
std::string place_of(const Node &object);
std::string sample_name_of(const Node &object);

} // namespace vantrel::sheets
