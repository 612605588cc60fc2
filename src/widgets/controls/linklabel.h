#pragma once

#include <QLabel>

/// A label whose links the keyboard reaches as it reaches buttons: each link takes one press of Tab, and the
/// label none by itself.
class LinkLabel : public QLabel {
    Q_OBJECT

public:
    using QLabel::QLabel;

protected:
    void focusInEvent(QFocusEvent *event) override;
};
