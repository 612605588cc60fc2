#pragma once

#include <QWidget>

/// What the frame shows while nobody is logged in: the product, and a way back to the login dialog.
class WelcomePage : public QWidget {
    Q_OBJECT

public:
    explicit WelcomePage(QWidget *parent = nullptr);

signals:
    void loginRequested();
};
