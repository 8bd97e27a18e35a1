#include "read/first_alike.h"

#include <algorithm>
#include <functional>
#include <utility>

namespace vantrel::sheets {

std::vector<std::size_t> first_alike(const std::vector<std::string_view> &texts)
{
    std::vector<std::pair<std::size_t, std::size_t>> hashes; // with the places
    hashes.reserve(texts.size());
    for (const std::string_view text : texts)
        hashes.emplace_back(std::hash<std::string_view>()(text), hashes.size());
    std::sort(hashes.begin(), hashes.end());
    std::vector<std::size_t> out(texts.size());
    auto same_hash = hashes.begin();
    for (auto at = hashes.begin(); at != hashes.end(); ++at) {
        if (at->first != same_hash->first)
            same_hash = at;
        const std::string_view text = texts[at->second];
        out[at->second] = std::find_if(same_hash, at, [&](const auto &other) {
                              return texts[other.second] == text;
                          })->second;
    }
    return out;
}

} // namespace vantrel::sheets
