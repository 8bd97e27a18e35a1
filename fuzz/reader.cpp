// Hands arbitrary bytes to the reader of measurement files, and stops where it neither refuses them
// in one printable line nor hands on a sheet that can be measured and printed.
#include "read/reader.h"
#include "read/text.h"
#include "require.h"

#include <algorithm>
#include <cmath>
#include <cstdint>

using namespace vantrel::sheets;

namespace {

bool finite(double value) { return std::isfinite(value); }
bool is_printable(const std::string &text) { return printable(text) == text; }

void check(const Measurement &sheet)
{
    require(!sheet.patches.empty(), "a sheet without patches");
    for (const Patch &patch : sheet.patches) {
        require(std::all_of(patch.refl.begin(), patch.refl.end(), finite), "a band is not finite");
        require(sheet.kind != Kind::colours || patch.lab, "a colour is missing");
        require(!patch.lab ||
                    (finite(patch.lab->L) && finite(patch.lab->a) && finite(patch.lab->b)),
                "a colour is not finite");
        require(!patch.id.empty() && is_printable(patch.id), "an id cannot be printed");
        require(!patch.name.empty() && is_printable(patch.name), "a name cannot be printed");
        for (const auto &[field, value] : patch.device)
            require(finite(value) && is_printable(field), "a device value cannot be printed");
    }
    require(sheet.kind == Kind::colours ||
                (sheet.source.first_nm <= 411 && sheet.source.last_nm >= 679),
            "a range too short for a spectrum");
    for (const std::string &text :
         {sheet.colours.stated, sheet.origin.originator, sheet.origin.descriptor,
          sheet.origin.created, sheet.origin.instrument, sheet.origin.job})
        require(is_printable(text), "what the file says of itself cannot be printed");
    require(std::all_of(sheet.warnings.begin(), sheet.warnings.end(), is_printable),
            "a warning cannot be printed");
}

} // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t *data, std::size_t size)
{
    try {
        // conditions and scales that are asked for take turns with the size
        Reading reading;
        reading.scale = static_cast<Scale>(size % 3);
        if (size % 4 == 1)
            reading.condition = "M2";
        reading.colours = size % 5 != 1;
        check(read_measurement({reinterpret_cast<const char *>(data), size}, reading));
    } catch (const InputError &error) {
        require(!error.reason.empty() && is_printable(error.reason), "a reason cannot be printed");
    }
    return 0;
}
