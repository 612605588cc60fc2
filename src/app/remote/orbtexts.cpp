#include "app/remote/orbtexts.h"

#include "api/client/apiresult.h"

#include <QCoreApplication>
#include <QDesktopServices>
#include <QLabel>
#include <QUrl>

namespace OrbTexts {

namespace {

constexpr auto portal = "https://partner.norvell.example/";

struct Texts {
    Q_DECLARE_TR_FUNCTIONS(OrbTexts)
};

QString deskLink() {
    return portalLink(Texts::tr("Norvell Partner Desk"));
}

} // namespace

QString unableToConnect() {
    return Texts::tr("Unable to connect to this service. Check connection information, then retry.");
}

QString unknownError() {
    return Texts::tr(
        "Oops! An unknown error happened. Try again or contact Norvell technical support for further "
        "assistance.");
}

QString failure(unsigned result) {
    return result == ApiTransportError ? unableToConnect() : unknownError();
}

SignInFailure signInFailure(unsigned result) {
    switch (result) {
    case ApiCode105:
        return {
            Texts::tr("Incorrect email or password. Check account information via %1.").arg(deskLink()),
            true,
        };
    case ApiCode108:
        return {
            Texts::tr(
                "Invalid password: Password reset required or password expired. Check account information "
                "via %1.")
                .arg(deskLink()),
            true,
        };
    case ApiServerError:
        return {
            Texts::tr("User does not exist. %1 via Norvell Partner Desk.")
                .arg(portalLink(Texts::tr("Become a Partner"))),
            true,
        };
    default:
        return {failure(result)};
    }
}

QString portalLink(const QString &text) {
    return QStringLiteral("<a href=\"%1\">%2</a>").arg(QLatin1String(portal), text.toHtmlEscaped());
}

void openLinksOf(QLabel *label) {
    QObject::connect(label, &QLabel::linkActivated, label,
                     [](const QString &link) { QDesktopServices::openUrl(QUrl(link)); });
}

} // namespace OrbTexts
