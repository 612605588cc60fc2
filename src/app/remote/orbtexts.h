#pragma once

#include <QString>

class QLabel;

/// What the dialogs about the remote-access service say in common.
namespace OrbTexts {

QString unableToConnect();
QString unknownError();
/// The first of the two where the server did not answer, else the second.
QString failure(unsigned result);

/// What came of a sign-in that did not succeed. One with a link is marked up, the others are plain.
struct SignInFailure {
    QString text;
    bool linked = false;
};
SignInFailure signInFailure(unsigned result);

/// Markup of a link to the partner portal.
QString portalLink(const QString &text);
/// Opens the links of a label in the user's browser.
void openLinksOf(QLabel *label);

} // namespace OrbTexts
