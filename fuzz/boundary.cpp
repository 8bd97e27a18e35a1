// Hands arbitrary bytes to the C interface of measurement files: a line of options, then a file.
// Stops where a call neither refuses them in printable text nor answers with JSON.
#include "read/text.h"
#include "require.h"

#include <nlohmann/json.hpp>
#include <vantrel_sheets.h>

#include <cstdint>
#include <string>
#include <string_view>

namespace {

void check(VantrelAnswer *answer, bool json)
{
    const std::string text(vantrel_answer_text(answer), vantrel_answer_size(answer));
    require(!text.empty(), "an answer without a text");
    if (!vantrel_answer_ok(answer))
        require(vantrel::sheets::printable(text) == text, "a reason cannot be printed");
    else if (json)
        require(nlohmann::json::accept(text), "an answer is no JSON");
    vantrel_answer_free(answer);
}

} // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t *data, std::size_t size)
{
    const std::string_view input(reinterpret_cast<const char *>(data), size);
    const std::size_t end = input.find('\n');
    if (end == std::string_view::npos)
        return 0;
    const std::string options(input.substr(0, end));
    const std::string_view bytes = input.substr(end + 1);
    VantrelSheet *sheet = nullptr, *by_options = nullptr;
    check(vantrel_open("a", bytes.data(), bytes.size(), options.c_str(), &by_options, nullptr,
                       nullptr),
          true);
    vantrel_close(by_options);
    check(vantrel_open("b", bytes.data(), bytes.size(), nullptr, &sheet, nullptr, nullptr), true);
    if (!sheet)
        return 0;
    const bool json = options.find("format") == std::string::npos;
    check(vantrel_report(&sheet, 1, sheet, options.c_str(), nullptr, nullptr), json);
    check(vantrel_compare(sheet, sheet, options.c_str(), nullptr, nullptr), json);
    check(vantrel_run(&sheet, 1, sheet, options.c_str()), json);
    check(vantrel_predict(sheet, options.c_str()), json);
    check(vantrel_ink(sheet, options.c_str()), json);
    vantrel_close(sheet);
    return 0;
}
