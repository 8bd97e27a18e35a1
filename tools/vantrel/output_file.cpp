#include "output_file.h"

namespace vantrel::program {

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
