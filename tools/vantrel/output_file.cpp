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

constexpr std::size_t kBlock = 1u << 16;

OutputError error_now() { return {std::strerror(errno)}; }

// The permissions of a new file.
mode_t usual_mode()
{
    const mode_t mask = umask(0);
    umask(mask);
    return 0666 & ~mask;
}

} // namespace

OutputFile::~OutputFile()
{
    if (file >= 0 && file != STDOUT_FILENO)
        static_cast<void>(close(file));
    if (!temporary.empty())
        static_cast<void>(unlink(temporary.c_str()));
}

void OutputFile::write(std::string_view text)
{
    buffer += text;
    if (buffer.size() >= kBlock)
        flush();
}

void OutputFile::finish()
{
    flush();
    if (file == STDOUT_FILENO)
        return;
    // On the disk before it takes the name, so that a crash of the machine leaves no empty file.
    if (!temporary.empty() && (fchmod(file, mode) != 0 || fsync(file) != 0))
        throw error_now();
    if (close(std::exchange(file, -1)) != 0)
        throw error_now();
    if (!temporary.empty() && std::rename(temporary.c_str(), replaced.c_str()) != 0)
        throw error_now();
    temporary.clear();
}

void OutputFile::flush()
{
    if (file < 0)
        open();
    for (std::string_view rest = buffer; !rest.empty();) {
        const ssize_t written = ::write(file, rest.data(), rest.size());
        if (written < 0 && errno != EINTR)
            throw error_now();
        rest.remove_prefix(static_cast<std::size_t>(written < 0 ? 0 : written));
    }
    buffer.clear();
}

void OutputFile::open()
{
    struct stat standard_output {
    }, target{};
    const bool exists = !path.empty() && path != "-" && stat(path.c_str(), &target) == 0;
    if (path.empty() || path == "-" ||
        (exists && fstat(STDOUT_FILENO, &standard_output) == 0 &&
         standard_output.st_dev == target.st_dev && standard_output.st_ino == target.st_ino)) {
        file = STDOUT_FILENO;
    } else if (!exists) { // a link to nothing is refused: it names no file yet
        if (errno != ENOENT || lstat(path.c_str(), &target) == 0)
            throw error_now();
        open_beside(path, usual_mode());
    } else if (!S_ISREG(target.st_mode)) {
        file = ::open(path.c_str(), O_WRONLY | O_NOCTTY | O_CLOEXEC);
    } else {
        const std::unique_ptr<char, decltype(&std::free)> real(realpath(path.c_str(), nullptr),
                                                               std::free);
        if (access(path.c_str(), W_OK) != 0 || !real)
            throw error_now();
        open_beside(real.get(), target.st_mode & 07777);
    }
    if (file < 0)
        throw error_now();
}

void OutputFile::open_beside(const std::string &target, mode_t of_target)
{
    replaced = target;
    mode = of_target;
    std::string name = target + ".XXXXXX";
    file = mkostemp(name.data(), O_CLOEXEC);
    if (file >= 0)
        temporary = name;
}

} // namespace vantrel::program
