#include "write/json_text.h"

#include "judge/names.h"
#include "judge/report.h"

#include <fmt/format.h>

#include <utility>

namespace vantrel::sheets {

Json lab_json(const CIELABCOORD &lab) { return {lab.L, lab.a, lab.b}; }

Json name_json(const PaperChoice &paper) { return paper.exists() ? Json(paper.name) : Json(); }

Json response_json(const std::optional<int> &response, int status)
{
    return response ? Json(response_name(status, *response)) : Json();
}

void add_reading(Json &object, const DensityReading &reading, int status)
{
    object["response"] = response_json(reading.response, status);
    object["density"] = or_null(reading.density);
}

Json patch_json(const PatchReport &patch, int status)
{
    Members out;
    Json::object_t device;
    for (const auto &[field, value] : patch.patch->device)
        device[field] = value;
    out.add("id", patch.patch->id);
    out.add("name", patch.patch->name);
    out.add("device", std::move(device));
    out.add("rgb", hex(patch.colour.rgb));
    out.add("lab", lab_json(patch.colour.lab));
    out.add("lch", {patch.lch.L, patch.lch.C, patch.lch.h});
    out.add("de00_to_paper", or_null(patch.to_paper));
    out.add("response", response_json(patch.response, status));
    out.add("response_id", or_null(patch.response));
    out.add("density", or_null(patch.density));
    out.add("dot_area", or_null(patch.dot_area));
    out.add("dot_gain", or_null(patch.dot_gain));
    out.add("sctv", or_null(patch.sctv));
    out.add("print_contrast", or_null(patch.print_contrast));
    out.add("hue_error", or_null(patch.hue_error));
    out.add("grayness", or_null(patch.grayness));
    out.add("trap", or_null(patch.trap));
    out.add("refl", patch.refl ? Json(*patch.refl) : Json());
    return std::move(out.members);
}

void add_advice(Json &object, const std::vector<SolidAdvice> &advice)
{
    Json rows = Json::array();
    for (const SolidAdvice &solid : advice) {
        const Advice &one = solid.advice;
        rows.push_back({{"ink", solid.ink},
                        {"de00", one.de00},
                        {"density_change", one.density_change},
                        {"de00_after", one.de00_after},
                        {"words", words_of(one)},
                        {"patch", name_of(solid)}});
    }
    object["advice"] = rows;
    if (!advice.empty())
        object["advice_from"] = advice_from();
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
