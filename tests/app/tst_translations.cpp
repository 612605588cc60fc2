#include "app/help/interfacelanguage.h"

#include <QFile>
#include <QLocale>
#include <QProcess>
#include <QRegularExpression>
#include <QSet>
#include <QTemporaryDir>
#include <QTest>
#include <QXmlStreamReader>

namespace {

struct Message {
    QString context;
    QString source;
    QString comment;
    bool finished = true;
    bool counted = false;
    QStringList translations;

    QString key() const { return QStringList{context, source, comment}.join(QLatin1Char('\x1f')); }
};

/// The files as they are kept, one for each language.
QString kept(const QString &language) {
    return QStringLiteral(NVLDM_SOURCES "/resources/translations/norvell_%1.ts").arg(language);
}

void readTranslation(QXmlStreamReader &xml, Message &message) {
    message.finished = !xml.attributes().hasAttribute(QLatin1String("type"));
    if (!message.counted) {
        message.translations += xml.readElementText();
        return;
    }
    while (xml.readNextStartElement())
        message.translations += xml.readElementText();
}

QList<Message> read(const QString &path) {
    QList<Message> messages;
    QString context;
    QFile file(path);
    if (!file.open(QIODevice::ReadOnly))
        return messages;
    QXmlStreamReader xml(&file);
    while (!xml.atEnd()) {
        if (xml.readNext() != QXmlStreamReader::StartElement)
            continue;
        if (xml.name() == QLatin1String("name")) {
            context = xml.readElementText();
        } else if (xml.name() == QLatin1String("message")) {
            messages.append(Message());
            messages.last().context = context;
            messages.last().counted = xml.attributes().hasAttribute(QLatin1String("numerus"));
        } else if (xml.name() == QLatin1String("source")) {
            messages.last().source = xml.readElementText();
        } else if (xml.name() == QLatin1String("comment")) {
            messages.last().comment = xml.readElementText();
        } else if (xml.name() == QLatin1String("translation")) {
            readTranslation(xml, messages.last());
        }
    }
    return xml.hasError() ? QList<Message>() : messages;
}

/// What a translation has to keep: placeholders, line ends, the blanks around it, and the dots of an
/// ellipsis.
QStringList marksOf(const QString &text) {
    static const QRegularExpression mark(
        QStringLiteral("%L?(?:n|[1-9])|\\n|^\\s+|\\s+$|\\.\\.\\.$|:$|&|</?a"));
    QStringList marks;
    for (auto match = mark.globalMatch(text); match.hasNext();)
        marks += match.next().captured();
    marks.sort();
    return marks;
}

} // namespace

class TestTranslations : public QObject {
    Q_OBJECT

private slots:
    void init() { QVERIFY(m_folder.isValid()); }

    void everyTextOfTheSourcesIsTranslated_data() { addLanguages(); }
    void everyTextOfTheSourcesIsTranslated() {
        QFETCH(QString, language);
        const QString fresh = m_folder.filePath(language + QStringLiteral(".ts"));
        QVERIFY(QFile::copy(kept(language), fresh));
        QProcess lupdate;
        lupdate.start(QStringLiteral(NVLDM_LUPDATE),
                      {QStringLiteral("-no-obsolete"), QStringLiteral("-locations"), QStringLiteral("none"),
                       QStringLiteral("-I"), QStringLiteral(NVLDM_SOURCES "/src"),
                       QStringLiteral(NVLDM_SOURCES "/src"), QStringLiteral("-ts"), fresh});
        QVERIFY(lupdate.waitForFinished());
        QCOMPARE(lupdate.exitCode(), 0);
        // It warns of texts whose context it cannot know.
        QCOMPARE(QString::fromUtf8(lupdate.readAllStandardError()), QString());

        QSet<QString> known;
        for (const Message &message : read(kept(language)))
            known += message.key();
        const QList<Message> messages = read(fresh);
        QVERIFY(messages.size() > 500);
        for (const Message &message : messages) {
            QVERIFY2(known.remove(message.key()) && message.finished,
                     qPrintable(message.context + QStringLiteral(": ") + message.source));
        }
        QCOMPARE(known, QSet<QString>());
    }

    void translationsKeepWhatProgramsFillIn_data() { addLanguages(); }
    void translationsKeepWhatProgramsFillIn() {
        QFETCH(QString, language);
        QFETCH(int, plurals);
        const QList<Message> messages = read(kept(language));
        QVERIFY(messages.size() > 500);
        for (const Message &message : messages) {
            QCOMPARE(message.translations.size(), message.counted ? plurals : 1);
            for (const QString &text : message.translations) {
                QVERIFY2(!text.isEmpty(), qPrintable(message.source));
                QVERIFY2(marksOf(text) == marksOf(message.source),
                         qPrintable(message.source + QStringLiteral(" -> ") + text));
            }
        }
    }

    void speaksTheChosenLanguage_data() {
        QTest::addColumn<QString>("wish");
        QTest::addColumn<QString>("button");
        QTest::addColumn<QStringList>("counted");
        QTest::addColumn<QString>("number");
        QTest::newRow("German") << "de"
                                << "Abbrechen" << QStringList{"1 Gerät gelöscht.", "2 Geräte gelöscht."}
                                << "50.000";
        QTest::newRow("Japanese") << "ja" << QString::fromUtf8("キャンセル")
                                  << QStringList{QString::fromUtf8("1 台のデバイスを削除しました。"),
                                                 QString::fromUtf8("2 台のデバイスを削除しました。")}
                                  << "50,000";
        QTest::newRow("English") << "en"
                                 << "Cancel" << QStringList{"1 device deleted.", "2 devices deleted."}
                                 << QLocale::system().toString(50000);
    }
    void speaksTheChosenLanguage() {
        QFETCH(QString, wish);
        QFETCH(QStringList, counted);
        InterfaceLanguage language;
        // From one language to the next, as when the settings change.
        language.use(QStringLiteral("ja"));
        language.use(wish);
        QTEST(QCoreApplication::translate("SettingWindow", "Cancel"), "button");
        for (int n = 1; n <= 2; ++n)
            QCOMPARE(QCoreApplication::translate("DeviceActions", "%n device(s) deleted.", nullptr, n),
                     counted[n - 1]);
        QTEST(QLocale().toString(50000), "number");
    }

    void choosesAmongWhatThereIs_data() {
        QTest::addColumn<QString>("wish");
        QTest::addColumn<QStringList>("ofSystem");
        QTest::addColumn<QString>("language");
        QTest::newRow("wish before system") << "ja" << QStringList{"de-DE"} << "ja";
        QTest::newRow("of a country") << "de_AT" << QStringList{"en"} << "de";
        QTest::newRow("as the system") << "" << QStringList{"fr-FR", "de-CH", "en"} << "de";
        QTest::newRow("English system") << "" << QStringList{"en-US", "de"} << "en";
        QTest::newRow("unknown wish") << "tlh" << QStringList{"ja-JP"} << "ja";
        QTest::newRow("nothing fits") << "../de" << QStringList{"C"} << "en";
    }
    void choosesAmongWhatThereIs() {
        QFETCH(QString, wish);
        QFETCH(QStringList, ofSystem);
        QTEST(InterfaceLanguage::choose(wish, ofSystem), "language");
    }

private:
    static void addLanguages() {
        QTest::addColumn<QString>("language");
        QTest::addColumn<int>("plurals");
        QTest::newRow("German") << "de" << 2;
        QTest::newRow("Japanese") << "ja" << 1;
    }

    QTemporaryDir m_folder;
};

QTEST_GUILESS_MAIN(TestTranslations)

#include "tst_translations.moc"
