#pragma once

#include "widgets/dialogs/framelessdialog.h"

#include <memory>

namespace Ui {
class ConfirmDialog;
}

/// Asks before something that cannot be taken back. The kind selects title, text and buttons.
class ConfirmDialog : public FramelessDialog {
    Q_OBJECT

public:
    enum class Kind {
        SwitchServer,    ///< ends the present session for one with another server
        UnfinishedTask,  ///< ends the session while a task is still being requested
        UnsavedSites,    ///< ends the session with changes of sites that were not sent
        UnsavedSettings, ///< ends the session with settings that were not applied
        LeavePage,       ///< leaves a page with changes; accepted means to stay, and so does Escape
        CancelTask,      ///< ends tasks, as many as the count says
        RemoveTasks,     ///< takes as many finished tasks off the list
        DeleteAlarms,    ///< as many as the count says
        DeleteDevices,   ///< from the service for good
        RemoveFromSite,  ///< devices, which the overview keeps
        RestartDevices,  ///< as many as the count says
        DeleteSite,      ///< with its sub-sites
        UnlinkService    ///< from the remote-access service
    };

    explicit ConfirmDialog(Kind kind, QWidget *parent = nullptr, int count = 1);
    ~ConfirmDialog() override;

    /// Adds what the user should know below the question; the dialog owns it.
    void addDetail(QWidget *detail);
    /// Whether the question can be answered with yes.
    void setAcceptable(bool acceptable);

public slots:
    void reject() override;

private:
    std::unique_ptr<Ui::ConfirmDialog> m_ui;
    Kind m_kind;
};
