#pragma once

#include "api/session/netjob.h"
#include "devices/operations/files/filecheck.h"
#include "devices/operations/files/pathfield.h"

#include <functional>

/// A field for a file that is to be sent or a folder that files are to be put into, which is chosen from a
/// file dialog or dropped. What is chosen is looked at beside the user-interface thread. A folder field
/// begins with the folder that was used last.
class FileField : public PathField {
    Q_OBJECT

public:
    enum class Kind { File, Folder };
    /// Asks the user for a path and calls the function with it, or never.
    using AskPath = std::function<void(const std::function<void(const QString &path)> &chosen)>;
    /// What is wrong with a good file all the same, as a sentence; empty for nothing.
    using Judge = std::function<QString(const FileCheck &file)>;

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
    void setJudge(Judge judge) { m_judge = std::move(judge); }

    void setPath(const QString &path);
    /// What was found; its path is empty while nothing is chosen or the look at it goes on.
    const FileCheck &file() const { return m_file; }
    bool isChecking() const { return m_isChecking; }

protected:
    bool eventFilter(QObject *watched, QEvent *event) override;
    void browse() override;

private:
    void drop(const QMimeData &dropped);
    void onChecked(FileCheck found);
    void onCheckEnded(int choice, const QString &path, JobOutcome end);

    Kind m_kind;
    QString m_title;
    AskPath m_askPath;
    Judge m_judge;
    FileCheck m_file;
    bool m_isChecking = false;
    int m_choice = 0; ///< counts what was chosen, so that a late look at an earlier path is dropped
};
