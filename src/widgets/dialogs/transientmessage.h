#pragma once

#include <QLabel>

/// A short message over the lower edge of a window, which goes by itself.
class TransientMessage : public QLabel {
    Q_OBJECT

public:
    enum class Kind {
        Plain,
        Loading, ///< work is under way; stays until it is cleared or another message takes its place
        Success,
        Error ///< stays longer than the others
    };

    /// Shows the text over the window of the given widget, in place of an earlier message there.
    static void show(QWidget *over, const QString &text, Kind kind = Kind::Plain);
    /// Takes the message of that window away.
    static void clear(QWidget *over);

private:
    TransientMessage(QWidget *window, Kind kind);

    void addMark(Kind kind);
    void fit();
};
