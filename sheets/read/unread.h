// Columns of a table that nothing reads, and what is said of them.
#pragma once

#include "read/ink_columns.h"
#include "read/lines.h"
#include "read/sheet.h"

#include <cstddef>
#include <string>
#include <utility>
#include <vector>

namespace vantrel::sheets {

class UnreadColumns {
public:
    // Columns that continue the name of another set of wavelengths ("M2 380", "M2 390", …) are told
    // together. Beside spectra, colours under further illuminants say nothing more, and without
    // colours that are read neither does a part of one.
    struct Read {
        bool spectra, colours;
    };
    void find(const std::vector<std::string> &fields, const std::vector<std::string> &keys,
              const std::vector<std::size_t> &unread, Read read);

    // With the row that became the sheet's last patch.
    void take(const Row &row);

    // The column is read after all, or was warned about.
    void leave(std::size_t column);

    // Whether all its cells tell conditions, some of them more than once.
    bool repeats_conditions(std::size_t column) const;

    // Takes what columns tell as keywords do, and warns of the others. The line is that of the
    // heading.
    void finish(Sheet &sheet, std::size_t line) const;

private:
    struct Column {
        explicit Column(std::size_t place, const std::string &field, const std::string &key,
                        bool aside);
        void take(std::string_view cell);
        bool told_by_keyword(Sheet &sheet) const;
        bool recurs() const; // a few words again and again, which are told
        std::string described() const;

        std::size_t place;
        DoubtfulColumn ink;
        std::string head; // in quotes
        std::string key;
        bool aside;              // says nothing about the readings
        bool conditional = true; // all cells are conditions or empty
        std::size_t rows = 0;
        std::vector<Condition> conditions;                      // up to the last row that tells one
        std::vector<std::pair<std::string, std::size_t>> words; // the first, and how often each
        std::size_t filled = 0;
    };
    std::vector<Column> columns;
    std::vector<std::string> sets; // of wavelengths
};

} // namespace vantrel::sheets
