#include "uploadfilefield.h"

#include "filedialogs.h"
#include "localstore.h"
#include "netjob.h"
#include "plaintext.h"
#include "storewriter.h"

#include <QDragEnterEvent>
#include <QFileInfo>
#include <QHBoxLayout>
#include <QLabel>
#include <QLocale>
#include <QMimeData>
#include <QStyle>
#include <QToolButton>
#include <QUrl>

namespace {

QLabel *makeLabel(const char *name, QWidget *parent) {
    auto *label = new QLabel(parent);
    label->setObjectName(QLatin1String(name));
    label->setTextFormat(Qt::PlainText);
    return label;
}

} // namespace

UploadFileField::UploadFileField(QWidget *parent)
    : QFrame(parent),
      m_name(makeLabel("fileNameLabel", this)),
      m_size(makeLabel("fileSizeLabel", this)),
      m_browse(new QToolButton(this)) {
    setObjectName(QStringLiteral("uploadFileField"));
    // A name of 255 bytes must not widen the dialog.
    m_name->setSizePolicy(QSizePolicy::Ignored, QSizePolicy::Preferred);
    m_size->setProperty("role", "quiet");
    m_browse->setObjectName(QStringLiteral("browseButton"));
    m_browse->setText(tr("Browse"));
    m_browse->setProperty("role", "link");
    m_browse->setFocusPolicy(Qt::StrongFocus);
    setFocusProxy(m_browse);
    auto *layout = new QHBoxLayout(this);
    layout->setContentsMargins(10, 0, 6, 0);
    layout->setSpacing(10);
    layout->addWidget(m_name, 1);
    layout->addWidget(m_size);
    layout->addWidget(m_browse);
    connect(m_browse, &QToolButton::clicked, this, &UploadFileField::browse);
    showFile();
}

void UploadFileField::setFileDialog(const QString &title, const QString &filter, const QString &hint) {
    m_title = title;
    m_filter = filter;
    m_hint = hint;
    m_browse->setAccessibleName(title);
    showName();
}

void UploadFileField::acceptDropsOn(QWidget *widget) {
    widget->setAcceptDrops(true);
    widget->installEventFilter(this);
}

void UploadFileField::browse() {
    FileDialogs::askOpenPath(this, m_title, m_folder, m_filter, [this](const QString &path) {
        m_folder = QFileInfo(path).absolutePath();
        StoreWriter::post([folder = m_folder] { CLocalStore::instance().setDefaultFilePath(folder); });
        choose(path);
    });
}

bool UploadFileField::eventFilter(QObject *watched, QEvent *event) {
    if (event->type() != QEvent::DragEnter && event->type() != QEvent::Drop)
        return QFrame::eventFilter(watched, event);
    auto *drop = static_cast<QDropEvent *>(event);
    if (!drop->mimeData()->hasUrls())
        return QFrame::eventFilter(watched, event);
    // The source keeps its file, whatever it offers.
    drop->setDropAction(Qt::CopyAction);
    drop->accept();
    if (event->type() == QEvent::Drop)
        onDropped(*drop->mimeData());
    return true;
}

void UploadFileField::onDropped(const QMimeData &mime) {
    const QList<QUrl> urls = mime.urls();
    if (urls.size() != 1)
        return emit dropRefused(tr("Only one file can be uploaded at a time."));
    if (!urls.first().isLocalFile())
        return emit dropRefused(tr("Only a file of this computer can be uploaded."));
    choose(urls.first().toLocalFile());
}

void UploadFileField::choose(const QString &path) {
    const int choice = ++m_choice;
    m_file = {};
    m_file.path = path;
    m_file.name = QFileInfo(path).fileName();
    m_checking = true;
    showFile();
    emit changed();
    NetJob::post(
        NetJob::createRunner("checking a file", NetTask::Turn::Beside), this,
        [path] { return UploadFile::inspect(path); },
        [this, choice](const UploadFile &file) {
            if (choice == m_choice)
                onInspected(file);
        },
        [this, choice](JobEnd end) {
            if (end == JobEnd::Delivered || choice != m_choice)
                return;
            UploadFile file = m_file;
            file.problem = tr("The file could not be checked; choose it again.");
            onInspected(file);
        });
}

void UploadFileField::onInspected(const UploadFile &file) {
    m_file = file;
    m_checking = false;
    showFile();
    emit changed();
}

void UploadFileField::showFile() {
    const bool isChosen = !m_file.path.isEmpty();
    m_name->setProperty("role", isChosen ? "" : "quiet");
    m_name->style()->polish(m_name);
    m_name->setToolTip(PlainText::toolTip(m_file.path));
    m_size->setText(m_checking        ? tr("Checking...")
                    : m_file.isGood() ? QLocale().formattedDataSize(m_file.size, 1)
                                      : QString());
    showName();
}

void UploadFileField::showName() {
    const QString name = m_file.path.isEmpty() ? m_hint : m_file.name;
    m_name->setText(m_name->fontMetrics().elidedText(name.simplified(), Qt::ElideMiddle, m_name->width()));
    m_name->setAccessibleName(name);
}

void UploadFileField::resizeEvent(QResizeEvent *event) {
    QFrame::resizeEvent(event);
    // The label has its place once the layout has seen the new size.
    layout()->activate();
    showName();
}
