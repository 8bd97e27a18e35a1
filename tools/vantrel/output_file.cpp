#include "output_file.h"

#include "read/text.h"

#include <fmt/format.h>

#include <cerrno>
#include <cstring>

namespace vantrel::program {

OutputError not_made_in(const std::string &folder)
{
    const char *reason = std::strerror(errno);
    return {fmt::format("no file can be made in its folder {}: {}",
                        folder.empty() ? "." : sheets::printable(folder), reason)};
}

void OutputFile::write(std::string_view text)
{
    buffer += text;
    if (buffer.size() >= kBlock)
        flush();
}

void OutputFile::flush()
{
    if (file < 0)
        open();
    for (std::string_view rest = buffer; !rest.empty();)
        rest.remove_prefix(put(rest));
    buffer.clear();
}

} // namespace vantrel::program
