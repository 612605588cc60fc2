#pragma once

#include "tasks/notify/taskannouncer.h"
#include "tasks/service/taskfilter.h"

#include <QTime>
#include <QWidget>

class ListActions;
class PanelPage;
class QAction;
class QLabel;
class QLineEdit;
class QToolButton;
class QTreeView;
class TaskModel;

/// The tasks of the service: what they do, on which devices, how far they are and what went wrong.
class TaskPanel : public QWidget {
    Q_OBJECT

public:
    explicit TaskPanel(QWidget *parent = nullptr);
    ~TaskPanel() override;

private:
    QWidget *buildFilterRow();
    QToolButton *addFilterButton(QWidget *row, const char *name, const QString &text, TaskFilter::Kind kind);
    void buildTree();
    QWidget *buildActionBar();
    QAction *addAction(const char *name, const QString &text, void (TaskPanel::*slot)());
    QToolButton *makeButton(QAction *action, const QString &name);
    void connectParts();

    void onTaskListUpdated();
    void onTaskListFailed();
    void onCleared();

    void filterTasks();
    void showTasks(const std::vector<TaskRecordPtr> &tasks);
    void showPage();
    void showActions();
    void showHint(const QString &text, const char *role = "quiet");

    void copySelected();
    void cancelSelected();
    void retrySelected();
    void removeSelected();
    void removeFinished();

    std::vector<TaskRecordPtr> selectedTasks() const;

    TaskModel *m_model;
    ListActions *m_actions;
    PanelPage *m_page;
    QTreeView *m_tree;
    QLineEdit *m_search;
    QLabel *m_hint;
    QToolButton *m_removeFinished = nullptr;
    QAction *m_copy = nullptr;
    QAction *m_cancel = nullptr;
    QAction *m_retry = nullptr;
    QAction *m_remove = nullptr;
    TaskFilter m_filter;
    TaskAnnouncer m_announcer;
    QTime m_staleSince; ///< when the list could not be read any more; null while it can
    bool m_searching = false;
};
