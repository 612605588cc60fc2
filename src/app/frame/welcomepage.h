#pragma once

#include <QWidget>

class QLabel;
class WaitingSpinner;

/// What the frame shows while nobody is logged in: the product, and a way back to the login dialog.
class WelcomePage : public QWidget {
    Q_OBJECT

public:
    explicit WelcomePage(QWidget *parent = nullptr);

    /// Tells that it is being found out what the user has to see.
    void setChecking(bool checking);

signals:
    void loginRequested();

private:
    WaitingSpinner *m_spinner;
    QLabel *m_checking;
};
