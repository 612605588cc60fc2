#pragma once

#include "api/client/apiresult.h"

#include <QDebug>

namespace ApiLog {

/// Logs a call of the service that went wrong; returns its result as it is.
inline unsigned logged(const char *method, unsigned result) {
    if (result != ApiOk)
        qWarning("HTTP API(%s) failed! (%u)", method, result);
    return result;
}

} // namespace ApiLog
