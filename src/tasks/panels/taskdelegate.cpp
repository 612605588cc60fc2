#include "tasks/panels/taskdelegate.h"

#include "tasks/panels/taskmodel.h"
#include "tasks/panels/tasktexts.h"
#include "tasks/service/taskstate.h"
#include "tasks/service/tasktype.h"
#include "widgets/lists/rowpainter.h"
#include "widgets/style/theme.h"

#include <QPainter>

namespace {

constexpr int padding = 12;
constexpr int lineHeight = 18;
constexpr int barHeight = 3;
constexpr int iconSize = 9;

QColor colourOf(TaskState::Kind kind) {
    switch (kind) {
    case TaskState::Kind::Success:
        return Theme::success;
    case TaskState::Kind::Warning:
        return Theme::warning;
    default:
        return Theme::textDim;
    }
}

QRect line(const QRect &place, int number) {
    return {place.left(), place.top() + 7 + number * lineHeight, place.width(), lineHeight};
}

/// The icon of a state and a text in its colour.
void paintState(QPainter *painter, const QRect &place, const QFont &font, const QString &code,
                const QString &text) {
    const TaskState::Kind kind = TaskState::kind(code);
    TaskState::icon(kind).paint(painter,
                                QRect(place.left(), place.center().y() - iconSize / 2, iconSize, iconSize));
    RowPainter::paintText(painter, place.adjusted(iconSize + 6, 0, 0, 0), font, colourOf(kind), text);
}

void paintBar(QPainter *painter, const QRect &place, int percent) {
    painter->fillRect(place, Theme::line);
    painter->fillRect(QRect(place.topLeft(), QSize(place.width() * percent / 100, place.height())),
                      Theme::accent);
}

} // namespace

QSize TaskDelegate::sizeHint(const QStyleOptionViewItem &, const QModelIndex &) const {
    return {0, rowHeight};
}

void TaskDelegate::paint(QPainter *painter, const QStyleOptionViewItem &option,
                         const QModelIndex &index) const {
    const auto &model = static_cast<const TaskModel &>(*index.model());
    const TaskRecordPtr task = model.taskOf(index);
    painter->save();
    RowPainter::paintBackground(painter, option);
    const QRect place = option.rect.adjusted(4, 0, -padding, -1);
    switch (model.kindOf(index)) {
    case TaskModel::RowKind::Task:
        paintTask(painter, place, option.font, *task);
        break;
    case TaskModel::RowKind::Summary:
        paintSummary(painter, place, option.font, *task);
        break;
    case TaskModel::RowKind::Device:
        paintDevice(painter, place, option.font, model.deviceOf(index));
        break;
    }
    painter->restore();
}

void TaskDelegate::paintTask(QPainter *painter, QRect place, const QFont &font,
                             const TaskRecord &task) const {
    const QFont small = RowPainter::smaller(font);
    const QRect first = line(place, 0);
    const QRect rest =
        RowPainter::paintRight(painter, first, small, Theme::textQuiet, TaskTexts::shortTime(task.createdAt));
    RowPainter::paintText(painter, rest, RowPainter::bold(font), Theme::text, TaskType::title(task.type));

    paintState(painter, line(place, 1), small, task.state, TaskTexts::standing(task));
    if (!task.user.isEmpty())
        RowPainter::paintText(painter, line(place, 2), small, Theme::textQuiet, task.user);
    if (TaskTexts::showsProgress(task))
        paintBar(painter, QRect(place.left(), place.bottom() - 5, place.width(), barHeight), task.progress);
}

void TaskDelegate::paintSummary(QPainter *painter, QRect place, const QFont &font,
                                const TaskRecord &task) const {
    painter->setFont(RowPainter::smaller(font));
    painter->setPen(task.failedDevices > 0 ? Theme::warning : Theme::textDim);
    painter->drawText(place.adjusted(0, 4, 0, -4), Qt::AlignVCenter | Qt::TextWordWrap,
                      TaskTexts::summary(task).left(300));
}

void TaskDelegate::paintDevice(QPainter *painter, QRect place, const QFont &font,
                               const TaskDevice &device) const {
    const QFont small = RowPainter::smaller(font);
    const QRect first = line(place, 0).translated(0, lineHeight / 2);
    const bool final = TaskState::isFinal(device.state);
    QRect rest = final ? first
                       : RowPainter::paintRight(painter, first, small, Theme::textQuiet,
                                                TaskTexts::percent(device.progress));
    RowPainter::paintText(painter, rest, small, Theme::textStrong, TaskTexts::target(*device.target));
    paintState(painter, first.translated(0, lineHeight), small, device.state, TaskState::text(device.state));
    if (!final)
        paintBar(painter, QRect(place.left(), place.bottom() - 5, place.width(), barHeight), device.progress);
}
