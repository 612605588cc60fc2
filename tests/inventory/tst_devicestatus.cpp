#include "devices/inventory/devicestatus.h"
#include "support/testmain.h"

#include <QTest>

class TestDeviceStatus : public QObject {
    Q_OBJECT

private slots:
    void code_data() {
        QTest::addColumn<QStringList>("words"); // connection, authorization, action
        QTest::addColumn<int>("expected");
        const std::pair<QStringList, int> rows[] = {{{"Connected", "Authorized", "Standby"}, 2},
                                                    {{"Connected", "Authorized", "deviceRestart"}, 4},
                                                    {{"Connected", "Authorized", ""}, 4},
                                                    {{"Connected", "Authorized", "standby"}, 4},
                                                    {{"Unreachable", "Authorized", "Standby"}, 3},
                                                    {{"Unreachable", "Access Denied", "Standby"}, 3},
                                                    {{"unreachable", "Access Denied", "Standby"}, 1},
                                                    {{"Connected", "Access Denied", "Standby"}, 1},
                                                    {{"Connected", "Invalid Password", "Standby"}, 6},
                                                    {{"Connected", "Account Blocked", "Standby"}, 7},
                                                    {{"Connected", "Set Password", "Standby"}, 5},
                                                    {{"Connected", "Unauthorized", "Standby"}, 0},
                                                    {{"Connected", "authorized", "Standby"}, 0},
                                                    {{"Connected", "Authorized ", "Standby"}, 0},
                                                    {{"", "", ""}, 0}};
        for (const auto &[words, expected] : rows)
            QTest::newRow(qPrintable(words.join(u'/'))) << words << expected;
    }
    void code() {
        QFETCH(QStringList, words);
        const auto code =
            DeviceStatus::codeOf(words[0].toStdString(), words[1].toStdString(), words[2].toStdString());
        QTEST(static_cast<int>(code), "expected");
    }

    void look_data() {
        QTest::addColumn<int>("code");
        QTest::addColumn<QString>("text");
        QTest::addColumn<QSize>("iconSize"); // empty: no icon
        const char *texts[] = {"Unauthorized",
                               "Access Denied",
                               "Authorized",
                               "Unreachable",
                               "Maintaining...",
                               "Set Password",
                               "Invalid Password",
                               "Account Blocked",
                               "",
                               ""};
        for (int code = 0; code < 10; ++code)
            QTest::addRow("%d", code) << code << QStringLiteral("  ") + QLatin1String(texts[code])
                                      << (code > 7    ? QSize()
                                          : code == 4 ? QSize(12, 12)
                                                      : QSize(9, 9));
    }
    void look() {
        QFETCH(int, code);
        QTEST(DeviceStatus::text(static_cast<DeviceStatusCode>(code)), "text");
        const QIcon &icon = DeviceStatus::icon(static_cast<DeviceStatusCode>(code));
        QTEST(icon.availableSizes().value(0), "iconSize");
        QCOMPARE(icon.isNull(), code > 7);
    }
};

NVLDM_TEST(TestDeviceStatus)
#include "tst_devicestatus.moc"
