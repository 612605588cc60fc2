#include "devices/operations/captioned.h"

#include <QLabel>
#include <QVBoxLayout>

QWidget *captioned(const QString &caption, QWidget *field, QWidget *parent) {
    auto *part = new QWidget(parent);
    auto *label = new QLabel(caption, part);
    label->setTextFormat(Qt::PlainText);
    label->setProperty("role", "caption");
    label->setBuddy(field);
    field->setAccessibleName(caption);
    auto *layout = new QVBoxLayout(part);
    layout->setContentsMargins(0, 0, 0, 0);
    layout->setSpacing(4);
    layout->addWidget(label);
    layout->addWidget(field);
    return part;
}
