#include "read/xml.h"

#include <cstring>

namespace vantrel::sheets {

std::string_view local_name(const char *name)
{
    const char *colon = std::strchr(name, ':');
    return colon ? colon + 1 : name;
}

bool is(const Node &node, std::string_view name) { return local_name(node.name()) == name; }

Node child(const Node &parent, std::string_view name)
{
    return parent.find_child([&](const Node &node) { return is(node, name); });
}

std::string_view attribute(const Node &node, const char *name)
{
    return node.attribute(name).value();
}

std::string text_of(const Node &node)
{
    std::string out;
    for (const Node &part : node.children())
        if (part.type() == pugi::node_pcdata || part.type() == pugi::node_cdata)
            out += part.value();
    return out;
}

} // namespace vantrel::sheets
