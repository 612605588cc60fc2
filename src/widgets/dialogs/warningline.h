#pragma once

#include <QString>
#include <Qt>

class QLabel;

/// The line of a dialog that tells what is wrong: an icon ("msgWarningIcon") and a text, both of the form.
/// Their place stays reserved while there is nothing to tell, so that the dialog does not jump.
class WarningLine {
public:
    inline static const QString defaultIcon = QStringLiteral(":/images/icon_general_warning_solid.svg");

    WarningLine(QLabel *icon, QLabel *text);

    /// Shows the text beside the icon; an empty one clears the line.
    void setText(const QString &text, const QString &icon = defaultIcon);
    /// The same for a text of the program's own with a link in it, which the keyboard reaches too. Where the
    /// link leads is told by the label's linkActivated.
    void setLinkedText(const QString &html);

private:
    void show(const QString &text, Qt::TextFormat format, const QString &icon);

    QLabel *m_icon;
    QLabel *m_text;
};
