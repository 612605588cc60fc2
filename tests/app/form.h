#pragma once

#include <QApplication>
#include <QLineEdit>
#include <QTest>

/// Works on the parts of a form by their object names, with the keys and the mouse of a user.
namespace Form {

template <typename Part = QWidget>
Part *part(const QWidget *form, const char *name) {
    auto *found = form->findChild<Part *>(QString::fromLatin1(name));
    if (!found)
        qFatal("the form has no part %s", name);
    return found;
}

inline void type(const QWidget *form, const char *name, const QString &text) {
    auto *edit = part<QLineEdit>(form, name);
    QTest::mouseClick(edit, Qt::LeftButton);
    QTest::keyClick(edit, Qt::Key_A, Qt::ControlModifier);
    QTest::keyClick(edit, Qt::Key_Delete);
    QTest::keyClicks(edit, text);
}

inline void click(const QWidget *form, const char *name) {
    auto *target = part(form, name);
    // Radio buttons and check boxes react where their mark and text are, which need not be the middle.
    QTest::mouseClick(target, Qt::LeftButton, {}, QPoint(10, target->height() / 2));
}

inline QString text(const QWidget *form, const char *name) {
    const QWidget *found = part(form, name);
    return found->property("text").toString();
}

/// The visible dialog of a class, or null.
template <typename Dialog>
Dialog *visible() {
    for (QWidget *window : QApplication::topLevelWidgets()) {
        auto *dialog = qobject_cast<Dialog *>(window);
        if (dialog && dialog->isVisible())
            return dialog;
    }
    return nullptr;
}

} // namespace Form
