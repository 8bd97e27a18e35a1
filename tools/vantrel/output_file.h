// Text out. What is of the system is in output_file_posix.cpp and system_windows.cpp.
#pragma once

#include <cstddef>
#include <optional>
#include <string>
#include <string_view>
#include <sys/stat.h>
#include <utility>

namespace vantrel::program {

// Why text could not be written.
struct OutputError {
    std::string reason;
};

// That errno keeps a file from being made there; an empty folder is the one that the program is in.
OutputError not_made_in(const std::string &folder);

// Takes text for a file, or for standard output where the path is empty or "-". A file has either
// its old content or all of the new one, also when a signal ends the program: it is written under a
// temporary name beside its own, with the rights, access list, attributes, owner and group of the
// old one, and renamed. What is no regular file (a device, a pipe) is written straight. There is
// one at a time.
class OutputFile {
public:
    explicit OutputFile(std::string path) : path(std::move(path)) {}
    ~OutputFile(); // leaves the old file in place unless finish() was called
    OutputFile(const OutputFile &) = delete;
    OutputFile &operator=(const OutputFile &) = delete;

    // These throw OutputError, and RequestError for a file that was read. Nothing is opened before
    // there is text for it.
    void write(std::string_view text);
    void finish();

    // How many other names the file had that was replaced; they keep the old one.
    std::size_t other_names() const { return links_cut; }

private:
    void open();
    void open_to_replace(const struct stat &target);
    void open_beside(const std::string &target);
    void forget_temporary();
    void flush();
    std::size_t put(std::string_view text); // how much of it was written

    static constexpr std::size_t kBlock = 1u << 16;
    std::string path;
    std::string buffer;
    int file = -1;
    std::string temporary, replaced; // both empty where the file is written straight
    std::optional<unsigned> mode;    // that of the old file
    std::size_t links_cut = 0;
};

} // namespace vantrel::program
