#pragma once

#include "certificatefile.h"

#include <QWidget>

class CertificateReader;
class QLabel;
class QLineEdit;

/// The field for the certificate of an authority: the file, and below it what is in the file or why it is of
/// no use.
class CaFileField : public QWidget {
    Q_OBJECT

public:
    explicit CaFileField(QWidget *parent = nullptr);

    /// Reads a file.
    void take(const QString &path);
    bool isReading() const;
    /// Null while there is no certificate.
    const CertificateFilePtr &file() const { return m_file; }

signals:
    void changed();

private:
    void onRead(const CertificateFilePtr &file);
    void tell(const QString &text, const char *role);

    CertificateReader *m_reader;
    CertificateFilePtr m_file;
    QLineEdit *m_name;
    QLabel *m_details;
};
