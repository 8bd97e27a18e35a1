#include <fmt/format.h>
#include <nlohmann/json.hpp>

#include "names.h"
#include "report.h"

std::string as_json(const Report &report)
{
    using Json = nlohmann::ordered_json;
    Json patches = Json::array();
    for (const PatchReport &patch : report.patches) {
        Json device = Json::object();
        for (const auto &[field, value] : patch.device)
            device[field] = value;
        patches.push_back(
            {{"id", patch.id},
             {"name", patch.name},
             {"device", device},
             {"rgb", fmt::format("#{:02x}{:02x}{:02x}", patch.red, patch.green, patch.blue)},
             {"lab", {patch.lab.L, patch.lab.a, patch.lab.b}},
             {"lch", {patch.lch.L, patch.lch.C, patch.lch.h}},
             {"de00_to_paper", patch.to_paper}});
    }
    const Json sheet = {
        {"file", report.file},
        {"illuminant", name_of(report.illuminant)},
        {"paper", report.paper},
        {"source",
         {{"first_nm", report.source.first_nm},
          {"last_nm", report.source.last_nm},
          {"bands", report.source.bands},
          {"scaled_to_percent", report.source.scaled}}},
        {"patches", patches},
    };
    return sheet.dump(2) + '\n';
}
