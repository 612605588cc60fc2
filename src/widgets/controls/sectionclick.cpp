#include "widgets/controls/sectionclick.h"

#include <QDateTimeEdit>
#include <QEvent>
#include <QLineEdit>

namespace SectionClick {

namespace {

class ClickFilter : public QObject {
public:
    ClickFilter(QDateTimeEdit *field, QLineEdit *text) : QObject(field), m_field(field), m_text(text) {
        text->installEventFilter(this);
    }

    bool eventFilter(QObject *watched, QEvent *event) override {
        // A part that was marked by dragging stays as it is.
        if (event->type() == QEvent::MouseButtonRelease && !m_text->hasSelectedText())
            m_field->setSelectedSection(m_field->currentSection());
        return QObject::eventFilter(watched, event);
    }

private:
    QDateTimeEdit *m_field;
    QLineEdit *m_text;
};

} // namespace

void install(QDateTimeEdit *field) {
    if (auto *text = field->findChild<QLineEdit *>())
        new ClickFilter(field, text);
}

} // namespace SectionClick
