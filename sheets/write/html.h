// A command's result as a page to look at.
#pragma once

#include "write/sink.h"

#include <functional>

namespace vantrel::sheets {

// One self-contained file that shows a JSON document of this program, which `write_document`
// writes; the document is in it. Throws RequestError where the program was built without the page.
void write_html(const std::function<void(const Sink &)> &write_document, const Sink &sink);

} // namespace vantrel::sheets
