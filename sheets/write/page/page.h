// The page around its data: what page/build.mjs makes, or nothing in a build without npm.
#pragma once

#include <span>
#include <string_view>

namespace vantrel::sheets {

extern const std::span<const std::string_view> page_before_data;
extern const std::span<const std::string_view> page_after_data;

} // namespace vantrel::sheets
