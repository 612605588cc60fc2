#pragma once

#include <QLabel>

/// A short message over the lower edge of a window, which goes by itself.
class TransientMessage : public QLabel {
    Q_OBJECT

public:
    /// Shows the text over the window of the given widget, in place of an earlier message there.
    static void show(QWidget *over, const QString &text);

private:
    explicit TransientMessage(QWidget *window);
};
