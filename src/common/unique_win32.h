// Move-only owners for Win32 handles and objects: one type per kind, with its close
// function and its empty value in the type.
#pragma once

#include <windows.h>
#include <objbase.h>

#include <utility>

namespace checker {

template <typename T, auto Close, T Empty = T{}> class UniqueAny {
public:
    UniqueAny() noexcept = default;
    explicit UniqueAny(T value) noexcept : value_(value) {}
    UniqueAny(const UniqueAny&) = delete;
    UniqueAny& operator=(const UniqueAny&) = delete;
    UniqueAny(UniqueAny&& other) noexcept : value_(std::exchange(other.value_, Empty)) {}
    UniqueAny& operator=(UniqueAny&& other) noexcept {
        if (this != &other) reset(std::exchange(other.value_, Empty));
        return *this;
    }
    ~UniqueAny() { reset(); }

    T get() const noexcept { return value_; }
    explicit operator bool() const noexcept { return value_ != Empty; }
    T release() noexcept { return std::exchange(value_, Empty); }
    void reset(T value = Empty) noexcept {
        T old = std::exchange(value_, value);
        if (old != Empty) Close(old);
    }

private:
    T value_ = Empty;
};

namespace detail {
inline void closeHandle(HANDLE h) noexcept { ::CloseHandle(h); }
inline void deleteGdiObject(HGDIOBJ h) noexcept { ::DeleteObject(h); }
inline void destroyMenu(HMENU h) noexcept { ::DestroyMenu(h); }
inline void destroyIcon(HICON h) noexcept { ::DestroyIcon(h); }
inline void destroyWindow(HWND h) noexcept { ::DestroyWindow(h); }
inline void findClose(HANDLE h) noexcept { ::FindClose(h); }
} // namespace detail

using UniqueHandle = UniqueAny<HANDLE, detail::closeHandle, HANDLE{}>;
// Toolhelp snapshots and files report failure as INVALID_HANDLE_VALUE.
inline const HANDLE kInvalidHandle = INVALID_HANDLE_VALUE;
struct InvalidHandleCloser {
    void operator()(HANDLE h) const noexcept {
        if (h != INVALID_HANDLE_VALUE && h != nullptr) ::CloseHandle(h);
    }
};
class UniqueFileHandle {
public:
    UniqueFileHandle() noexcept = default;
    explicit UniqueFileHandle(HANDLE h) noexcept : h_(h) {}
    UniqueFileHandle(const UniqueFileHandle&) = delete;
    UniqueFileHandle& operator=(const UniqueFileHandle&) = delete;
    UniqueFileHandle(UniqueFileHandle&& o) noexcept : h_(std::exchange(o.h_, INVALID_HANDLE_VALUE)) {}
    UniqueFileHandle& operator=(UniqueFileHandle&& o) noexcept {
        if (this != &o) {
            InvalidHandleCloser{}(h_);
            h_ = std::exchange(o.h_, INVALID_HANDLE_VALUE);
        }
        return *this;
    }
    ~UniqueFileHandle() { InvalidHandleCloser{}(h_); }
    HANDLE get() const noexcept { return h_; }
    explicit operator bool() const noexcept { return h_ != INVALID_HANDLE_VALUE && h_ != nullptr; }

private:
    HANDLE h_ = INVALID_HANDLE_VALUE;
};
class UniqueFindHandle {
public:
    UniqueFindHandle() noexcept = default;
    explicit UniqueFindHandle(HANDLE h) noexcept : h_(h) {}
    UniqueFindHandle(const UniqueFindHandle&) = delete;
    UniqueFindHandle& operator=(const UniqueFindHandle&) = delete;
    ~UniqueFindHandle() {
        if (h_ != INVALID_HANDLE_VALUE) ::FindClose(h_);
    }
    explicit operator bool() const noexcept { return h_ != INVALID_HANDLE_VALUE; }

private:
    HANDLE h_ = INVALID_HANDLE_VALUE;
};

using UniqueGdiObject = UniqueAny<HGDIOBJ, detail::deleteGdiObject, HGDIOBJ{}>;
using UniqueMenu = UniqueAny<HMENU, detail::destroyMenu, HMENU{}>;
using UniqueIcon = UniqueAny<HICON, detail::destroyIcon, HICON{}>;
using UniqueWindow = UniqueAny<HWND, detail::destroyWindow, HWND{}>;

// CoInitialize for the life of the owner.
class ComApartment {
public:
    ComApartment() noexcept : ok_(SUCCEEDED(::CoInitialize(nullptr))) {}
    ComApartment(const ComApartment&) = delete;
    ComApartment& operator=(const ComApartment&) = delete;
    ~ComApartment() {
        if (ok_) ::CoUninitialize();
    }

private:
    bool ok_;
};

// The paint DC of one WM_PAINT.
class PaintScope {
public:
    explicit PaintScope(HWND hwnd) noexcept : hwnd_(hwnd) { dc_ = ::BeginPaint(hwnd_, &ps_); }
    PaintScope(const PaintScope&) = delete;
    PaintScope& operator=(const PaintScope&) = delete;
    ~PaintScope() { ::EndPaint(hwnd_, &ps_); }
    HDC dc() const noexcept { return dc_; }

private:
    HWND hwnd_;
    PAINTSTRUCT ps_{};
    HDC dc_ = nullptr;
};

// Selects an object into a DC and puts the previous one back.
class SelectScope {
public:
    SelectScope(HDC dc, HGDIOBJ obj) noexcept : dc_(dc), old_(::SelectObject(dc, obj)) {}
    SelectScope(const SelectScope&) = delete;
    SelectScope& operator=(const SelectScope&) = delete;
    ~SelectScope() { ::SelectObject(dc_, old_); }

private:
    HDC dc_;
    HGDIOBJ old_;
};

} // namespace checker
