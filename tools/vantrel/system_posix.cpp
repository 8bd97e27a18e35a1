#include "system.h"

#include <csignal>
#include <sys/stat.h>
#include <unistd.h>

namespace vantrel::program {

void prepare(char **&)
{
    for (const int signal : {SIGPIPE, SIGXFSZ})
        static_cast<void>(std::signal(signal, SIG_IGN));
}

bool is_terminal(Stream stream)
{
    return isatty(stream == Stream::output ? STDOUT_FILENO : STDERR_FILENO) != 0;
}

bool is_regular_file(const std::string &path)
{
    struct stat state {};
    return stat(path.c_str(), &state) == 0 && S_ISREG(state.st_mode);
}

std::vector<std::string> files_of(const std::vector<std::string> &words) { return words; }

} // namespace vantrel::program
