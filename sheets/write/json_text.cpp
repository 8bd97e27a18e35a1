#include "write/json_text.h"

#include "judge/names.h"
#include "judge/report.h"

#include <fmt/format.h>

#include <utility>

namespace vantrel::sheets {

Json lab_json(const CIELABCOORD &lab) { return {lab.L, lab.a, lab.b}; }

Json name_json(const PaperChoice &paper) { return paper.exists() ? Json(paper.name) : Json(); }

void add_reading(Json &object, const DensityReading &reading, int status)
{
    object["response"] = reading.response ? Json(response_name(status, *reading.response)) : Json();
    object["density"] = or_null(reading.density);
}

// Member by member: braces would make an array of every pair first.
Json patch_json(const PatchReport &patch, int status)
{
    Json::object_t out;
    out.reserve(19);
    const auto add = [&out](const char *name, Json value) {
        out.emplace_back(name, std::move(value));
    };
    Json::object_t device;
    for (const auto &[field, value] : patch.patch->device)
        device[field] = value;
    add("id", patch.patch->id);
    add("name", patch.patch->name);
    add("device", std::move(device));
    add("rgb", hex(patch.colour.rgb));
    add("lab", lab_json(patch.colour.lab));
    add("lch", {patch.lch.L, patch.lch.C, patch.lch.h});
    add("de00_to_paper", or_null(patch.to_paper));
    add("response", patch.response ? Json(response_name(status, *patch.response)) : Json());
    add("response_id", or_null(patch.response));
    add("density", or_null(patch.density));
    add("dot_area", or_null(patch.dot_area));
    add("dot_gain", or_null(patch.dot_gain));
    add("sctv", or_null(patch.sctv));
    add("print_contrast", or_null(patch.print_contrast));
    add("hue_error", or_null(patch.hue_error));
    add("grayness", or_null(patch.grayness));
    add("trap", or_null(patch.trap));
    add("refl", patch.refl ? Json(*patch.refl) : Json());
    return out;
}

void add_advice(Json &object, const std::vector<SolidAdvice> &advice)
{
    Json rows = Json::array();
    for (const auto &[ink, one, patch] : advice) {
        rows.push_back({{"ink", ink},
                        {"de00", one.de00},
                        {"density_change", one.density_change},
                        {"de00_after", one.de00_after},
                        {"words", words_of(one)}});
        if (!patch.empty())
            rows.back()["patch"] = patch;
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
