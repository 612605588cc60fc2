#pragma once

#include "devices/operations/certificates/certificatefile.h"
#include "devices/operations/files/pathfield.h"

class CertificateReader;

/// The field for the certificate of an authority: the file, and below it what is in the file or why it is of
/// no use.
class CaFileField : public PathField {
    Q_OBJECT

public:
    explicit CaFileField(const QString &caption, QWidget *parent = nullptr);

    /// Reads a file.
    void take(const QString &path);
    bool isReading() const;
    /// Null while there is no certificate.
    const CertificateFilePtr &file() const { return m_file; }

protected:
    void browse() override;

private:
    void onRead(const CertificateFilePtr &file);

    CertificateReader *m_reader;
    CertificateFilePtr m_file;
};
