#include "pages/log/logpager.h"

#include "widgets/style/icons.h"

#include <QComboBox>
#include <QHBoxLayout>
#include <QLabel>
#include <QToolButton>

#include <algorithm>

namespace {
constexpr QSize iconSize{16, 16};
constexpr QSize buttonSize{32, 32};
const QStringList limits = {QStringLiteral("25"), QStringLiteral("50"), QStringLiteral("100")};
} // namespace

LogPager::LogPager(QWidget *parent)
    : QWidget(parent), m_limit(new QComboBox(this)), m_label(new QLabel(this)) {
    setObjectName(QStringLiteral("limitContainer"));
    auto *caption = new QLabel(tr("Results per page"), this);
    caption->setProperty("role", QStringLiteral("caption"));
    caption->setBuddy(m_limit);
    m_limit->setObjectName(QStringLiteral("limitDropdown"));
    m_limit->setAccessibleName(caption->text());
    m_limit->addItems(limits);
    m_pageSize = limits.constFirst().toInt();
    m_label->setObjectName(QStringLiteral("pageLabel"));
    m_label->setAlignment(Qt::AlignCenter);
    auto *layout = new QHBoxLayout(this);
    layout->setContentsMargins(0, 6, 0, 8);
    layout->setSpacing(6);
    layout->addWidget(caption);
    layout->addWidget(m_limit);
    layout->addStretch();
    m_first = addButton("firstPageButton", QStringLiteral("icon_general_first_solid"), tr("First page"),
                        &LogPager::goFirst);
    m_previous = addButton("previousPageButton", QStringLiteral("icon_general_arrow_left_solid"),
                           tr("Previous page"), &LogPager::goPrevious);
    layout->addWidget(m_label);
    m_next = addButton("nextPageButton", QStringLiteral("icon_general_arrow_right_solid"), tr("Next page"),
                       &LogPager::goNext);
    m_last = addButton("lastPageButton", QStringLiteral("icon_general_last_solid"), tr("Last page"),
                       &LogPager::goLast);
    connect(m_limit, &QComboBox::currentTextChanged, this, &LogPager::limitChosen);
    showPage();
}

QToolButton *LogPager::addButton(const char *name, const QString &icon, const QString &text,
                                 void (LogPager::*slot)()) {
    auto *button = new QToolButton(this);
    button->setObjectName(QLatin1String(name));
    button->setProperty("role", QStringLiteral("flat"));
    button->setIcon(Icons::icon(QStringLiteral(":/images/%1.svg").arg(icon), iconSize));
    button->setIconSize(iconSize);
    button->setFixedSize(buttonSize);
    button->setAccessibleName(text);
    button->setToolTip(text);
    button->setFocusPolicy(Qt::StrongFocus);
    connect(button, &QToolButton::clicked, this, slot);
    layout()->addWidget(button);
    return button;
}

void LogPager::setRowCount(int rows) {
    m_rows = rows;
    m_page = 0;
    showPage();
}

void LogPager::showRow(int row) {
    m_page = row / m_pageSize;
    showPage();
}

void LogPager::updateLimit(const QString &limit, int row) {
    m_limit->setCurrentText(limit);
    m_pageSize = std::max(limit.toInt(), 1);
    showRow(row);
    emit pageChanged();
}

int LogPager::pageCount() const {
    return (m_rows + m_pageSize - 1) / m_pageSize;
}

void LogPager::goTo(int page) {
    m_page = std::clamp(page, 0, std::max(pageCount() - 1, 0));
    showPage();
    emit pageChanged();
}

void LogPager::showPage() {
    const int pages = pageCount();
    m_label->setText(pages == 0 ? tr("0 of 0") : tr("%1 from %2").arg(m_page + 1).arg(pages));
    const bool onForward = m_next->hasFocus() || m_last->hasFocus();
    const bool onBackward = m_first->hasFocus() || m_previous->hasFocus();
    for (QToolButton *button : {m_first, m_previous})
        button->setEnabled(m_page > 0);
    for (QToolButton *button : {m_next, m_last})
        button->setEnabled(m_page + 1 < pages);
    // The focus of a button that has come to its end goes to the one that leads back.
    if (onForward && !m_next->isEnabled())
        m_previous->setFocus();
    else if (onBackward && !m_previous->isEnabled())
        m_next->setFocus();
}
