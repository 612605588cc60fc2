#pragma once

#include <QString>

class QLabel;

/// The line of a dialog that tells what is wrong: an icon ("msgWarningIcon") and a text, both of the form.
/// Their place stays reserved while there is nothing to tell, so that the dialog does not jump.
class WarningLine {
public:
    WarningLine(QLabel *icon, QLabel *text);

    /// Shows the text; an empty one clears the line.
    void setText(const QString &text);

private:
    QLabel *m_icon;
    QLabel *m_text;
};
