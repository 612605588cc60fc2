#include "devices/operations/certificates/certificatefile.h"
#include "devices/operations/certificates/certificatevalidity.h"
#include "support/certificatemaker.h"
#include "support/isolatedroot.h"
#include "support/testmain.h"

#include <QDateTime>
#include <QElapsedTimer>
#include <QTest>

#include <sys/stat.h>

using namespace CertificateMaker;

class TestCertificateFile : public QObject {
    Q_OBJECT

private slots:
    void initTestCase() {
        m_key = makeKey();
        m_leaf = makeCertificate(m_key.get(), "gate, \xC3\x96st", -1, 90);
        m_authority = makeCertificate(makeKey().get(), "Authority", -10, 3650, true);
    }

    void certificatesAreRead_data() {
        QTest::addColumn<QByteArray>("bytes");
        QTest::addColumn<int>("certificates");
        QTest::addColumn<bool>("hasKey");
        QTest::newRow("pem") << pem(m_leaf) << 1 << false;
        QTest::newRow("der") << der(m_leaf) << 1 << false;
        QTest::newRow("chain, leaf first") << pem(m_leaf) + pem(m_authority) << 2 << false;
        QTest::newRow("with its key") << pem(m_key) + pem(m_leaf) << 1 << true;
        QTest::newRow("text and mark before it")
            << "\xEF\xBB\xBFissued for the gate\r\n" + pem(m_leaf).replace("\n", "\r\n") << 1 << false;
    }
    void certificatesAreRead() {
        QFETCH(QByteArray, bytes);
        const CertificateFile file = read(bytes);
        QVERIFY2(file.error.isEmpty(), qPrintable(file.error));
        QTEST(file.certificates, "certificates");
        QTEST(file.hasKey, "hasKey");
        QCOMPARE(file.subject, QStringLiteral("CN=gate\\, Öst"));
        QCOMPARE(file.issuer, file.subject);
        QVERIFY(!file.isAuthority && read(pem(m_authority)).isAuthority);
        const qint64 now = QDateTime::currentMSecsSinceEpoch();
        QVERIFY(qAbs(file.validUntil - now - 90 * dayMs) < 600000);
        QVERIFY(qAbs(file.validFrom - now + dayMs) < 600000);
    }

    void keysMatchTheirCertificates_data() {
        QTest::addColumn<QByteArray>("bytes");
        QTest::addColumn<bool>("encrypted");
        QTest::addColumn<bool>("opened"); // with the pass phrase "secret"
        QTest::newRow("pem") << pem(m_key) << false << true;
        QTest::newRow("der") << der(m_key) << false << true;
        QTest::newRow("old form") << written([&](BIO *out) {
            return PEM_write_bio_PrivateKey_traditional(out, m_key.get(), nullptr, nullptr, 0, nullptr,
                                                        nullptr);
        }) << false << true;
        QTest::newRow("encrypted pem") << pem(m_key, "secret") << true << true;
        QTest::newRow("encrypted der") << der(m_key, "secret") << true << true;
        QTest::newRow("other pass phrase") << pem(m_key, "geheim") << true << false;
        QTest::newRow("other pass phrase, der") << der(m_key, "geheim") << true << false;
    }
    void keysMatchTheirCertificates() {
        QFETCH(QByteArray, bytes);
        QFETCH(bool, encrypted);
        QFETCH(bool, opened);
        const CertificateFile certificate = read(pem(m_leaf));
        const CertificateFile closed = read(bytes);
        const CertificateFile key = read(bytes, QStringLiteral("secret"));
        QVERIFY2(key.error.isEmpty(), qPrintable(key.error));
        QVERIFY(key.hasKey && !key.hasCertificate());
        QCOMPARE(key.isEncrypted, encrypted);
        QCOMPARE(CertificateFiles::belongTogether(certificate, key), opened);
        QCOMPARE(CertificateFiles::belongTogether(certificate, closed), !encrypted);
        QVERIFY(!CertificateFiles::belongTogether(read(pem(m_authority)), key));
        QVERIFY(!CertificateFiles::belongTogether(CertificateFile(), CertificateFile()));
    }

    void badFilesAreRefused_data() {
        QTest::addColumn<QByteArray>("bytes");
        QTest::addColumn<QString>("reason"); // a part of it
        const QByteArray whole = pem(m_leaf);
        const QByteArray request(
            "-----BEGIN CERTIFICATE REQUEST-----\nAAAA\n-----END CERTIFICATE REQUEST-----\n");
        QTest::newRow("empty") << QByteArray() << "is empty";
        QTest::newRow("too large") << whole + QByteArray(1 << 20, '\n') << "larger than 1 MiB";
        QTest::newRow("no certificate in a PEM") << request << "request for a certificate";
        QTest::newRow("public key") << written([&](BIO *out) {
            return PEM_write_bio_PUBKEY(out, m_key.get());
        }) << "public key only";
        QTest::newRow("cut") << whole.first(whole.size() / 2) << "damaged or cut";
        QTest::newRow("chain cut") << whole + whole.first(whole.size() / 2) << "damaged or cut";
        QTest::newRow("garbled certificate") << QByteArray(request).replace(" REQUEST", "") << "is damaged";
        QTest::newRow("garbled key") << QByteArray(request).replace("CERTIFICATE REQUEST", "PRIVATE KEY")
                                     << "key in the file is damaged";
        const QString excessive = QStringLiteral("larger than any in use, or made to take too long");
        QTest::newRow("2^31 rounds") << sealedUnder(PKCS5_pbe2_set_iv(EVP_aes_128_cbc(), INT_MAX, nullptr, 0,
                                                                      nullptr, NID_hmacWithSHA256))
                                     << excessive;
        QTest::newRow("2^31 rounds, old scheme")
            << sealedUnder(PKCS5_pbe_set(NID_pbeWithMD5AndDES_CBC, INT_MAX, nullptr, 0)) << excessive;
        QTest::newRow("scrypt for hours")
            << sealedUnder(PKCS5_pbe2_set_scrypt(EVP_aes_128_cbc(), nullptr, 0, nullptr, 1 << 14, 8, 8000))
            << excessive;
        QTest::newRow("15 KB of DSA") << dsaKey(5000) << excessive;
        QTest::newRow("over 64 KiB") << block("PRIVATE KEY", QByteArray(70000, 'x')) << excessive;
        QTest::newRow("text") << QByteArray("no certificate at all") << "neither";
        QTest::newRow("der cut") << der(m_leaf).chopped(5) << "neither";
    }
    void badFilesAreRefused() {
        QFETCH(QByteArray, bytes);
        QFETCH(QString, reason);
        QElapsedTimer timer;
        timer.start();
        const CertificateFile file = read(bytes, "secret");
        QVERIFY2(file.error.contains(reason), qPrintable(file.error));
        QVERIFY2(timer.elapsed() < 3000, "whatever it asks for");
    }

    void whatIsNoFileIsRefused() {
        QCOMPARE(CertificateFiles::read(m_root.path()).error, QStringLiteral("It is a folder, not a file."));
        QCOMPARE(CertificateFiles::read(m_root.filePath("none")).error,
                 QStringLiteral("The file does not exist."));
        const QString pipe = m_root.filePath("pipe");
        QCOMPARE(mkfifo(QFile::encodeName(pipe).constData(), 0600), 0);
        QCOMPARE(CertificateFiles::read(pipe).error, QStringLiteral("It is not a plain file."));
    }

    void validityIsJudged_data() {
        QTest::addColumn<int>("fromDays");
        QTest::addColumn<int>("untilDays");
        QTest::addColumn<CertificateValidity>("validity");
        QTest::newRow("expired") << -5 << -1 << CertificateValidity::Expired;
        QTest::newRow("to the moment") << -5 << 0 << CertificateValidity::Expired;
        QTest::newRow("soon") << -5 << 30 << CertificateValidity::ExpiresSoon;
        QTest::newRow("valid") << -5 << 31 << CertificateValidity::Valid;
        QTest::newRow("not yet") << 1 << 31 << CertificateValidity::NotYetValid;
        QTest::newRow("neither") << 2 << -2 << CertificateValidity::Expired;
    }
    void validityIsJudged() {
        QFETCH(int, fromDays);
        QFETCH(int, untilDays);
        constexpr qint64 now = 1768464000000;
        QTEST(CertificateValidities::of(now + fromDays * dayMs, now + untilDays * dayMs, now), "validity");
        QCOMPARE(CertificateValidities::of(0, 0, now), CertificateValidity::Unknown);
    }

private:
    static constexpr qint64 dayMs = 86400000;

    CertificateFile read(const QByteArray &bytes, const QString &passPhrase = {}) const {
        const QString name = QStringLiteral("a \"file\" <b>.pem");
        if (!m_root.write(name, bytes))
            qFatal("a test's file cannot be written");
        return CertificateFiles::read(m_root.filePath(name), passPhrase);
    }

    static QByteArray block(const char *name, const QByteArray &body) {
        return written([&](BIO *out) {
            const auto *bytes = reinterpret_cast<const unsigned char *>(body.constData());
            return PEM_write_bio(out, name, "", bytes, body.size()) > 0 ? 1 : 0;
        });
    }
    /// Something that says of itself that it is a key under this scheme.
    static QByteArray sealedUnder(X509_ALGOR *scheme) {
        const std::unique_ptr<X509_ALGOR, Freed<X509_ALGOR_free>> owned(scheme);
        const std::unique_ptr<X509_SIG, Freed<X509_SIG_free>> sealed(X509_SIG_new());
        X509_ALGOR *inside = nullptr;
        ASN1_OCTET_STRING *text = nullptr;
        X509_SIG_getm(sealed.get(), &inside, &text);
        X509_ALGOR_copy(inside, scheme);
        ASN1_STRING_set(text, std::string(64, 'x').data(), 64);
        return written([&](BIO *out) { return PEM_write_bio_PKCS8(out, sealed.get()); });
    }
    /// A DSA key with numbers of so many bytes, whose public half takes minutes to compute.
    static QByteArray dsaKey(int bytes) {
        QByteArray number("\x02\x82", 2);
        number += char(bytes >> 8);
        number += char(bytes & 0xff);
        number += QByteArray(bytes, 'Q');
        const QByteArray numbers = number + number + number;
        ASN1_STRING *parameters = ASN1_STRING_new();
        QByteArray sequence("\x30\x82", 2);
        sequence += char(numbers.size() >> 8);
        sequence += char(numbers.size() & 0xff);
        sequence += numbers;
        ASN1_STRING_set(parameters, sequence.constData(), int(sequence.size()));
        auto *secret = static_cast<unsigned char *>(OPENSSL_malloc(number.size()));
        std::copy(number.begin(), number.end(), secret);
        const std::unique_ptr<PKCS8_PRIV_KEY_INFO, Freed<PKCS8_PRIV_KEY_INFO_free>> info(
            PKCS8_PRIV_KEY_INFO_new());
        PKCS8_pkey_set0(info.get(), OBJ_nid2obj(NID_dsa), 0, V_ASN1_SEQUENCE, parameters, secret,
                        int(number.size()));
        return written([&](BIO *out) { return PEM_write_bio_PKCS8_PRIV_KEY_INFO(out, info.get()); });
    }

    IsolatedRoot m_root;
    Key m_key;
    Certificate m_leaf;
    Certificate m_authority;
};

NVLDM_GUILESS_TEST(TestCertificateFile)
#include "tst_certificatefile.moc"
