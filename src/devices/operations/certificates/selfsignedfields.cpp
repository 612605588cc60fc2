#include "devices/operations/certificates/selfsignedfields.h"

#include "devices/operations/captioned.h"

#include <QGridLayout>
#include <QLineEdit>
#include <QRegularExpression>
#include <QRegularExpressionValidator>
#include <QSpinBox>

namespace {

constexpr int maxFunctionNameLength = 128; ///< as certificates limit it
constexpr int maxOrganizationLength = 64;
constexpr int maxValidityDays = 36500;
constexpr int defaultValidityDays = 365;

} // namespace

SelfSignedFields::SelfSignedFields(QWidget *parent)
    : QWidget(parent),
      m_country(addEdit("countryEdit", 2, tr("Two letters, as in US"))),
      m_province(addEdit("provinceEdit", maxFunctionNameLength, tr("Optional"))),
      m_locality(addEdit("localityEdit", maxFunctionNameLength, tr("Optional"))),
      m_org(addEdit("orgEdit", maxOrganizationLength, tr("Optional"))),
      m_orgUnit(addEdit("orgUnitEdit", maxOrganizationLength, tr("Optional"))),
      m_validity(new QSpinBox(this)) {
    m_country->setValidator(
        new QRegularExpressionValidator(QRegularExpression(QStringLiteral("[A-Za-z]{0,2}")), m_country));
    m_validity->setObjectName(QStringLiteral("validitySpinBox"));
    m_validity->setRange(1, maxValidityDays);
    m_validity->setValue(defaultValidityDays);
    auto *grid = new QGridLayout(this);
    grid->setContentsMargins(0, 0, 0, 0);
    grid->setHorizontalSpacing(12);
    grid->setVerticalSpacing(8);
    grid->addWidget(captioned(tr("Country"), m_country, this), 0, 0);
    grid->addWidget(captioned(tr("State/Province"), m_province, this), 0, 1);
    grid->addWidget(captioned(tr("Locality"), m_locality, this), 0, 2);
    grid->addWidget(captioned(tr("Organization"), m_org, this), 1, 0);
    grid->addWidget(captioned(tr("Organizational Unit"), m_orgUnit, this), 1, 1);
    grid->addWidget(captioned(tr("Validity (days)"), m_validity, this), 1, 2);
    for (int column = 0; column < grid->columnCount(); ++column)
        grid->setColumnStretch(column, 1);
}

QLineEdit *SelfSignedFields::addEdit(const char *name, int longest, const QString &placeholder) {
    auto *edit = new QLineEdit(this);
    edit->setObjectName(QLatin1String(name));
    edit->setMaxLength(longest);
    edit->setPlaceholderText(placeholder);
    return edit;
}

QString SelfSignedFields::problem(QWidget **field) const {
    if (m_country->text().size() == 2)
        return {};
    *field = m_country;
    return tr("The country is named by its two letters, as in US.");
}

void SelfSignedFields::fill(SelfSignedCert &cert) const {
    cert.country = m_country->text().toUpper();
    cert.province = m_province->text().trimmed();
    cert.locality = m_locality->text().trimmed();
    cert.org = m_org->text().trimmed();
    cert.orgUnit = m_orgUnit->text().trimmed();
    cert.validity = QString::number(m_validity->value());
}
