#include "write/json_text.h"

#include "judge/names.h"
#include "judge/report.h"

#include <fmt/format.h>

namespace vantrel::sheets {

Json lab_json(const CIELABCOORD &lab) { return {lab.L, lab.a, lab.b}; }

Json name_json(const PaperChoice &paper) { return paper.exists() ? Json(paper.name) : Json(); }

void add_reading(Json &object, const DensityReading &reading, int status)
{
    object["response"] = reading.response ? Json(response_name(status, *reading.response)) : Json();
    object["density"] = or_null(reading.density);
}

Json patch_json(const PatchReport &patch, int status)
{
    Json device = Json::object();
    for (const auto &[field, value] : patch.device)
        device[field] = value;
    return {{"id", patch.id},
            {"name", patch.name},
            {"device", device},
            {"rgb", hex(patch.colour.rgb)},
            {"lab", lab_json(patch.colour.lab)},
            {"lch", {patch.lch.L, patch.lch.C, patch.lch.h}},
            {"de00_to_paper", or_null(patch.to_paper)},
            {"response", patch.response ? Json(response_name(status, *patch.response)) : Json()},
            {"response_id", or_null(patch.response)},
            {"density", or_null(patch.density)},
            {"dot_area", or_null(patch.dot_area)},
            {"dot_gain", or_null(patch.dot_gain)},
            {"print_contrast", or_null(patch.print_contrast)},
            {"hue_error", or_null(patch.hue_error)},
            {"grayness", or_null(patch.grayness)},
            {"trap", or_null(patch.trap)},
            {"refl", or_null(patch.refl)}};
}

void add_left_out(Json &object, const LeftOut &left_out)
{
    if (left_out.count == 0)
        return;
    object["left_out"] = left_out.count;
    object["kept"] = left_out.kept;
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
