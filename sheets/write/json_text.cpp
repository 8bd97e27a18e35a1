#include "write/json_text.h"

#include "judge/names.h"
#include "judge/report.h"
#include "write/decimal.h"

#include <fmt/format.h>

#include <algorithm>
#include <cmath>
#include <iterator>
#include <map>

namespace vantrel::sheets {

Json lab_json(const CIELABCOORD &lab) { return {lab.L, lab.a, lab.b}; }

Json name_json(const PaperChoice &paper) { return paper.exists() ? Json(paper.name) : Json(); }

std::optional<std::string> response_text(const std::optional<int> &response, int status)
{
    return response ? std::optional(response_name(status, *response)) : std::nullopt;
}

void add_reading(Json &object, const DensityReading &reading, int status)
{
    object["response"] = or_null(response_text(reading.response, status));
    object["density"] = or_null(reading.density);
}

void ObjectText::append(double value)
{
    if (!std::isfinite(value)) {
        text += "null";
        return;
    }
    // to_chars() writes all of these alike, but takes longer
    if (const auto k = ten_thousandths(value); k && std::abs(value) < 2000) {
        append_ten_thousandths(*k, false, text);
        if (*k % 10000 == 0)
            text += ".0";
        return;
    }
    char digits[32];
    text.append(digits, nlohmann::detail::to_chars(digits, std::end(digits), value));
}

void ObjectText::append(std::string_view value)
{
    const bool plain = std::all_of(value.begin(), value.end(), [](char c) {
        return c >= ' ' && c <= '~' && c != '"' && c != '\\';
    });
    if (plain)
        (text += '"').append(value) += '"';
    else
        text += Json(value).dump();
}

ObjectText patch_text(const PatchReport &patch, int status)
{
    ObjectText out, device;
    std::map<std::string_view, double> last; // of a name that stands twice
    for (const auto &[field, value] : patch.patch->device)
        last[field] = value;
    for (const auto &[field, value] : patch.patch->device)
        if (const auto found = last.extract(field))
            device.add(field, found.mapped());
    out.add("id", patch.patch->id);
    out.add("name", patch.patch->name);
    out.add("device", device);
    out.add("rgb", hex(patch.colour.rgb));
    out.add("lab", patch.colour.lab);
    out.add("lch", patch.lch);
    out.add("de00_to_paper", patch.to_paper);
    out.add("response", response_text(patch.response, status));
    out.add("response_id", patch.response);
    out.add("density", patch.density);
    out.add("dot_area", patch.dot_area);
    out.add("dot_gain", patch.dot_gain);
    out.add("sctv", patch.sctv);
    out.add("print_contrast", patch.print_contrast);
    out.add("hue_error", patch.hue_error);
    out.add("grayness", patch.grayness);
    out.add("trap", patch.trap);
    out.add("refl", patch.refl);
    return out;
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
                      const std::function<std::string(std::size_t)> &element, const Sink &sink)
{
    std::string head = object.dump(2);
    head.erase(head.rfind("\n}"));
    sink.write(fmt::format("{},\n  \"{}\": [", head, name));
    const Work work{sink.tell, "Writing", count};
    for (std::size_t i = 0; i < count; ++i) {
        sink.write((i ? ",\n" : "\n") + element(i));
        work.done(i + 1);
    }
    sink.write("\n  ]\n}");
}

} // namespace vantrel::sheets
