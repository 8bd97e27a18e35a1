#include "read/measurement.h"

#include "read/text.h"

#include <fmt/format.h>

namespace vantrel::sheets {

bool is_ink(std::string_view field) { return !field.starts_with("RGB_"); }

std::vector<std::string> reading_warnings(const Measurement &sheet)
{
    std::vector<std::string> out;
    for (const std::string &warning : sheet.warnings)
        out.push_back(fmt::format("{}:{}", sheet.file, warning));
    return out;
}

std::string complaint_of(const std::string &file, const InputError &error)
{
    return fmt::format("{}{}: {}", file, error.line ? fmt::format(":{}", error.line) : "",
                       error.reason);
}

const Patch *find_patch(const Measurement &sheet, std::string_view name)
{
    for (const Patch &patch : sheet.patches)
        if (patch.name == name)
            return &patch;
    for (const Patch &patch : sheet.patches)
        if (patch.id == name)
            return &patch;
    return nullptr;
}

const Patch &patch_named(const Measurement &sheet, std::string_view name)
{
    if (const Patch *patch = find_patch(sheet, name))
        return *patch;
    std::string names;
    for (std::size_t i = 0; i < sheet.patches.size() && i < 8; ++i)
        names += (i ? ", " : "") + in_quotes(sheet.patches[i].name);
    throw RequestError{fmt::format("{} holds no patch {}; its patches are {}{}", sheet.file,
                                   in_quotes(name), names, sheet.patches.size() > 8 ? ", …" : "")};
}

std::vector<std::size_t> places_named(const Measurement &sheet, std::string_view name)
{
    const bool by_name = patch_named(sheet, name).name == name;
    std::vector<std::size_t> out;
    for (std::size_t i = 0; i < sheet.patches.size(); ++i)
        if ((by_name ? sheet.patches[i].name : sheet.patches[i].id) == name)
            out.push_back(i);
    return out;
}

} // namespace vantrel::sheets
