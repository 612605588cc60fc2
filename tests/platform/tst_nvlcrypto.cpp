#include "platform/crypto/nvlcrypto.h"
#include "support/isolatedroot.h"
#include "support/testmain.h"

#include <QDateTime>
#include <QDir>
#include <QFile>
#include <QTest>

#include <openssl/hmac.h>

#include <optional>

namespace {

constexpr const char *knownSecret = "P1:AAECAwQFBgcICQoLm/UnjTdjEJIaWPSTfEOWbQuKhXw7Zz/HEg==";
constexpr const char *knownData = "D1:AAECAwQFBgcICQoLOXwj4EEoiSlsKMQiJQWh8xuIQ3caeiY=";
const QByteArray tokenKey =
    QByteArray::fromHex("2ecaeb6cddbae6f619a032e234613385068fec96fd04da6e9b6b7fcb74544326");
constexpr const char *keyFile = "nvlcrypto.key";
constexpr QByteArray::Base64Options tokenForm =
    QByteArray::Base64UrlEncoding | QByteArray::OmitTrailingEquals | QByteArray::AbortOnBase64DecodingErrors;

using Operation = int (*)(const char *, std::size_t, char **);

/// Nothing on failure; a failure that is not 1 with a null pointer comes back as a text of its own.
std::optional<QByteArray> apply(Operation operation, const QByteArray &in) {
    char unset = 0;
    char *out = &unset;
    const int failure = operation(in.constData(), static_cast<std::size_t>(in.size()), &out);
    if (failure != 0)
        return failure == 1 && !out ? std::nullopt : std::optional<QByteArray>("not a proper failure");
    const QByteArray text(out);
    nvlcryptoFree(out);
    return text;
}

std::optional<QByteArray> token() {
    char *out = nullptr;
    if (createGenericToken(&out) != 0)
        return std::nullopt;
    const QByteArray text(out);
    nvlcryptoFree(out);
    return text;
}

QByteArray tokenBytes(const QByteArray &text) {
    return QByteArray::fromBase64(text.mid(3), tokenForm);
}

QByteArray hmac(const QByteArray &key, const QByteArray &bytes) {
    QByteArray mac(32, '\0');
    HMAC(EVP_sha256(), key.constData(), static_cast<int>(key.size()),
         reinterpret_cast<const unsigned char *>(bytes.constData()), static_cast<std::size_t>(bytes.size()),
         reinterpret_cast<unsigned char *>(mac.data()), nullptr);
    return mac;
}

} // namespace

Q_DECLARE_METATYPE(Operation)

class TestNvlcrypto : public QObject {
    Q_OBJECT

private slots:
    void cleanup();

    void opensKnownAnswers();
    void roundTrip_data();
    void roundTrip();
    void sealsAnewEachTime();
    void refusesEmptySecret();
    void refusesTampering_data();
    void refusesTampering();
    void refusesOtherText_data();
    void refusesOtherText();
    void tokenLayout();
    void keyFileReplacesTheKey();
    void malformedKeyFileStopsEverything_data();
    void malformedKeyFileStopsEverything();
    void otherKeyFolder();
    void nullPointers();

private:
    IsolatedRoot m_root;
};

void TestNvlcrypto::cleanup() {
    QFile::remove(m_root.filePath(keyFile));
    QDir(m_root.filePath(keyFile)).removeRecursively();
}

void TestNvlcrypto::opensKnownAnswers() {
    QCOMPARE(apply(cipherToPass, knownSecret), "Passw0rd!");
    QCOMPARE(apply(cypherToData, knownData), R"({"a":1})");
}

void TestNvlcrypto::roundTrip_data() {
    QTest::addColumn<Operation>("seal");
    QTest::addColumn<Operation>("open");
    QTest::addColumn<QByteArray>("plain");
    QTest::addColumn<QByteArray>("prefix");
    const QByteArray large(5 << 20, 'x');
    QTest::newRow("one byte") << Operation(passToCipher) << Operation(cipherToPass) << QByteArray("a")
                              << QByteArray("P1:");
    QTest::newRow("UTF-8") << Operation(passToCipher) << Operation(cipherToPass)
                           << QByteArray("pä\xe2\x82\xac'\"\n") << QByteArray("P1:");
    QTest::newRow("5 MiB of data") << Operation(dataToCypher) << Operation(cypherToData) << large
                                   << QByteArray("D1:");
    QTest::newRow("no data") << Operation(dataToCypher) << Operation(cypherToData) << QByteArray("")
                             << QByteArray("D1:");
}

void TestNvlcrypto::roundTrip() {
    QFETCH(Operation, seal);
    QFETCH(Operation, open);
    QFETCH(QByteArray, plain);
    QFETCH(QByteArray, prefix);
    const auto sealed = apply(seal, plain);
    QVERIFY(sealed && sealed->startsWith(prefix));
    QCOMPARE(QByteArray::fromBase64(sealed->mid(3)).size(), 12 + plain.size() + 16);
    QVERIFY(apply(open, *sealed) == plain);
}

void TestNvlcrypto::sealsAnewEachTime() {
    const auto first = apply(passToCipher, "secret");
    const auto second = apply(passToCipher, "secret");
    QVERIFY(first && second && first->mid(3, 16) != second->mid(3, 16));
}

void TestNvlcrypto::refusesEmptySecret() {
    QVERIFY(!apply(passToCipher, ""));
}

void TestNvlcrypto::refusesTampering_data() {
    QTest::addColumn<Operation>("open");
    QTest::addColumn<QByteArray>("sealed");
    QTest::newRow("secret") << Operation(cipherToPass) << QByteArray(knownSecret);
    QTest::newRow("data") << Operation(cypherToData) << QByteArray(knownData);
}

void TestNvlcrypto::refusesTampering() {
    QFETCH(Operation, open);
    QFETCH(QByteArray, sealed);
    const QByteArray bytes = QByteArray::fromBase64(sealed.mid(3));
    for (qsizetype i = 0; i < bytes.size(); ++i) {
        QByteArray changed = bytes;
        changed[i] = static_cast<char>(changed[i] ^ 1);
        QVERIFY2(!apply(open, sealed.first(3) + changed.toBase64()), qPrintable(QString::number(i)));
        QVERIFY2(!apply(open, sealed.first(3) + bytes.first(i).toBase64()), qPrintable(QString::number(i)));
    }
    QVERIFY(!apply(open, sealed.first(3) + (bytes + '\0').toBase64()));
}

void TestNvlcrypto::refusesOtherText_data() {
    QTest::addColumn<QByteArray>("text");
    const QByteArray base64 = QByteArray(knownSecret).mid(3);
    QTest::newRow("empty") << QByteArray("");
    QTest::newRow("prefix alone") << QByteArray("P1:");
    QTest::newRow("no prefix") << base64;
    QTest::newRow("no colon") << "P1" + base64;
    QTest::newRow("later version") << "P2:" + base64;
    QTest::newRow("lower case") << "p1:" + base64;
    QTest::newRow("data under the label of a secret") << "P1:" + QByteArray(knownData).mid(3);
    QTest::newRow("data") << QByteArray(knownData);
    QTest::newRow("no base64") << "P1:" + QByteArray(base64).replace('m', '!');
    QTest::newRow("blanks in front") << "P1:    " + base64;
    QTest::newRow("line feeds behind") << "P1:" + base64 + "\n\n\n\n";
    QTest::newRow("padding in the middle") << "P1:=" + base64.mid(1);
    QTest::newRow("padding left out") << "P1:" + base64.chopped(2);
    QTest::newRow("url alphabet") << "P1:" + QByteArray(base64).replace('/', '_');
}

void TestNvlcrypto::refusesOtherText() {
    QFETCH(QByteArray, text);
    QVERIFY(!apply(cipherToPass, text));
}

void TestNvlcrypto::tokenLayout() {
    const qint64 before = QDateTime::currentMSecsSinceEpoch();
    const auto text = token();
    const qint64 after = QDateTime::currentMSecsSinceEpoch();
    QVERIFY(text && text->startsWith("G1:"));
    QCOMPARE(text->size(), 3 + 75);
    const QByteArray bytes = tokenBytes(*text);
    QCOMPARE(bytes.size(), 8 + 16 + 32);
    const qint64 time = bytes.first(8).toHex().toLongLong(nullptr, 16);
    QVERIFY(time >= before && time <= after);
    QCOMPARE(bytes.last(32), hmac(tokenKey, bytes.first(24)));
    QVERIFY(tokenBytes(token().value_or("")).mid(8, 16) != bytes.mid(8, 16));
}

void TestNvlcrypto::keyFileReplacesTheKey() {
    QVERIFY(m_root.write(keyFile, " \t\r\n" + QByteArray(32, 'a') + QByteArray(32, 'B') + "\n\n"));
    QVERIFY(!apply(cipherToPass, knownSecret));
    const auto sealed = apply(passToCipher, "secret");
    QVERIFY(sealed);
    QCOMPARE(apply(cipherToPass, *sealed), "secret");
    const QByteArray bytes = tokenBytes(token().value_or(""));
    QVERIFY(bytes.size() == 56 && bytes.last(32) != hmac(tokenKey, bytes.first(24)));

    QVERIFY(m_root.write(keyFile, QByteArray(64, 'c')));
    QVERIFY2(!apply(cipherToPass, *sealed), "a changed key file counts at once");
    QVERIFY(QFile::remove(m_root.filePath(keyFile)));
    QCOMPARE(apply(cipherToPass, knownSecret), "Passw0rd!");
}

void TestNvlcrypto::malformedKeyFileStopsEverything_data() {
    QTest::addColumn<QByteArray>("contents");
    QTest::newRow("empty") << QByteArray("");
    QTest::newRow("short") << QByteArray(63, 'a');
    QTest::newRow("long") << QByteArray(65, 'a');
    QTest::newRow("no hex") << QByteArray(63, 'a') + 'g';
    QTest::newRow("blank inside") << QByteArray(32, 'a') + ' ' + QByteArray(32, 'a');
    QTest::newRow("a folder of that name") << QByteArray();
}

void TestNvlcrypto::malformedKeyFileStopsEverything() {
    QFETCH(QByteArray, contents);
    QVERIFY(contents.isNull() ? QDir(m_root.path()).mkdir(keyFile) : m_root.write(keyFile, contents));
    QVERIFY(!apply(passToCipher, "secret"));
    QVERIFY(!apply(cipherToPass, knownSecret));
    QVERIFY(!apply(dataToCypher, "{}"));
    QVERIFY(!apply(cypherToData, knownData));
    QVERIFY(!token());
}

void TestNvlcrypto::otherKeyFolder() {
    QTemporaryDir other;
    QFile file(other.filePath(keyFile));
    QVERIFY(file.open(QIODevice::WriteOnly) && file.write(QByteArray(64, '7')) == 64);
    file.close();
    const QByteArray folder = other.path().toUtf8();
    QCOMPARE(nvlcryptoSetKeyFolder(folder.constData(), static_cast<std::size_t>(folder.size())), 0);
    QVERIFY(!apply(cipherToPass, knownSecret));
    QCOMPARE(nvlcryptoSetKeyFolder("", 0), 0);
    QVERIFY(apply(cipherToPass, knownSecret));
}

void TestNvlcrypto::nullPointers() {
    for (const Operation operation : {passToCipher, cipherToPass, dataToCypher, cypherToData}) {
        char *out = nullptr;
        QCOMPARE(operation(nullptr, 0, &out), 1);
        QCOMPARE(operation("secret", 6, nullptr), 1);
    }
    QCOMPARE(createGenericToken(nullptr), 1);
    QCOMPARE(nvlcryptoSetKeyFolder(nullptr, 0), 1);
    nvlcryptoFree(nullptr);
}

NVLDM_GUILESS_TEST(TestNvlcrypto)
#include "tst_nvlcrypto.moc"
