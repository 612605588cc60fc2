#pragma once

#include "devices/inventory/passwordpolicy.h"

#include <QWidget>

class QVBoxLayout;

/// The rules of a password policy, each with a mark that tells whether a password keeps it.
class PasswordChecklist : public QWidget {
    Q_OBJECT

public:
    explicit PasswordChecklist(QWidget *parent = nullptr);

    void showPolicy(const PasswordPolicy &policy, const QString &password, const QString &userName);

private:
    void addLine(const QString &text, const QString &icon);

    QVBoxLayout *m_lines;
};
