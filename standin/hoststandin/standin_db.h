// The stand-in database: a small text file holding tables of integer and text cells, with the
// password the host protects it with. Portable: hostkit writes it, the DLL reads it.
//
//   HOSTSTANDIN DATABASE 1
//   password <hex>
//   table <name>
//   column <name>            (one line per column)
//   row <cell> <cell> ...    (N = null, I<decimal>, S<hex of the text>)
//   end table
//   end database
#pragma once

#include <cstdint>
#include <optional>
#include <string>
#include <string_view>
#include <variant>
#include <vector>

namespace hoststandin {

struct Null {
    friend bool operator==(Null, Null) { return true; }
};
using Cell = std::variant<Null, std::int32_t, std::string>;

struct Table {
    std::string name;
    std::vector<std::string> columns;
    std::vector<std::vector<Cell>> rows;
};

struct Database {
    std::string password;
    std::vector<Table> tables;
};

std::string serialize(const Database& db);
// Nothing for anything that is not a whole, well-formed database file (empty, truncated, garbage).
std::optional<Database> parse(std::string_view text);

bool equalsNoCase(std::string_view a, std::string_view b);
const Table* findTable(const Database& db, std::string_view name);
std::optional<std::size_t> findColumn(const std::vector<std::string>& columns,
                                      std::string_view name);

// "SELECT * FROM t" or "SELECT a,b FROM t", any case, blanks around the parts.
struct Select {
    std::vector<std::string> columns; // empty: every column
    std::string table;
};
std::optional<Select> parseSelect(std::string_view sql);

// "column = value" with a number or a quoted text ('...' or "...").
struct Condition {
    std::string column;
    Cell value;
};
std::optional<Condition> parseCondition(std::string_view text);
bool matches(const Cell& cell, const Cell& value);

// Key=value pairs of a connection string, keys compared without case.
std::optional<std::string> connectionValue(std::string_view connection, std::string_view key);

} // namespace hoststandin
