#include "standin_db.h"

#include <cctype>
#include <charconv>
#include <sstream>

#include "host_cipher.h"

namespace hoststandin {

namespace {
constexpr std::string_view kMagic = "HOSTSTANDIN DATABASE 1";

std::string_view trim(std::string_view s) {
    while (!s.empty() && (s.front() == ' ' || s.front() == '\t'))
        s.remove_prefix(1);
    while (!s.empty() && (s.back() == ' ' || s.back() == '\t' || s.back() == '\r'))
        s.remove_suffix(1);
    return s;
}

std::vector<std::string_view> words(std::string_view line) {
    std::vector<std::string_view> out;
    std::size_t i = 0;
    while (i < line.size()) {
        while (i < line.size() && line[i] == ' ')
            ++i;
        const std::size_t start = i;
        while (i < line.size() && line[i] != ' ')
            ++i;
        if (i > start) out.push_back(line.substr(start, i - start));
    }
    return out;
}

bool isName(std::string_view s) {
    if (s.empty()) return false;
    for (char c : s)
        if (!std::isalnum(static_cast<unsigned char>(c)) && c != '_') return false;
    return true;
}

std::optional<std::int32_t> toInt(std::string_view s) {
    std::int32_t v = 0;
    const auto [end, ec] = std::from_chars(s.data(), s.data() + s.size(), v);
    if (ec != std::errc() || end != s.data() + s.size() || s.empty()) return std::nullopt;
    return v;
}

std::optional<Cell> parseCell(std::string_view w) {
    if (w == "N") return Cell(Null{});
    if (w.size() >= 2 && w[0] == 'I') {
        if (auto v = toInt(w.substr(1))) return Cell(*v);
        return std::nullopt;
    }
    if (!w.empty() && w[0] == 'S') {
        if (auto t = fromHex(w.substr(1))) return Cell(*t);
    }
    return std::nullopt;
}
} // namespace

bool equalsNoCase(std::string_view a, std::string_view b) {
    if (a.size() != b.size()) return false;
    for (std::size_t i = 0; i < a.size(); ++i)
        if (std::tolower(static_cast<unsigned char>(a[i])) !=
            std::tolower(static_cast<unsigned char>(b[i])))
            return false;
    return true;
}

std::string serialize(const Database& db) {
    std::ostringstream out;
    out << kMagic << "\npassword " << toHex(db.password) << "\n";
    for (const Table& t : db.tables) {
        out << "table " << t.name << "\n";
        for (const auto& c : t.columns)
            out << "column " << c << "\n";
        for (const auto& row : t.rows) {
            out << "row";
            for (const Cell& cell : row) {
                out << ' ';
                if (std::holds_alternative<Null>(cell))
                    out << 'N';
                else if (auto i = std::get_if<std::int32_t>(&cell))
                    out << 'I' << *i;
                else
                    out << 'S' << toHex(std::get<std::string>(cell));
            }
            out << "\n";
        }
        out << "end table\n";
    }
    out << "end database\n";
    return out.str();
}

std::optional<Database> parse(std::string_view text) {
    std::vector<std::string_view> lines;
    std::size_t start = 0;
    while (start < text.size()) {
        auto nl = text.find('\n', start);
        if (nl == std::string_view::npos) nl = text.size();
        lines.push_back(trim(text.substr(start, nl - start)));
        start = nl + 1;
    }
    std::size_t i = 0;
    if (lines.size() < 3 || lines[i++] != kMagic) return std::nullopt;
    Database db;
    {
        const auto w = words(lines[i++]);
        if (w.size() > 2 || w.empty() || w[0] != "password") return std::nullopt;
        if (w.size() == 2) {
            auto p = fromHex(w[1]);
            if (!p) return std::nullopt;
            db.password = *p;
        }
    }
    for (;;) {
        if (i >= lines.size()) return std::nullopt; // truncated
        const auto w = words(lines[i++]);
        if (w.size() == 2 && w[0] == "end" && w[1] == "database") break;
        if (w.size() != 2 || w[0] != "table" || !isName(w[1])) return std::nullopt;
        Table t;
        t.name = std::string(w[1]);
        for (;;) {
            if (i >= lines.size()) return std::nullopt;
            const auto r = words(lines[i++]);
            if (r.size() == 2 && r[0] == "end" && r[1] == "table") break;
            if (r.size() == 2 && r[0] == "column" && isName(r[1]) && t.rows.empty()) {
                t.columns.emplace_back(r[1]);
                continue;
            }
            if (r.empty() || r[0] != "row" || r.size() != t.columns.size() + 1) return std::nullopt;
            std::vector<Cell> row;
            for (std::size_t k = 1; k < r.size(); ++k) {
                auto cell = parseCell(r[k]);
                if (!cell) return std::nullopt;
                row.push_back(std::move(*cell));
            }
            t.rows.push_back(std::move(row));
        }
        db.tables.push_back(std::move(t));
    }
    for (; i < lines.size(); ++i)
        if (!lines[i].empty()) return std::nullopt;
    return db;
}

const Table* findTable(const Database& db, std::string_view name) {
    for (const Table& t : db.tables)
        if (equalsNoCase(t.name, name)) return &t;
    return nullptr;
}

std::optional<std::size_t> findColumn(const std::vector<std::string>& columns,
                                      std::string_view name) {
    for (std::size_t i = 0; i < columns.size(); ++i)
        if (equalsNoCase(columns[i], trim(name))) return i;
    return std::nullopt;
}

std::optional<Select> parseSelect(std::string_view sql) {
    sql = trim(sql);
    const auto w = words(sql);
    if (w.size() < 4 || !equalsNoCase(w[0], "select")) return std::nullopt;
    // Find FROM, then the table name as the last word.
    std::size_t from = 0;
    for (std::size_t k = 1; k < w.size(); ++k)
        if (equalsNoCase(w[k], "from")) from = k;
    if (from < 2 || from + 2 != w.size() || !isName(w[from + 1])) return std::nullopt;
    std::string list;
    for (std::size_t k = 1; k < from; ++k)
        list += std::string(w[k]);
    Select s;
    s.table = std::string(w[from + 1]);
    if (list == "*") return s;
    std::size_t pos = 0;
    for (;;) {
        const auto comma = list.find(',', pos);
        const std::string name =
            list.substr(pos, comma == std::string::npos ? std::string::npos : comma - pos);
        if (!isName(name)) return std::nullopt;
        s.columns.push_back(name);
        if (comma == std::string::npos) break;
        pos = comma + 1;
    }
    return s;
}

std::optional<Condition> parseCondition(std::string_view text) {
    const auto eq = text.find('=');
    if (eq == std::string_view::npos) return std::nullopt;
    const std::string_view name = trim(text.substr(0, eq));
    std::string_view value = trim(text.substr(eq + 1));
    if (!isName(name) || value.empty()) return std::nullopt;
    Condition c;
    c.column = std::string(name);
    if ((value.front() == '\'' || value.front() == '"') && value.size() >= 2 &&
        value.back() == value.front()) {
        c.value = std::string(value.substr(1, value.size() - 2));
        return c;
    }
    auto n = toInt(value);
    if (!n) return std::nullopt;
    c.value = *n;
    return c;
}

bool matches(const Cell& cell, const Cell& value) {
    if (std::holds_alternative<Null>(cell) || std::holds_alternative<Null>(value)) return false;
    if (auto a = std::get_if<std::int32_t>(&cell)) {
        if (auto b = std::get_if<std::int32_t>(&value)) return *a == *b;
        return std::to_string(*a) == std::get<std::string>(value);
    }
    const std::string& a = std::get<std::string>(cell);
    if (auto b = std::get_if<std::int32_t>(&value)) return a == std::to_string(*b);
    return equalsNoCase(a, std::get<std::string>(value));
}

std::optional<std::string> connectionValue(std::string_view connection, std::string_view key) {
    std::size_t pos = 0;
    while (pos <= connection.size()) {
        auto semi = connection.find(';', pos);
        if (semi == std::string_view::npos) semi = connection.size();
        const std::string_view part = connection.substr(pos, semi - pos);
        const auto eq = part.find('=');
        if (eq != std::string_view::npos && equalsNoCase(trim(part.substr(0, eq)), key)) {
            return std::string(part.substr(eq + 1));
        }
        pos = semi + 1;
    }
    return std::nullopt;
}

} // namespace hoststandin
