#include "service/xmlhttp_win32.h"

#include "common/com_win32.h"
#include "common/constants.h"

namespace checker {

namespace {

using namespace service;

UniqueVariant synchronousFlag() {
    UniqueVariant flag;
    flag.get()->vt = VT_BOOL;
    flag.get()->boolVal = VARIANT_FALSE; // varAsync = False: send() returns with the whole answer
    return flag;
}

class XmlHttpRequest final : public HttpRequest {
  public:
    XmlHttpRequest(ComPtr<IDispatch> object, bool passCredentials)
        : object_(std::move(object)), passCredentials_(passCredentials) {}

    void open(std::string_view method, const std::string& url) override {
        std::vector<UniqueVariant> args;
        args.emplace_back(method);
        args.emplace_back(std::string_view(url));
        args.push_back(synchronousFlag());
        if (passCredentials_) {
            args.emplace_back(std::string_view());
            args.emplace_back(std::string_view());
        }
        invokeMethod(object_.Get(), kMemberOpen, std::move(args));
    }

    void send() override {
        invokeMethod(object_.Get(), kMemberSend);
        // A connection closed before any answer: Windows fails the send, but some HTTP layers
        // (Wine's) return with status 0 and no body, which would pass for an empty answer.
        // Status 0 is no HTTP status at all, so this examines no server's status code.
        const UniqueVariant status = getProperty(object_.Get(), kMemberStatus);
        if (status.get()->vt == VT_I4 && status.get()->lVal == 0)
            throw CheckerError(kErrNoAnswer, std::string(kMemberSend), std::string(kTextNoAnswer));
    }

    std::string responseText() override {
        const UniqueVariant text = getProperty(object_.Get(), kMemberResponseText);
        return variantToText(*text.get(), std::string(kMemberResponseText));
    }

  private:
    ComPtr<IDispatch> object_;
    bool passCredentials_;
};

ComPtr<IDispatch> createMsxml30() {
    const std::string source(kProgIdXmlHttp);
    CLSID clsid{};
    const std::wstring text = widen(kClsidXmlHttp30);
    ComPtr<IDispatch> object;
    if (FAILED(::CLSIDFromString(text.c_str(), &clsid)) ||
        FAILED(::CoCreateInstance(clsid, nullptr, CLSCTX_INPROC_SERVER, IID_IDispatch,
                                  reinterpret_cast<void**>(object.GetAddressOf()))) ||
        !object)
        throw CheckerError(kErrCannotCreateObject, source, std::string(kTextCannotCreateObject));
    return object;
}

} // namespace

std::unique_ptr<HttpRequest> XmlHttpPort::create() {
    if (creation_ == Creation::Msxml30Class)
        return std::make_unique<XmlHttpRequest>(createMsxml30(), true);
    return std::make_unique<XmlHttpRequest>(createByProgId(kProgIdXmlHttp), false);
}

} // namespace checker
