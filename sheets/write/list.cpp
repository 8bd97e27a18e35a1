// A list as table, JSON and columns.

#include "read/text.h"
#include "write/json_text.h"
#include "write/result.h"
#include "write/table_text.h"

#include <fmt/format.h>

#include <algorithm>

namespace vantrel::sheets {
namespace {

Flat flat(const List &list)
{
    Flat out;
    out.description = list.what;
    out.rows = list.rows();
    for (const ListColumn &column : list.columns)
        if (const auto *texts = std::get_if<std::vector<std::string>>(&column.values))
            out.text(column.name, column.cgats, [texts](std::size_t i) { return (*texts)[i]; });
        else
            out.exact(column.name, column.cgats,
                      [numbers = std::get_if<std::vector<double>>(&column.values)](std::size_t i) {
                          return (*numbers)[i];
                      });
    return out;
}

// A number to four decimals, without those that are 0.
std::string shown(const Column &column, std::size_t row)
{
    const std::string text = column.cell(row);
    const auto value = column.text ? std::nullopt : number_in(text);
    return value && text.find_first_of(".e") != std::string::npos ? fixed(value, 4) : text;
}

} // namespace

void write_table(const List &list, const Sink &sink, const TableStyle &)
{
    const Flat table = flat(list);
    std::vector<std::string> lines(table.rows + 1);
    for (const Column &column : table.columns) {
        std::vector<std::string> cells = {column.name};
        for (std::size_t i = 0; i < table.rows; ++i)
            cells.push_back(shown(column, i));
        std::size_t width = 0;
        for (const std::string &cell : cells)
            width = std::max(width, characters(cell));
        for (std::size_t i = 0; i < lines.size(); ++i) {
            const std::string padding(width - characters(cells[i]), ' ');
            lines[i] += (&column == table.columns.data() ? "" : "  ") +
                        (column.text ? cells[i] + padding : padding + cells[i]);
        }
    }
    Lines out(sink);
    for (const std::string &line : lines)
        out.add(line);
}

void write_json(const List &list, const Sink &sink)
{
    const Flat table = flat(list);
    const Json head = {{"command", "list"}, {"list", list.what}};
    const auto row_json = [&](std::size_t i) {
        Json out = Json::object();
        for (const Column &column : table.columns) {
            const std::string cell = column.cell(i);
            out[column.name] =
                column.text ? Json(cell) : Json::parse(cell); // whole numbers as such
        }
        return out.dump();
    };
    write_with_array(head, "rows", table.rows, row_json, sink);
    sink.write("\n");
}

std::vector<Flat> flat_of(const List &list) { return {flat(list)}; }

} // namespace vantrel::sheets
