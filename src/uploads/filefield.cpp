#include "filefield.h"

#include "filedialogs.h"
#include "localstore.h"
#include "netjob.h"
#include "storewriter.h"

#include <QDir>
#include <QDropEvent>
#include <QFileInfo>
#include <QGridLayout>
#include <QLabel>
#include <QLineEdit>
#include <QLocale>
#include <QMimeData>
#include <QPushButton>
#include <QStyle>

namespace {

/// Lets the style sheet look at the widget again: it does not watch properties.
void setStyled(QWidget *widget, const char *property, const QVariant &value) {
    if (widget->property(property) == value)
        return;
    widget->setProperty(property, value);
    widget->style()->unpolish(widget);
    widget->style()->polish(widget);
}

QStringList localPaths(const QMimeData &data) {
    QStringList paths;
    for (const QUrl &url : data.urls()) {
        if (url.isLocalFile())
            paths += url.toLocalFile();
    }
    return paths;
}

} // namespace

FileField::FileField(Kind kind, const Texts &texts, QWidget *parent)
    : QWidget(parent),
      m_kind(kind),
      m_edit(new QLineEdit(this)),
      m_browse(new QPushButton(tr("Browse..."), this)),
      m_state(new QLabel(texts.hint, this)) {
    auto *caption = new QLabel(texts.caption, this);
    caption->setProperty("role", "caption");
    caption->setBuddy(m_browse);
    m_edit->setAccessibleName(texts.caption);
    m_edit->setObjectName(QStringLiteral("pathEdit"));
    m_edit->setReadOnly(true);
    m_edit->setPlaceholderText(kind == Kind::File ? tr("Drop a file here or browse for it")
                                                  : tr("Drop a folder here or browse for it"));
    m_browse->setObjectName(QStringLiteral("browseButton"));
    m_browse->setAutoDefault(false);
    m_state->setObjectName(QStringLiteral("pathStateLabel"));
    m_state->setTextFormat(Qt::PlainText);
    m_state->setWordWrap(true);
    m_state->setProperty("role", "quiet");
    auto *layout = new QGridLayout(this);
    layout->setContentsMargins(0, 0, 0, 0);
    layout->setHorizontalSpacing(8);
    layout->setVerticalSpacing(6);
    layout->addWidget(caption, 0, 0, 1, 2);
    layout->addWidget(m_edit, 1, 0);
    layout->addWidget(m_browse, 1, 1);
    layout->addWidget(m_state, 2, 0, 1, 2);
    setFocusProxy(m_browse);
    connect(m_browse, &QPushButton::clicked, this, [this, title = texts.title] { browse(title); });
}

void FileField::acceptDropsOn(QWidget *area) {
    area->setAcceptDrops(true);
    area->installEventFilter(this);
}

void FileField::browse(const QString &title) {
    const auto chosen = [this](const QString &path) { setPath(path); };
    if (m_askPath)
        return m_askPath(chosen);
    const QString folder = CLocalStore::instance().defaultFilePath();
    if (m_kind == Kind::Folder)
        FileDialogs::askFolder(this, title, m_path.isEmpty() ? folder : m_path, chosen);
    else
        FileDialogs::askOpenPath(this, title, folder, tr("All files (*)"), chosen);
}

bool FileField::eventFilter(QObject *watched, QEvent *event) {
    switch (event->type()) {
    case QEvent::DragEnter:
    case QEvent::DragMove: {
        auto *drag = static_cast<QDragMoveEvent *>(event);
        if (localPaths(*drag->mimeData()).isEmpty())
            return false;
        drag->acceptProposedAction();
        setDropping(true);
        return true;
    }
    case QEvent::DragLeave:
        setDropping(false);
        return false;
    case QEvent::Drop:
        setDropping(false);
        static_cast<QDropEvent *>(event)->acceptProposedAction();
        drop(*static_cast<QDropEvent *>(event)->mimeData());
        return true;
    default:
        return QWidget::eventFilter(watched, event);
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

void FileField::setDropping(bool on) {
    setStyled(m_edit, "dropping", on);
}

void FileField::setPath(const QString &path) {
    if (path.isEmpty())
        return;
    m_path = path;
    m_good = false;
    m_edit->setText(QDir::toNativeSeparators(path));
    say(tr("Looking at it..."), Tone::Quiet);
    emit changed();
    NetJob::post(
        NetJob::createRunner("looking at a file", NetTask::Turn::Beside), this,
        [path, look = m_kind == Kind::File ? &FileCheck::ofFile : &FileCheck::ofFolder] {
            return look(path);
        },
        [this, path](const FileCheck &check) {
            if (path == m_path)
                onChecked(check);
        });
}

void FileField::onChecked(const FileCheck &check) {
    m_good = check.problem.isEmpty();
    const QString size = QLocale().formattedDataSize(check.size);
    if (!m_good)
        say(check.problem, Tone::Warning);
    else
        say(m_kind == Kind::File ? tr("Size: %1").arg(size) : tr("Free: %1").arg(size), Tone::Quiet);
    if (m_good)
        StoreWriter::post([folder = m_kind == Kind::File ? QFileInfo(m_path).absolutePath() : m_path] {
            CLocalStore::instance().setDefaultFilePath(folder);
        });
    emit changed();
}

QString FileField::fileName() const {
    return m_good ? QFileInfo(m_path).fileName() : QString();
}

void FileField::say(const QString &text, Tone tone) {
    m_state->setText(text);
    setStyled(m_state, "role", tone == Tone::Warning ? "warning" : "quiet");
}
