// --drop: a listener that reads each request's head, logs it and closes the connection
// without a byte of answer (what a client sees when a server dies mid-request).
#pragma once

#include "request_log.h"

namespace updsrv {

// Binds 127.0.0.1:port (0 for a free one); returns the listening socket or -1, and the port.
int bindLoopback(int port, int& boundPort);
// Serves forever on `listener`.
void serveDropping(int listener, RequestLog& log, int delayMs);

} // namespace updsrv
