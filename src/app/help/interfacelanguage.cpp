#include "app/help/interfacelanguage.h"

#include <QCoreApplication>
#include <QDebug>
#include <QLibraryInfo>
#include <QLocale>

namespace {

const QStringList offered{QStringLiteral("en"), QStringLiteral("de"), QStringLiteral("ja")};

/// "de" of "de-AT" and of "de_AT".
QString languageOf(const QString &code) {
    return code.section(QLatin1Char('-'), 0, 0).section(QLatin1Char('_'), 0, 0).toLower();
}

/// The system's own ways of writing numbers, unless they belong to another language.
QLocale localeOf(const QString &language) {
    const QLocale system = QLocale::system();
    const QLocale plain(language);
    const bool fits = system.language() == QLocale::C ? plain.language() == QLocale::English
                                                      : system.language() == plain.language();
    return fits ? system : plain;
}

} // namespace

QString InterfaceLanguage::choose(const QString &wish, const QStringList &ofSystem) {
    for (const QString &code : QStringList(wish) + ofSystem) {
        if (const QString language = languageOf(code); offered.contains(language))
            return language;
    }
    return offered.front();
}

InterfaceLanguage::InterfaceLanguage() {
    // The translator that was installed last is asked first.
    for (QTranslator *translator : {static_cast<QTranslator *>(&m_plurals), &m_toolkit, &m_texts})
        QCoreApplication::installTranslator(translator);
}

void InterfaceLanguage::use(const QString &wish) {
    const QString language = choose(wish, QLocale::system().uiLanguages());
    QLocale::setDefault(localeOf(language));
    if (language == offered.front()) {
        // The texts in the code are English.
        static_cast<void>(m_toolkit.load(QString()));
        static_cast<void>(m_texts.load(QString()));
        return;
    }
    if (!m_texts.load(QStringLiteral(":/translations/norvell_%1.qm").arg(language)))
        qWarning("There are no texts for the language \"%s\"", qUtf8Printable(language));
    // A machine may have Qt without its translations.
    static_cast<void>(m_toolkit.load(QStringLiteral("qtbase_%1").arg(language),
                                     QLibraryInfo::path(QLibraryInfo::TranslationsPath)));
}
