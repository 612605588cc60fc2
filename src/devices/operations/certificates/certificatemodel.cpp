#include "devices/operations/certificates/certificatemodel.h"

#include "devices/inventory/devicesearch.h"
#include "devices/operations/certificates/certificatevalidity.h"
#include "devices/operations/certificates/macnames.h"
#include "widgets/style/plaintext.h"

#include <QDateTime>
#include <QLocale>
#include <QSet>

#include <algorithm>
#include <array>
#include <bit>
#include <limits>
#include <map>

namespace {

constexpr DeviceColumn deviceColumns[] = {DeviceColumn::Model, DeviceColumn::Ip, DeviceColumn::Mac};

QString nameOf(const CertificateFilePtr &file) {
    return file ? file->name : QStringLiteral("--");
}

qint64 expiryOf(const CertificatePair &pair) {
    return pair.certificate ? pair.certificate->validUntil : 0;
}

} // namespace

CertificateModel::CertificateModel(OperationTargets::List targets, QObject *parent)
    : CheckListModel(parent),
      m_targets(std::move(targets)),
      m_pairs(m_targets.size()),
      m_findings(m_targets.size()),
      m_deviceNotes(m_targets.size()),
      m_isNameless(m_targets.size()) {
    setItemCount(static_cast<int>(m_targets.size()), true);
}

/// Not before files are needed: tens of thousands of devices take their time.
void CertificateModel::readAddresses() {
    if (!m_byMac.isEmpty())
        return;
    m_byMac.reserve(static_cast<int>(m_targets.size()));
    for (std::size_t item = 0; item < m_targets.size(); ++item) {
        const quint64 mac = m_targets[item].device->sortKey(DeviceColumn::Mac);
        m_isNameless[item] = !CertificateCheck::hasAddress(*m_targets[item].device) || m_byMac.contains(mac);
        if (!m_isNameless[item])
            m_byMac.insert(mac, static_cast<int>(item));
    }
}

void CertificateModel::setNeeds(CertificateNeeds needs) {
    if (m_needs == needs)
        return;
    m_needs = needs;
    if (needs != CertificateNeeds::Nothing)
        readAddresses();
    judgeAll();
}

void CertificateModel::setDeviceWarnings(std::vector<TargetWarning> warnings) {
    m_deviceWarnings = std::move(warnings);
    std::fill(m_deviceNotes.begin(), m_deviceNotes.end(), QString());
    for (const TargetWarning &warning : m_deviceWarnings) {
        for (const int item : warning.targets) {
            QString &note = m_deviceNotes[static_cast<std::size_t>(item)];
            note = note.isEmpty() ? warning.note : tr("%1, %2").arg(note, warning.note);
        }
    }
    tellFiles();
}

/// The place of the device whose address a name bears; -1 for none, or for more than one.
int CertificateModel::ownerOf(const QString &fileName) const {
    const std::vector<quint64> addresses = MacNames::in(fileName);
    if (addresses.empty() && itemCount() == 1)
        return 0;
    int owner = -1;
    for (const quint64 address : addresses) {
        const int found = m_byMac.value(address, -1);
        if (found >= 0 && owner >= 0 && found != owner)
            return -1;
        owner = std::max(owner, found);
    }
    return owner;
}

/// A file that holds both stands for both, unless a key of its own is there.
void CertificateModel::give(CertificatePair &pair, const CertificateFilePtr &file) {
    if (!file->error.isEmpty()) {
        pair.refused = file;
        return;
    }
    const bool keyCameWithCertificate = pair.key && pair.key == pair.certificate;
    if (file->hasCertificate())
        pair.certificate = file;
    if (file->hasKey && (!file->hasCertificate() || !pair.key || keyCameWithCertificate))
        pair.key = file;
    pair.refused.reset();
}

CertificateModel::Files CertificateModel::matchFiles(const Files &files) {
    const qint64 now = QDateTime::currentMSecsSinceEpoch();
    Files unmatchedFiles;
    readAddresses();
    for (const CertificateFilePtr &file : files) {
        const int owner = ownerOf(file->name);
        if (owner < 0) {
            unmatchedFiles.push_back(file);
            continue;
        }
        give(m_pairs[static_cast<std::size_t>(owner)], file);
        judge(static_cast<std::size_t>(owner), now);
    }
    tellFiles();
    return unmatchedFiles;
}

bool CertificateModel::assign(const std::vector<int> &items, const CertificateFilePtr &file, Slot slot) {
    if (!file->error.isEmpty() || !(slot == Slot::Key ? file->hasKey : file->hasCertificate()))
        return false;
    for (const int item : items) {
        CertificatePair &pair = m_pairs[static_cast<std::size_t>(item)];
        (slot == Slot::Key ? pair.key : pair.certificate) = file;
        if (slot == Slot::Certificate && file->hasKey && !pair.key)
            pair.key = file;
        pair.refused.reset();
    }
    judgeAll();
    return true;
}

void CertificateModel::replace(const Files &files) {
    QHash<QString, CertificateFilePtr> byPath;
    for (const CertificateFilePtr &file : files)
        byPath.insert(file->path, file);
    for (CertificatePair &pair : m_pairs) {
        for (CertificateFilePtr *file : {&pair.certificate, &pair.key}) {
            const CertificateFilePtr again = *file ? byPath.value((*file)->path) : nullptr;
            if (again && !again->error.isEmpty())
                pair.refused = again;
            if (again)
                *file = again->error.isEmpty() ? again : nullptr;
        }
    }
    judgeAll();
}

void CertificateModel::removeFiles(const std::vector<int> &items) {
    for (const int item : items)
        m_pairs[static_cast<std::size_t>(item)] = {};
    judgeAll();
}

QStringList CertificateModel::encryptedKeys() const {
    QSet<QString> paths;
    for (const CertificatePair &pair : m_pairs) {
        if (pair.key && pair.key->isEncrypted)
            paths.insert(pair.key->path);
    }
    return paths.values();
}

void CertificateModel::judge(std::size_t item, qint64 now) {
    m_findings[item] = CertificateCheck::judge(m_pairs[item], *m_targets[item].device, m_needs, now);
    if (m_isNameless[item] && m_needs != CertificateNeeds::Nothing)
        m_findings[item] |= CertificateFinding::NoAddress;
}

void CertificateModel::judgeAll() {
    const qint64 now = QDateTime::currentMSecsSinceEpoch();
    for (std::size_t item = 0; item < m_pairs.size(); ++item)
        judge(item, now);
    tellFiles();
}

void CertificateModel::tellFiles() {
    updateCells();
    emit filesChanged();
}

/// How many of the checked devices cannot be served for which reason.
QString CertificateModel::blockedText() const {
    std::array<int, std::numeric_limits<int>::digits> counts{};
    for (int item = 0; item < itemCount(); ++item) {
        const CertificateFindings findings = m_findings[static_cast<std::size_t>(item)];
        if (isChecked(item) && CertificateCheck::blocks(findings))
            ++counts[static_cast<std::size_t>(std::countr_zero(unsigned(findings.toInt())))];
    }
    QStringList reasons;
    for (const CertificateFinding finding : CertificateCheck::all()) {
        const int count = counts[static_cast<std::size_t>(std::countr_zero(unsigned(finding)))];
        if (count > 0)
            reasons += tr("%1 (%2)").arg(CertificateCheck::note(finding), QLocale().toString(count));
    }
    return reasons.join(tr(", "));
}

std::vector<TargetWarning> CertificateModel::warnings() const {
    TargetWarning leftOut{
        [this](int count) {
            return tr("%n device(s) will be left out: %1.", nullptr, count).arg(blockedText());
        },
        {},
        {}};
    std::map<int, TargetWarning> doubts;
    for (int item = 0; item < itemCount(); ++item) {
        const CertificateFindings findings = m_findings[static_cast<std::size_t>(item)];
        if (!findings)
            continue;
        if (CertificateCheck::blocks(findings)) {
            leftOut.targets.push_back(item);
            continue;
        }
        for (const CertificateFinding finding : CertificateCheck::all()) {
            if (findings & finding)
                doubts[static_cast<int>(finding)].targets.push_back(item);
        }
    }
    std::vector<TargetWarning> found;
    if (!leftOut.targets.empty())
        found.push_back(std::move(leftOut));
    found.insert(found.end(), m_deviceWarnings.begin(), m_deviceWarnings.end());
    for (auto &[finding, warning] : doubts) {
        warning.summary = CertificateCheck::summary(static_cast<CertificateFinding>(finding));
        if (warning.summary)
            found.push_back(std::move(warning));
    }
    return found;
}

std::vector<int> CertificateModel::readyItems() const {
    std::vector<int> ready;
    for (int item = 0; item < itemCount(); ++item) {
        if (isChecked(item) && !CertificateCheck::blocks(m_findings[static_cast<std::size_t>(item)]))
            ready.push_back(item);
    }
    return ready;
}

QString CertificateModel::details(int item) const {
    const CertificateFilePtr &file = pair(item).certificate;
    if (!file || m_needs == CertificateNeeds::Nothing)
        return {};
    const QString unknown = QStringLiteral("--");
    const QString issuer = file->issuer == file->subject
                               ? tr("self-signed")
                               : tr("issued by %1").arg(file->issuer.isEmpty() ? unknown : file->issuer);
    return tr("%1, %2, valid from %3 to %4")
        .arg(file->subject.isEmpty() ? unknown : file->subject, issuer,
             CertificateValidities::dateText(file->validFrom),
             CertificateValidities::dateText(file->validUntil));
}

int CertificateModel::columnCount(const QModelIndex &parent) const {
    return parent.isValid() ? 0 : columnTotal;
}

QVariant CertificateModel::data(const QModelIndex &index, int role) const {
    if (!checkIndex(index, CheckIndexOption::IndexIsValid))
        return {};
    const int item = itemAt(index.row());
    if (role == Qt::ToolTipRole)
        return PlainText::toolTip(index.column() == CertificateColumn ? details(item)
                                                                      : text(item, index.column()));
    if (role == Qt::DecorationRole && index.column() == NoteColumn)
        return noteIcon(item);
    return CheckListModel::data(index, role);
}

QVariant CertificateModel::headerData(int section, Qt::Orientation orientation, int role) const {
    if (orientation != Qt::Horizontal || role != Qt::DisplayRole || section < 0 || section >= columnTotal)
        return {};
    const QString titles[] = {tr("Model"),       tr("IP"),          tr("MAC"), tr("Certificate"),
                              tr("Private Key"), tr("Valid until"), tr("Note")};
    return titles[section];
}

QString CertificateModel::note(int item) const {
    QStringList notes;
    for (const CertificateFinding finding : CertificateCheck::all()) {
        if (m_findings[static_cast<std::size_t>(item)] & finding)
            notes += finding == CertificateFinding::Unusable
                         ? tr("%1: %2").arg(pair(item).refused->name, pair(item).refused->error)
                         : CertificateCheck::note(finding);
    }
    if (const QString &device = m_deviceNotes[static_cast<std::size_t>(item)]; !device.isEmpty())
        notes += device;
    if (notes.isEmpty() && m_needs != CertificateNeeds::Nothing)
        return CertificateCheck::needsKey(m_needs) ? tr("Key matches") : tr("Ready");
    return notes.join(tr(", "));
}

QString CertificateModel::noteIcon(int item) const {
    const CertificateFindings findings = m_findings[static_cast<std::size_t>(item)];
    if (CertificateCheck::blocks(findings))
        return QStringLiteral(":/images/icon_general_error_solid.svg");
    if (findings || !m_deviceNotes[static_cast<std::size_t>(item)].isEmpty())
        return QStringLiteral(":/images/icon_general_warning_solid.svg");
    return m_needs == CertificateNeeds::Nothing
               ? QString()
               : QStringLiteral(":/images/icon_general_success_solid_green.svg");
}

QString CertificateModel::text(int item, int column) const {
    switch (column) {
    case CertificateColumn:
        return nameOf(pair(item).certificate);
    case KeyColumn:
        return nameOf(pair(item).key);
    case ExpiryColumn:
        return CertificateValidities::dateText(expiryOf(pair(item)));
    case NoteColumn:
        return note(item);
    default:
        return device(item).text(deviceColumns[column]);
    }
}

std::vector<int> CertificateModel::find(const QString &search) const {
    const DeviceSearch words(search, {});
    std::vector<int> found;
    for (int item = 0; item < static_cast<int>(m_targets.size()); ++item) {
        if (words.matches(device(item)))
            found.push_back(item);
    }
    return found;
}

/// By the note, what blocks comes first; by the date, what has none comes last.
int CertificateModel::compare(int left, int right, int column, bool ascending) const {
    if (column <= MacColumn)
        return DeviceRecords::compare(device(left), device(right), deviceColumns[column], ascending);
    qint64 difference = 0;
    if (column == ExpiryColumn) {
        const qint64 a = expiryOf(pair(left));
        const qint64 b = expiryOf(pair(right));
        if ((a == 0) != (b == 0))
            return b == 0 ? -1 : 1;
        difference = a < b ? -1 : a > b ? 1 : 0;
    } else if (column == NoteColumn) {
        const auto rank = [this](int item) {
            const CertificateFindings findings = m_findings[static_cast<std::size_t>(item)];
            return findings ? CertificateCheck::first(findings) : std::numeric_limits<int>::max();
        };
        difference = rank(left) < rank(right) ? -1 : rank(left) > rank(right) ? 1 : 0;
    } else {
        difference = text(left, column).compare(text(right, column), Qt::CaseInsensitive);
    }
    return static_cast<int>(ascending ? difference : -difference);
}
