#include "tasks/panels/taskpanel.h"

#include "tasks/notify/notifier.h"
#include "tasks/panels/listactions.h"
#include "tasks/panels/panelpage.h"
#include "tasks/panels/queuebanners.h"
#include "tasks/panels/taskdelegate.h"
#include "tasks/panels/taskmodel.h"
#include "tasks/panels/tasktexts.h"
#include "tasks/service/retryregistry.h"
#include "tasks/service/taskinfopool.h"
#include "tasks/service/taskstate.h"
#include "widgets/controls/flowlayout.h"
#include "widgets/dialogs/confirmdialog.h"
#include "widgets/dialogs/transientmessage.h"
#include "widgets/style/icons.h"

#include <QAction>
#include <QButtonGroup>
#include <QClipboard>
#include <QGuiApplication>
#include <QLabel>
#include <QLineEdit>
#include <QPointer>
#include <QScrollBar>
#include <QStyle>
#include <QThreadPool>
#include <QToolButton>
#include <QTreeView>
#include <QVBoxLayout>

#include <algorithm>
#include <unordered_set>

namespace {

QStringList idsOf(const std::vector<TaskRecordPtr> &tasks, bool (*wanted)(const TaskRecord &)) {
    QStringList ids;
    for (const TaskRecordPtr &task : tasks) {
        if (wanted(*task))
            ids += task->tid;
    }
    return ids;
}

bool isFinal(const TaskRecord &task) {
    return task.isFinal();
}
bool isUnfinished(const TaskRecord &task) {
    return !task.isFinal();
}

bool hasFailures(const TaskRecord &task) {
    return task.isFinal() && std::any_of(task.devices.begin(), task.devices.end(),
                                         [&](const auto &device) { return task.hasFailedOn(device); });
}

QStringList failedDevices(const TaskRecord &task) {
    QStringList ids;
    for (const TaskDevice &device : task.devices) {
        if (task.hasFailedOn(device))
            ids += device.target->id;
    }
    return ids;
}

/// Keeps what is seen in its place while rows come and go above it.
class ScrollKeeper {
public:
    explicit ScrollKeeper(QTreeView *tree)
        : m_tree(tree),
          m_top(tree->verticalScrollBar()->value() > 0 ? tree->indexAt({0, 0}) : QModelIndex()),
          m_offset(m_top.isValid() ? tree->visualRect(m_top).top() : 0) {}

    ~ScrollKeeper() {
        // At the upper end the newest task is what one wants to see.
        if (!m_top.isValid())
            return;
        QScrollBar *bar = m_tree->verticalScrollBar();
        const int moved = m_tree->visualRect(m_top).top() - m_offset;
        bar->setValue(bar->value() + moved);
    }

private:
    QTreeView *m_tree;
    QPersistentModelIndex m_top;
    int m_offset;
};

} // namespace

TaskPanel::TaskPanel(QWidget *parent)
    : QWidget(parent),
      m_model(new TaskModel(this)),
      m_actions(new ListActions(this)),
      m_page(new PanelPage(this)),
      m_tree(new QTreeView(m_page)),
      m_search(new QLineEdit(this)),
      m_hint(new QLabel(this)) {
    setObjectName(QStringLiteral("taskPanel"));
    m_copy = addAction("copyTaskAction", tr("Copy"), &TaskPanel::copySelected);
    m_copy->setShortcut(QKeySequence::Copy);
    m_copy->setShortcutContext(Qt::WidgetShortcut);
    m_retry = addAction("retryTaskAction", tr("Retry failed"), &TaskPanel::retrySelected);
    m_cancel = addAction("cancelTaskAction", tr("Cancel task"), &TaskPanel::cancelSelected);
    m_remove = addAction("removeTaskAction", tr("Remove"), &TaskPanel::removeSelected);
    m_remove->setShortcut(QKeySequence::Delete);
    m_remove->setShortcutContext(Qt::WidgetShortcut);
    buildTree();
    auto *layout = new QVBoxLayout(this);
    layout->setContentsMargins(0, 0, 0, 0);
    layout->setSpacing(0);
    layout->addWidget(buildFilterRow());
    layout->addWidget(new QueueBanners(this));
    layout->addWidget(m_page, 1);
    layout->addWidget(buildActionBar());
    connectParts();
    showPage();
    showActions();
}

TaskPanel::~TaskPanel() = default;

QWidget *TaskPanel::buildFilterRow() {
    auto *box = new QWidget(this);
    auto *row = new QWidget(box);
    auto *rowLayout = new FlowLayout(row);
    rowLayout->setSpacing(4);
    auto *group = new QButtonGroup(this);
    group->addButton(addFilterButton(row, "taskFilterAllButton", tr("All"), TaskFilter::Kind::All));
    group->addButton(addFilterButton(row, "taskFilterActiveButton", tr("Active"), TaskFilter::Kind::Active));
    group->addButton(addFilterButton(row, "taskFilterFailedButton", tr("Failed"), TaskFilter::Kind::Failed));
    group->buttons().constFirst()->setChecked(true);
    m_removeFinished = new QToolButton(row);
    m_removeFinished->setObjectName(QStringLiteral("removeFinishedButton"));
    m_removeFinished->setProperty("role", QStringLiteral("panel"));
    m_removeFinished->setText(tr("Remove finished"));
    m_removeFinished->setToolTip(tr("Remove all finished tasks from the list"));
    rowLayout->addWidget(m_removeFinished);

    m_search->setObjectName(QStringLiteral("taskSearchEdit"));
    m_search->setPlaceholderText(tr("Search task, user, model, IP, MAC, state"));
    m_search->setClearButtonEnabled(true);
    auto *layout = new QVBoxLayout(box);
    layout->setContentsMargins(12, 10, 12, 10);
    layout->setSpacing(8);
    layout->addWidget(row);
    layout->addWidget(m_search);
    return box;
}

QToolButton *TaskPanel::addFilterButton(QWidget *row, const char *name, const QString &text,
                                        TaskFilter::Kind kind) {
    auto *button = new QToolButton(row);
    button->setObjectName(QLatin1String(name));
    button->setProperty("role", QStringLiteral("filter"));
    button->setText(text);
    button->setCheckable(true);
    button->setFocusPolicy(Qt::TabFocus);
    row->layout()->addWidget(button);
    connect(button, &QToolButton::clicked, this, [this, kind] {
        m_filter.kind = kind;
        filterTasks();
    });
    return button;
}

void TaskPanel::buildTree() {
    m_tree->setObjectName(QStringLiteral("taskTree"));
    m_tree->setAccessibleName(tr("Tasks"));
    m_tree->setModel(m_model);
    m_tree->setItemDelegate(new TaskDelegate(m_tree));
    m_tree->setHeaderHidden(true);
    m_tree->setUniformRowHeights(true);
    m_tree->setIndentation(18);
    m_tree->setSelectionMode(QAbstractItemView::ExtendedSelection);
    m_tree->setVerticalScrollMode(QAbstractItemView::ScrollPerPixel);
    m_tree->setHorizontalScrollBarPolicy(Qt::ScrollBarAlwaysOff);
    m_tree->verticalScrollBar()->setSingleStep(TaskDelegate::rowHeight / 3);
    m_tree->setMouseTracking(true);
    m_tree->setContextMenuPolicy(Qt::ActionsContextMenu);
    m_tree->addActions({m_copy, m_retry, m_cancel, m_remove});
    m_page->setView(m_tree);
}

QWidget *TaskPanel::buildActionBar() {
    auto *bar = new QFrame(this);
    bar->setObjectName(QStringLiteral("panelActionBar"));
    auto *buttons = new FlowLayout;
    buttons->setSpacing(6);
    buttons->addWidget(makeButton(m_retry, QStringLiteral("retryTaskButton")));
    buttons->addWidget(makeButton(m_cancel, QStringLiteral("cancelTaskButton")));
    buttons->addWidget(makeButton(m_remove, QStringLiteral("removeTaskButton")));
    m_hint->setObjectName(QStringLiteral("taskHintLabel"));
    m_hint->setTextFormat(Qt::PlainText);
    m_hint->setProperty("role", QStringLiteral("quiet"));
    m_hint->setWordWrap(true);
    // Two lines are always there, so that the list does not jump with every selection.
    m_hint->setMinimumHeight(2 * m_hint->fontMetrics().lineSpacing());
    m_hint->setAlignment(Qt::AlignTop);
    auto *layout = new QVBoxLayout(bar);
    layout->setContentsMargins(12, 10, 12, 8);
    layout->setSpacing(6);
    layout->addLayout(buttons);
    layout->addWidget(m_hint);
    return bar;
}

QAction *TaskPanel::addAction(const char *name, const QString &text, void (TaskPanel::*slot)()) {
    auto *action = new QAction(text, this);
    action->setObjectName(QLatin1String(name));
    connect(action, &QAction::triggered, this, slot);
    return action;
}

QToolButton *TaskPanel::makeButton(QAction *action, const QString &name) {
    auto *button = new QToolButton(this);
    button->setObjectName(name);
    button->setProperty("role", QStringLiteral("panel"));
    button->setDefaultAction(action);
    button->setFocusPolicy(Qt::TabFocus);
    return button;
}

void TaskPanel::connectParts() {
    CTaskInfoPool *pool = &CTaskInfoPool::instance();
    connect(pool, &CTaskInfoPool::taskListUpdated, this, &TaskPanel::onTaskListUpdated);
    connect(pool, &CTaskInfoPool::taskListFailed, this, &TaskPanel::onTaskListFailed);
    connect(pool, &CTaskInfoPool::cleared, this, &TaskPanel::onCleared);
    connect(m_search, &QLineEdit::textChanged, this, [this](const QString &text) {
        m_filter.search = text.trimmed();
        filterTasks();
    });
    connect(m_tree->selectionModel(), &QItemSelectionModel::selectionChanged, this, &TaskPanel::showActions);
    connect(m_removeFinished, &QToolButton::clicked, this, &TaskPanel::removeFinished);
    connect(m_actions, &ListActions::busyChanged, this, &TaskPanel::showActions);
    connect(m_actions, &ListActions::failed, this, [this](const QString &message) {
        TransientMessage::show(this, message, TransientMessage::Kind::Error);
    });
}

void TaskPanel::onTaskListUpdated() {
    m_staleSince = {};
    const TaskListPtr tasks = CTaskInfoPool::instance().taskList();
    for (const TaskAnnouncer::Announcement &each : m_announcer.follow(*tasks))
        Notifier::instance().ShowMessage(each.text, Notifier::Task, each.tid);
    RetryRegistry::instance().follow(*tasks);
    filterTasks();
}

void TaskPanel::onTaskListFailed() {
    // The time of the first failure is the age of what is shown.
    if (m_staleSince.isNull())
        m_staleSince = QTime::currentTime();
    showActions();
    showPage();
}

void TaskPanel::onCleared() {
    m_announcer.reset();
    RetryRegistry::instance().clear();
    m_staleSince = {};
    m_model->setTasks({});
    showPage();
    showActions();
}

void TaskPanel::filterTasks() {
    const TaskListPtr tasks = CTaskInfoPool::instance().taskList();
    if (m_filter.search.isEmpty())
        return showTasks(m_filter.apply(*tasks));
    // A search looks at every device of every task, a million of them perhaps.
    if (m_searching)
        return;
    m_searching = true;
    QThreadPool::globalInstance()->start([panel = QPointer(this), filter = m_filter, tasks] {
        auto found = filter.apply(*tasks);
        QMetaObject::invokeMethod(qApp, [panel, filter, tasks, found = std::move(found)] {
            if (!panel)
                return;
            panel->m_searching = false;
            if (panel->m_filter == filter && CTaskInfoPool::instance().taskList() == tasks)
                panel->showTasks(found);
            else
                panel->filterTasks();
        });
    });
}

void TaskPanel::showTasks(const std::vector<TaskRecordPtr> &tasks) {
    {
        const ScrollKeeper keeper(m_tree);
        m_model->setTasks(tasks);
    }
    showPage();
    showActions();
}

void TaskPanel::showPage() {
    const CTaskInfoPool &pool = CTaskInfoPool::instance();
    if (m_model->rowCount() > 0)
        m_page->showView();
    else if (!pool.isTaskListLoaded())
        m_page->showText(m_staleSince.isNull() ? tr("Loading tasks...")
                                               : tr("The task list could not be read."));
    else if (pool.taskList()->isEmpty())
        m_page->showText(tr("No tasks.\nWhat is done to devices shows here."));
    else
        m_page->showText(tr("No task matches the filter."));
}

std::vector<TaskRecordPtr> TaskPanel::selectedTasks() const {
    std::vector<TaskRecordPtr> tasks;
    std::unordered_set<const TaskRecord *> seen;
    for (const QModelIndex &index : m_tree->selectionModel()->selectedIndexes()) {
        TaskRecordPtr task = m_model->taskOf(index);
        if (seen.insert(task.get()).second)
            tasks.push_back(std::move(task));
    }
    return tasks;
}

void TaskPanel::showActions() {
    const std::vector<TaskRecordPtr> tasks = selectedTasks();
    const auto any = [&](auto wanted) {
        return std::any_of(tasks.begin(), tasks.end(),
                           [&](const TaskRecordPtr &task) { return wanted(*task); });
    };
    const auto repeatOf = [](const TaskRecord &task) { return RetryRegistry::instance().find(task.tid); };
    const bool failures = any(hasFailures);
    const bool repeatable = any([&](const TaskRecord &task) { return hasFailures(task) && repeatOf(task); });
    const bool asksAgain = any([&](const TaskRecord &task) {
        return hasFailures(task) && repeatOf(task) && repeatOf(task)->needsInput;
    });
    const bool idle = !m_actions->isBusy();
    m_copy->setEnabled(!tasks.empty());
    m_retry->setEnabled(repeatable);
    m_cancel->setEnabled(idle && any(isUnfinished));
    m_remove->setEnabled(idle && any(isFinal));
    const std::vector<TaskRecordPtr> &all = CTaskInfoPool::instance().taskList()->records();
    m_removeFinished->setEnabled(idle && std::any_of(all.begin(), all.end(), [](const TaskRecordPtr &task) {
                                     return isFinal(*task);
                                 }));
    if (!m_staleSince.isNull())
        showHint(tr("The tasks could not be read since %1.")
                     .arg(m_staleSince.toString(QStringLiteral("hh:mm:ss"))),
                 "warning");
    else if (failures &&
             any([](const TaskRecord &task) { return RetryRegistry::instance().isTaken(task.tid); }))
        showHint(tr("Its rollout or its repetition sees to the devices that failed."));
    else if (failures && !repeatable)
        showHint(tr("This client cannot retry the task: it was started elsewhere or before the last log-in, "
                    "so its settings are not known here."));
    else if (asksAgain)
        showHint(tr("Retrying asks for the password or key again."));
    else
        showHint(tasks.size() == 1 ? TaskTexts::origin(*tasks.front()) : QString());
}

void TaskPanel::showHint(const QString &text, const char *role) {
    m_hint->setText(text);
    if (m_hint->property("role").toString() == QLatin1String(role))
        return;
    m_hint->setProperty("role", QLatin1String(role));
    m_hint->style()->unpolish(m_hint);
    m_hint->style()->polish(m_hint);
}

void TaskPanel::copySelected() {
    QStringList lines;
    QModelIndexList selected = m_tree->selectionModel()->selectedIndexes();
    std::sort(selected.begin(), selected.end(), [this](const QModelIndex &a, const QModelIndex &b) {
        return m_tree->visualRect(a).top() < m_tree->visualRect(b).top();
    });
    for (const QModelIndex &index : selected) {
        switch (m_model->kindOf(index)) {
        case TaskModel::RowKind::Task:
            lines += TaskTexts::copyText(*m_model->taskOf(index));
            break;
        case TaskModel::RowKind::Summary:
            lines += TaskTexts::summary(*m_model->taskOf(index));
            break;
        case TaskModel::RowKind::Device:
            lines += TaskTexts::copyLine(m_model->deviceOf(index));
            break;
        }
    }
    QGuiApplication::clipboard()->setText(lines.join(QLatin1Char('\n')));
}

void TaskPanel::cancelSelected() {
    const QStringList tids = idsOf(selectedTasks(), &isUnfinished);
    auto *confirm = new ConfirmDialog(ConfirmDialog::Kind::CancelTask, this, static_cast<int>(tids.size()));
    confirm->setAttribute(Qt::WA_DeleteOnClose);
    connect(confirm, &QDialog::accepted, this, [this, tids] { m_actions->cancelTasks(tids); });
    confirm->open();
}

void TaskPanel::retrySelected() {
    for (const TaskRecordPtr &task : selectedTasks()) {
        const RetryRegistry::Repeat *repeat = RetryRegistry::instance().find(task->tid);
        // A copy: who does it again forgets the task.
        if (const auto again = repeat && hasFailures(*task) ? repeat->again : nullptr)
            again(failedDevices(*task));
    }
    showActions();
}

void TaskPanel::removeSelected() {
    m_actions->removeTasks(idsOf(selectedTasks(), &isFinal));
}

void TaskPanel::removeFinished() {
    const QStringList tids = idsOf(CTaskInfoPool::instance().taskList()->records(), &isFinal);
    auto *confirm = new ConfirmDialog(ConfirmDialog::Kind::RemoveTasks, this, static_cast<int>(tids.size()));
    confirm->setAttribute(Qt::WA_DeleteOnClose);
    connect(confirm, &QDialog::accepted, this, [this, tids] { m_actions->removeTasks(tids); });
    confirm->open();
}
