// A bar on standard error for work that takes over a second, where that is a terminal.
#pragma once

#include <cstddef>

namespace vantrel::sheets {

class Progress {
public:
    // What is being done, and how much of it there is in all. The second counts from the first bar
    // of the process.
    Progress(const char *what, std::size_t total);
    ~Progress(); // wipes the bar
    Progress(const Progress &) = delete;
    Progress &operator=(const Progress &) = delete;

    void done(std::size_t amount);
    void left(std::size_t amount) { done(total - amount); }

private:
    const char *what;
    std::size_t total;
    bool terminal;
    bool drawn = false;
    double next = 1; // seconds
};

} // namespace vantrel::sheets
