// How far work is, told to whoever asks.
#pragma once

#include <cstddef>
#include <functional>

namespace vantrel::sheets {

// What is being done, and which share of it is done: 1 at its end.
using Tell = std::function<void(const char *what, double share)>;

// A piece of work whose amount is known.
struct Work {
    const Tell &tell; // may be empty
    const char *what;
    std::size_t total;

    void done(std::size_t amount) const
    {
        if (tell)
            tell(what, static_cast<double>(amount) / static_cast<double>(total));
    }
    void left(std::size_t amount) const { done(total - amount); }
};

} // namespace vantrel::sheets
