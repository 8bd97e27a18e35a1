#include "file.h"

#include "read/measurement.h"

#include <cerrno>
#include <cstdio>
#include <cstring>
#include <memory>

namespace vantrel::program {
namespace {

constexpr std::size_t kLargestFile = 512u << 20;

struct Close {
    void operator()(std::FILE *file) const
    {
        if (file != stdin)
            static_cast<void>(std::fclose(file));
    }
};

} // namespace

std::string read_file(const std::string &path)
{
    const std::unique_ptr<std::FILE, Close> file(path == "-" ? stdin
                                                             : std::fopen(path.c_str(), "rb"));
    if (!file)
        throw sheets::InputError{0, std::strerror(errno)};
    std::string text;
    char block[1 << 16];
    while (const std::size_t got = std::fread(block, 1, sizeof block, file.get())) {
        text.append(block, got);
        if (text.size() > kLargestFile)
            throw sheets::InputError{0, "larger than 512 MiB"};
    }
    if (std::ferror(file.get()))
        throw sheets::InputError{0, std::strerror(errno)};
    return text;
}

} // namespace vantrel::program
