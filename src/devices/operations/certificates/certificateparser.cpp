#include "devices/operations/certificates/certificateparser.h"

#include "devices/operations/certificates/certificatefile.h"
#include "devices/operations/certificates/privatekeys.h"

#include <QCoreApplication>
#include <QCryptographicHash>
#include <QDateTime>
#include <QTimeZone>

#include <openssl/core_names.h>
#include <openssl/err.h>
#include <openssl/pem.h>
#include <openssl/x509.h>
#include <openssl/x509v3.h>

#include <algorithm>
#include <ctime>
#include <string_view>

namespace CertificateParser {

namespace {

constexpr qsizetype maxNameLength = 300;
const QByteArray pemBegin = QByteArrayLiteral("-----BEGIN ");

struct Texts {
    Q_DECLARE_TR_FUNCTIONS(CertificateParser)
};

template <auto Free>
struct Freed {
    template <typename T>
    void operator()(T *object) const {
        Free(object);
    }
};
using Bio = std::unique_ptr<BIO, Freed<BIO_free_all>>;
using Certificate = std::unique_ptr<X509, Freed<X509_free>>;
using Sealed = std::unique_ptr<X509_SIG, Freed<X509_SIG_free>>;

/// Memory that the library has given.
struct Buffer {
    ~Buffer() { OPENSSL_clear_free(data, static_cast<std::size_t>(std::max(length, 0L))); }

    unsigned char *data = nullptr;
    long length = 0;
};

/// One block of a PEM text.
struct Block {
    ~Block() {
        OPENSSL_free(name);
        OPENSSL_free(header);
    }

    bool isNamed(std::initializer_list<std::string_view> names) const {
        return std::find(names.begin(), names.end(), std::string_view(name)) != names.end();
    }

    char *name = nullptr;
    char *header = nullptr;
    Buffer body;
};

Bio readerOf(const QByteArray &bytes) {
    return Bio(BIO_new_mem_buf(bytes.constData(), static_cast<int>(bytes.size())));
}

const unsigned char *bytesOf(const QByteArray &bytes) {
    return reinterpret_cast<const unsigned char *>(bytes.constData());
}

/// The library would ask on the terminal otherwise.
int givePassPhrase(char *buffer, int size, int, void *phrase) {
    const auto &text = *static_cast<const QByteArray *>(phrase);
    if (text.isEmpty() || text.size() > size)
        return -1;
    std::copy(text.begin(), text.end(), buffer);
    return static_cast<int>(text.size());
}

void *passPhraseArgument(const QByteArray &passPhrase) {
    return const_cast<QByteArray *>(&passPhrase);
}

QString nameText(const X509_NAME *name) {
    const Bio writer(BIO_new(BIO_s_mem()));
    X509_NAME_print_ex(writer.get(), name, 0,
                       XN_FLAG_RFC2253 & ~static_cast<unsigned long>(ASN1_STRFLGS_ESC_MSB));
    char *text = nullptr;
    const long length = BIO_get_mem_data(writer.get(), &text);
    return QString::fromUtf8(text, std::max(length, 0L)).left(maxNameLength);
}

qint64 timeOf(const ASN1_TIME *time) {
    std::tm parts{};
    if (ASN1_TIME_to_tm(time, &parts) != 1)
        return 0;
    const QDate date(parts.tm_year + 1900, parts.tm_mon + 1, parts.tm_mday);
    return QDateTime(date, QTime(parts.tm_hour, parts.tm_min, std::min(parts.tm_sec, 59)), Qt::UTC)
        .toMSecsSinceEpoch();
}

/// What a public key is known by; empty for one that cannot be written.
QByteArray markOf(EVP_PKEY *key) {
    if (!key)
        return {};
    // The same point has two forms; keys without points take no notice.
    EVP_PKEY_set_utf8_string_param(key, OSSL_PKEY_PARAM_EC_POINT_CONVERSION_FORMAT, "uncompressed");
    Buffer written;
    written.length = i2d_PUBKEY(key, &written.data);
    if (written.length <= 0)
        return {};
    return QCryptographicHash::hash(
        QByteArrayView(reinterpret_cast<const char *>(written.data), written.length),
        QCryptographicHash::Sha256);
}

/// The first one is the device's, the others are its chain.
void take(const Certificate &certificate, CertificateFile &file) {
    if (file.certificates++ > 0)
        return;
    file.subject = nameText(X509_get_subject_name(certificate.get()));
    file.issuer = nameText(X509_get_issuer_name(certificate.get()));
    file.validFrom = timeOf(X509_get0_notBefore(certificate.get()));
    file.validUntil = timeOf(X509_get0_notAfter(certificate.get()));
    file.isAuthority = X509_check_ca(certificate.get()) != 0;
    file.certificateMark = markOf(X509_get0_pubkey(certificate.get()));
}

/// A key that is under no pass phrase has to open; one that is may stay closed.
void take(const PrivateKeys::Opened &opened, CertificateFile &file) {
    file.hasKey = true;
    file.keyMark = markOf(opened.key.get());
    if (opened.isExcessive)
        file.error = Texts::tr("The private key in the file is larger than any in use, or made to take too "
                               "long to open.");
    else if (!opened.key && !file.isEncrypted)
        file.error = Texts::tr("The private key in the file is damaged or of an unknown kind.");
}

/// What a text holds that has blocks, but none that is wanted.
QString strangerText(const QByteArray &name) {
    if (name.contains("CERTIFICATE REQUEST"))
        return Texts::tr("The file holds a request for a certificate, not a certificate.");
    if (name.contains("PUBLIC KEY"))
        return Texts::tr("The file holds a public key only.");
    return Texts::tr("The file holds neither a certificate nor a private key.");
}

/// Takes the older way of keeping a key under a pass phrase off the block.
bool decrypt(Block &block, const QByteArray &passPhrase) {
    EVP_CIPHER_INFO cipher;
    return PEM_get_EVP_CIPHER_INFO(block.header, &cipher) == 1 &&
           PEM_do_header(&cipher, block.body.data, &block.body.length, &givePassPhrase,
                         passPhraseArgument(passPhrase)) == 1;
}

void takeKeyBlock(Block &block, const QByteArray &passPhrase, CertificateFile &file) {
    const bool isSealed = block.isNamed({"ENCRYPTED PRIVATE KEY"});
    const bool hasHeader = QByteArrayView(block.header).contains("ENCRYPTED");
    file.isEncrypted = isSealed || hasHeader;
    if (isSealed)
        return take(PrivateKeys::openSealed(block.body.data, block.body.length, passPhrase), file);
    if (block.body.length > PrivateKeys::maxKey)
        return take({{}, true}, file);
    const bool isReadable = !hasHeader || decrypt(block, passPhrase);
    take(isReadable ? PrivateKeys::open(block.body.data, block.body.length) : PrivateKeys::Opened(), file);
}

void takeBlock(Block &block, const QByteArray &passPhrase, CertificateFile &file) {
    if (block.isNamed({"CERTIFICATE", "X509 CERTIFICATE", "TRUSTED CERTIFICATE"})) {
        const unsigned char *at = block.body.data;
        const Certificate certificate(d2i_X509(nullptr, &at, block.body.length));
        if (certificate)
            take(certificate, file);
        else
            file.error = Texts::tr("A certificate in the file is damaged.");
    } else if (QByteArrayView(block.name).endsWith("PRIVATE KEY") && !file.hasKey) {
        takeKeyBlock(block, passPhrase, file);
    }
}

void parsePem(const QByteArray &bytes, const QByteArray &passPhrase, CertificateFile &file) {
    QByteArray stranger;
    const Bio reader = readerOf(bytes);
    for (;;) {
        Block block;
        if (PEM_read_bio(reader.get(), &block.name, &block.header, &block.body.data, &block.body.length) != 1)
            break;
        takeBlock(block, passPhrase, file);
        ERR_clear_error();
        stranger = block.name;
    }
    // Behind the last block it finds no other start; anything else is a block that is cut or garbled.
    const bool isWhole = ERR_GET_REASON(ERR_peek_last_error()) == PEM_R_NO_START_LINE;
    if (!isWhole && file.error.isEmpty())
        file.error = Texts::tr("The file is damaged or cut off.");
    if (file.error.isEmpty() && !file.hasCertificate() && !file.hasKey)
        file.error = strangerText(stranger);
}

void parseDer(const QByteArray &bytes, const QByteArray &passPhrase, CertificateFile &file) {
    const auto length = static_cast<long>(bytes.size());
    const unsigned char *at = bytesOf(bytes);
    if (const Certificate certificate(d2i_X509(nullptr, &at, length)); certificate)
        return take(certificate, file);
    at = bytesOf(bytes);
    if (const Sealed sealed(d2i_X509_SIG(nullptr, &at, length)); sealed) {
        file.isEncrypted = true;
        return take(PrivateKeys::openSealed(bytesOf(bytes), length, passPhrase), file);
    }
    if (length <= PrivateKeys::maxKey) {
        const PrivateKeys::Opened opened = PrivateKeys::open(bytesOf(bytes), length);
        if (opened.key || opened.isExcessive)
            return take(opened, file);
    }
    file.error = Texts::tr("The file holds neither a certificate nor a private key in PEM or DER form.");
}

} // namespace

void parse(const QByteArray &bytes, const QByteArray &passPhrase, CertificateFile &file) {
    ERR_clear_error();
    // Some editors put a mark before the text, which the library stumbles over.
    const qsizetype begin = bytes.indexOf(pemBegin);
    if (begin >= 0)
        parsePem(bytes.sliced(begin), passPhrase, file);
    else
        parseDer(bytes, passPhrase, file);
    ERR_clear_error();
}

} // namespace CertificateParser
