#pragma once

#include "widgets/style/pluraltranslator.h"

#include <QStringList>
#include <QTranslator>

/// The language that windows speak: English, German or Japanese. Lives as long as the application object.
class InterfaceLanguage {
public:
    /// The language for a wish as the settings have it and for what the system prefers, best first: the wish
    /// where there is such a translation, else the first of the system's that there is, else English.
    static QString choose(const QString &wish, const QStringList &ofSystem);

    InterfaceLanguage();
    /// Makes the windows that are made from now on speak the language that fits the wish.
    void use(const QString &wish);

private:
    PluralTranslator m_plurals;
    QTranslator m_toolkit;
    QTranslator m_texts;
};
