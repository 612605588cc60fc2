#include "api/client/apiresult.h"

#include <QCoreApplication>
#include <QDebug>

namespace {
struct Texts {
    Q_DECLARE_TR_FUNCTIONS(ApiResult)
};
} // namespace

QString apiResultText(unsigned result) {
    switch (result) {
    case ApiTransportError:
        return Texts::tr("the server did not answer");
    case ApiHttpStatusError:
        return Texts::tr("the server answered with an error");
    case ApiServerError:
        return Texts::tr("the server refused it");
    case ApiMissingData:
    case ApiException:
        return Texts::tr("the server's answer could not be read");
    case ApiCipherFailure:
        return Texts::tr("a secret could not be ciphered");
    case ApiInvalidArgument:
        return Texts::tr("nothing was sent, because something in it is missing or not allowed");
    case ApiCode105:
        return Texts::tr("the server does not know the session any more");
    case ApiCode108:
        return Texts::tr("the server takes no more sessions");
    case ApiKeyChanged:
        return Texts::tr("the server's key has changed");
    case ApiTargetNotWritten:
        return Texts::tr("the file exists already or cannot be written");
    default:
        return Texts::tr("error %1").arg(result);
    }
}

unsigned loggedResult(const char *method, unsigned result) {
    if (result != ApiOk)
        qWarning("HTTP API(%s) failed! (%u)", method, result);
    return result;
}
