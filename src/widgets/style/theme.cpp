#include "widgets/style/theme.h"

#include <QFile>
#include <QFontDatabase>
#include <QGuiApplication>
#include <QResource>

#include <utility>

namespace Theme {

namespace {

QString cssColour(const QColor &colour) {
    return QStringLiteral("rgba(%1, %2, %3, %4)")
        .arg(colour.red())
        .arg(colour.green())
        .arg(colour.blue())
        .arg(colour.alphaF(), 0, 'f', 3);
}

QString readSheet(const char *name) {
    QFile file(QStringLiteral(":/styles/%1.qss").arg(QLatin1String(name)));
    return file.open(QIODevice::ReadOnly) ? QString::fromUtf8(file.readAll()) : QString();
}

QString withColours(QString sheet) {
    const std::pair<const char *, QColor> colours[] = {{"background", background},
                                                       {"raised", raised},
                                                       {"hover", hover},
                                                       {"line", line},
                                                       {"text", text},
                                                       {"textDim", textDim},
                                                       {"textQuiet", textQuiet},
                                                       {"textOff", textOff},
                                                       {"accent", accent},
                                                       {"accentHover", accent.lighter(115)},
                                                       {"accentPressed", accent.darker(120)},
                                                       {"warning", warning},
                                                       {"error", error}};
    for (const auto &[name, colour] : colours)
        sheet.replace(QLatin1Char('@') + QLatin1String(name) + QLatin1Char('@'), cssColour(colour));
    return sheet;
}

} // namespace

QString fontFamily() {
    return QStringLiteral("Segoe UI Variable Static Small");
}

void installFonts() {
    for (const char *name :
         {"Segoe-UI-Variable-Static-Small", "Segoe-UI-Variable-Static-Small-Semibold", "Segoe-UI-Symbol"}) {
        // Given by its file name, a font would be copied; its bytes stand in the program, uncompressed.
        const QResource font(QStringLiteral(":/fonts/%1.ttf").arg(QLatin1String(name)));
        if (font.isValid())
            QFontDatabase::addApplicationFontFromData(font.uncompressedData());
    }
    QFont::insertSubstitutions(fontFamily(), {QStringLiteral("Inter"), QStringLiteral("Segoe UI")});
    // Letters come from the text family; the symbol family only fills in what that has not.
    QFont::insertSubstitutions(QStringLiteral("Segoe UI Symbol"),
                               {QStringLiteral("Inter"), QStringLiteral("Symbola")});
    QFont font(fontFamily());
    font.setPixelSize(13);
    QGuiApplication::setFont(font);
}

QPalette palette() {
    QPalette palette(raised, background);
    palette.setColor(QPalette::Base, background);
    palette.setColor(QPalette::AlternateBase, raised);
    palette.setColor(QPalette::Highlight, accent);
    palette.setColor(QPalette::Link, accent);
    palette.setColor(QPalette::LinkVisited, accent);
    for (const auto role : {QPalette::WindowText, QPalette::Text, QPalette::ButtonText,
                            QPalette::HighlightedText, QPalette::ToolTipText})
        palette.setColor(role, text);
    for (const auto role : {QPalette::WindowText, QPalette::Text, QPalette::ButtonText})
        palette.setColor(QPalette::Disabled, role, textOff);
    palette.setColor(QPalette::Link, accent);
    palette.setColor(QPalette::LinkVisited, accent);
    palette.setColor(QPalette::PlaceholderText, textQuiet);
    palette.setColor(QPalette::ToolTipBase, raised);
    return palette;
}

QString styleSheet() {
    QString sheet;
    // Of rules that weigh the same the later one holds, and what all widgets share weighs as much as a class.
    for (const char *name : {"base", "combobox", "checkbox", "spinbox", "radiobutton"})
        sheet += readSheet(name);
    return withColours(sheet);
}

} // namespace Theme
