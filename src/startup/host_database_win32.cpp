// Host database access: the password from the host's components, the one connection of
// start-up, the settings read and the customer-row read. Everything goes through late-bound
// automation calls, so a failure carries the number and text of the layer that raised it.
#include <windows.h>

#include <string>

#include "common/com_win32.h"
#include "common/constants.h"
#include "common/files_win32.h"
#include "common/text.h"
#include "startup/customer_id.h"
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
    if (FAILED(
            ::VariantChangeType(converted.put(), const_cast<VARIANT*>(value.get()), 0, VT_BOOL)))
        throw typeMismatchError(source);
    return converted.get()->boolVal != VARIANT_FALSE;
}

// The Settings are stored enciphered. Their plain form comes from the host's own protection
// component, the one that also yields the database password: created for this one text,
// given the key, asked to decipher, released. A null value cannot be passed as text (error 94).
std::string fnPlainSettings(const UniqueVariant& stored, const std::string& storedText) {
    if (stored.isNull()) throw CheckerError(94, std::string(c::kColumnSettings), "Invalid use of Null");
    ComPtr<IDispatch> protect = createByProgId(c::kProgIdProtect);
    putProperty(protect.Get(), c::kMemberSecretKey, UniqueVariant(c::kSecretKey));
    std::vector<UniqueVariant> args;
    args.emplace_back(storedText);
    const UniqueVariant plain = invokeMethod(protect.Get(), c::kMemberDecryptURL, std::move(args));
    return variantToText(*plain.get(), std::string(c::kMemberDecryptURL));
}

// Recordset.Open(source, objConn, adOpenStatic, adLockReadOnly) with unspecified options.
ComPtr<IDispatch> prOpenPlanIDs(std::string_view sql) {
    ComPtr<IDispatch> rs = createByProgId(c::kProgIdRecordset);
    std::vector<UniqueVariant> args;
    args.emplace_back(sql);
    args.push_back(dispatchArg(objConn.Get()));
    args.emplace_back(static_cast<long>(c::kAdOpenStatic));
    args.emplace_back(static_cast<long>(c::kAdLockReadOnly));
    args.push_back(UniqueVariant::missing());
    invokeMethod(rs.Get(), c::kMemberOpen, std::move(args));
    return rs;
}

// rs.Fields(index).Value, where index is a column name or an ordinal.
UniqueVariant fieldValue(IDispatch* rs, UniqueVariant index) {
    const UniqueVariant fields = getProperty(rs, c::kMemberFields);
    const ComPtr<IDispatch> fieldsObject = variantToDispatch(*fields.get(), std::string(c::kMemberFields));
    std::vector<UniqueVariant> args;
    args.push_back(std::move(index));
    const UniqueVariant field = invokeMethod(fieldsObject.Get(), c::kMemberItem, std::move(args));
    const ComPtr<IDispatch> fieldObject = variantToDispatch(*field.get(), std::string(c::kMemberItem));
    return getProperty(fieldObject.Get(), c::kMemberValue);
}

void setFilter(IDispatch* rs, UniqueVariant filter) { putProperty(rs, c::kMemberFilter, std::move(filter)); }

bool atEnd(IDispatch* rs) { return boolOf(getProperty(rs, c::kMemberEOF), std::string(c::kMemberEOF)); }

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
    ComPtr<IDispatch> rsPlanIDs = prOpenPlanIDs(c::kSqlSettings);
    setFilter(rsPlanIDs.Get(), UniqueVariant(static_cast<long>(c::kAdFilterNone)));
    setFilter(rsPlanIDs.Get(), UniqueVariant(fnPlanFilter(c::kPlanCustomerIdFlag)));
    if (!atEnd(rsPlanIDs.Get()) &&
        !fieldValue(rsPlanIDs.Get(), UniqueVariant(c::kColumnSettings)).isNull()) {
        record.blnUseCustID = true;
        setFilter(rsPlanIDs.Get(), UniqueVariant(static_cast<long>(c::kAdFilterNone)));
        setFilter(rsPlanIDs.Get(), UniqueVariant(fnPlanFilter(profile.bytCustPlan)));
        const UniqueVariant stored = fieldValue(rsPlanIDs.Get(), UniqueVariant(c::kColumnSettings));
        const std::string storedText = stored.isNull() ? std::string()
                                                       : variantToText(*stored.get(), std::string(c::kColumnSettings));
        record.lngCustID = fnDeriveCustID(fnPlainSettings(stored, storedText));
    }
    invokeMethod(rsPlanIDs.Get(), c::kMemberClose);
    rsPlanIDs.Reset();
}

void frmCheckUpdate::prGetVersion() {
    Win32FilesPort files;
    const std::string version = files.fileVersion(hostExePath(profile.lngInstallType, strFolder));
    // No version: the end of the program, at once and silently (the tray icon stays as it is).
    if (!fnApplyInstalledVersion(version, record)) ::ExitProcess(0);

    ComPtr<IDispatch> rsPlanIDs = prOpenPlanIDs(c::kSqlCustomerRow);
    std::vector<UniqueVariant> findArgs;
    findArgs.emplace_back(fnPlanFind(profile.bytCustPlan));
    findArgs.emplace_back(0L);
    findArgs.emplace_back(static_cast<long>(c::kAdSearchForward));
    findArgs.emplace_back(static_cast<long>(c::kAdBookmarkFirst));
    invokeMethod(rsPlanIDs.Get(), c::kMemberFind, std::move(findArgs));
    const UniqueVariant stored =
        fieldValue(rsPlanIDs.Get(), UniqueVariant(static_cast<long>(c::kFirstColumn)));
    const std::string storedText =
        stored.isNull() ? std::string() : trimBlanks(variantToText(*stored.get(), std::string(c::kColumnSettings)));
    record.strCustCode = fnPlainSettings(stored, storedText);
    if (longOf(getProperty(rsPlanIDs.Get(), c::kMemberState), std::string(c::kMemberState)) ==
        c::kAdStateOpen)
        invokeMethod(rsPlanIDs.Get(), c::kMemberClose);
    rsPlanIDs.Reset();
}

void frmCheckUpdate::prCloseDatabase() {
    if (!objConn) return;
    if (longOf(getProperty(objConn.Get(), c::kMemberState), std::string(c::kMemberState)) ==
        c::kAdStateOpen)
        invokeMethod(objConn.Get(), c::kMemberClose);
    objConn.Reset();
}

} // namespace checker
