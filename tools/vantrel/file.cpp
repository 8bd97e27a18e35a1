#include "file.h"

#include "read/measurement.h"

#include <algorithm>
#include <cerrno>
#include <cstdio>
#include <cstring>
#include <memory>
#include <vector>

namespace vantrel::program {
namespace {

constexpr std::size_t kLargestFile = 512u << 20;

std::vector<struct stat> files_read; // the state of this file

struct Close {
    void operator()(std::FILE *file) const
    {
        if (file != stdin)
            static_cast<void>(std::fclose(file));
    }
};

sheets::InputError error_now() { return {0, std::strerror(errno)}; }

struct stat state_of(std::FILE *file)
{
    struct stat state {};
    if (fstat(fileno(file), &state) != 0)
        throw error_now();
    return state;
}

bool is_unchanged(const struct stat &before, const struct stat &after)
{
    return before.st_size == after.st_size && before.st_mtim.tv_sec == after.st_mtim.tv_sec &&
           before.st_mtim.tv_nsec == after.st_mtim.tv_nsec;
}

} // namespace

std::string read_file(const std::string &path)
{
    const std::unique_ptr<std::FILE, Close> file(path == "-" ? stdin
                                                             : std::fopen(path.c_str(), "rb"));
    if (!file) {
        const int reason = errno;
        struct stat unread {}; // named as an input, it is none of an output either
        if (stat(path.c_str(), &unread) == 0)
            files_read.push_back(unread);
        errno = reason;
        throw error_now();
    }
    const struct stat before = state_of(file.get());
    const bool regular = S_ISREG(before.st_mode);
    if (!was_read(before))
        files_read.push_back(before);
    std::string text;
    if (regular) // at once, so that a large file does not stand in memory twice
        text.reserve(std::min(static_cast<std::size_t>(before.st_size), kLargestFile));
    char block[1 << 16];
    while (const std::size_t got = std::fread(block, 1, sizeof block, file.get())) {
        text.append(block, got);
        if (text.size() > kLargestFile)
            throw sheets::InputError{0, "larger than 512 MiB"};
    }
    if (std::ferror(file.get()))
        throw error_now();
    if (regular && !is_unchanged(before, state_of(file.get())))
        throw sheets::InputError{0, "it was written to while it was read; try again"};
    return text;
}

bool was_read(const struct stat &file)
{
    return S_ISREG(file.st_mode) &&
           std::any_of(files_read.begin(), files_read.end(), [&](const struct stat &read) {
               return read.st_dev == file.st_dev && read.st_ino == file.st_ino;
           });
}

} // namespace vantrel::program
