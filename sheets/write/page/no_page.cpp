// Stands for the page in a build without npm.
#include "write/page/page.h"

namespace vantrel::sheets {

const std::span<const std::string_view> page_before_data{};
const std::span<const std::string_view> page_after_data{};

} // namespace vantrel::sheets
