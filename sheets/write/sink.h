// Where a writer's text goes.
#pragma once

#include "read/tell.h"

#include <functional>
#include <string_view>

namespace vantrel::sheets {

struct Sink {
    std::function<void(std::string_view)> write; // takes the text piece by piece, as it is made
    Tell tell{};
};

} // namespace vantrel::sheets
