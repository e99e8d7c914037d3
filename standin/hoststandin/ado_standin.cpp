// ADODB.Connection and ADODB.Recordset over the stand-in database file, for machines without
// the Access provider. They keep ADO's behaviour for what the checker does with them: state,
// a static read-only recordset, Filter, EOF, Fields, Find, nulls, and the provider's errors.
#include <memory>

#include "host_components.h"
#include "standin_db.h"

namespace hoststandin {

namespace {

// ---- errors, with the numbers and texts ADO and the Access engine report
constexpr char kEngine[] = "Microsoft Access Database Engine";
constexpr char kAdoConnection[] = "ADODB.Connection";
constexpr char kAdoRecordset[] = "ADODB.Recordset";
constexpr char kAdoFields[] = "ADODB.Fields";
constexpr char kAdoField[] = "ADODB.Field";

ComFailure closedError(const char* source) {
    return {static_cast<HRESULT>(0x800A0E78), "Operation is not allowed when the object is closed.",
            source};
}
ComFailure openError(const char* source) {
    return {static_cast<HRESULT>(0x800A0E79), "Operation is not allowed when the object is open.",
            source};
}
ComFailure argumentsError(const char* source) {
    return {static_cast<HRESULT>(0x800A0BB9),
            "Arguments are of the wrong type, are out of acceptable range, or are in conflict with "
            "one another.",
            source};
}
ComFailure itemNotFound(const char* source) {
    return {
        static_cast<HRESULT>(0x800A0CC1),
        "Item cannot be found in the collection corresponding to the requested name or ordinal.",
        source};
}
ComFailure noCurrentRecord(const char* source) {
    return {
        static_cast<HRESULT>(0x800A0BCD),
        "Either BOF or EOF is True, or the current record has been deleted. Requested operation "
        "requires a current record.",
        source};
}

constexpr std::string_view kProvider = "Microsoft.ACE.OLEDB.12.0";
constexpr DWORD kLargestDatabase = 16u << 20;
constexpr long kStateClosed = 0, kStateOpen = 1;
constexpr long kBookmarkFirst = 1, kBookmarkLast = 2;
constexpr long kSearchBackward = -1;

// ---- Connection
enum ConnectionMember : DISPID { cState = 1, cOpen, cClose, cConnectionString };

class Connection final : public DispatchObject {
  public:
    Connection()
        : DispatchObject("Connection",
                         {{L"State", Kind::Property},
                          {L"Open", Kind::Method},
                          {L"Close", Kind::Method},
                          {L"ConnectionString", Kind::Property}},
                         cConnectionString) {}

    bool isOpen() const noexcept { return db_ != nullptr; }
    const Database& database() const { return *db_; }

  protected:
    void call(DISPID id, bool put, const std::vector<VARIANT>& args, VARIANT* result) override {
        switch (id) {
        case cState:
            if (put) throw argumentsError(kAdoConnection);
            setLong(result, isOpen() ? kStateOpen : kStateClosed);
            return;
        case cConnectionString:
            if (put) {
                if (isOpen()) throw openError(kAdoConnection);
                connection_ = textArg(args.back());
            } else {
                setText(result, connection_);
            }
            return;
        case cOpen:
            open(args);
            return;
        case cClose:
            if (!isOpen()) throw closedError(kAdoConnection);
            db_.reset();
            return;
        }
    }

  private:
    void open(const std::vector<VARIANT>& args) {
        if (isOpen()) throw openError(kAdoConnection);
        if (!args.empty() && !isMissing(args[0])) connection_ = textArg(args[0]);
        const auto provider = connectionValue(connection_, "Provider");
        if (!provider || !equalsNoCase(*provider, kProvider))
            throw ComFailure{static_cast<HRESULT>(0x800A0E7A),
                             "Provider cannot be found. It may not be properly installed.",
                             kAdoConnection};
        const std::string path = connectionValue(connection_, "Data Source").value_or("");
        const std::string password =
            connectionValue(connection_, "Jet OLEDB:Database Password").value_or("");

        const HANDLE file =
            ::CreateFileA(path.c_str(), GENERIC_READ, FILE_SHARE_READ | FILE_SHARE_WRITE, nullptr,
                          OPEN_EXISTING, FILE_ATTRIBUTE_NORMAL, nullptr);
        if (file == INVALID_HANDLE_VALUE) {
            const DWORD e = ::GetLastError();
            if (e == ERROR_FILE_NOT_FOUND || e == ERROR_PATH_NOT_FOUND || e == ERROR_INVALID_NAME ||
                path.empty())
                throw ComFailure{E_FAIL, "Could not find file '" + path + "'.", kEngine};
            throw ComFailure{
                E_FAIL,
                "The Microsoft Access database engine cannot open or write to the file '" + path +
                    "'. It is already opened exclusively by another user, or you need "
                    "permission to view and write its data.",
                kEngine};
        }
        std::string content;
        const DWORD size = ::GetFileSize(file, nullptr);
        bool readOk = size != INVALID_FILE_SIZE && size <= kLargestDatabase;
        if (readOk) {
            content.resize(size);
            DWORD got = 0;
            readOk =
                size == 0 || (::ReadFile(file, content.data(), size, &got, nullptr) && got == size);
        }
        ::CloseHandle(file);
        std::optional<Database> db;
        if (readOk) db = parse(content);
        if (!db) throw ComFailure{E_FAIL, "Unrecognized database format '" + path + "'.", kEngine};
        if (db->password != password)
            throw ComFailure{static_cast<HRESULT>(0x80040E4D), "Not a valid password.", kEngine};
        db_ = std::make_unique<Database>(std::move(*db));
    }

    std::string connection_;
    std::unique_ptr<Database> db_;
};

// ---- Recordset, with its Fields collection and Field objects
class Recordset;

enum RecordsetMember : DISPID {
    rState = 1,
    rOpen,
    rClose,
    rFilter,
    rEOF,
    rBOF,
    rFields,
    rFind,
    rMoveFirst,
    rMoveNext,
    rRecordCount
};

class Recordset final : public DispatchObject {
  public:
    Recordset()
        : DispatchObject("Recordset",
                         {{L"State", Kind::Property},
                          {L"Open", Kind::Method},
                          {L"Close", Kind::Method},
                          {L"Filter", Kind::Property},
                          {L"EOF", Kind::Property},
                          {L"BOF", Kind::Property},
                          {L"Fields", Kind::Property},
                          {L"Find", Kind::Method},
                          {L"MoveFirst", Kind::Method},
                          {L"MoveNext", Kind::Method},
                          {L"RecordCount", Kind::Property}},
                         rFields) {}

    bool isOpen() const noexcept { return open_; }
    const std::vector<std::string>& columns() const { return columns_; }
    const Cell& cell(std::size_t column, const char* source) const {
        if (!open_) throw closedError(source);
        if (cursor_ >= view_.size()) throw noCurrentRecord(source);
        return rows_[view_[cursor_]][column];
    }

  protected:
    void call(DISPID id, bool put, const std::vector<VARIANT>& args, VARIANT* result) override;

  private:
    void open(const std::vector<VARIANT>& args);
    void setFilter(const VARIANT& value);
    void find(const std::vector<VARIANT>& args);
    void requireOpen() const {
        if (!open_) throw closedError(kAdoRecordset);
    }

    bool open_ = false;
    std::vector<std::string> columns_;
    std::vector<std::vector<Cell>> rows_;
    std::vector<std::size_t> view_; // the rows the filter lets through, in order
    std::size_t cursor_ = 0;        // an index into view_; view_.size() is EOF
    std::string filter_;            // empty: no filter
};

class Field final : public DispatchObject {
  public:
    Field(Recordset* rs, std::size_t column)
        : DispatchObject("Field", {{L"Value", Kind::Property}, {L"Name", Kind::Property}}, 1),
          rs_(rs), column_(column) {
        rs_->AddRef();
    }
    ~Field() override { rs_->Release(); }

  protected:
    void call(DISPID id, bool put, const std::vector<VARIANT>&, VARIANT* result) override {
        if (put) throw argumentsError(kAdoField);
        if (id == 2) {
            setText(result, rs_->columns().at(column_));
            return;
        }
        const Cell& c = rs_->cell(column_, kAdoField);
        if (std::holds_alternative<Null>(c))
            result->vt = VT_NULL;
        else if (auto i = std::get_if<std::int32_t>(&c))
            setLong(result, *i);
        else
            setText(result, std::get<std::string>(c));
    }

  private:
    Recordset* rs_;
    std::size_t column_;
};

class Fields final : public DispatchObject {
  public:
    explicit Fields(Recordset* rs)
        : DispatchObject("Fields", {{L"Item", Kind::Method}, {L"Count", Kind::Property}}, 1),
          rs_(rs) {
        rs_->AddRef();
    }
    ~Fields() override { rs_->Release(); }

  protected:
    void call(DISPID id, bool put, const std::vector<VARIANT>& args, VARIANT* result) override {
        if (put) throw argumentsError(kAdoFields);
        if (!rs_->isOpen()) throw closedError(kAdoFields);
        if (id == 2) {
            setLong(result, static_cast<long>(rs_->columns().size()));
            return;
        }
        if (args.size() != 1) throw argumentsError(kAdoFields);
        std::optional<std::size_t> column;
        if (args[0].vt == VT_BSTR) {
            column = findColumn(rs_->columns(), textArg(args[0]));
        } else {
            const long ordinal = longArg(args[0]);
            if (ordinal >= 0 && static_cast<std::size_t>(ordinal) < rs_->columns().size())
                column = static_cast<std::size_t>(ordinal);
        }
        if (!column) throw itemNotFound(kAdoFields);
        setObject(result, new Field(rs_, *column));
    }

  private:
    Recordset* rs_;
};

void Recordset::call(DISPID id, bool put, const std::vector<VARIANT>& args, VARIANT* result) {
    if (put && id != rFilter) throw argumentsError(kAdoRecordset);
    switch (id) {
    case rState:
        setLong(result, open_ ? kStateOpen : kStateClosed);
        return;
    case rOpen:
        open(args);
        return;
    case rClose:
        requireOpen();
        open_ = false;
        rows_.clear();
        view_.clear();
        return;
    case rFilter:
        if (put) {
            requireOpen();
            setFilter(args.back());
        } else if (filter_.empty()) {
            setLong(result, 0);
        } else {
            setText(result, filter_);
        }
        return;
    case rEOF:
        requireOpen();
        setBool(result, cursor_ >= view_.size());
        return;
    case rBOF:
        requireOpen();
        setBool(result, view_.empty());
        return;
    case rFields:
        if (!args.empty()) throw argumentsError(kAdoRecordset);
        setObject(result, new Fields(this));
        return;
    case rFind:
        requireOpen();
        find(args);
        return;
    case rMoveFirst:
        requireOpen();
        cursor_ = 0;
        return;
    case rMoveNext:
        requireOpen();
        if (cursor_ >= view_.size()) throw noCurrentRecord(kAdoRecordset);
        ++cursor_;
        return;
    case rRecordCount:
        requireOpen();
        setLong(result, static_cast<long>(view_.size()));
        return;
    }
}

void Recordset::open(const std::vector<VARIANT>& args) {
    if (open_) throw openError(kAdoRecordset);
    if (args.size() < 2) throw argumentsError(kAdoRecordset);
    const auto* connection = dynamic_cast<const Connection*>(DispatchObject::fromVariant(args[1]));
    if (!connection || !connection->isOpen())
        throw ComFailure{
            static_cast<HRESULT>(0x800A0E7D),
            "The connection cannot be used to perform this operation. It is either closed or "
            "invalid in this context.",
            kAdoRecordset};
    const auto select = parseSelect(textArg(args[0]));
    if (!select)
        throw ComFailure{static_cast<HRESULT>(0x80040E14),
                         "Invalid SQL statement; expected 'DELETE', 'INSERT', 'PROCEDURE', "
                         "'SELECT', or 'UPDATE'.",
                         kEngine};
    const Table* table = findTable(connection->database(), select->table);
    if (!table)
        throw ComFailure{
            static_cast<HRESULT>(0x80040E37),
            "The Microsoft Access database engine cannot find the input table or query '" +
                select->table + "'. Make sure it exists and that its name is spelled correctly.",
            kEngine};
    std::vector<std::size_t> picked;
    if (select->columns.empty()) {
        for (std::size_t i = 0; i < table->columns.size(); ++i)
            picked.push_back(i);
    } else {
        for (const auto& name : select->columns) {
            const auto c = findColumn(table->columns, name);
            if (!c)
                throw ComFailure{static_cast<HRESULT>(0x80040E10),
                                 "No value given for one or more required parameters.", kEngine};
            picked.push_back(*c);
        }
    }
    columns_.clear();
    rows_.clear();
    for (std::size_t c : picked)
        columns_.push_back(table->columns[c]);
    for (const auto& row : table->rows) {
        std::vector<Cell> out;
        for (std::size_t c : picked)
            out.push_back(row[c]);
        rows_.push_back(std::move(out));
    }
    view_.clear();
    for (std::size_t i = 0; i < rows_.size(); ++i)
        view_.push_back(i);
    cursor_ = 0;
    filter_.clear();
    open_ = true;
}

void Recordset::setFilter(const VARIANT& value) {
    std::string text;
    if (value.vt == VT_BSTR) {
        text = textArg(value);
    } else if (longArg(value) != 0) { // only adFilterNone among the numbers
        throw argumentsError(kAdoRecordset);
    }
    std::vector<std::size_t> view;
    if (text.empty()) {
        for (std::size_t i = 0; i < rows_.size(); ++i)
            view.push_back(i);
    } else {
        const auto condition = parseCondition(text);
        if (!condition) throw argumentsError(kAdoRecordset);
        const auto column = findColumn(columns_, condition->column);
        if (!column) throw itemNotFound(kAdoRecordset);
        for (std::size_t i = 0; i < rows_.size(); ++i)
            if (matches(rows_[i][*column], condition->value)) view.push_back(i);
    }
    view_ = std::move(view);
    filter_ = text;
    cursor_ = 0;
}

void Recordset::find(const std::vector<VARIANT>& args) {
    if (args.empty()) throw argumentsError(kAdoRecordset);
    const auto condition = parseCondition(textArg(args[0]));
    if (!condition) throw argumentsError(kAdoRecordset);
    const auto column = findColumn(columns_, condition->column);
    if (!column) throw itemNotFound(kAdoRecordset);
    const long skip = args.size() > 1 && !isMissing(args[1]) ? longArg(args[1]) : 0;
    const bool backward =
        args.size() > 2 && !isMissing(args[2]) && longArg(args[2]) == kSearchBackward;
    long start = static_cast<long>(cursor_);
    if (args.size() > 3 && !isMissing(args[3])) {
        const long bookmark = longArg(args[3]);
        if (bookmark == kBookmarkFirst)
            start = 0;
        else if (bookmark == kBookmarkLast)
            start = static_cast<long>(view_.size()) - 1;
        else
            throw argumentsError(kAdoRecordset);
    } else if (cursor_ >= view_.size()) {
        throw noCurrentRecord(kAdoRecordset);
    }
    const long step = backward ? -1 : 1;
    for (long i = start + step * skip; i >= 0 && i < static_cast<long>(view_.size()); i += step) {
        if (matches(rows_[view_[static_cast<std::size_t>(i)]][*column], condition->value)) {
            cursor_ = static_cast<std::size_t>(i);
            return;
        }
    }
    // Not found: forward ends at EOF (backward at BOF, which this stand-in does not model apart).
    cursor_ = view_.size();
}

} // namespace

DispatchObject* newConnection() {
    return new Connection();
}
DispatchObject* newRecordset() {
    return new Recordset();
}

} // namespace hoststandin
