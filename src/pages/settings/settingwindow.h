#pragma once

#include "api/session/netjob.h"
#include "pages/settings/serversettings.h"

#include <QPointer>
#include <QWidget>

class QFrame;
class QLabel;
class QPushButton;
class ServiceSession;
class SettingsChangedDialog;
class SettingsForm;
class WaitingSpinner;

/// The settings page: the service's settings and what the client itself keeps there.
class SettingWindow : public QWidget {
    Q_OBJECT

public:
    explicit SettingWindow(QWidget *parent = nullptr);
    ~SettingWindow() override;

    bool hasUnsavedEdits() const;
    /// Puts the loaded values back; while a save is under way, those that are being saved.
    void discardEdits();
    /// Forgets what was loaded, as at the end of a session.
    void reset();

public slots:
    /// Reads the settings of the service and fills the controls; what the user has changed meanwhile stays.
    void loadConfig();
    /// Saves the controls' values, unless somebody else has changed something: then the user is asked.
    void saveConfig();

private:
    struct Loaded {
        unsigned result = 0;
        ServerSettings::Reading reading;
    };
    struct Saved {
        unsigned loadResult = 0;
        unsigned saveResult = 0;
        ServerSettings::Reading fresh;
        QStringList
            changed; ///< keys whose value on the service is neither the loaded one nor that of the page
    };

    static Loaded load(ServiceSession &session);
    static Saved save(ServiceSession &session, const QVariantMap &loaded, const QVariantMap &wanted);

    QWidget *buildNotice();
    QWidget *buildFooter();
    void onLoaded(const Loaded &loaded);
    void onSaved(const Saved &saved, const QVariantMap &wanted);
    void onEdited(const QString &key);
    void endSaving();
    void resolveConflict(const Saved &saved, const QVariantMap &wanted);
    void takeOver(const QVariantMap &values);
    void onJobEnded(JobOutcome end, const QString &failure, bool offersRetry);
    void showNotice(const QString &text, bool offersRetry = false);
    void showBusy(const QString &text);
    void enableButtons(bool enabled);

    NetTask::Owner m_runner;
    QVariantMap m_loaded; ///< what the service has, as far as known
    QVariantMap m_saving; ///< what is on its way to it
    bool m_discardedWhileSaving = false;
    bool m_everLoaded = false;
    QString m_busyText;

    QFrame *m_notice = nullptr;
    QLabel *m_noticeText = nullptr;
    QPushButton *m_retry = nullptr;
    SettingsForm *m_form;
    QLabel *m_status = nullptr;
    WaitingSpinner *m_spinner = nullptr;
    QPushButton *m_cancel = nullptr;
    QPushButton *m_apply = nullptr;
    QPointer<SettingsChangedDialog> m_question;
};
