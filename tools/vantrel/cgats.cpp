#include "cgats.h"

#include <memory>

#include <lcms2.h>

#include "cgats_text.h"
#include "table.h"
#include "text.h"

namespace {

// Keeps what Little CMS first complains of.
void keep_first(cmsContext context, cmsUInt32Number, const char *message)
{
    auto &kept = *static_cast<std::string *>(cmsGetContextUserData(context));
    if (kept.empty())
        kept = message;
}

template <auto release> struct Release {
    void operator()(auto *handle) const { release(handle); }
};
using Context = std::unique_ptr<std::remove_pointer_t<cmsContext>, Release<cmsDeleteContext>>;
using Cgats = std::unique_ptr<void, Release<cmsIT8Free>>;

} // namespace

Measurement read_cgats(std::string_view file)
{
    PlainCgats plain = plain_cgats(file);

    std::string complaint;
    const Context context(cmsCreateContext(nullptr, &complaint));
    cmsSetLogErrorHandlerTHR(context.get(), keep_first);
    const Cgats cgats(cmsIT8LoadFromMem(context.get(), plain.text.data(),
                                        static_cast<cmsUInt32Number>(plain.text.size())));
    if (!cgats)
        throw InputError{0, "not CGATS text: " + printable(trimmed(complaint))};

    char **names = nullptr;
    const int fields = cmsIT8EnumDataFormat(cgats.get(), &names);
    Table table;
    for (int i = 0; i < fields; ++i)
        table.fields.emplace_back(names[i][0] == '_' ? names[i] + 1 : names[i]);
    table.fields_line = plain.fields_line;
    table.row_lines = plain.row_lines;
    table.cell = [&](std::size_t row, std::size_t column) -> std::string_view {
        const char *text =
            cmsIT8GetDataRowCol(cgats.get(), static_cast<int>(row), static_cast<int>(column));
        return text ? text : "";
    };
    if (const char *norm = cmsIT8GetProperty(cgats.get(), "SPECTRAL_NORM"))
        table.full_scale = number_in(norm);

    Measurement sheet = measurement_of(table);
    sheet.warnings = std::move(plain.warnings);
    return sheet;
}
