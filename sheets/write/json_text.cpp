#include "write/json_text.h"

#include "judge/names.h"

#include <fmt/format.h>

namespace vantrel::sheets {

Json lab_json(const CIELABCOORD &lab) { return {lab.L, lab.a, lab.b}; }

void add_reading(Json &object, const DensityReading &reading, int status)
{
    object["response"] = reading.response ? Json(response_name(status, *reading.response)) : Json();
    object["density"] = or_null(reading.density);
}

void write_with_array(const Json &object, std::string_view name, std::size_t count,
                      const std::function<Json(std::size_t)> &element, const Sink &sink)
{
    std::string head = object.dump(2);
    head.erase(head.rfind("\n}"));
    sink.write(fmt::format("{},\n  \"{}\": [", head, name));
    const Work work{sink.tell, "Writing", count};
    for (std::size_t i = 0; i < count; ++i) {
        sink.write((i ? ",\n" : "\n") + element(i).dump());
        work.done(i + 1);
    }
    sink.write("\n  ]\n}");
}

} // namespace vantrel::sheets
