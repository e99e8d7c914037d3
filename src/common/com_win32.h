// COM late binding: owners for BSTR and VARIANT, creation by program identifier, and calls by
// member name through IDispatch. Failures become CheckerError with the callee's number and text.
#pragma once

#include <windows.h>
#include <oleauto.h>
#include <wrl/client.h>

#include <string>
#include <string_view>
#include <utility>
#include <vector>

#include "common/error.h"

namespace checker {

using Microsoft::WRL::ComPtr;

class UniqueBstr {
public:
    UniqueBstr() noexcept = default;
    explicit UniqueBstr(std::string_view ansi);
    UniqueBstr(const UniqueBstr&) = delete;
    UniqueBstr& operator=(const UniqueBstr&) = delete;
    UniqueBstr(UniqueBstr&& o) noexcept : b_(std::exchange(o.b_, nullptr)) {}
    UniqueBstr& operator=(UniqueBstr&& o) noexcept {
        if (this != &o) {
            ::SysFreeString(b_);
            b_ = std::exchange(o.b_, nullptr);
        }
        return *this;
    }
    ~UniqueBstr() { ::SysFreeString(b_); }
    BSTR get() const noexcept { return b_; }
    BSTR* put() noexcept {
        ::SysFreeString(b_);
        b_ = nullptr;
        return &b_;
    }
    BSTR release() noexcept { return std::exchange(b_, nullptr); }

private:
    BSTR b_ = nullptr;
};

class UniqueVariant {
public:
    UniqueVariant() noexcept { ::VariantInit(&v_); }
    explicit UniqueVariant(std::string_view ansi); // VT_BSTR
    explicit UniqueVariant(long value) noexcept {
        ::VariantInit(&v_);
        v_.vt = VT_I4;
        v_.lVal = value;
    }
    static UniqueVariant missing() noexcept; // an omitted optional argument
    UniqueVariant(const UniqueVariant&) = delete;
    UniqueVariant& operator=(const UniqueVariant&) = delete;
    UniqueVariant(UniqueVariant&& o) noexcept : v_(o.v_) { ::VariantInit(&o.v_); }
    UniqueVariant& operator=(UniqueVariant&& o) noexcept {
        if (this != &o) {
            ::VariantClear(&v_);
            v_ = o.v_;
            ::VariantInit(&o.v_);
        }
        return *this;
    }
    ~UniqueVariant() { ::VariantClear(&v_); }
    VARIANT* get() noexcept { return &v_; }
    const VARIANT* get() const noexcept { return &v_; }
    VARIANT* put() noexcept {
        ::VariantClear(&v_);
        return &v_;
    }
    bool isNull() const noexcept { return v_.vt == VT_NULL; }
    bool isEmpty() const noexcept { return v_.vt == VT_EMPTY; }

private:
    VARIANT v_;
};

// ANSI (system code page) <-> UTF-16, as the platform's A functions convert.
std::wstring widen(std::string_view ansi);
std::string narrow(const wchar_t* wide, std::size_t length);
std::string narrow(BSTR b);

// Error from an HRESULT, with the system's text for it.
CheckerError errorFromHresult(HRESULT hr, const std::string& source);

// Creates an automation object by program identifier (CLSIDFromProgID + CoCreateInstance).
ComPtr<IDispatch> createByProgId(std::string_view progId);

// Calls by member name. Arguments are given in call order.
UniqueVariant dispatchCall(IDispatch* object, std::string_view member, WORD kind,
                           std::vector<UniqueVariant> args = {});
inline UniqueVariant invokeMethod(IDispatch* object, std::string_view member,
                                  std::vector<UniqueVariant> args = {}) {
    return dispatchCall(object, member, DISPATCH_METHOD | DISPATCH_PROPERTYGET, std::move(args));
}
inline UniqueVariant getProperty(IDispatch* object, std::string_view member,
                                 std::vector<UniqueVariant> args = {}) {
    return dispatchCall(object, member, DISPATCH_PROPERTYGET, std::move(args));
}
void putProperty(IDispatch* object, std::string_view member, UniqueVariant value);

// Text of a VARIANT as the language runtime converts it (VariantChangeType to VT_BSTR).
std::string variantToText(const VARIANT& value, const std::string& source);
ComPtr<IDispatch> variantToDispatch(const VARIANT& value, const std::string& source);

} // namespace checker
