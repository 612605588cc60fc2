#include "app/frame/noticecard.h"

#include "app/help/userguide.h"
#include "widgets/style/icons.h"

#include <QAccessible>
#include <QEvent>
#include <QHBoxLayout>
#include <QLabel>
#include <QPushButton>

#include <algorithm>

namespace {

constexpr int maxWidth = 760;
constexpr int sideDistance = 24;
constexpr int bottomDistance = 56;
constexpr QSize markSize{16, 16};

} // namespace

NoticeCard::NoticeCard(QWidget *frame)
    : QFrame(frame), m_text(new QLabel(this)), m_guide(new QPushButton(tr("User Guide"), this)) {
    setObjectName(QStringLiteral("noticeCard"));
    auto *mark = new QLabel(this);
    mark->setPixmap(Icons::pixmap(QStringLiteral(":/images/icon_general_tip_solid_blue.svg"), markSize,
                                  devicePixelRatioF()));
    m_text->setObjectName(QStringLiteral("noticeCardText"));
    m_text->setTextFormat(Qt::PlainText);
    m_text->setWordWrap(true);
    auto *dismiss = new QPushButton(tr("Dismiss"), this);
    dismiss->setObjectName(QStringLiteral("noticeDismissButton"));
    m_guide->setObjectName(QStringLiteral("noticeGuideButton"));
    auto *layout = new QHBoxLayout(this);
    layout->setContentsMargins(14, 10, 10, 10);
    layout->setSpacing(10);
    layout->addWidget(mark);
    layout->addWidget(m_text, 1);
    layout->addWidget(m_guide);
    layout->addWidget(dismiss);
    hide();
    frame->installEventFilter(this);
    connect(m_guide, &QPushButton::clicked, this, [this] { UserGuide::open(m_notices.head().guidePage); });
    connect(dismiss, &QPushButton::clicked, this, [this] {
        m_notices.dequeue();
        showFirst();
    });
}

void NoticeCard::add(const QString &text, const QString &guidePage) {
    m_notices.enqueue({text, guidePage});
    if (m_notices.size() == 1)
        showFirst();
}

void NoticeCard::showFirst() {
    setVisible(!m_notices.isEmpty());
    if (m_notices.isEmpty())
        return;
    m_text->setText(m_notices.head().text);
    m_guide->setVisible(!m_notices.head().guidePage.isEmpty());
    place();
    QAccessibleEvent alert(m_text, QAccessible::Alert);
    QAccessible::updateAccessibility(&alert);
}

void NoticeCard::place() {
    const QSize frame = parentWidget()->size();
    const int width = std::min(maxWidth, frame.width() - 2 * sideDistance);
    layout()->activate();
    const int height =
        layout()->hasHeightForWidth() ? layout()->totalHeightForWidth(width) : sizeHint().height();
    setGeometry((frame.width() - width) / 2, frame.height() - bottomDistance - height, width, height);
    raise();
}

bool NoticeCard::eventFilter(QObject *watched, QEvent *event) {
    if (event->type() == QEvent::Resize && isVisible())
        place();
    return QFrame::eventFilter(watched, event);
}
