#include "write/json_text.h"

#include "judge/names.h"
#include "read/progress.h"

#include <fmt/format.h>

namespace vantrel::sheets {

Json lab_json(const CIELABCOORD &lab) { return {lab.L, lab.a, lab.b}; }

void add_reading(Json &object, const DensityReading &reading, int status)
{
    object["response"] = reading.response ? Json(response_name(status, *reading.response)) : Json();
    object["density"] = or_null(reading.density);
}

std::string with_array(const Json &object, std::string_view name, std::size_t count,
                       const std::function<Json(std::size_t)> &element)
{
    std::string out = object.dump(2);
    out.erase(out.rfind("\n}"));
    out += fmt::format(",\n  \"{}\": [", name);
    Progress progress("Writing", count);
    for (std::size_t i = 0; i < count; ++i) {
        progress.done(i);
        out += (i ? ",\n" : "\n") + element(i).dump();
    }
    return out + "\n  ]\n}";
}

} // namespace vantrel::sheets
