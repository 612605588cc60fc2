#include "tasks/panels/alarmdelegate.h"

#include "tasks/panels/alarmmodel.h"
#include "tasks/panels/tasktexts.h"
#include "tasks/service/taskstate.h"
#include "widgets/lists/rowpainter.h"
#include "widgets/style/theme.h"

#include <QPainter>

namespace {

constexpr int lineHeight = 20;
constexpr int padding = 12;
constexpr int iconSize = 9;
constexpr int markSize = 6;

TaskState::Kind kindOf(int description) {
    switch (description) {
    case AlarmRecord::ConnectionLost:
    case AlarmRecord::MemoryCardError:
    case AlarmRecord::AuthorizationLost:
        return TaskState::Kind::Warning;
    case AlarmRecord::ConnectionRestored:
    case AlarmRecord::ServerStarted:
        return TaskState::Kind::Success;
    default:
        return TaskState::Kind::Notice;
    }
}

void paintUnreadMark(QPainter *painter, const QRect &line) {
    painter->setRenderHint(QPainter::Antialiasing);
    painter->setPen(Qt::NoPen);
    painter->setBrush(Theme::accent);
    painter->drawEllipse(line.left() - markSize - 3, line.center().y() - markSize / 2, markSize, markSize);
}

} // namespace

QSize AlarmDelegate::sizeHint(const QStyleOptionViewItem &, const QModelIndex &) const {
    return {0, rowHeight};
}

void AlarmDelegate::paint(QPainter *painter, const QStyleOptionViewItem &option,
                          const QModelIndex &index) const {
    const auto &model = static_cast<const AlarmModel &>(*index.model());
    const AlarmRecord &alarm = model.alarmOf(index);
    const bool unread = model.isMarked(index);
    painter->save();
    RowPainter::paintBackground(painter, option);
    const QRect place = option.rect.adjusted(padding, 6, -padding, 0);
    QRect first(place.left(), place.top(), place.width(), lineHeight);
    if (unread)
        paintUnreadMark(painter, first);
    const QFont small = RowPainter::smaller(option.font);
    TaskState::icon(kindOf(alarm.description))
        .paint(painter, QRect(first.left(), first.center().y() - iconSize / 2, iconSize, iconSize));
    first.setLeft(first.left() + iconSize + 6);
    const QRect rest = RowPainter::paintRight(painter, first, small, Theme::textQuiet,
                                              TaskTexts::shortTime(alarm.createdAt));
    RowPainter::paintText(painter, rest, unread ? RowPainter::bold(option.font) : option.font,
                          unread ? Theme::text : Theme::textDim, alarm.text());
    RowPainter::paintText(painter, first.translated(0, lineHeight), small, Theme::textQuiet, alarm.deviceIp);
    painter->restore();
}
