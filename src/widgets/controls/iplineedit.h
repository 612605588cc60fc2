#pragma once

#include <QLineEdit>

/// A field for an IPv4 address: four numbers from 0 to 255 with dots between them. Blanks, which come along
/// with pasted text, are left out; other letters are not taken.
class IPLineEdit : public QLineEdit {
    Q_OBJECT

public:
    explicit IPLineEdit(QWidget *parent = nullptr);

    bool isValid() const { return hasAcceptableInput(); }
    /// The address without leading zeros; empty while it is not whole.
    QString address() const;

signals:
    void validityChanged(bool valid);

private:
    bool m_wasValid = false;
};
