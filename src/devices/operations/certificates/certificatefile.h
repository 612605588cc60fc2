#pragma once

#include <QByteArray>
#include <QString>

#include <memory>

/// A file with a certificate or a private key, in PEM or DER form, as it was when it was read. Never changed
/// after that, so threads share it freely.
struct CertificateFile {
    QString path;
    QString name;
    QString error; ///< a whole sentence: why the file is of no use; empty where it holds something

    int certificates = 0;       ///< how many: behind the first one stands the chain up to its authority
    QString subject;            ///< of the first one, the device's, as are those below
    QString issuer;             ///< as RFC 2253 writes names
    qint64 validFrom = 0;       ///< Unix ms
    qint64 validUntil = 0;      ///< Unix ms
    bool isAuthority = false;   ///< it may sign others
    QByteArray certificateMark; ///< of the public key that it was made for

    bool hasKey = false;
    bool isEncrypted = false; ///< the private key is under a pass phrase
    QByteArray keyMark;       ///< of the private key's public half; empty while the key cannot be opened

    bool hasCertificate() const { return certificates > 0; }
};

using CertificateFilePtr = std::shared_ptr<const CertificateFile>;

/// Reads such files. Any thread but the user-interface thread: a pass phrase takes its time.
namespace CertificateFiles {

inline constexpr qint64 sizeLimit = 1 << 20;

/// Reads a file; what is wrong with it stands in its error. passPhrase: for a private key under one.
CertificateFile read(const QString &path, const QString &passPhrase = {});

/// True where the certificate was made for the private key of the other file, or of the same.
bool belongTogether(const CertificateFile &certificate, const CertificateFile &key);

} // namespace CertificateFiles
