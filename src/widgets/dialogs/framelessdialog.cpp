#include "widgets/dialogs/framelessdialog.h"

#include "widgets/dialogs/dialogdragger.h"
#include "widgets/style/icons.h"

#include <QDebug>
#include <QEvent>
#include <QHBoxLayout>
#include <QKeyEvent>
#include <QLabel>
#include <QToolButton>
#include <QVBoxLayout>
#include <QWindow>

namespace {
constexpr int titleHeight = 44;
/// How long a window manager may take to place a new window.
constexpr int placingMs = 2000;
/// One that wants the window elsewhere gets its way after these.
constexpr int maxCorrections = 5;
/// After a change of its geometry the dialog checks its native window's position so often.
constexpr int positionCheckMs = 50;
constexpr int maxPositionChecks = 20;
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
    connect(dragger, &WindowDragger::dragged, this, [this] { m_dragged = true; });
    m_positionTimer.setInterval(positionCheckMs);
    connect(&m_positionTimer, &QTimer::timeout, this, &FramelessDialog::checkNativePosition);

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

QRect FramelessDialog::preferredPlace(const QSize &size) const {
    QRect place(pos(), size);
    if (parentWidget())
        place.moveCenter(parentWidget()->window()->geometry().center());
    return place;
}

void FramelessDialog::centreOverParent() {
    if (!m_dragged)
        move(preferredPlace(size().expandedTo(minimumSizeHint())).topLeft());
}

/// On X11 a window that is moved between its making and its mapping often does not know where the window
/// manager has put it: its lists then open elsewhere. So its place is set before there is a native window.
void FramelessDialog::prepareToShow() {
    ensurePolished();
    layout()->activate();
    if (!testAttribute(Qt::WA_Resized))
        resize(sizeHint().expandedTo(minimumSizeHint()));
    centreOverParent();
    m_sinceShown.start();
    m_corrections = maxCorrections;
    startPositionChecks();
}

void FramelessDialog::moveEvent(QMoveEvent *event) {
    QDialog::moveEvent(event);
    if (isVisible() && m_corrections > 0)
        QMetaObject::invokeMethod(this, &FramelessDialog::correctPlace, Qt::QueuedConnection);
}

/// The first news of a new window's place may be of a moment when the window manager was not done with it. A
/// move to where it should be makes the window manager tell its true place.
void FramelessDialog::correctPlace() {
    const QPoint place = preferredPlace(size()).topLeft();
    if (m_dragged || m_corrections == 0 || m_sinceShown.elapsed() > placingMs || pos() == place)
        return;
    --m_corrections;
    move(place);
}

void FramelessDialog::startPositionChecks() {
    m_positionChecks = maxPositionChecks;
    m_positionTimer.start();
}

/// A window manager resizes and moves in two steps. Qt may note the position between the two for the native
/// window, and sends no move event for it because it is the position before the change. Lists would open
/// there.
void FramelessDialog::checkNativePosition() {
    QWindow *window = windowHandle();
    if (--m_positionChecks <= 0 || !isVisible() || !window) {
        m_positionTimer.stop();
        return;
    }
    if (window->position() != pos())
        window->setPosition(pos());
}

void FramelessDialog::setVisible(bool visible) {
    if (visible && isHidden())
        prepareToShow();
    QDialog::setVisible(visible);
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

/// Keeps its place, or where the user has dragged it the middle of its upper edge.
void FramelessDialog::fitContent() {
    const QRect before = geometry();
    const QSize wanted = sizeHint().expandedTo(minimumSizeHint());
    const QRect grown(QPoint(before.center().x() - wanted.width() / 2, before.top()), wanted);
    const QRect place = m_dragged ? grown : preferredPlace(wanted);
    if (place == before)
        return;
    setGeometry(place);
    startPositionChecks();
}
