#pragma once

#include "widgets/dialogs/windowdragger.h"

class PopupMenu;
class QToolButton;

/// The frame's title bar: logo, help, account menu, and the window's own buttons.
class TitleBar : public WindowDragger {
    Q_OBJECT

public:
    explicit TitleBar(QWidget *parent = nullptr);

    QToolButton *helpButton() const { return m_help; }
    QToolButton *accountButton() const { return m_account; }
    PopupMenu *accountMenu() const { return m_menu; }
    QAction *accountManagementAction() const { return m_accountManagement; }
    QAction *serviceManagementAction() const { return m_serviceManagement; }
    QAction *aboutAction() const { return m_about; }
    QAction *logOffAction() const { return m_logOff; }
    QToolButton *minimizeButton() const { return m_minimize; }
    QToolButton *maximizeButton() const { return m_maximize; }
    QToolButton *restoreButton() const { return m_restore; }
    QToolButton *closeButton() const { return m_close; }

    /// Shows the button that leads out of the present state.
    void setMaximized(bool maximized);
    /// Marks the menu's entry for the remote-access service while this service is linked with it.
    void setServiceAdded(bool added);

private:
    QToolButton *addButton(const char *name, const QString &icon, const QString &text);
    void buildMenu();

    QToolButton *m_help;
    QToolButton *m_account;
    QToolButton *m_minimize;
    QToolButton *m_maximize;
    QToolButton *m_restore;
    QToolButton *m_close;
    PopupMenu *m_menu;
    QAction *m_accountManagement = nullptr;
    QAction *m_serviceManagement = nullptr;
    QAction *m_about = nullptr;
    QAction *m_logOff = nullptr;
};
