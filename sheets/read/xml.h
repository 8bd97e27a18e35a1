// Elements of XML, read by their names behind the prefix of a namespace, which each program chooses
// for itself.
#pragma once

#include <pugixml.hpp>

#include <string>
#include <string_view>

namespace vantrel::sheets {

using Node = pugi::xml_node;

std::string_view local_name(const char *name);
bool is(const Node &node, std::string_view name);
Node child(const Node &parent, std::string_view name);
std::string_view attribute(const Node &node, const char *name);

// All text of an element; a comment may divide it.
std::string text_of(const Node &node);

} // namespace vantrel::sheets
