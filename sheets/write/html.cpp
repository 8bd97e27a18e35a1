#include "write/html.h"

#include "read/measurement.h"
#include "write/page/page.h"

namespace vantrel::sheets {
namespace {

// JSON as the text of a script element: no sequence in it ends the element or opens a comment, and
// no space stands between its tokens. `<` occurs in strings alone. Each piece of the document ends
// outside of its strings.
std::string script_data(std::string_view json)
{
    std::string out;
    bool in_string = false;
    for (std::size_t i = 0; i < json.size(); ++i) {
        const char c = json[i];
        if (c == '<') {
            out += "\\u003c";
        } else if (in_string && c == '\\') {
            out += json.substr(i, 2);
            ++i;
        } else if (in_string || (c != ' ' && c != '\n')) {
            in_string ^= c == '"';
            out += c;
        }
    }
    return out;
}

} // namespace

void write_html(const std::function<void(const Sink &)> &write_document, const Sink &sink)
{
    if (page_before_data.empty())
        throw RequestError{
            "--format html: this program was built without the page, which takes npm"};
    for (const std::string_view part : page_before_data)
        sink.write(part);
    write_document({[&](std::string_view json) { sink.write(script_data(json)); }, sink.tell});
    for (const std::string_view part : page_after_data)
        sink.write(part);
}

} // namespace vantrel::sheets
