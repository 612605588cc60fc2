#include "widgets/controls/statepage.h"

#include "widgets/style/icons.h"

#include <QLabel>
#include <QVBoxLayout>

namespace StatePage {

QLabel *text(const QString &text, const char *role) {
    auto *label = new QLabel(text);
    label->setTextFormat(Qt::PlainText);
    label->setAlignment(Qt::AlignCenter);
    label->setProperty("role", QLatin1String(role));
    return label;
}

QLabel *picture(const QString &resource) {
    auto *label = new QLabel;
    label->setAlignment(Qt::AlignCenter);
    label->setPixmap(Icons::pixmap(resource, {160, 120}, 2.0));
    return label;
}

QWidget *make(const char *name, std::initializer_list<QWidget *> parts) {
    auto *page = new QWidget;
    page->setObjectName(QLatin1String(name));
    auto *layout = new QVBoxLayout(page);
    layout->setSpacing(12);
    layout->addStretch();
    for (QWidget *part : parts)
        layout->addWidget(part, 0, Qt::AlignHCenter);
    layout->addStretch();
    return page;
}

} // namespace StatePage
