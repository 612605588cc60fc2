#pragma once

#include "app/login/accountpermission.h"

#include <QObject>
#include <QPointer>

class ServiceDialog;

/// Leads the user to the dialog about the remote-access service that fits: to link the service with it, or to
/// look after the link.
class ServiceManagement : public QObject {
    Q_OBJECT

public:
    /// frame: the window that the dialogs open over; it owns this object.
    explicit ServiceManagement(QWidget *frame);

public slots:
    /// Asks the service whether it is linked and opens the dialog. While that is under way, or a dialog is
    /// open, nothing is begun a second time.
    void validateOrbServiceAdded();
    /// Asks as well, but only tells the answer.
    void lookUp();
    /// The session is over, and what was asked on it.
    void reset();

signals:
    /// A transient message to be shown until connectToOrbFinished; 0 stands for the usual time and width.
    void connectToOrbMessage(const QString &i_message, const QString &i_dialog_type, int i_timeout,
                             int i_dialog_width);
    void connectToOrbFinished();
    /// The service is linked, or is not any more.
    void serviceAdded(bool added);

private:
    struct Answer;

    void finishAsking();
    void onAnswer(const Answer &answer);
    void openAddDialog();
    void openStatusDialog();
    void open(ServiceDialog *dialog);
    void showError(const QString &text);
    QWidget *frame() const;

    bool m_asking = false;
    AccountPermission m_permission = AccountPermission::Unknown;
    QPointer<ServiceDialog> m_dialog;
};
