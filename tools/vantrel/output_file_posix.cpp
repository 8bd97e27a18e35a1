#include "output_file.h"

#include "file.h"
#include "read/measurement.h"
#include "read/text.h"

#include <fmt/format.h>

#include <algorithm>
#include <cerrno>
#include <climits>
#include <csignal>
#include <cstdlib>
#include <cstring>
#include <fcntl.h>
#include <iterator>
#include <memory>
#include <sys/stat.h>
#include <unistd.h>

#ifdef __linux__
#include <linux/limits.h>
#include <sys/xattr.h>
#endif

namespace vantrel::program {
namespace {

OutputError output_error_now() { return {std::strerror(errno)}; }

// Signals that end no program.
constexpr int kHarmless[] = {SIGCHLD, SIGCONT, SIGTSTP, SIGTTIN, SIGTTOU, SIGURG, SIGWINCH};

char doomed[PATH_MAX] = ""; // the temporary file that goes when a signal ends the program

extern "C" void remove_and_end(int signal)
{
    if (doomed[0])
        static_cast<void>(unlink(doomed));
    static_cast<void>(raise(signal)); // as if there were no handler, by SA_RESETHAND
}

// Makes the temporary file and has signals remove it, without a moment between. Its name has a
// number for "XXXXXX".
int make_temporary(std::string &name, mode_t mode)
{
    sigset_t all, before;
    sigfillset(&all);
    sigprocmask(SIG_BLOCK, &all, &before);
    int file = -1;
    for (unsigned number = static_cast<unsigned>(getpid());; ++number) {
        fmt::format_to(name.end() - 6, "{:06x}", number & 0xFFFFFF);
        file = open(name.c_str(), O_WRONLY | O_CREAT | O_EXCL | O_CLOEXEC, mode);
        if (file >= 0 || errno != EEXIST)
            break;
    }
    const int error = errno;
    if (file >= 0) {
        doomed[name.copy(doomed, sizeof doomed - 1)] = '\0';
        for (int signal = 1; signal < NSIG; ++signal) {
            struct sigaction action {};
            if (std::find(std::begin(kHarmless), std::end(kHarmless), signal) ==
                    std::end(kHarmless) &&
                sigaction(signal, nullptr, &action) == 0 && action.sa_handler == SIG_DFL) {
                action.sa_handler = remove_and_end;
                action.sa_flags = SA_RESETHAND;
                sigaction(signal, &action, nullptr);
            }
        }
    }
    sigprocmask(SIG_SETMASK, &before, nullptr);
    errno = error;
    return file;
}

void refuse_what_was_read(const struct stat &target, const std::string &name)
{
    if (was_read(target))
        throw sheets::RequestError{name + " is an input; the output would write over it"};
}

// Access lists and what users attach to a file, from the old one to the new.
bool copy_attributes(const std::string &from, int to)
{
#ifdef __linux__
    static_cast<void>(fremovexattr(to, "system.posix_acl_access")); // which the folder may give
    std::string names(XATTR_LIST_MAX, '\0'), value(XATTR_SIZE_MAX, '\0');
    const ssize_t size = listxattr(from.c_str(), names.data(), names.size());
    for (ssize_t at = 0; at < size;) {
        const std::string name = names.c_str() + at;
        at += static_cast<ssize_t>(name.size()) + 1;
        if (name != "system.posix_acl_access" && !name.starts_with("user."))
            continue;
        const ssize_t got = getxattr(from.c_str(), name.c_str(), value.data(), value.size());
        if (got < 0 ||
            fsetxattr(to, name.c_str(), value.data(), static_cast<std::size_t>(got), 0) != 0)
            return false;
    }
#endif
    return true;
}

} // namespace

OutputFile::~OutputFile()
{
    if (file >= 0 && file != STDOUT_FILENO)
        static_cast<void>(close(file));
    if (!temporary.empty())
        static_cast<void>(unlink(temporary.c_str()));
    forget_temporary();
}

void OutputFile::finish()
{
    flush();
    if (file == STDOUT_FILENO)
        return;
    // On the disk before it takes the name, so that a crash of the machine leaves no empty file.
    if (!temporary.empty() && ((mode && fchmod(file, *mode) != 0) || fsync(file) != 0))
        throw output_error_now();
    if (close(std::exchange(file, -1)) != 0)
        throw output_error_now();
    if (!temporary.empty() && std::rename(temporary.c_str(), replaced.c_str()) != 0)
        throw output_error_now();
    forget_temporary();
}

void OutputFile::forget_temporary()
{
    temporary.clear();
    doomed[0] = '\0';
}

std::size_t OutputFile::put(std::string_view text)
{
    const ssize_t written = ::write(file, text.data(), text.size());
    if (written < 0 && errno != EINTR)
        throw output_error_now();
    return static_cast<std::size_t>(written < 0 ? 0 : written);
}

void OutputFile::open()
{
    struct stat standard_output {
    }, target{};
    const bool has_output = fstat(STDOUT_FILENO, &standard_output) == 0;
    const bool named = !path.empty() && path != "-";
    const bool exists = named && stat(path.c_str(), &target) == 0;
    if (!named || (exists && has_output && standard_output.st_dev == target.st_dev &&
                   standard_output.st_ino == target.st_ino)) {
        refuse_what_was_read(standard_output, "the file behind standard output");
        file = STDOUT_FILENO;
    } else if (!exists) { // a link to nothing is refused: it names no file yet
        if (errno != ENOENT || lstat(path.c_str(), &target) == 0)
            throw output_error_now();
        open_beside(path);
    } else if (!S_ISREG(target.st_mode)) {
        file = ::open(path.c_str(), O_WRONLY | O_NOCTTY | O_CLOEXEC);
    } else {
        refuse_what_was_read(target, sheets::printable(path));
        open_to_replace(target);
    }
    if (file < 0)
        throw output_error_now();
}

void OutputFile::open_to_replace(const struct stat &target)
{
    struct stat name {
    }, made{};
    std::string real = path;
    if (lstat(path.c_str(), &name) == 0 && S_ISLNK(name.st_mode)) { // which stays
        const std::unique_ptr<char, decltype(&std::free)> end(realpath(path.c_str(), nullptr),
                                                              std::free);
        if (!end)
            throw output_error_now();
        real = end.get();
    }
    if (access(path.c_str(), W_OK) != 0)
        throw output_error_now();
    mode = target.st_mode & 0777; // what is new may not act as its owner
    links_cut = target.st_nlink - 1;
    open_beside(real);
    if (fstat(file, &made) != 0)
        throw output_error_now();
    if ((made.st_uid != target.st_uid || made.st_gid != target.st_gid) &&
        fchown(file, target.st_uid, target.st_gid) != 0)
        throw OutputError{"a new file cannot be given its owner and group; choose another name"};
    if (!copy_attributes(real, file))
        throw OutputError{
            "a new file cannot be given its access list or attributes; choose another name"};
}

void OutputFile::open_beside(const std::string &target)
{
    replaced = target;
    const auto slash = target.rfind('/');
    const std::string folder = slash == std::string::npos ? "" : target.substr(0, slash + 1);
    std::string name = folder + ".vantrel.XXXXXX"; // of no more characters where the name has 255
    // A new file has the usual rights, less the user's mask, or those that the folder gives.
    file = make_temporary(name, mode ? 0600 : 0666);
    if (file < 0)
        throw not_made_in(folder);
    temporary = name;
}

} // namespace vantrel::program
