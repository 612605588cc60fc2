#include "devices/operations/certificates/certificatelistmodel.h"

#include "api/session/netjob.h"
#include "widgets/style/plaintext.h"

#include <algorithm>

struct CertificateListModel::Arrangement {
    CertificateList::ListPtr list;
    std::vector<int> order;
};

namespace {

QString iconOf(CertificateValidity validity) {
    switch (validity) {
    case CertificateValidity::Expired:
        return QStringLiteral(":/images/icon_general_error_solid.svg");
    case CertificateValidity::ExpiresSoon:
        return QStringLiteral(":/images/icon_general_warning_solid.svg");
    case CertificateValidity::Valid:
        return QStringLiteral(":/images/icon_general_success_solid_green.svg");
    default:
        return QStringLiteral(":/images/icon_general_notice_solid.svg");
    }
}

} // namespace

void CertificateListModel::gather(const DeviceSnapshotPtr &devices, qint64 now) {
    m_devices = devices;
    m_now = now;
    arrange();
}

void CertificateListModel::setSearch(const QString &text) {
    m_search = text;
    arrange();
}

void CertificateListModel::sort(int column, Qt::SortOrder order) {
    if (column < 0 || column >= certificateColumnCount)
        return;
    m_column = static_cast<CertificateColumn>(column);
    m_sortOrder = order;
    arrange();
}

void CertificateListModel::arrange() {
    if (!m_list && !m_devices)
        return;
    const int number = ++m_asked;
    const auto work = [list = m_list, devices = m_devices, search = m_search, column = m_column,
                       order = m_sortOrder] {
        Arrangement done{list, {}};
        if (!list)
            done.list = std::make_shared<CertificateList::List>(CertificateList::of(*devices));
        done.order = CertificateList::arranged(*done.list, search, column, order);
        return done;
    };
    const auto ended = [this](JobOutcome end) {
        if (end != JobOutcome::Delivered)
            emit failed();
    };
    auto *runner = NetJob::createRunner("arranging certificates", NetTask::Turn::Beside);
    const bool started = NetJob::post(
        runner, this, work,
        [this, number](Arrangement done) {
            if (number == m_asked)
                show(std::move(done));
        },
        ended);
    if (!started)
        ended(JobOutcome::NotRun);
}

void CertificateListModel::show(Arrangement arrangement) {
    beginResetModel();
    if (m_list != arrangement.list) {
        m_list = std::move(arrangement.list);
        m_devices.reset();
        const auto count = [this](CertificateValidity validity) {
            return static_cast<int>(
                std::count_if(m_list->begin(), m_list->end(),
                              [&](const CertificateInUse &each) { return validityOf(each) == validity; }));
        };
        m_expired = count(CertificateValidity::Expired);
        m_soon = count(CertificateValidity::ExpiresSoon);
    }
    m_order = std::move(arrangement.order);
    endResetModel();
    emit arranged();
}

const CertificateInUse &CertificateListModel::at(int row) const {
    return (*m_list)[static_cast<std::size_t>(m_order[static_cast<std::size_t>(row)])];
}

CertificateValidity CertificateListModel::validityOf(const CertificateInUse &certificate) const {
    return CertificateValidities::of(0, certificate.expires, m_now);
}

int CertificateListModel::rowCount(const QModelIndex &parent) const {
    return parent.isValid() ? 0 : static_cast<int>(m_order.size());
}

int CertificateListModel::columnCount(const QModelIndex &parent) const {
    return parent.isValid() ? 0 : certificateColumnCount;
}

QString CertificateListModel::text(const CertificateInUse &certificate, CertificateColumn column) const {
    switch (column) {
    case CertificateColumn::State:
        return CertificateValidities::text(validityOf(certificate));
    case CertificateColumn::Expires:
        return CertificateValidities::dateText(certificate.expires);
    case CertificateColumn::Use:
        return certificate.use == CertificateInUse::Use::Https ? tr("HTTPS") : tr("IEEE 802.1X");
    case CertificateColumn::Subject:
        return certificate.subject.isEmpty() ? QStringLiteral("--") : certificate.subject;
    default:
        return certificate.device->text(CertificateList::deviceColumnOf(column));
    }
}

QVariant CertificateListModel::data(const QModelIndex &index, int role) const {
    if (!checkIndex(index, CheckIndexOption::IndexIsValid))
        return {};
    const CertificateInUse &certificate = at(index.row());
    const auto column = static_cast<CertificateColumn>(index.column());
    if (role == Qt::DisplayRole)
        return text(certificate, column);
    if (role == Qt::ToolTipRole)
        return PlainText::toolTip(text(certificate, column));
    if (role == Qt::DecorationRole && column == CertificateColumn::State)
        return iconOf(validityOf(certificate));
    return {};
}

QVariant CertificateListModel::headerData(int section, Qt::Orientation orientation, int role) const {
    if (orientation != Qt::Horizontal || role != Qt::DisplayRole || section < 0 ||
        section >= certificateColumnCount)
        return {};
    const auto column = static_cast<CertificateColumn>(section);
    if (CertificateList::isOfDevice(column))
        return DeviceRecords::columnTitle(CertificateList::deviceColumnOf(column));
    const QString titles[] = {tr("State"), tr("Expires"), tr("Use"), tr("Subject")};
    return titles[section];
}
