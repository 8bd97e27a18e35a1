// A command's result as a page to look at.
#pragma once

#include <string>
#include <string_view>

namespace vantrel::sheets {

// One self-contained file that shows a JSON document of this program; the document is in it. Throws
// RequestError where the program was built without the page.
std::string as_html(std::string_view json);

} // namespace vantrel::sheets
