#include "output_file.h"

#include <cerrno>
#include <cstdlib>
#include <cstring>
#include <fcntl.h>
#include <memory>
#include <sys/stat.h>
#include <unistd.h>

namespace vantrel::program {
namespace {

std::string reason() { return std::strerror(errno); }

bool write_all(int file, std::string_view text)
{
    while (!text.empty()) {
        const ssize_t written = write(file, text.data(), text.size());
        if (written < 0 && errno != EINTR)
            return false;
        text.remove_prefix(static_cast<std::size_t>(written < 0 ? 0 : written));
    }
    return true;
}

std::string write_straight(const std::string &path, std::string_view text)
{
    const int file = open(path.c_str(), O_WRONLY | O_NOCTTY | O_CLOEXEC);
    if (file < 0)
        return reason();
    std::string problem = write_all(file, text) ? "" : reason();
    if (close(file) != 0 && problem.empty())
        problem = reason();
    return problem;
}

// The permissions of a new file.
mode_t usual_mode()
{
    const mode_t mask = umask(0);
    umask(mask);
    return 0666 & ~mask;
}

std::string replace_file(const std::string &path, mode_t mode, std::string_view text)
{
    std::string temporary = path + ".XXXXXX";
    const int file = mkostemp(temporary.data(), O_CLOEXEC);
    if (file < 0)
        return reason();
    // On the disk before it takes the name, so that a crash of the machine leaves no empty file.
    bool done = write_all(file, text) && fchmod(file, mode) == 0 && fsync(file) == 0;
    std::string problem = done ? "" : reason();
    if (close(file) != 0 && problem.empty())
        problem = reason();
    if (problem.empty() && std::rename(temporary.c_str(), path.c_str()) != 0)
        problem = reason();
    if (!problem.empty())
        unlink(temporary.c_str());
    return problem;
}

} // namespace

std::string write_output(const std::string &path, std::string_view text)
{
    const auto to_standard_output = [&] { return write_all(STDOUT_FILENO, text) ? "" : reason(); };
    struct stat standard_output {
    }, file{};
    if (path.empty() || path == "-")
        return to_standard_output();
    if (stat(path.c_str(), &file) != 0) // a link to nothing is refused: it names no file yet
        return errno == ENOENT && lstat(path.c_str(), &file) != 0
                   ? replace_file(path, usual_mode(), text)
                   : reason();
    if (fstat(STDOUT_FILENO, &standard_output) == 0 && standard_output.st_dev == file.st_dev &&
        standard_output.st_ino == file.st_ino)
        return to_standard_output();
    if (!S_ISREG(file.st_mode))
        return write_straight(path, text);
    if (access(path.c_str(), W_OK) != 0)
        return reason();
    const std::unique_ptr<char, decltype(&std::free)> target(realpath(path.c_str(), nullptr),
                                                             std::free);
    return target ? replace_file(target.get(), file.st_mode & 07777, text) : reason();
}

} // namespace vantrel::program
