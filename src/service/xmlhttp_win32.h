// The HTTP port on the platform's request object, MSXML2.XMLHTTP, called through IDispatch.
// The caller owns the COM apartment (CoInitialize) for as long as requests live.
#pragma once

#include "common/ports.h"

namespace checker {

class XmlHttpPort final : public HttpPort {
  public:
    enum class Creation {
        // The service calls: the MSXML 3.0 XMLHTTP class by its class id; open() also passes an
        // empty user name and password.
        Msxml30Class,
        // The date query: by program identifier; open() passes method, address and the
        // synchronous flag only.
        ProgId,
    };
    explicit XmlHttpPort(Creation creation) : creation_(creation) {}
    // Throws CheckerError 429 when the object cannot be created.
    std::unique_ptr<HttpRequest> create() override;

  private:
    Creation creation_;
};

} // namespace checker
