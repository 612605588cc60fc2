#include "framelessdialog.h"

#include "dialogdragger.h"
#include "icons.h"

#include <QDebug>
#include <QEvent>
#include <QHBoxLayout>
#include <QKeyEvent>
#include <QLabel>
#include <QToolButton>
#include <QVBoxLayout>

namespace {
constexpr int titleHeight = 44;
} // namespace

FramelessDialog::FramelessDialog(QWidget *parent)
    : QDialog(parent, Qt::Dialog | Qt::FramelessWindowHint | Qt::NoDropShadowWindowHint),
      m_title(new QLabel),
      m_close(new QToolButton),
      m_content(new QWidget) {
    setAttribute(Qt::WA_TranslucentBackground);

    auto *window = new QWidget(this);
    window->setObjectName(QStringLiteral("dialogWindow"));
    auto *frame = new QFrame(window);
    frame->setObjectName(QStringLiteral("dialogFrame"));
    auto *dragger = new DialogDragger(frame);
    dragger->setObjectName(QStringLiteral("dialogDragger"));
    dragger->setFixedHeight(titleHeight);
    m_title->setObjectName(QStringLiteral("dialogTitleLabel"));
    m_title->setTextFormat(Qt::PlainText);
    m_close->setObjectName(QStringLiteral("dialogCloseButton"));
    m_close->setAccessibleName(tr("Close"));
    m_close->setIcon(Icons::icon(QStringLiteral(":/images/icon_general_close_line.svg"), {16, 16}));
    m_close->setIconSize({16, 16});
    m_close->setFixedSize(28, 28);
    // Escape closes as well, so the keyboard's way leads past the cross.
    m_close->setFocusPolicy(Qt::NoFocus);
    connect(m_close, &QToolButton::clicked, this, &QDialog::reject);

    auto *titleLayout = new QHBoxLayout(dragger);
    titleLayout->setContentsMargins(16, 0, 8, 0);
    titleLayout->addWidget(m_title, 1);
    titleLayout->addWidget(m_close);

    auto *frameLayout = new QVBoxLayout(frame);
    frameLayout->setContentsMargins(1, 1, 1, 1);
    frameLayout->setSpacing(0);
    frameLayout->addWidget(dragger);
    frameLayout->addWidget(m_content, 1);

    auto *windowLayout = new QVBoxLayout(window);
    windowLayout->setContentsMargins(0, 0, 0, 0);
    windowLayout->addWidget(frame);
    auto *layout = new QVBoxLayout(this);
    layout->setContentsMargins(0, 0, 0, 0);
    layout->addWidget(window);

    connect(this, &QWidget::windowTitleChanged, m_title, &QLabel::setText);
    // A dialog's object name is that of its class, which is not known here yet.
    connect(this, &QObject::objectNameChanged, this,
            [](const QString &name) { qDebug("%s constructor", qUtf8Printable(name)); });
}

FramelessDialog::~FramelessDialog() {
    qDebug("%s destructor", qUtf8Printable(objectName()));
}

void FramelessDialog::setClosable(bool closable) {
    m_closable = closable;
    m_close->setVisible(closable);
}

void FramelessDialog::centreOverParent() {
    const QWidget *over = parentWidget() ? parentWidget()->window() : nullptr;
    if (!over)
        return;
    QRect place({}, size().expandedTo(minimumSizeHint()));
    place.moveCenter(over->geometry().center());
    move(place.topLeft());
}

void FramelessDialog::showEvent(QShowEvent *event) {
    QDialog::showEvent(event);
    if (!event->spontaneous())
        centreOverParent();
}

void FramelessDialog::keyPressEvent(QKeyEvent *event) {
    if (event->key() == Qt::Key_Escape && !m_closable) {
        event->accept();
        return;
    }
    QDialog::keyPressEvent(event);
}

bool FramelessDialog::event(QEvent *event) {
    const bool handled = QDialog::event(event);
    // A part that appears or a text that wraps changes what the content needs.
    if (event->type() == QEvent::LayoutRequest && isVisible())
        fitContent();
    return handled;
}

/// Resizes about the middle of the upper edge: the window system may otherwise choose another place.
void FramelessDialog::fitContent() {
    const QRect before = geometry();
    const QSize wanted = sizeHint().expandedTo(minimumSizeHint());
    if (wanted == before.size())
        return;
    setGeometry(QRect(QPoint(before.center().x() - wanted.width() / 2, before.top()), wanted));
}
