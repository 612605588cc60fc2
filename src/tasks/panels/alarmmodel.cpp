#include "tasks/panels/alarmmodel.h"

#include "tasks/panels/alarmreadhistory.h"
#include "tasks/panels/tasktexts.h"
#include "widgets/lists/rowdiff.h"
#include "widgets/style/plaintext.h"

namespace {

std::vector<QString> keysOf(const AlarmList &alarms) {
    std::vector<QString> keys;
    for (const AlarmRecord &alarm : alarms)
        keys.push_back(alarm.alid);
    return keys;
}

} // namespace

AlarmModel::AlarmModel(const AlarmReadHistory &history, QObject *parent)
    : QAbstractListModel(parent), m_history(history) {}

void AlarmModel::setAlarms(const AlarmList &alarms) {
    if (alarms == m_alarms)
        return;
    const RowDiff diff = RowDiff::between(keysOf(m_alarms), keysOf(alarms));
    for (const RowDiff::Range &range : diff.removed) {
        beginRemoveRows({}, range.first, range.last);
        m_alarms.erase(m_alarms.begin() + range.first, m_alarms.begin() + range.last + 1);
        endRemoveRows();
    }
    for (const RowDiff::Range &range : diff.inserted) {
        beginInsertRows({}, range.first, range.last);
        m_alarms.insert(m_alarms.begin() + range.first, alarms.begin() + range.first,
                        alarms.begin() + range.last + 1);
        endInsertRows();
    }
    m_alarms = alarms;
}

const AlarmRecord &AlarmModel::alarmOf(const QModelIndex &index) const {
    return m_alarms[static_cast<std::size_t>(index.row())];
}

void AlarmModel::keepMarks() {
    for (const AlarmRecord &alarm : m_alarms) {
        if (!m_history.isRead(alarm))
            m_marks.insert(alarm.alid);
    }
}

void AlarmModel::clearMarks() {
    m_marks.clear();
}

bool AlarmModel::isMarked(const QModelIndex &index) const {
    const AlarmRecord &alarm = alarmOf(index);
    return m_marks.contains(alarm.alid) || !m_history.isRead(alarm);
}

int AlarmModel::rowCount(const QModelIndex &parent) const {
    return parent.isValid() ? 0 : static_cast<int>(m_alarms.size());
}

QVariant AlarmModel::data(const QModelIndex &index, int role) const {
    if (!index.isValid())
        return {};
    const AlarmRecord &alarm = alarmOf(index);
    switch (role) {
    case Qt::DisplayRole:
        return alarm.text();
    case Qt::ToolTipRole:
        return PlainText::toolTip(alarm.text() + QLatin1Char('\n') + TaskTexts::zonedTime(alarm.createdAt));
    case Qt::AccessibleTextRole:
        return TaskTexts::spoken({isMarked(index) ? tr("Unread") : QString(), alarm.text(), alarm.deviceIp,
                                  TaskTexts::shortTime(alarm.createdAt)});
    default:
        return {};
    }
}
