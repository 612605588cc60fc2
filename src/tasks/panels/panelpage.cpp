#include "tasks/panels/panelpage.h"

#include <QLabel>

PanelPage::PanelPage(QWidget *parent) : QStackedWidget(parent), m_text(new QLabel(this)) {
    m_text->setObjectName(QStringLiteral("panelEmptyLabel"));
    m_text->setAlignment(Qt::AlignCenter);
    m_text->setTextFormat(Qt::PlainText);
    m_text->setWordWrap(true);
    m_text->setContentsMargins(24, 24, 24, 24);
    m_text->setProperty("role", QStringLiteral("quiet"));
    addWidget(m_text);
}

void PanelPage::setView(QWidget *view) {
    addWidget(view);
}

void PanelPage::showText(const QString &text) {
    m_text->setText(text);
    setCurrentIndex(0);
}
