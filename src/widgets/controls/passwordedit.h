#pragma once

#include <QLineEdit>

/// A field for a password, with a trailing eye that shows and hides it.
class PasswordEdit : public QLineEdit {
    Q_OBJECT

public:
    explicit PasswordEdit(QWidget *parent = nullptr);

    void setShown(bool shown);

private:
    QAction *m_eye;
};
