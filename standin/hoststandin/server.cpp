// The in-process server: class factories for the four stand-in classes, and the registration
// that points their program identifiers (ADO's included) at this DLL.
#include <windows.h>
// after windows.h
#include <olectl.h>

#include <string>

#include "host_components.h"

namespace hoststandin {

namespace {

HMODULE g_module = nullptr;
LONG g_locks = 0;

struct ClassEntry {
    CLSID clsid;
    const char* clsidText;
    const char* progId;
    const char* description;
    DispatchObject* (*create)();
};

const ClassEntry kClasses[] = {
    {{0x83e80b51, 0x6929, 0x42d3, {0xbe, 0x72, 0x5d, 0x81, 0x4a, 0x77, 0x4d, 0xd0}},
     "{83E80B51-6929-42D3-BE72-5D814A774DD0}",
     "QvlZarnPlan.clsZarnPlan",
     "Host plan component (stand-in)",
     newZarnPlan},
    {{0x82d62d2a, 0x76e4, 0x41b0, {0xb2, 0x44, 0x22, 0x2e, 0xa6, 0x84, 0x60, 0x09}},
     "{82D62D2A-76E4-41B0-B244-222EA6846009}",
     "QVLEncryption.clsProtect",
     "Host protection component (stand-in)",
     newProtect},
    {{0xdbd94800, 0x2023, 0x476d, {0x91, 0xae, 0xab, 0xe9, 0x2f, 0xea, 0x33, 0x99}},
     "{DBD94800-2023-476D-91AE-ABE92FEA3399}",
     "ADODB.Connection",
     "ADO connection (stand-in)",
     newConnection},
    {{0xf1dbfca8, 0xc8f5, 0x419c, {0xb2, 0x33, 0x10, 0x26, 0x2b, 0x84, 0x26, 0x79}},
     "{F1DBFCA8-C8F5-419C-B233-10262B842679}",
     "ADODB.Recordset",
     "ADO recordset (stand-in)",
     newRecordset},
};

class Factory final : public IClassFactory {
  public:
    explicit Factory(const ClassEntry& entry) : entry_(entry) {}
    HRESULT STDMETHODCALLTYPE QueryInterface(REFIID riid, void** ppv) override {
        if (!ppv) return E_POINTER;
        if (riid == IID_IUnknown || riid == IID_IClassFactory) {
            *ppv = static_cast<IClassFactory*>(this);
            AddRef();
            return S_OK;
        }
        *ppv = nullptr;
        return E_NOINTERFACE;
    }
    ULONG STDMETHODCALLTYPE AddRef() override {
        return static_cast<ULONG>(::InterlockedIncrement(&refs_));
    }
    ULONG STDMETHODCALLTYPE Release() override {
        const LONG n = ::InterlockedDecrement(&refs_);
        if (n == 0) delete this;
        return static_cast<ULONG>(n);
    }
    HRESULT STDMETHODCALLTYPE CreateInstance(IUnknown* outer, REFIID riid, void** ppv) override {
        if (!ppv) return E_POINTER;
        *ppv = nullptr;
        if (outer) return CLASS_E_NOAGGREGATION;
        DispatchObject* object = entry_.create();
        const HRESULT hr = object->QueryInterface(riid, ppv);
        object->Release();
        return hr;
    }
    HRESULT STDMETHODCALLTYPE LockServer(BOOL lock) override {
        if (lock)
            ::InterlockedIncrement(&g_locks);
        else
            ::InterlockedDecrement(&g_locks);
        return S_OK;
    }

  private:
    LONG refs_ = 1;
    const ClassEntry& entry_;
};

bool setKey(const std::string& path, const char* name, const std::string& value) {
    HKEY key = nullptr;
    if (::RegCreateKeyExA(HKEY_CLASSES_ROOT, path.c_str(), 0, nullptr, 0, KEY_WRITE, nullptr, &key,
                          nullptr) != ERROR_SUCCESS)
        return false;
    const LONG rc =
        ::RegSetValueExA(key, name, 0, REG_SZ, reinterpret_cast<const BYTE*>(value.c_str()),
                         static_cast<DWORD>(value.size() + 1));
    ::RegCloseKey(key);
    return rc == ERROR_SUCCESS;
}

} // namespace

} // namespace hoststandin

using namespace hoststandin;

extern "C" BOOL WINAPI DllMain(HINSTANCE instance, DWORD reason, LPVOID) {
    if (reason == DLL_PROCESS_ATTACH) {
        g_module = instance;
        ::DisableThreadLibraryCalls(instance);
    }
    return TRUE;
}

extern "C" HRESULT STDAPICALLTYPE DllGetClassObject(REFCLSID clsid, REFIID riid, void** ppv) {
    if (!ppv) return E_POINTER;
    *ppv = nullptr;
    for (const ClassEntry& entry : kClasses) {
        if (entry.clsid == clsid) {
            auto* factory = new Factory(entry);
            const HRESULT hr = factory->QueryInterface(riid, ppv);
            factory->Release();
            return hr;
        }
    }
    return CLASS_E_CLASSNOTAVAILABLE;
}

extern "C" HRESULT STDAPICALLTYPE DllCanUnloadNow() {
    return (g_objects == 0 && g_locks == 0) ? S_OK : S_FALSE;
}

extern "C" HRESULT STDAPICALLTYPE DllRegisterServer() {
    char path[MAX_PATH];
    const DWORD n = ::GetModuleFileNameA(g_module, path, MAX_PATH);
    if (n == 0 || n >= MAX_PATH) return SELFREG_E_CLASS;
    for (const ClassEntry& e : kClasses) {
        const std::string clsidKey = std::string("CLSID\\") + e.clsidText;
        // An existing program identifier (ADO's) is pointed at this class: CLSIDFromProgID reads
        // it.
        const bool ok = setKey(clsidKey, nullptr, e.description) &&
                        setKey(clsidKey + "\\InprocServer32", nullptr, path) &&
                        setKey(clsidKey + "\\InprocServer32", "ThreadingModel", "Apartment") &&
                        setKey(clsidKey + "\\ProgID", nullptr, e.progId) &&
                        setKey(e.progId, nullptr, e.description) &&
                        setKey(std::string(e.progId) + "\\CLSID", nullptr, e.clsidText);
        if (!ok) return SELFREG_E_CLASS;
    }
    return S_OK;
}

extern "C" HRESULT STDAPICALLTYPE DllUnregisterServer() {
    for (const ClassEntry& e : kClasses) {
        ::RegDeleteTreeA(HKEY_CLASSES_ROOT, (std::string("CLSID\\") + e.clsidText).c_str());
        // Only the CLSID link of a program identifier that still names this class goes.
        char value[64] = {};
        LONG size = sizeof value;
        const std::string link = std::string(e.progId) + "\\CLSID";
        if (::RegQueryValueA(HKEY_CLASSES_ROOT, link.c_str(), value, &size) == ERROR_SUCCESS &&
            lstrcmpiA(value, e.clsidText) == 0)
            ::RegDeleteKeyA(HKEY_CLASSES_ROOT, link.c_str());
    }
    return S_OK;
}
