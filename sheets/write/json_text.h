// Small helpers of the JSON documents.
#pragma once

#include "judge/advice.h"
#include "judge/colour.h"
#include "judge/densitometer.h"
#include "judge/left_out.h"
#include "judge/paper.h"
#include "write/sink.h"

#include <nlohmann/json.hpp>

#include <cstddef>
#include <functional>
#include <optional>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

namespace vantrel::sheets {

using Json = nlohmann::ordered_json;

template <typename Value> Json or_null(const std::optional<Value> &value)
{
    return value ? Json(*value) : Json();
}

// An object of a row, member by member: braces would make an array of every pair first, and a
// search for its name goes through all.
struct Members {
    Json::object_t members;

    Members() { members.reserve(20); }
    void add(std::string_view name, Json value) { members.emplace_back(name, std::move(value)); }
};

struct PatchReport; // judge/report.h

Json lab_json(const CIELABCOORD &lab);

Json name_json(const PaperChoice &paper); // null where there is none

Json response_json(const std::optional<int> &response, int status); // its name

// Adds `response` and `density`.
void add_reading(Json &object, const DensityReading &reading, int status);

Json patch_json(const PatchReport &patch, int status);

// Adds `advice` and, where there is any, `advice_from`.
void add_advice(Json &object, const std::vector<SolidAdvice> &advice);

// Adds `left_out` and `kept` where the page does not hold all.
void add_left_out(Json &object, const LeftOut &left_out);

// Writes the object with one more member, an array whose elements never stand in memory together:
// each is a line.
void write_with_array(const Json &object, std::string_view name, std::size_t count,
                      const std::function<Json(std::size_t)> &element, const Sink &sink);

} // namespace vantrel::sheets
