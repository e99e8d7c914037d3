// A small late-bound automation object: members by name, calls by DISPID, failures as
// DISP_E_EXCEPTION with the scode and text the caller reports, and one log line per call.
#pragma once

#include <windows.h>
// after windows.h
#include <oleauto.h>

#include <string>
#include <string_view>
#include <vector>

namespace hoststandin {

// An error as the real component raises it.
struct ComFailure {
    HRESULT scode;
    std::string description;
    std::string source;
};

enum class Kind { Method, Property };
struct Member {
    const wchar_t* name;
    Kind kind;
};

// Lets a stand-in recognise its own objects among the arguments it receives.
// {4C1B0B52-7A0E-4B8F-9E59-2D7A3C6B8E11}
inline constexpr IID IID_IStandInObject = {
    0x4c1b0b52, 0x7a0e, 0x4b8f, {0x9e, 0x59, 0x2d, 0x7a, 0x3c, 0x6b, 0x8e, 0x11}};

class DispatchObject : public IDispatch {
  public:
    DispatchObject(std::string className, std::vector<Member> members, DISPID defaultMember);
    virtual ~DispatchObject();
    DispatchObject(const DispatchObject&) = delete;
    DispatchObject& operator=(const DispatchObject&) = delete;

    HRESULT STDMETHODCALLTYPE QueryInterface(REFIID riid, void** ppv) override;
    ULONG STDMETHODCALLTYPE AddRef() override;
    ULONG STDMETHODCALLTYPE Release() override;
    HRESULT STDMETHODCALLTYPE GetTypeInfoCount(UINT* count) override;
    HRESULT STDMETHODCALLTYPE GetTypeInfo(UINT, LCID, ITypeInfo**) override;
    HRESULT STDMETHODCALLTYPE GetIDsOfNames(REFIID, LPOLESTR* names, UINT count, LCID,
                                            DISPID* ids) override;
    HRESULT STDMETHODCALLTYPE Invoke(DISPID id, REFIID, LCID, WORD flags, DISPPARAMS* params,
                                     VARIANT* result, EXCEPINFO* info, UINT* argError) override;

    const std::string& label() const noexcept { return label_; }
    // Our own object behind a VARIANT, or null (no reference added).
    static DispatchObject* fromVariant(const VARIANT& v);

  protected:
    // DISPIDs are member indexes + 1. `args` in call order (missing arguments included);
    // for a property put the value is `args.back()`. Throws ComFailure.
    virtual void call(DISPID id, bool put, const std::vector<VARIANT>& args, VARIANT* result) = 0;

  private:
    LONG refs_ = 1;
    std::string className_;
    std::string label_;
    std::vector<Member> members_;
    DISPID defaultMember_;
};

// ---- helpers for stand-in members
std::wstring widen(std::string_view ansi);
std::string narrow(const wchar_t* wide, std::size_t length);
std::string describe(const VARIANT& v); // for the log
bool isMissing(const VARIANT& v);
// The text of an argument; Null and objects are refused as the runtime refuses them.
std::string textArg(const VARIANT& v);
long longArg(const VARIANT& v);
void setText(VARIANT* result, std::string_view ansi);
void setLong(VARIANT* result, long value);
void setBool(VARIANT* result, bool value);
void setObject(VARIANT* result, DispatchObject* object); // takes over the reference

// Appends one line to the file named by HOSTSTANDIN_LOG, when it is set.
void logLine(const std::string& line);

// Live objects, for DllCanUnloadNow.
extern LONG g_objects;

} // namespace hoststandin
