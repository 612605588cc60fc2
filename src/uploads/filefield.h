#pragma once

#include "filecheck.h"

#include <QWidget>

#include <functional>

class QLabel;
class QLineEdit;
class QMimeData;
class QPushButton;

/// A field for a file or a folder of this computer, which is chosen from a file dialog or dropped. What is
/// chosen is looked at beside the user-interface thread; the line below tells what was found.
class FileField : public QWidget {
    Q_OBJECT

public:
    enum class Kind { File, Folder };
    /// Asks the user for a path and calls the function with it, or never.
    using AskPath = std::function<void(const std::function<void(const QString &path)> &chosen)>;

    struct Texts {
        QString caption; ///< above the field
        QString title;   ///< of the file dialog
        QString hint;    ///< below the field while nothing is chosen
    };

    FileField(Kind kind, const Texts &texts, QWidget *parent);

    /// Takes what is dropped anywhere on the widget.
    void acceptDropsOn(QWidget *area);
    /// Replaces the file dialog.
    void setAskPath(AskPath ask) { m_askPath = std::move(ask); }

    void setPath(const QString &path);
    /// What was chosen and found to be good; empty as long as there is no such thing.
    QString path() const { return m_good ? m_path : QString(); }
    QString fileName() const;

signals:
    /// Another path is good, or none any more.
    void changed();

protected:
    bool eventFilter(QObject *watched, QEvent *event) override;

private:
    enum class Tone { Quiet, Warning };

    void browse(const QString &title);
    void drop(const QMimeData &dropped);
    void setDropping(bool on);
    void onChecked(const FileCheck &check);
    void say(const QString &text, Tone tone);

    Kind m_kind;
    QLineEdit *m_edit;
    QPushButton *m_browse;
    QLabel *m_state;
    AskPath m_askPath;
    QString m_path;
    bool m_good = false;
};
