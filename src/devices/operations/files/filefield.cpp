#include "devices/operations/files/filefield.h"

#include "store/lastfolder.h"
#include "widgets/dialogs/filedialogs.h"

#include <QDropEvent>
#include <QLocale>
#include <QMimeData>

FileField::FileField(Kind kind, const Texts &texts, QWidget *parent)
    : PathField(texts.caption,
                kind == Kind::File ? tr("Drop a file here or browse for it")
                                   : tr("Drop a folder here or browse for it"),
                parent),
      m_kind(kind),
      m_title(texts.title) {
    say(texts.hint, Tone::Quiet);
    if (kind == Kind::Folder)
        setPath(LastFolder::path());
}

void FileField::acceptDropsOn(QWidget *area) {
    area->setAcceptDrops(true);
    area->installEventFilter(this);
}

void FileField::browse() {
    const auto chosen = [this](const QString &path) { setPath(path); };
    if (m_askPath)
        m_askPath(chosen);
    else if (m_kind == Kind::Folder)
        FileDialogs::askFolder(this, m_title, m_file.path.isEmpty() ? LastFolder::path() : m_file.path,
                               chosen);
    else
        FileDialogs::askOpenPath(this, m_title, LastFolder::path(), tr("All Files(*)"), chosen);
}

bool FileField::eventFilter(QObject *watched, QEvent *event) {
    switch (event->type()) {
    case QEvent::DragEnter:
    case QEvent::DragMove:
    case QEvent::Drop: {
        auto *drag = static_cast<QDropEvent *>(event);
        if (localPaths(*drag->mimeData()).isEmpty())
            return false;
        // The source keeps its file, whatever it offers.
        drag->setDropAction(Qt::CopyAction);
        drag->accept();
        setDropping(event->type() != QEvent::Drop);
        if (event->type() == QEvent::Drop)
            drop(*drag->mimeData());
        return true;
    }
    case QEvent::DragLeave:
        setDropping(false);
        return false;
    default:
        return PathField::eventFilter(watched, event);
    }
}

void FileField::drop(const QMimeData &dropped) {
    const QStringList paths = localPaths(dropped);
    if (paths.size() == 1)
        setPath(paths.constFirst());
    else
        say(m_kind == Kind::File ? tr("Only one file can be taken.") : tr("Only one folder can be taken."),
            Tone::Warning);
}

void FileField::setPath(const QString &path) {
    if (path.isEmpty())
        return;
    const int choice = ++m_choice;
    m_file = {};
    m_isChecking = true;
    showPath(path);
    say(tr("Looking at it..."), Tone::Quiet);
    emit changed();
    const auto ended = [this, choice, path](JobOutcome end) { onCheckEnded(choice, path, end); };
    const bool started = NetJob::post(
        NetJob::createRunner("looking at a file", NetTask::Turn::Beside), this,
        [path, look = m_kind == Kind::File ? &FileCheck::ofFile : &FileCheck::ofFolder] {
            return look(path);
        },
        [this, choice](FileCheck found) {
            if (choice == m_choice)
                onChecked(std::move(found));
        },
        ended);
    if (!started)
        ended(JobOutcome::NotRun);
}

void FileField::onCheckEnded(int choice, const QString &path, JobOutcome end) {
    if (end == JobOutcome::Delivered || choice != m_choice)
        return;
    FileCheck unknown;
    unknown.path = path;
    unknown.problem = tr("It could not be looked at; choose it again.");
    onChecked(std::move(unknown));
}

void FileField::onChecked(FileCheck found) {
    m_isChecking = false;
    m_file = std::move(found);
    if (m_file.isGood() && m_judge)
        m_file.problem = m_judge(m_file);
    const QString size = QLocale().formattedDataSize(m_file.size, 1);
    if (!m_file.isGood())
        say(m_file.problem, Tone::Warning);
    else
        say(m_kind == Kind::File ? tr("Size: %1").arg(size) : tr("Free: %1").arg(size), Tone::Quiet);
    // A folder that was only offered is nobody's choice.
    if (m_file.isGood() && m_kind == Kind::File)
        LastFolder::rememberFile(m_file.path);
    else if (m_file.isGood() && m_file.path != LastFolder::path())
        LastFolder::rememberFolder(m_file.path);
    emit changed();
}
