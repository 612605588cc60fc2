#pragma once

#include <QWidget>

class QLabel;
class QLineEdit;
class QMimeData;

/// The look of a field for a file or a folder of this computer: a caption, the path with a button that
/// browses, and a line below that tells what is there.
class PathField : public QWidget {
    Q_OBJECT

public:
    /// The files and folders of this computer among what is dragged.
    static QStringList localPaths(const QMimeData &data);

signals:
    /// Another path was chosen, or more is known of it.
    void changed();

protected:
    enum class Tone { Quiet, Warning };

    PathField(const QString &caption, const QString &placeholder, QWidget *parent);

    virtual void browse() = 0;

    void showPath(const QString &path);
    void say(const QString &text, Tone tone);
    /// Shows that something would be taken here.
    void setDropping(bool on);

private:
    QLineEdit *m_edit;
    QLabel *m_state;
};
