#include "devices/inventory/passwordpolicy.h"
#include "devices/operations/credentialrules.h"
#include "support/testmain.h"

#include <QSet>
#include <QTest>

#include <algorithm>

class TestPasswordPolicy : public QObject {
    Q_OBJECT

private slots:
    void credentialsAreJudged_data() {
        QTest::addColumn<QString>("text");
        QTest::addColumn<QString>("nameProblem");
        QTest::addColumn<QString>("passwordProblem");
        const QString empty = QStringLiteral("The field can't be empty.");
        const QString name = QStringLiteral("Only alphanumeric characters are allowed.");
        const QString password = QStringLiteral(
            "Only alphanumeric characters and the following special characters !%-.@^_~ are allowed.");
        QTest::newRow("empty") << QString() << empty << empty;
        QTest::newRow("letters and digits") << "Root7" << QString() << QString();
        QTest::newRow("every symbol") << "!%-.@^_~" << name << QString();
        QTest::newRow("space") << "a b" << name << password;
        QTest::newRow("number sign") << "a#b" << name << password;
        QTest::newRow("dollar") << "a$b" << name << password;
        QTest::newRow("line break at the end") << "root\n" << name << password;
        QTest::newRow("letter of another script") << QStringLiteral("r\u00f6\u00f6t") << name << password;
    }
    void credentialsAreJudged() {
        QFETCH(QString, text);
        QTEST(CredentialRules::nameProblem(text), "nameProblem");
        QTEST(CredentialRules::passwordProblem(text), "passwordProblem");
    }

    void rulesAreKeptOrNot_data() {
        QTest::addColumn<int>("rules");
        QTest::addColumn<QString>("password");
        QTest::addColumn<bool>("met");
        QTest::newRow("length") << 0 << "1234567" << false;
        QTest::newRow("long enough") << 0 << "12345678" << true;
        QTest::newRow("no letter") << 1 << "12345678!" << false;
        QTest::newRow("no symbol") << 2 << "abcdEFG1" << false;
        QTest::newRow("no digit") << 4 << "abcdEFG!" << false;
        QTest::newRow("no lower case") << 8 << "ABCDEFG1" << false;
        QTest::newRow("no upper case") << 16 << "abcdefg1" << false;
        QTest::newRow("the user's name") << 32 << "OPERATOR" << false;
        QTest::newRow("all kept") << 63 << "abcdEF1!" << true;
    }
    void rulesAreKeptOrNot() {
        QFETCH(int, rules);
        QFETCH(QString, password);
        const PasswordPolicy policy{8, rules};
        QTEST(policy.isMetBy(password, QStringLiteral("operator")), "met");
        const auto lines = policy.check(password, QStringLiteral("operator"));
        const bool all = std::all_of(lines.begin(), lines.end(), [](const auto &line) { return line.met; });
        QTEST(all, "met");
    }

    void generatedOnesMeetThePolicy() {
        QSet<QString> all;
        for (int i = 0; i < 200; ++i) {
            const PasswordPolicy policy{i % 65, i % 64};
            const QString password = Passwords::generate(policy, QStringLiteral("root"));
            QVERIFY2(policy.isMetBy(password, QStringLiteral("root")), qPrintable(password));
            QCOMPARE(CredentialRules::passwordProblem(password), QString());
            QCOMPARE(Passwords::strengthOf(password), Passwords::Strength::Strong);
            all.insert(password);
        }
        QCOMPARE(all.size(), 200);
    }

    void strengthIsTold() {
        using enum Passwords::Strength;
        QCOMPARE(Passwords::strengthOf({}), None);
        for (const char *weak : {"12345678", "aaaaaaaaaaaaaaaa", "abcdefghijkl", "Passw0rd"})
            QVERIFY2(Passwords::strengthOf(QLatin1String(weak)) == Weak, weak);
        QCOMPARE(Passwords::strengthOf(QStringLiteral("kT7!pQ2~xw")), Fair);
        QCOMPARE(Passwords::strengthOf(QStringLiteral("kT7!pQ2~xw9^Lz4m")), Strong);
    }
};

NVLDM_TEST(TestPasswordPolicy)
#include "tst_passwordpolicy.moc"
