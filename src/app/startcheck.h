#pragma once

#include "nettask.h"

#include <QObject>

/// Finds out what the user has to see first when nobody is logged in: asks the local service, where there is
/// one, whether it answers and whether it has an account yet.
class StartCheck : public QObject {
    Q_OBJECT

public:
    explicit StartCheck(QObject *parent = nullptr);

    /// Starts the check; one that is under way is not doubled. One of the signals tells its end.
    void start();

signals:
    /// The local service has only the account it came with.
    void accountSetupNeeded();
    /// Somebody has to log in; the tip says why this computer's service is not to be had, or is empty.
    void loginNeeded(const QString &tip);
    /// The local service shows another key than the remembered one; nothing was sent to it.
    void keyChanged(const QString &fingerprint);

private:
    NetTask::Owner m_runner;
};
