// Columns that tell of each row how it was measured.
#pragma once

#include "read/header.h"
#include "read/lines.h"

#include <cstddef>
#include <string>
#include <vector>

namespace vantrel::sheets {

class MethodColumns {
public:
    explicit MethodColumns(const std::vector<std::string> &keys);

    bool has(std::size_t column) const;
    std::vector<std::size_t> all() const;

    // The condition that a row tells; through polarisers or without ultraviolet whatever else it
    // tells. What is none that is known is kept in the header.
    Condition condition(const Row &row, Header &header) const;

    // Backing and geometry as Header::setup() tells them, by the row where it has such columns.
    bool tell_setup() const { return !backings.empty() || !geometries.empty(); }
    std::string setup(const Row &row, const Header &header) const;

private:
    struct Column {
        std::size_t place;
        std::string key;
    };
    std::vector<Column> conditions, backings, geometries;
};

} // namespace vantrel::sheets
