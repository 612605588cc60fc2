#include "app/login/passwordrule.h"
#include "support/testmain.h"

#include <QTest>

class TestPasswordRule : public QObject {
    Q_OBJECT

private slots:
    void accepts() {
        const QString tail(60, u'a');
        for (const QString &password : {QStringLiteral("Passw0r!"), tail + "A1!a"})
            QVERIFY2(PasswordRule::accepts(password), qPrintable(password));
        for (const QChar symbol : QStringLiteral("!%-.@^_~"))
            QVERIFY2(PasswordRule::accepts(QStringLiteral("Passw0rd") + symbol), qPrintable(QString(symbol)));
    }

    void refuses() {
        const QString tail(60, u'a');
        for (const QString &password :
             {QString(), QStringLiteral("Passw0!"), tail + "A1!aa", QStringLiteral("Passw0rd"),
              QStringLiteral("Password!"), QStringLiteral("passw0rd!"), QStringLiteral("PASSW0RD!"),
              QStringLiteral("Passw0rd!\n"), QStringLiteral("Passw0rd!\nx"),
              QString::fromUtf8("P\u00e4ssw0rd!"), QString::fromUtf8("Password!\u0663")})
            QVERIFY2(!PasswordRule::accepts(password), qPrintable(password));
        for (const QChar symbol : QStringLiteral("#$&*()+,/:;<=>?[]{}|\\\"' "))
            QVERIFY2(!PasswordRule::accepts(QStringLiteral("Passw0rd!") + symbol),
                     qPrintable(QString(symbol)));
    }
};

NVLDM_APPLESS_TEST(TestPasswordRule)
#include "tst_passwordrule.moc"
