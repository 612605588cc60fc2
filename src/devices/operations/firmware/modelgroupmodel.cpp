#include "devices/operations/firmware/modelgroupmodel.h"

#include "widgets/style/plaintext.h"
#include "widgets/style/theme.h"

#include <QLocale>

#include <algorithm>
#include <numeric>

namespace {

enum Column { ModelColumn, DevicesColumn, VersionsColumn, FitColumn, ColumnCount };

template <typename T>
int order(const T &left, const T &right) {
    return left < right ? -1 : right < left ? 1 : 0;
}

} // namespace

void ModelGroupModel::setGroups(std::vector<ModelGroup> groups) {
    m_groups.clear();
    setItemCount(0, false);
    m_groups = std::move(groups);
    m_ticked.clear();
    for (const ModelGroup &each : m_groups)
        m_ticked.push_back(static_cast<int>(each.targets.size()));
    setItemCount(static_cast<int>(m_groups.size()), true);
}

void ModelGroupModel::setTicked(const std::vector<int> &targets) {
    std::size_t all = 0;
    for (const ModelGroup &each : m_groups)
        all += each.targets.size();
    std::vector<bool> isTicked(all);
    for (const int target : targets)
        isTicked[static_cast<std::size_t>(target)] = true;
    m_ticked.clear();
    for (const ModelGroup &each : m_groups)
        m_ticked.push_back(
            static_cast<int>(std::count_if(each.targets.begin(), each.targets.end(), [&](int target) {
                return isTicked[static_cast<std::size_t>(target)];
            })));
    std::vector<int> some;
    std::vector<int> none;
    for (int item = 0; item < itemCount(); ++item)
        (tickedIn(item) > 0 ? some : none).push_back(item);
    setChecked(some, true);
    setChecked(none, false);
}

void ModelGroupModel::setImage(const FirmwareHeader &head, bool isKnown) {
    m_head = head;
    m_hasImage = isKnown;
    updateCells();
}

FirmwareHeader::Fit ModelGroupModel::fitOf(std::size_t group) const {
    return m_hasImage ? m_head.fitOf(m_groups[group].model) : FirmwareHeader::Fit::Unknown;
}

int ModelGroupModel::columnCount(const QModelIndex &parent) const {
    return parent.isValid() ? 0 : ColumnCount;
}

QVariant ModelGroupModel::headerData(int section, Qt::Orientation orientation, int role) const {
    if (orientation != Qt::Horizontal || role != Qt::DisplayRole || section < 0 || section >= ColumnCount)
        return {};
    const QString titles[] = {tr("Model"), tr("Devices"), tr("Present version"), tr("Image")};
    return titles[section];
}

QVariant ModelGroupModel::data(const QModelIndex &index, int role) const {
    if (!checkIndex(index, CheckIndexOption::IndexIsValid))
        return {};
    const int item = itemAt(index.row());
    if (role == Qt::ToolTipRole)
        return PlainText::toolTip(text(item, index.column()));
    if (role != Qt::ForegroundRole || index.column() != FitColumn)
        return CheckListModel::data(index, role);
    switch (fitOf(static_cast<std::size_t>(item))) {
    case FirmwareHeader::Fit::Fits:
        return Theme::success;
    case FirmwareHeader::Fit::OtherModel:
        return Theme::warning;
    case FirmwareHeader::Fit::Unknown:
        break;
    }
    return Theme::textQuiet;
}

bool ModelGroupModel::setData(const QModelIndex &index, const QVariant &value, int role) {
    if (role != Qt::CheckStateRole || index.column() != 0)
        return false;
    emit groupToggled(itemAt(index.row()), value.toInt() == Qt::Checked);
    return true;
}

QString ModelGroupModel::countText(int item) const {
    const QString all = QLocale().toString(static_cast<qlonglong>(group(item).targets.size()));
    const int ticked = tickedIn(item);
    return ticked == 0 || ticked == static_cast<int>(group(item).targets.size())
               ? all
               : tr("%1 of %2").arg(QLocale().toString(ticked), all);
}

QString ModelGroupModel::fitText(int item) const {
    switch (fitOf(static_cast<std::size_t>(item))) {
    case FirmwareHeader::Fit::Fits:
        return tr("fits");
    case FirmwareHeader::Fit::OtherModel:
        return tr("another model group");
    case FirmwareHeader::Fit::Unknown:
        break;
    }
    return m_hasImage ? tr("cannot be told, the device will judge") : QString();
}

QString ModelGroupModel::text(int item, int column) const {
    switch (column) {
    case ModelColumn:
        return group(item).model;
    case DevicesColumn:
        return countText(item);
    case VersionsColumn:
        return group(item).versions.join(QStringLiteral(", "));
    default:
        return fitText(item);
    }
}

std::vector<int> ModelGroupModel::find(const QString &) const {
    std::vector<int> all(m_groups.size());
    std::iota(all.begin(), all.end(), 0);
    return all;
}

int ModelGroupModel::compare(int left, int right, int column, bool ascending) const {
    const int rising = column == DevicesColumn
                           ? order(group(left).targets.size(), group(right).targets.size())
                           : text(left, column).localeAwareCompare(text(right, column));
    return ascending ? rising : -rising;
}
