#include "dispatch.h"

#include <cstdio>
#include <cwchar>

namespace hoststandin {

LONG g_objects = 0;

namespace {
constexpr HRESULT kTypeMismatch = static_cast<HRESULT>(0x800A000D);
constexpr HRESULT kInvalidUseOfNull = static_cast<HRESULT>(0x800A005E);
int g_serial = 0;
} // namespace

std::wstring widen(std::string_view ansi) {
    if (ansi.empty()) return {};
    const int n =
        ::MultiByteToWideChar(CP_ACP, 0, ansi.data(), static_cast<int>(ansi.size()), nullptr, 0);
    std::wstring out(static_cast<std::size_t>(n > 0 ? n : 0), L'\0');
    if (n > 0)
        ::MultiByteToWideChar(CP_ACP, 0, ansi.data(), static_cast<int>(ansi.size()), out.data(), n);
    return out;
}

std::string narrow(const wchar_t* wide, std::size_t length) {
    if (!wide || !length) return {};
    const int n = ::WideCharToMultiByte(CP_ACP, 0, wide, static_cast<int>(length), nullptr, 0,
                                        nullptr, nullptr);
    std::string out(static_cast<std::size_t>(n > 0 ? n : 0), '\0');
    if (n > 0)
        ::WideCharToMultiByte(CP_ACP, 0, wide, static_cast<int>(length), out.data(), n, nullptr,
                              nullptr);
    return out;
}

DispatchObject::DispatchObject(std::string className, std::vector<Member> members,
                               DISPID defaultMember)
    : className_(std::move(className)), members_(std::move(members)),
      defaultMember_(defaultMember) {
    label_ = className_ + "#" + std::to_string(++g_serial);
    ::InterlockedIncrement(&g_objects);
    logLine("new " + label_);
}

DispatchObject::~DispatchObject() {
    logLine(label_ + " released");
    ::InterlockedDecrement(&g_objects);
}

HRESULT DispatchObject::QueryInterface(REFIID riid, void** ppv) {
    if (!ppv) return E_POINTER;
    if (riid == IID_IUnknown || riid == IID_IDispatch || riid == IID_IStandInObject) {
        *ppv = static_cast<IDispatch*>(this);
        AddRef();
        return S_OK;
    }
    *ppv = nullptr;
    return E_NOINTERFACE;
}

ULONG DispatchObject::AddRef() {
    return static_cast<ULONG>(::InterlockedIncrement(&refs_));
}

ULONG DispatchObject::Release() {
    const LONG n = ::InterlockedDecrement(&refs_);
    if (n == 0) delete this;
    return static_cast<ULONG>(n);
}

HRESULT DispatchObject::GetTypeInfoCount(UINT* count) {
    if (count) *count = 0;
    return S_OK;
}

HRESULT DispatchObject::GetTypeInfo(UINT, LCID, ITypeInfo**) {
    return E_NOTIMPL;
}

HRESULT DispatchObject::GetIDsOfNames(REFIID, LPOLESTR* names, UINT count, LCID, DISPID* ids) {
    if (!names || !ids || count == 0) return E_INVALIDARG;
    HRESULT hr = S_OK;
    for (UINT i = 0; i < count; ++i)
        ids[i] = DISPID_UNKNOWN;
    for (std::size_t m = 0; m < members_.size(); ++m)
        if (_wcsicmp(names[0], members_[m].name) == 0) ids[0] = static_cast<DISPID>(m + 1);
    if (ids[0] == DISPID_UNKNOWN) {
        logLine(label_ + "." + narrow(names[0], std::wcslen(names[0])) + " -> unknown member");
        hr = DISP_E_UNKNOWNNAME;
    }
    if (count > 1) hr = DISP_E_UNKNOWNNAME; // no named arguments
    return hr;
}

HRESULT DispatchObject::Invoke(DISPID id, REFIID, LCID, WORD flags, DISPPARAMS* params,
                               VARIANT* result, EXCEPINFO* info, UINT* argError) {
    if (id == DISPID_VALUE) id = defaultMember_;
    if (id < 1 || static_cast<std::size_t>(id) > members_.size()) return DISP_E_MEMBERNOTFOUND;
    const Member& member = members_[static_cast<std::size_t>(id - 1)];
    const bool put = (flags & (DISPATCH_PROPERTYPUT | DISPATCH_PROPERTYPUTREF)) != 0;
    if (put && member.kind == Kind::Method) return DISP_E_MEMBERNOTFOUND;
    if (argError) *argError = 0;

    // Call order, each value with references followed.
    std::vector<VARIANT> args;
    const UINT n = params ? params->cArgs : 0;
    for (UINT i = 0; i < n; ++i) {
        VARIANT v;
        ::VariantInit(&v);
        ::VariantCopyInd(&v, &params->rgvarg[n - 1 - i]);
        args.push_back(v);
    }
    std::string line = label_ + "." + narrow(member.name, std::wcslen(member.name));
    if (put) {
        line += " = " + (args.empty() ? std::string("?") : describe(args.back()));
    } else if (member.kind == Kind::Method || !args.empty()) {
        line += "(";
        for (std::size_t i = 0; i < args.size(); ++i)
            line += (i ? ", " : "") + describe(args[i]);
        line += ")";
    }

    VARIANT out;
    ::VariantInit(&out);
    HRESULT hr = S_OK;
    try {
        call(id, put, args, &out);
        if (!put) line += " -> " + describe(out);
        if (result)
            *result = out;
        else
            ::VariantClear(&out);
    } catch (const ComFailure& f) {
        ::VariantClear(&out);
        line += " -> error 0x";
        char hex[16];
        std::snprintf(hex, sizeof hex, "%08lX", static_cast<unsigned long>(f.scode));
        line += hex;
        line += " " + f.description;
        if (info) {
            *info = EXCEPINFO{};
            info->scode = f.scode;
            const std::wstring d = widen(f.description), s = widen(f.source);
            info->bstrDescription = ::SysAllocStringLen(d.data(), static_cast<UINT>(d.size()));
            info->bstrSource = ::SysAllocStringLen(s.data(), static_cast<UINT>(s.size()));
        }
        hr = DISP_E_EXCEPTION;
    }
    for (VARIANT& v : args)
        ::VariantClear(&v);
    logLine(line);
    return hr;
}

DispatchObject* DispatchObject::fromVariant(const VARIANT& v) {
    IUnknown* unknown = nullptr;
    if (v.vt == VT_DISPATCH)
        unknown = v.pdispVal;
    else if (v.vt == VT_UNKNOWN)
        unknown = v.punkVal;
    if (!unknown) return nullptr;
    void* ours = nullptr;
    if (FAILED(unknown->QueryInterface(IID_IStandInObject, &ours)) || !ours) return nullptr;
    auto* object = static_cast<DispatchObject*>(static_cast<IDispatch*>(ours));
    object->Release();
    return object;
}

std::string describe(const VARIANT& v) {
    switch (v.vt) {
    case VT_EMPTY:
        return "Empty";
    case VT_NULL:
        return "Null";
    case VT_BOOL:
        return v.boolVal ? "True" : "False";
    case VT_ERROR:
        return v.scode == DISP_E_PARAMNOTFOUND ? "missing" : "error";
    case VT_DISPATCH:
    case VT_UNKNOWN: {
        const DispatchObject* o = DispatchObject::fromVariant(v);
        return o ? "<" + o->label() + ">" : "<object>";
    }
    case VT_BSTR: {
        // Quoted; anything outside printable ASCII (and the quote) as \xNN. Backslashes stay
        // as they are so that paths read naturally.
        const std::string text = narrow(v.bstrVal, ::SysStringLen(v.bstrVal));
        std::string out = "\"";
        for (char c : text) {
            const auto b = static_cast<unsigned char>(c);
            if (b < 0x20 || b >= 0x7F || c == '"') {
                char hex[8];
                std::snprintf(hex, sizeof hex, "\\x%02X", b);
                out += hex;
            } else {
                out.push_back(c);
            }
        }
        return out + "\"";
    }
    default: {
        VARIANT t;
        ::VariantInit(&t);
        std::string out = "?";
        if (SUCCEEDED(::VariantChangeType(&t, const_cast<VARIANT*>(&v), 0, VT_BSTR)))
            out = narrow(t.bstrVal, ::SysStringLen(t.bstrVal));
        ::VariantClear(&t);
        return out;
    }
    }
}

bool isMissing(const VARIANT& v) {
    return v.vt == VT_ERROR && v.scode == DISP_E_PARAMNOTFOUND;
}

std::string textArg(const VARIANT& v) {
    if (v.vt == VT_BSTR) return narrow(v.bstrVal, ::SysStringLen(v.bstrVal));
    if (v.vt == VT_NULL) throw ComFailure{kInvalidUseOfNull, "Invalid use of Null", "HostStandIn"};
    VARIANT t;
    ::VariantInit(&t);
    if (v.vt == VT_DISPATCH || v.vt == VT_UNKNOWN || isMissing(v) ||
        FAILED(::VariantChangeType(&t, const_cast<VARIANT*>(&v), 0, VT_BSTR)))
        throw ComFailure{kTypeMismatch, "Type mismatch", "HostStandIn"};
    std::string out = narrow(t.bstrVal, ::SysStringLen(t.bstrVal));
    ::VariantClear(&t);
    return out;
}

long longArg(const VARIANT& v) {
    VARIANT t;
    ::VariantInit(&t);
    if (v.vt == VT_DISPATCH || isMissing(v) ||
        FAILED(::VariantChangeType(&t, const_cast<VARIANT*>(&v), 0, VT_I4)))
        throw ComFailure{kTypeMismatch, "Type mismatch", "HostStandIn"};
    return t.lVal;
}

void setText(VARIANT* result, std::string_view ansi) {
    const std::wstring w = widen(ansi);
    result->vt = VT_BSTR;
    result->bstrVal = ::SysAllocStringLen(w.data(), static_cast<UINT>(w.size()));
}

void setLong(VARIANT* result, long value) {
    result->vt = VT_I4;
    result->lVal = value;
}

void setBool(VARIANT* result, bool value) {
    result->vt = VT_BOOL;
    result->boolVal = value ? VARIANT_TRUE : VARIANT_FALSE;
}

void setObject(VARIANT* result, DispatchObject* object) {
    result->vt = VT_DISPATCH;
    result->pdispVal = object;
}

void logLine(const std::string& line) {
    char path[1024];
    const DWORD n = ::GetEnvironmentVariableA("HOSTSTANDIN_LOG", path, sizeof path);
    if (n == 0 || n >= sizeof path) return;
    // A Linux path from the test's environment: Wine shows the Linux root as drive Z:.
    std::string target = path;
    if (!target.empty() && target[0] == '/') {
        for (char& c : target)
            if (c == '/') c = '\\';
        target = "Z:" + target;
    }
    const HANDLE file =
        ::CreateFileA(target.c_str(), FILE_APPEND_DATA, FILE_SHARE_READ | FILE_SHARE_WRITE, nullptr,
                      OPEN_ALWAYS, FILE_ATTRIBUTE_NORMAL, nullptr);
    if (file == INVALID_HANDLE_VALUE) return;
    const std::string text = line + "\n";
    DWORD written = 0;
    ::WriteFile(file, text.data(), static_cast<DWORD>(text.size()), &written, nullptr);
    ::CloseHandle(file);
}

} // namespace hoststandin
