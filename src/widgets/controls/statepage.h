#pragma once

#include <QString>

#include <initializer_list>

class QLabel;
class QWidget;

/// Pages that stand in the place of a list, and say why there is none.
namespace StatePage {

/// A centred text. role: as the style sheet knows it for labels.
QLabel *text(const QString &text, const char *role);
QLabel *picture(const QString &resource);
/// A page with its parts one below the other, in the middle.
QWidget *make(const char *name, std::initializer_list<QWidget *> parts);

} // namespace StatePage
