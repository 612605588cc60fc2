#pragma once

#include "uploadfile.h"

#include <QFrame>

class QLabel;
class QMimeData;
class QToolButton;

/// The field of a dialog that takes a file to be sent, by a file dialog or dropped, and looks at it on a
/// runner. Shows its name and size.
class UploadFileField : public QFrame {
    Q_OBJECT

public:
    explicit UploadFileField(QWidget *parent = nullptr);

    /// title, filter: of the file dialog. hint: shown while there is no file.
    void setFileDialog(const QString &title, const QString &filter, const QString &hint);
    /// Where the file dialog begins.
    void setFolder(const QString &folder) { m_folder = folder; }
    /// Takes files that are dropped onto this widget.
    void acceptDropsOn(QWidget *widget);

    /// Takes a file and begins to look at it.
    void choose(const QString &path);

    /// The last file that was looked at; its path is empty while there is none.
    const UploadFile &file() const { return m_file; }
    bool isChecking() const { return m_checking; }

signals:
    /// Another file was chosen, or the look at it is over.
    void changed();
    /// Something was dropped that is not one file.
    void dropRefused(const QString &reason);

protected:
    bool eventFilter(QObject *watched, QEvent *event) override;
    void resizeEvent(QResizeEvent *event) override;

private:
    void browse();
    void onDropped(const QMimeData &mime);
    void onInspected(const UploadFile &file);
    void showFile();
    void showName();

    QString m_title;
    QString m_filter;
    QString m_hint;
    QString m_folder;
    UploadFile m_file;
    bool m_checking = false;
    int m_choice = 0; ///< counts what was chosen, so that a late look at an earlier file is dropped
    QLabel *m_name;
    QLabel *m_size;
    QToolButton *m_browse;
};
