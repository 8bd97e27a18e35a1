// Texts that are equal among very many.
#pragma once

#include <cstddef>
#include <string_view>
#include <vector>

namespace vantrel::sheets {

// For each text the place of the first that is equal to it.
std::vector<std::size_t> first_alike(const std::vector<std::string_view> &texts);

} // namespace vantrel::sheets
