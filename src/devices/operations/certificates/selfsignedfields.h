#pragma once

#include "tasks/queue/selfsignedcert.h"

#include <QWidget>

class QLineEdit;
class QSpinBox;

/// The fields for whom a device is to name in a certificate that it generates, and for how long.
class SelfSignedFields : public QWidget {
    Q_OBJECT

public:
    explicit SelfSignedFields(QWidget *parent = nullptr);

    /// What is wrong with the fields, and which of them it is; an empty text for nothing.
    QString problem(QWidget **field) const;
    /// Fills in all but the mode and the port.
    void fill(SelfSignedCert &cert) const;

private:
    QLineEdit *addEdit(const char *name, int longest, const QString &placeholder);

    QLineEdit *m_country;
    QLineEdit *m_province;
    QLineEdit *m_locality;
    QLineEdit *m_org;
    QLineEdit *m_orgUnit;
    QSpinBox *m_validity;
};
