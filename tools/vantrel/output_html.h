// A result as a page.
#ifndef VANTREL_TOOL_OUTPUT_HTML_H
#define VANTREL_TOOL_OUTPUT_HTML_H

#include <string>
#include <string_view>

// One self-contained file around the JSON of a command; throws RequestError.
std::string as_html(std::string_view json);

#endif
