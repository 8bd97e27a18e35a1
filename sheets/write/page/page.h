// The page around its data: what page/build.mjs makes, or nothing in a build without npm.
#ifndef VANTREL_TOOL_PAGE_H
#define VANTREL_TOOL_PAGE_H

#include <span>
#include <string_view>

extern const std::span<const std::string_view> page_before_data;
extern const std::span<const std::string_view> page_after_data;

#endif
