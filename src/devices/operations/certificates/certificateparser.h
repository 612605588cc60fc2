#pragma once

class QByteArray;
struct CertificateFile;

/// What is in the bytes of a certificate or private key file.
namespace CertificateParser {

/// Fills in all that does not concern the file itself. passPhrase: UTF-8, empty for none.
void parse(const QByteArray &bytes, const QByteArray &passPhrase, CertificateFile &file);

} // namespace CertificateParser
