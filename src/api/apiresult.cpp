#include "apiresult.h"

#include <QCoreApplication>

QString apiResultText(unsigned result) {
    const auto tr = [](const char *text) { return QCoreApplication::translate("ApiResult", text); };
    switch (result) {
    case ApiTransportError:
        return tr("the server did not answer");
    case ApiHttpStatusError:
        return tr("the server answered with an error");
    case ApiServerError:
        return tr("the server refused it");
    case ApiMissingData:
    case ApiException:
        return tr("the server's answer could not be read");
    case ApiCipherFailure:
        return tr("a secret could not be ciphered");
    case ApiInvalidArgument:
        return tr("nobody is logged in");
    case ApiTargetNotWritten:
        return tr("the file exists already or cannot be written");
    default:
        return tr("error %1").arg(result);
    }
}
