#include "common/com_win32.h"

#include <algorithm>

namespace checker {

UniqueBstr::UniqueBstr(std::string_view ansi) {
    const std::wstring w = widen(ansi);
    b_ = ::SysAllocStringLen(w.data(), static_cast<UINT>(w.size()));
}

UniqueVariant::UniqueVariant(std::string_view ansi) {
    ::VariantInit(&v_);
    UniqueBstr b(ansi);
    v_.vt = VT_BSTR;
    v_.bstrVal = b.release();
}

UniqueVariant UniqueVariant::missing() noexcept {
    UniqueVariant v;
    v.v_.vt = VT_ERROR;
    v.v_.scode = DISP_E_PARAMNOTFOUND;
    return v;
}

std::wstring widen(std::string_view ansi) {
    if (ansi.empty()) return {};
    const int n = ::MultiByteToWideChar(CP_ACP, 0, ansi.data(), static_cast<int>(ansi.size()),
                                        nullptr, 0);
    std::wstring out(static_cast<std::size_t>(std::max(n, 0)), L'\0');
    if (n > 0)
        ::MultiByteToWideChar(CP_ACP, 0, ansi.data(), static_cast<int>(ansi.size()), out.data(), n);
    return out;
}

std::string narrow(const wchar_t* wide, std::size_t length) {
    if (!wide || length == 0) return {};
    const int n = ::WideCharToMultiByte(CP_ACP, 0, wide, static_cast<int>(length), nullptr, 0,
                                        nullptr, nullptr);
    std::string out(static_cast<std::size_t>(std::max(n, 0)), '\0');
    if (n > 0)
        ::WideCharToMultiByte(CP_ACP, 0, wide, static_cast<int>(length), out.data(), n, nullptr,
                              nullptr);
    return out;
}

std::string narrow(BSTR b) { return b ? narrow(b, ::SysStringLen(b)) : std::string(); }

CheckerError errorFromHresult(HRESULT hr, const std::string& source) {
    char* text = nullptr;
    const DWORD n = ::FormatMessageA(FORMAT_MESSAGE_ALLOCATE_BUFFER | FORMAT_MESSAGE_FROM_SYSTEM |
                                         FORMAT_MESSAGE_IGNORE_INSERTS,
                                     nullptr, static_cast<DWORD>(hr), 0,
                                     reinterpret_cast<char*>(&text), 0, nullptr);
    std::string description = n && text ? std::string(text, n) : std::string();
    if (text) ::LocalFree(text);
    while (!description.empty() && (description.back() == '\n' || description.back() == '\r' ||
                                     description.back() == ' ' || description.back() == '.'))
        description.pop_back();
    if (description.empty()) description = "Automation error";
    return CheckerError(static_cast<std::int32_t>(hr), source, description);
}

ComPtr<IDispatch> createByProgId(std::string_view progId) {
    const std::string source(progId);
    // The runtime reports an unknown program identifier as error 429.
    CLSID clsid{};
    const std::wstring wide = widen(progId);
    if (FAILED(::CLSIDFromProgID(wide.c_str(), &clsid)))
        throw CheckerError(429, source, "ActiveX component can't create object");
    ComPtr<IDispatch> object;
    const HRESULT hr = ::CoCreateInstance(clsid, nullptr, CLSCTX_INPROC_SERVER | CLSCTX_LOCAL_SERVER,
                                          IID_IDispatch,
                                          reinterpret_cast<void**>(object.GetAddressOf()));
    if (FAILED(hr) || !object) throw CheckerError(429, source, "ActiveX component can't create object");
    return object;
}

namespace {

DISPID idOfName(IDispatch* object, std::string_view member) {
    std::wstring name = widen(member);
    LPOLESTR names[] = {name.data()};
    DISPID id = DISPID_UNKNOWN;
    const HRESULT hr = object->GetIDsOfNames(IID_NULL, names, 1, LOCALE_USER_DEFAULT, &id);
    if (FAILED(hr))
        throw CheckerError(438, std::string(member), "Object doesn't support this property or method");
    return id;
}

[[noreturn]] void throwInvokeFailure(HRESULT hr, EXCEPINFO& info, std::string_view member) {
    if (hr == DISP_E_EXCEPTION) {
        if (info.pfnDeferredFillIn) info.pfnDeferredFillIn(&info);
        const std::int32_t number = info.scode ? static_cast<std::int32_t>(info.scode)
                                               : static_cast<std::int32_t>(info.wCode);
        std::string description = narrow(info.bstrDescription);
        std::string source = info.bstrSource ? narrow(info.bstrSource) : std::string(member);
        ::SysFreeString(info.bstrDescription);
        ::SysFreeString(info.bstrSource);
        ::SysFreeString(info.bstrHelpFile);
        if (description.empty()) throw errorFromHresult(number, source);
        throw CheckerError(number, source, description);
    }
    throw errorFromHresult(hr, std::string(member));
}

} // namespace

UniqueVariant dispatchCall(IDispatch* object, std::string_view member, WORD kind,
                           std::vector<UniqueVariant> args) {
    if (!object) throw CheckerError(91, std::string(member), "Object variable or With block variable not set");
    const DISPID id = idOfName(object, member);
    // IDispatch takes its arguments last to first.
    std::vector<VARIANT> reversed;
    reversed.reserve(args.size());
    for (auto it = args.rbegin(); it != args.rend(); ++it) reversed.push_back(*it->get());
    DISPPARAMS params{reversed.data(), nullptr, static_cast<UINT>(reversed.size()), 0};
    UniqueVariant result;
    EXCEPINFO info{};
    UINT argError = 0;
    const HRESULT hr = object->Invoke(id, IID_NULL, LOCALE_USER_DEFAULT, kind, &params,
                                      result.put(), &info, &argError);
    if (FAILED(hr)) throwInvokeFailure(hr, info, member);
    return result;
}

void putProperty(IDispatch* object, std::string_view member, UniqueVariant value) {
    if (!object) throw CheckerError(91, std::string(member), "Object variable or With block variable not set");
    const DISPID id = idOfName(object, member);
    DISPID named = DISPID_PROPERTYPUT;
    DISPPARAMS params{value.get(), &named, 1, 1};
    EXCEPINFO info{};
    UINT argError = 0;
    const HRESULT hr = object->Invoke(id, IID_NULL, LOCALE_USER_DEFAULT, DISPATCH_PROPERTYPUT,
                                      &params, nullptr, &info, &argError);
    if (FAILED(hr)) throwInvokeFailure(hr, info, member);
}

std::string variantToText(const VARIANT& value, const std::string& source) {
    if (value.vt == VT_BSTR) return narrow(value.bstrVal);
    if (value.vt == VT_NULL) throw CheckerError(94, source, "Invalid use of Null");
    UniqueVariant converted;
    const HRESULT hr = ::VariantChangeType(converted.put(), const_cast<VARIANT*>(&value), 0, VT_BSTR);
    if (FAILED(hr)) throw typeMismatchError(source);
    return narrow(converted.get()->bstrVal);
}

ComPtr<IDispatch> variantToDispatch(const VARIANT& value, const std::string& source) {
    if (value.vt != VT_DISPATCH || !value.pdispVal)
        throw CheckerError(91, source, "Object variable or With block variable not set");
    return ComPtr<IDispatch>(value.pdispVal);
}

} // namespace checker
