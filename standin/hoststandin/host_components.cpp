// QvlZarnPlan.clsZarnPlan and QVLEncryption.clsProtect as the host product provides them:
// the plan component answers one plan code with the enciphered plan text; the protection
// component deciphers once it has been given the host's secret key.
#include "host_components.h"

#include "host_cipher.h"
#include "host_secrets.h"

namespace hoststandin {

namespace {
// The host's components raise their own application errors.
constexpr HRESULT kInvalidCall = static_cast<HRESULT>(0x800A0005);

enum PlanMember : DISPID { kGetPlanName = 1 };
enum ProtectMember : DISPID { kSecretKeyMember = 1, kDecryptURL };

// Tests may give the plan text another value with HOSTSTANDIN_PLAN ("<empty>" for an empty one)
// to see how the checker takes the password out of it.
std::string planText() {
    char buffer[512];
    const DWORD n = ::GetEnvironmentVariableA("HOSTSTANDIN_PLAN", buffer, sizeof buffer);
    if (n == 0 || n >= sizeof buffer) return std::string(kPlanText);
    const std::string value(buffer, n);
    return value == "<empty>" ? std::string() : value;
}

class ZarnPlan final : public DispatchObject {
  public:
    ZarnPlan() : DispatchObject("clsZarnPlan", {{L"getPlanName", Kind::Method}}, kGetPlanName) {}

  protected:
    void call(DISPID, bool, const std::vector<VARIANT>& args, VARIANT* result) override {
        if (args.size() != 1)
            throw ComFailure{DISP_E_BADPARAMCOUNT, "Wrong number of arguments", "QvlZarnPlan"};
        if (textArg(args[0]) != kPlanCode)
            throw ComFailure{kInvalidCall, "Invalid plan code", "QvlZarnPlan.clsZarnPlan"};
        setText(result, encipher(planText(), kSecretKey));
    }
};

class Protect final : public DispatchObject {
  public:
    Protect()
        : DispatchObject("clsProtect",
                         {{L"SecretKey", Kind::Property}, {L"DecryptURL", Kind::Method}},
                         kDecryptURL) {}

  protected:
    void call(DISPID id, bool put, const std::vector<VARIANT>& args, VARIANT* result) override {
        if (id == kSecretKeyMember) {
            if (!put)
                throw ComFailure{kInvalidCall, "SecretKey can only be set",
                                 "QVLEncryption.clsProtect"};
            if (textArg(args.back()) != kSecretKey)
                throw ComFailure{kInvalidCall, "Secret key not accepted",
                                 "QVLEncryption.clsProtect"};
            keyAccepted_ = true;
            return;
        }
        if (args.size() != 1)
            throw ComFailure{DISP_E_BADPARAMCOUNT, "Wrong number of arguments", "QVLEncryption"};
        if (!keyAccepted_)
            throw ComFailure{kInvalidCall, "No secret key given", "QVLEncryption.clsProtect"};
        const auto plain = decipher(textArg(args[0]), kSecretKey);
        if (!plain)
            throw ComFailure{kInvalidCall, "Not an enciphered text", "QVLEncryption.clsProtect"};
        setText(result, *plain);
    }

  private:
    bool keyAccepted_ = false;
};
} // namespace

DispatchObject* newZarnPlan() {
    return new ZarnPlan();
}
DispatchObject* newProtect() {
    return new Protect();
}

} // namespace hoststandin
