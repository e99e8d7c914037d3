// Host database access: the password from the host's components, the one connection of
// start-up, the settings read and the customer-row read. Everything goes through late-bound
// automation calls, so a failure carries the number and text of the layer that raised it.
#include <windows.h>

#include <memory>
#include <optional>
#include <string>

#include "common/com_win32.h"
#include "common/constants.h"
#include "common/files_win32.h"
#include "startup/host_database.h"
#include "tray/frmCheckUpdate_win32.h"

namespace checker {

namespace c = checker::startup;

namespace {

// The connection lives from prOpenDatabase to the end of start-up, and no longer.
ComPtr<IDispatch> objConn;

UniqueVariant dispatchArg(IDispatch* object) {
    UniqueVariant v;
    VARIANT* raw = v.put();
    raw->vt = VT_DISPATCH;
    raw->pdispVal = object;
    if (object) object->AddRef();
    return v;
}

std::int32_t longOf(const UniqueVariant& value, const std::string& source) {
    UniqueVariant converted;
    if (FAILED(::VariantChangeType(converted.put(), const_cast<VARIANT*>(value.get()), 0, VT_I4)))
        throw typeMismatchError(source);
    return converted.get()->lVal;
}

bool boolOf(const UniqueVariant& value, const std::string& source) {
    UniqueVariant converted;
    if (FAILED(::VariantChangeType(converted.put(), const_cast<VARIANT*>(value.get()), 0, VT_BOOL)))
        throw typeMismatchError(source);
    return converted.get()->boolVal != VARIANT_FALSE;
}

// rs.Fields(index).Value, where index is a column name or an ordinal.
UniqueVariant fieldValue(IDispatch* rs, UniqueVariant index) {
    const UniqueVariant fields = getProperty(rs, c::kMemberFields);
    const ComPtr<IDispatch> fieldsObject =
        variantToDispatch(*fields.get(), std::string(c::kMemberFields));
    std::vector<UniqueVariant> args;
    args.push_back(std::move(index));
    const UniqueVariant field = invokeMethod(fieldsObject.Get(), c::kMemberItem, std::move(args));
    const ComPtr<IDispatch> fieldObject =
        variantToDispatch(*field.get(), std::string(c::kMemberItem));
    return getProperty(fieldObject.Get(), c::kMemberValue);
}

std::optional<std::string> textOrNull(const UniqueVariant& value) {
    if (value.isNull()) return std::nullopt;
    return variantToText(*value.get(), std::string(c::kColumnSettings));
}

// An ADODB.Recordset opened on objConn: static cursor, read-only locking, options unspecified.
class AdoPlanRecordset final : public PlanRecordset {
  public:
    explicit AdoPlanRecordset(std::string_view sql) : rs_(createByProgId(c::kProgIdRecordset)) {
        std::vector<UniqueVariant> args;
        args.emplace_back(sql);
        args.push_back(dispatchArg(objConn.Get()));
        args.emplace_back(static_cast<long>(c::kAdOpenStatic));
        args.emplace_back(static_cast<long>(c::kAdLockReadOnly));
        args.push_back(UniqueVariant::missing());
        invokeMethod(rs_.Get(), c::kMemberOpen, std::move(args));
    }
    void clearFilter() override {
        putProperty(rs_.Get(), c::kMemberFilter,
                    UniqueVariant(static_cast<long>(c::kAdFilterNone)));
    }
    void filter(const std::string& criteria) override {
        putProperty(rs_.Get(), c::kMemberFilter, UniqueVariant(criteria));
    }
    bool eof() override {
        return boolOf(getProperty(rs_.Get(), c::kMemberEOF), std::string(c::kMemberEOF));
    }
    std::optional<std::string> field(std::string_view column) override {
        return textOrNull(fieldValue(rs_.Get(), UniqueVariant(column)));
    }
    std::optional<std::string> firstField() override {
        return textOrNull(fieldValue(rs_.Get(), UniqueVariant(static_cast<long>(c::kFirstColumn))));
    }
    void findFirst(const std::string& criteria) override {
        std::vector<UniqueVariant> args;
        args.emplace_back(criteria);
        args.emplace_back(0L);
        args.emplace_back(static_cast<long>(c::kAdSearchForward));
        args.emplace_back(static_cast<long>(c::kAdBookmarkFirst));
        invokeMethod(rs_.Get(), c::kMemberFind, std::move(args));
    }
    bool isOpen() override {
        return longOf(getProperty(rs_.Get(), c::kMemberState), std::string(c::kMemberState)) ==
               c::kAdStateOpen;
    }
    void close() override { invokeMethod(rs_.Get(), c::kMemberClose); }

  private:
    ComPtr<IDispatch> rs_; // released with this object
};

class AdoHostDatabase final : public HostDatabasePort {
  public:
    std::unique_ptr<PlanRecordset> open(std::string_view sql) override {
        return std::make_unique<AdoPlanRecordset>(sql);
    }
    // The Settings are stored enciphered. Their plain form comes from the host's own protection
    // component, the one that also yields the database password: created for this one text,
    // given the key, asked to decipher, released.
    std::string plainSettings(const std::string& stored) override {
        ComPtr<IDispatch> protect = createByProgId(c::kProgIdProtect);
        putProperty(protect.Get(), c::kMemberSecretKey, UniqueVariant(c::kSecretKey));
        std::vector<UniqueVariant> args;
        args.emplace_back(stored);
        const UniqueVariant plain =
            invokeMethod(protect.Get(), c::kMemberDecryptURL, std::move(args));
        return variantToText(*plain.get(), std::string(c::kMemberDecryptURL));
    }
};

} // namespace

void frmCheckUpdate::prOpenDatabase() {
    ComPtr<IDispatch> plan = createByProgId(c::kProgIdPlan);
    ComPtr<IDispatch> protect = createByProgId(c::kProgIdProtect);
    putProperty(protect.Get(), c::kMemberSecretKey, UniqueVariant(c::kSecretKey));
    std::vector<UniqueVariant> planArgs;
    planArgs.emplace_back(c::kPlanCode);
    UniqueVariant planName = invokeMethod(plan.Get(), c::kMemberGetPlanName, std::move(planArgs));
    // getPlanName's value goes to DecryptURL unchanged, whatever its type.
    std::vector<UniqueVariant> decryptArgs;
    decryptArgs.push_back(std::move(planName));
    const UniqueVariant deciphered =
        invokeMethod(protect.Get(), c::kMemberDecryptURL, std::move(decryptArgs));
    const std::string password =
        fnPasswordFromPlan(variantToText(*deciphered.get(), std::string(c::kMemberDecryptURL)));

    objConn = createByProgId(c::kProgIdConnection);
    if (longOf(getProperty(objConn.Get(), c::kMemberState), std::string(c::kMemberState)) ==
        c::kAdStateClosed) {
        std::vector<UniqueVariant> args;
        args.emplace_back(fnConnectionString(profile.strDatabasePath, password));
        args.emplace_back(std::string_view());
        args.emplace_back(std::string_view());
        args.push_back(UniqueVariant::missing());
        invokeMethod(objConn.Get(), c::kMemberOpen, std::move(args));
    }
    protect.Reset();
    plan.Reset();
}

void frmCheckUpdate::prReadSettings() {
    AdoHostDatabase db;
    fnReadSettings(db, profile.bytCustPlan, record);
}

void frmCheckUpdate::prGetVersion() {
    Win32FilesPort files;
    AdoHostDatabase db;
    // No version: the end of the program, at once and silently (the tray icon stays as it is).
    if (!fnGetVersion(files, db, profile, strFolder, record)) ::ExitProcess(0);
}

void frmCheckUpdate::prCloseDatabase() {
    if (!objConn) return;
    if (longOf(getProperty(objConn.Get(), c::kMemberState), std::string(c::kMemberState)) ==
        c::kAdStateOpen)
        invokeMethod(objConn.Get(), c::kMemberClose);
    objConn.Reset();
}

} // namespace checker
