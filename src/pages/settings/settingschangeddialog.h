#pragma once

#include "widgets/dialogs/framelessdialog.h"

#include <QVariantMap>

/// Tells which settings somebody else has changed since the page was filled, and asks whose values are to
/// stand. Closed without an answer it decides nothing.
class SettingsChangedDialog : public FramelessDialog {
    Q_OBJECT

public:
    /// page, server: the values of either side under the keys that differ.
    SettingsChangedDialog(const QStringList &keys, const QVariantMap &page, const QVariantMap &server,
                          QWidget *parent);

signals:
    void keepServerValues();
    void keepPageValues();

private:
    QWidget *buildList(const QStringList &keys, const QVariantMap &page, const QVariantMap &server);
    QWidget *buildFooter();
};
