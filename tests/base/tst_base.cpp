#include "base/ipv4.h"
#include "base/macaddress.h"
#include "base/spreadsheetcell.h"
#include "support/testmain.h"

#include <QTest>

/// The forms of addresses and cells that client and service share.
class TestBase : public QObject {
    Q_OBJECT

private slots:
    void ipv4() {
        const std::pair<const char *, std::uint32_t> good[] = {{"0.0.0.0", 0},
                                                               {"255.255.255.255", 0xFFFFFFFF},
                                                               {"1.2.3.4", 0x01020304},
                                                               {"010.000.0.09", 0x0A000009}};
        for (const auto &[text, number] : good) {
            QVERIFY2(Ipv4::parse(text) == number, text);
            QVERIFY(Ipv4::parse(Ipv4::toText(number)) == number);
        }
        QCOMPARE(Ipv4::toText(0x0A000009).c_str(), "10.0.0.9");
        for (const char *text : {"", ".", "1.2.3", "1.2.3.", ".1.2.3.4", "1..3.4", "1.2.3.4.5", "256.0.0.1",
                                 "1.2.3.4 ", " 1.2.3.4", "1.2.3.-4", "+1.2.3.4", "1.2.3.0x4", "0001.2.3.4",
                                 "99999999999999999999.1.1.1", "a.b.c.d", "::1", "--", "\xef\xbc\x91.2.3.4"})
            QVERIFY2(!Ipv4::parse(text), text);
        for (const char *mask : {"255.255.255.0", "255.255.254.0", "128.0.0.0", "255.255.255.254"})
            QVERIFY2(Ipv4::isMask(*Ipv4::parse(mask)), mask);
        for (const char *other : {"255.0.255.0", "0.0.0.0", "255.255.255.255", "255.255.255.1"})
            QVERIFY2(!Ipv4::isMask(*Ipv4::parse(other)), other);
    }

    void macAddress() {
        for (const char *text : {"00:1a:07:00:0B:01", "00-1A-07-00-0b-01", "001a.0700.0b01", "001A07000B01",
                                 "00 1a 07 00 0b 01", " 001a:07-00.0B 01 "}) {
            QCOMPARE(MacAddress::plain(text).c_str(), "001A07000B01");
            QVERIFY(MacAddress::parse(text) == std::uint64_t{0x001A07000B01});
        }
        for (const char *text : {"", "--", "00:1a:07:00:0b", "00:1a:07:00:0b:01:02", "00:1a:07:00:0b:0g",
                                 "0x1a07000b01", "+01a07000b01", "00_1a_07_00_0b_01"}) {
            QVERIFY2(MacAddress::plain(text).empty(), text);
            QVERIFY2(!MacAddress::parse(text), text);
        }
        QCOMPARE(MacAddress::digits("1a:0").c_str(), "1A0");
    }

    void spreadsheetCells() {
        for (const char *formula : {"=1+1", "+49", "-x", "@SUM(A1)", "\t=1", "\r=1"}) {
            const std::string cell = SpreadsheetCell::harmless(formula);
            QCOMPARE(cell, '\'' + std::string(formula));
            QVERIFY(SpreadsheetCell::original(cell) == formula);
        }
        for (const char *text : {"", "gate=1", "10.0.0.1", "'quoted'", "'"}) {
            QCOMPARE(SpreadsheetCell::harmless(text).c_str(), text);
            QVERIFY(SpreadsheetCell::original(text) == text);
        }
    }
};

NVLDM_APPLESS_TEST(TestBase)
#include "tst_base.moc"
