// hostkit: makes what the host product's installer would leave behind, for tests and the demo.
// Run `hostkit --help` for the commands.
#include <unistd.h>

#include <cstdint>
#include <cstdio>
#include <cstring>
#include <filesystem>
#include <fstream>
#include <iostream>
#include <iterator>
#include <optional>
#include <sstream>
#include <string>
#include <vector>

#include "host_cipher.h"
#include "host_secrets.h"
#include "standin_db.h"

namespace fs = std::filesystem;
using namespace hoststandin;

namespace {

constexpr char kHelp[] = R"(hostkit: host product stand-ins for the update checker's tests

  hostkit exe PATH [--version A.B.C.D]
      A runnable Windows executable at PATH. With --version it carries that file version
      (1 to 4 numbers, missing ones are 0); without, it has no version resource.

  hostkit db PATH [options]
      A stand-in host database with a PlanIDs table (columns Plan, Settings).
      --password TEXT      database password (default: the one the host components yield;
                           any other makes a database the checker cannot open)
      --row PLAN=TEXT      a row whose Settings hold TEXT enciphered as the host does
      --row-hex PLAN=HEX   the same with the plain text given as hex bytes (NULs, any byte)
      --raw-row PLAN=TEXT  a row whose stored Settings are TEXT as it stands (not enciphered)
      --null PLAN          a row whose Settings are null
      --no-table           no PlanIDs table at all
      --columns LIST       the table's columns, e.g. Plan (no Settings); default Plan,Settings
      Rows come in the order given.

  hostkit folder DIR --type standalone|client|second [options]
      A checker folder for one installation type: marker files, host executable, database.
        standalone: OZPLICNew.exe, data/OZPBLANK.ACCDB, data/Ozp.ACCDB
        client:     OZPLICNew.exe, CLIENT.INI (ServerPath=Z:\...\SERVERDIR\), and the
                    database in SERVERDIR/data/Ozp.ACCDB
        second:     OrvelDo.exe, data/ODOZBLANK.MDB, data/Odoz.Mdb
      --server SERVERDIR   the server folder of a client (required for --type client).
                           The checker reads at most 49 characters of ServerPath, so a longer
                           one is written through a short link /tmp/hostkit-links/<hash>
                           ($HOSTKIT_LINKS overrides the folder)
      --long-server-path   write the server folder's own path even when it is too long
      --version A.B.C.D    host executable version (default 10.3.0.3)
      --no-version         host executable without a version resource
      --no-exe             no host executable (a stand-alone folder is still stand-alone)
      --cust-id TEXT       row 999 present and the customer row (14, or 89 for second) = TEXT;
                           without it there is no row 999
      --flag-null          row 999 present with a null Settings
      --no-cust-row        no customer row (with --cust-id: row 999 stays)
      --cust-null          the customer row's Settings are null
      --application TEXT   Application.INI [General] Application=TEXT
      --password TEXT      database password (see db)
      --no-db              no database file (the checker then ends silently)
      and the db options --row, --row-hex, --raw-row, --null, --no-table, --columns.

  hostkit encipher TEXT | hostkit decipher HEX
      The host's cipher, for looking at databases by hand.

  The executables are copied from the Windows build (hoststub.exe, hoststub-versioned.exe):
  --stubs DIR, else $HOSTKIT_STUBS, else <hostkit's folder>/../windows.
)";

[[noreturn]] void die(const std::string& message) {
    std::cerr << "hostkit: " << message << "\n";
    std::exit(2);
}

struct Args {
    std::vector<std::string> items;
    std::size_t pos = 0;
    bool more() const { return pos < items.size(); }
    std::string next(const std::string& what) {
        if (!more()) die("missing " + what);
        return items[pos++];
    }
};

std::string readFile(const fs::path& p) {
    std::ifstream in(p, std::ios::binary);
    if (!in) die("cannot read " + p.string());
    return std::string(std::istreambuf_iterator<char>(in), {});
}

void writeFile(const fs::path& p, const std::string& data) {
    if (p.has_parent_path()) fs::create_directories(p.parent_path());
    std::ofstream out(p, std::ios::binary | std::ios::trunc);
    if (!out || !out.write(data.data(), static_cast<std::streamsize>(data.size())))
        die("cannot write " + p.string());
}

fs::path stubsDir(const std::optional<std::string>& given) {
    if (given) return *given;
    if (const char* env = std::getenv("HOSTKIT_STUBS")) return env;
    char self[4096];
    const ssize_t n = ::readlink("/proc/self/exe", self, sizeof self - 1);
    if (n <= 0) die("cannot find the Windows build: give --stubs DIR");
    self[n] = '\0';
    return fs::path(self).parent_path().parent_path() / "windows";
}

// "A.B.C.D" (1 to 4 numbers of 16 bits) as the two 32-bit halves of a fixed version block.
std::pair<std::uint32_t, std::uint32_t> parseVersion(const std::string& text) {
    std::uint32_t part[4] = {0, 0, 0, 0};
    std::size_t count = 0, start = 0;
    for (;;) {
        const auto dot = text.find('.', start);
        const std::string s =
            text.substr(start, dot == std::string::npos ? std::string::npos : dot - start);
        if (s.empty() || s.size() > 5 || s.find_first_not_of("0123456789") != std::string::npos ||
            count == 4)
            die("bad version: " + text);
        const unsigned long v = std::stoul(s);
        if (v > 0xFFFF) die("bad version: " + text);
        part[count++] = static_cast<std::uint32_t>(v);
        if (dot == std::string::npos) break;
        start = dot + 1;
    }
    return {(part[0] << 16) | part[1], (part[2] << 16) | part[3]};
}

void putLe32(std::string& data, std::size_t at, std::uint32_t v) {
    for (int i = 0; i < 4; ++i)
        data[at + i] = static_cast<char>((v >> (8 * i)) & 0xFF);
}

void makeExe(const fs::path& path, const std::optional<std::string>& version,
             const fs::path& stubs) {
    if (!version) {
        writeFile(path, readFile(stubs / "hoststub.exe"));
        return;
    }
    const auto [ms, ls] = parseVersion(*version);
    std::string data = readFile(stubs / "hoststub-versioned.exe");
    // VS_FIXEDFILEINFO: signature, structure version, file version MS/LS, product version MS/LS.
    const std::string signature("\xBD\x04\xEF\xFE", 4);
    const auto at = data.find(signature);
    if (at == std::string::npos || data.find(signature, at + 1) != std::string::npos)
        die("hoststub-versioned.exe has no single version block");
    putLe32(data, at + 8, ms);
    putLe32(data, at + 12, ls);
    putLe32(data, at + 16, ms);
    putLe32(data, at + 20, ls);
    writeFile(path, data);
}

// ---- databases
struct DbLayout {
    std::string password{kDatabasePassword};
    bool noTable = false;
    std::vector<std::string> columns{"Plan", "Settings"};
    std::vector<std::pair<std::int32_t, Cell>> rows; // plan, stored Settings
};

std::int32_t planOf(const std::string& text) {
    try {
        std::size_t used = 0;
        const long v = std::stol(text, &used);
        if (used == text.size()) return static_cast<std::int32_t>(v);
    } catch (...) {
    }
    die("bad plan number: " + text);
}

// Takes one db option at args.pos - 1; false when it is not one.
bool dbOption(const std::string& opt, Args& args, DbLayout& layout) {
    auto planText = [&](const std::string& what) {
        const std::string v = args.next(what);
        const auto eq = v.find('=');
        if (eq == std::string::npos) die(what + " needs PLAN=TEXT");
        return std::make_pair(planOf(v.substr(0, eq)), v.substr(eq + 1));
    };
    if (opt == "--password")
        layout.password = args.next("--password TEXT");
    else if (opt == "--no-table")
        layout.noTable = true;
    else if (opt == "--row") {
        auto [plan, text] = planText("--row");
        layout.rows.emplace_back(plan, Cell(encipher(text, kSecretKey)));
    } else if (opt == "--row-hex") {
        auto [plan, hex] = planText("--row-hex");
        const auto bytes = fromHex(hex);
        if (!bytes) die("--row-hex needs hex digits");
        layout.rows.emplace_back(plan, Cell(encipher(*bytes, kSecretKey)));
    } else if (opt == "--raw-row") {
        auto [plan, text] = planText("--raw-row");
        layout.rows.emplace_back(plan, Cell(text));
    } else if (opt == "--null") {
        layout.rows.emplace_back(planOf(args.next("--null PLAN")), Cell(Null{}));
    } else if (opt == "--columns") {
        layout.columns.clear();
        std::stringstream list(args.next("--columns LIST"));
        for (std::string c; std::getline(list, c, ',');)
            if (!c.empty()) layout.columns.push_back(c);
    } else {
        return false;
    }
    return true;
}

std::string buildDb(const DbLayout& layout) {
    Database db;
    db.password = layout.password;
    if (!layout.noTable) {
        Table t;
        t.name = "PlanIDs";
        t.columns = layout.columns;
        for (const auto& [plan, settings] : layout.rows) {
            std::vector<Cell> row;
            for (const auto& c : layout.columns) {
                if (equalsNoCase(c, "Plan"))
                    row.emplace_back(plan);
                else if (equalsNoCase(c, "Settings"))
                    row.push_back(settings);
                else
                    row.emplace_back(Null{});
            }
            t.rows.push_back(std::move(row));
        }
        db.tables.push_back(std::move(t));
    }
    return serialize(db);
}

std::string windowsPath(const fs::path& p) {
    std::string s = fs::absolute(p).lexically_normal().string();
    for (char& c : s)
        if (c == '/') c = '\\';
    return "Z:" + s;
}

// The checker reads ServerPath into 50 characters, so at most 49 arrive. A longer server path
// goes through a short symbolic link: /tmp/hostkit-links/<hash> (or $HOSTKIT_LINKS/<hash>).
constexpr std::size_t kLongestServerPath = 49;

std::string shortLink(const fs::path& target) {
    const fs::path absolute = fs::absolute(target).lexically_normal();
    const char* env = std::getenv("HOSTKIT_LINKS");
    const fs::path links = env ? fs::path(env) : fs::path("/tmp/hostkit-links");
    fs::create_directories(links);
    std::uint32_t h = 2166136261u; // FNV-1a of the path: one stable link per server folder
    for (char c : absolute.string())
        h = (h ^ static_cast<unsigned char>(c)) * 16777619u;
    char name[16];
    std::snprintf(name, sizeof name, "%08x", h);
    const fs::path link = links / name;
    std::error_code ec;
    fs::remove(link, ec);
    fs::create_directory_symlink(absolute, link);
    return windowsPath(link);
}

int cmdExe(Args& args) {
    const fs::path path = args.next("PATH");
    std::optional<std::string> version, stubs;
    while (args.more()) {
        const std::string opt = args.next("option");
        if (opt == "--version")
            version = args.next("--version A.B.C.D");
        else if (opt == "--stubs")
            stubs = args.next("--stubs DIR");
        else
            die("unknown option " + opt);
    }
    makeExe(path, version, stubsDir(stubs));
    std::cout << path.string() << "\n";
    return 0;
}

int cmdDb(Args& args) {
    const fs::path path = args.next("PATH");
    DbLayout layout;
    while (args.more()) {
        const std::string opt = args.next("option");
        if (!dbOption(opt, args, layout)) die("unknown option " + opt);
    }
    writeFile(path, buildDb(layout));
    std::cout << path.string() << "\n";
    return 0;
}

int cmdFolder(Args& args) {
    const fs::path dir = args.next("DIR");
    std::string type;
    std::optional<std::string> server, custId, application, stubs;
    std::string version = "10.3.0.3";
    bool longServerPath = false;
    bool noVersion = false, noExe = false, flagNull = false, noCustRow = false, custNull = false,
         noDb = false;
    DbLayout layout;
    DbLayout extra; // rows given with the db options come after the ones made here
    extra.password = layout.password;
    while (args.more()) {
        const std::string opt = args.next("option");
        if (opt == "--type")
            type = args.next("--type");
        else if (opt == "--server")
            server = args.next("--server SERVERDIR");
        else if (opt == "--version")
            version = args.next("--version A.B.C.D");
        else if (opt == "--no-version")
            noVersion = true;
        else if (opt == "--no-exe")
            noExe = true;
        else if (opt == "--cust-id")
            custId = args.next("--cust-id TEXT");
        else if (opt == "--flag-null")
            flagNull = true;
        else if (opt == "--no-cust-row")
            noCustRow = true;
        else if (opt == "--cust-null")
            custNull = true;
        else if (opt == "--application")
            application = args.next("--application TEXT");
        else if (opt == "--no-db")
            noDb = true;
        else if (opt == "--long-server-path")
            longServerPath = true;
        else if (opt == "--stubs")
            stubs = args.next("--stubs DIR");
        else if (!dbOption(opt, args, extra))
            die("unknown option " + opt);
    }
    if (type != "standalone" && type != "client" && type != "second")
        die("--type must be standalone, client or second");
    if (type == "client" && !server) die("--type client needs --server SERVERDIR");

    fs::create_directories(dir / "data");
    const bool second = type == "second";
    const std::int32_t custPlan = second ? 89 : 14;
    const std::int32_t otherPlan = second ? 14 : 89;
    if (!noExe) {
        const std::optional<std::string> v =
            noVersion ? std::nullopt : std::optional<std::string>(version);
        makeExe(dir / (second ? "OrvelDo.exe" : "OZPLICNew.exe"), v, stubsDir(stubs));
    }
    if (type == "standalone") writeFile(dir / "data" / "OZPBLANK.ACCDB", "");
    if (second) writeFile(dir / "data" / "ODOZBLANK.MDB", "");
    if (application)
        writeFile(dir / "Application.INI", "[General]\r\nApplication=" + *application + "\r\n");
    if (type == "client") {
        fs::create_directories(*server);
        std::string serverPath = windowsPath(*server) + "\\";
        if (serverPath.size() > kLongestServerPath && !longServerPath)
            serverPath = shortLink(*server) + "\\";
        writeFile(dir / "CLIENT.INI", "[General]\r\nServerPath=" + serverPath + "\r\n");
    }

    // Rows the checker must pass over, around the ones it reads.
    layout.password = extra.password;
    layout.noTable = extra.noTable;
    layout.columns = extra.columns;
    layout.rows.emplace_back(1, Cell(encipher("STANDARD", kSecretKey)));
    layout.rows.emplace_back(otherPlan, Cell(encipher("OTHER-PRODUCT-99", kSecretKey)));
    if (flagNull)
        layout.rows.emplace_back(999, Cell(Null{}));
    else if (custId)
        layout.rows.emplace_back(999, Cell(encipher("1", kSecretKey)));
    if (!noCustRow) {
        if (custNull)
            layout.rows.emplace_back(custPlan, Cell(Null{}));
        else
            layout.rows.emplace_back(custPlan,
                                     Cell(encipher(custId.value_or("CUSTOMER-CODE"), kSecretKey)));
    }
    layout.rows.insert(layout.rows.end(), extra.rows.begin(), extra.rows.end());
    layout.rows.emplace_back(1000, Cell(encipher("LAST", kSecretKey)));

    if (!noDb) {
        const fs::path dbDir = type == "client" ? fs::path(*server) / "data" : dir / "data";
        writeFile(dbDir / (second ? "Odoz.Mdb" : "Ozp.ACCDB"), buildDb(layout));
    }
    std::cout << fs::absolute(dir).string() << "\n";
    return 0;
}

} // namespace

int main(int argc, char** argv) {
    Args args;
    for (int i = 1; i < argc; ++i)
        args.items.emplace_back(argv[i]);
    if (!args.more() || args.items[0] == "--help" || args.items[0] == "-h") {
        std::cout << kHelp;
        return args.more() ? 0 : 2;
    }
    const std::string cmd = args.next("command");
    try {
        if (cmd == "exe") return cmdExe(args);
        if (cmd == "db") return cmdDb(args);
        if (cmd == "folder") return cmdFolder(args);
        if (cmd == "encipher") {
            std::cout << encipher(args.next("TEXT"), kSecretKey) << "\n";
            return 0;
        }
        if (cmd == "decipher") {
            const auto plain = decipher(args.next("HEX"), kSecretKey);
            if (!plain) die("not an enciphered text");
            std::cout << *plain << "\n";
            return 0;
        }
    } catch (const std::exception& e) {
        die(e.what());
    }
    die("unknown command " + cmd + " (see hostkit --help)");
}
