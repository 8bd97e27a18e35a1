// Small helpers of the JSON documents.
#pragma once

#include "judge/advice.h"
#include "judge/colour.h"
#include "judge/densitometer.h"
#include "judge/left_out.h"
#include "judge/paper.h"
#include "write/sink.h"

#include <nlohmann/json.hpp>

#include <array>
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

// An object on one line, its text as Json::dump() writes it: a tree of values for each of a million
// patches would take three times as long.
class ObjectText {
public:
    template <typename Value> void add(std::string_view name, const Value &value)
    {
        text += text.empty() ? '{' : ',';
        append(name);
        text += ':';
        append(value);
    }
    std::string whole() const { return text.empty() ? "{}" : text + '}'; }

private:
    void append(double value);
    void append(std::string_view value);
    void append(int value) { text += std::to_string(value); }
    void append(std::size_t value) { text += std::to_string(value); }
    void append(const CIELABCOORD &lab) { append(std::array{lab.L, lab.a, lab.b}); }
    void append(const CIELCHCOORD &lch) { append(std::array{lch.L, lch.C, lch.h}); }
    void append(const ObjectText &object) { text += object.whole(); }
    template <std::size_t Count> void append(const std::array<double, Count> &values)
    {
        text += '[';
        for (const double value : values) {
            append(value);
            text += ',';
        }
        text.back() = ']';
    }
    void append(const Spectrum *refl)
    {
        if (refl)
            append(*refl);
        else
            text += "null";
    }
    template <typename Value> void append(const std::optional<Value> &value)
    {
        if (value)
            append(*value);
        else
            text += "null";
    }

    std::string text; // without the brace at its end
};

struct PatchReport; // judge/report.h

Json lab_json(const CIELABCOORD &lab);

Json name_json(const PaperChoice &paper); // null where there is none

// Its name.
std::optional<std::string> response_text(const std::optional<int> &response, int status);

// Adds `response` and `density`.
void add_reading(Json &object, const DensityReading &reading, int status);

ObjectText patch_text(const PatchReport &patch, int status);

// Adds `advice` and, where there is any, `advice_from`.
void add_advice(Json &object, const std::vector<SolidAdvice> &advice);

// Adds `left_out` and `kept` where the page does not hold all.
void add_left_out(Json &object, const LeftOut &left_out);

// Writes the object with one more member, an array whose elements never stand in memory together:
// each is a line of text.
void write_with_array(const Json &object, std::string_view name, std::size_t count,
                      const std::function<std::string(std::size_t)> &element, const Sink &sink);

} // namespace vantrel::sheets
