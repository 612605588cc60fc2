#pragma once

#include "devices/operations/operation.h"

#include <QFrame>
#include <QList>

#include <vector>

class QAction;
class QMenu;
class QToolButton;

/// The tool bar of the console: the buttons and menus of the operations, and their part of the row menu.
///
/// Buttons that do not fit move to a menu at its end.
class DeviceToolBar : public QFrame {
    Q_OBJECT

public:
    explicit DeviceToolBar(QWidget *parent = nullptr);

    QToolButton *button(const QString &objectName) const;

    /// Adds the operations that can be begun now to a menu.
    void addOperations(QMenu *menu) const;
    /// Enables or disables the operations that need this.
    void setFulfilled(Operation::Needs needs, bool fulfilled);

    QSize minimumSizeHint() const override;

signals:
    void operationChosen(const Operation &operation);
    void fulfilledChanged(Operation::Needs needs, bool fulfilled);

protected:
    void resizeEvent(QResizeEvent *event) override;

private:
    struct Button {
        const Operation *operation;
        QToolButton *button;
    };

    bool beginsGroup(const Operation *operation) const;
    QToolButton *addButton(const Operation &operation);
    QMenu *buildMenu(Operation::Group group, QWidget *parent);
    QAction *makeAction(const Operation &operation, QObject *parent);
    template <typename Trigger>
    void setUp(Trigger *trigger, const Operation &operation);
    void buildMoreButton();
    void fitButtons();

    std::vector<Button> m_buttons;
    QList<QAction *> m_rowActions;
    QToolButton *m_more = nullptr;
};
