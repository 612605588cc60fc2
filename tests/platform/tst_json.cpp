#include "platform/elementtexts.h"
#include "platform/json.h"
#include "support/testmain.h"

#include <QElapsedTimer>
#include <QTest>

#include <nlohmann/json.hpp>

class TestJson : public QObject {
    Q_OBJECT

private slots:
    void nesting_data();
    void nesting();
    void refusesWhatIsNoJson_data();
    void refusesWhatIsNoJson();
    void takesAsLongAsTheTextIs();
    void dumpReplacesWhatIsNoUtf8();
    void elementsOfAnArray_data();
    void elementsOfAnArray();
};

void TestJson::nesting_data() {
    QTest::addColumn<std::string>("text");
    QTest::addColumn<bool>("taken");
    const auto nested = [](std::size_t levels, const std::string &open, const std::string &close) {
        std::string text;
        for (std::size_t i = 0; i < levels; ++i)
            text += open;
        text += "1";
        for (std::size_t i = 0; i < levels; ++i)
            text += close;
        return text;
    };
    QTest::newRow("64 arrays") << nested(64, "[", "]") << true;
    QTest::newRow("65 arrays") << nested(65, "[", "]") << false;
    QTest::newRow("64 objects") << nested(64, R"({"a":)", "}") << true;
    QTest::newRow("65 objects") << nested(65, R"({"a":)", "}") << false;
    QTest::newRow("a million arrays, never closed") << std::string(1000000, '[') << false;
    QTest::newRow("many values side by side") << "[" + nested(1000, "[],", "") + "]" << true;
    QTest::newRow("brackets in strings")
        << R"(["\"\\)" + std::string(100, '[') + R"(","\\",{"{[":1}])" << true;
}

void TestJson::nesting() {
    QFETCH(std::string, text);
    QFETCH(bool, taken);
    if (taken)
        QCOMPARE(dumpJson(parseJson(text)), text);
    else
        QVERIFY_THROWS_EXCEPTION(std::exception, parseJson(text));
}

void TestJson::refusesWhatIsNoJson_data() {
    QTest::addColumn<std::string>("text");
    QTest::newRow("nothing") << std::string();
    QTest::newRow("page") << std::string("<html></html>");
    QTest::newRow("cut off") << std::string(R"({"a":)");
    QTest::newRow("two values") << std::string("{}{}");
    QTest::newRow("no UTF-8") << std::string("\"\xff\xfe\"");
}

void TestJson::refusesWhatIsNoJson() {
    QFETCH(std::string, text);
    QVERIFY_THROWS_EXCEPTION(JSON::parse_error, parseJson(text));
}

/// Siblings by the hundred thousand took minutes each when every end of an object walked all of them.
void TestJson::takesAsLongAsTheTextIs() {
    std::string text = "[";
    while (text.size() < 4u << 20)
        text += "{},";
    QElapsedTimer timer;
    timer.start();
    QCOMPARE(parseJson(text + "{}]").size(), text.size() / 3 + 1);
    QVERIFY2(timer.elapsed() < 5000, qPrintable(QString::number(timer.elapsed())));
    while (text.size() < 16u << 20)
        text += "0,";
    QVERIFY_THROWS_EXCEPTION(std::length_error, parseJson(text + "0]"));
}

void TestJson::dumpReplacesWhatIsNoUtf8() {
    const JSON value = {{"name", "a\xff z\xc3\xa4"}};
    QCOMPARE(dumpJson(value), std::string("{\"name\":\"a\xef\xbf\xbd z\xc3\xa4\"}"));
}

void TestJson::elementsOfAnArray_data() {
    QTest::addColumn<std::string>("text");
    QTest::addColumn<QByteArrayList>("elements");
    const QByteArrayList refused = {"refused"};
    QTest::newRow("none") << std::string(" [ ] ") << QByteArrayList();
    QTest::newRow("values") << std::string("[1 ,\n\"a\", null]") << QByteArrayList{"1", "\"a\"", "null"};
    QTest::newRow("nested") << std::string(R"([{"a":[1,{"b":2}]},[3,4]])")
                            << QByteArrayList{R"({"a":[1,{"b":2}]})", "[3,4]"};
    QTest::newRow("brackets in texts")
        << std::string(R"(["]\",[", {"}":"\\"}])") << QByteArrayList{R"("]\",[")", R"({"}":"\\"})"};
    QTest::newRow("what is missing is for the parser") << std::string("[1,]") << QByteArrayList{"1", ""};
    for (const char *text : {"", "[", "{}", "1", "[1", "[{]", "[1]]", "[]]", "[1]}{[2]"})
        QTest::newRow(text) << std::string(text) << refused;
}

void TestJson::elementsOfAnArray() {
    QFETCH(std::string, text);
    QFETCH(QByteArrayList, elements);
    QByteArrayList found;
    try {
        for (const std::string_view element : elementTexts(text))
            found.append(QByteArray(element.data(), static_cast<qsizetype>(element.size())));
    } catch (const std::exception &) {
        found = {"refused"};
    }
    QCOMPARE(found, elements);
}

NVLDM_APPLESS_TEST(TestJson)
#include "tst_json.moc"
