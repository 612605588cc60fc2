#pragma once

#include <QFrame>

#include <vector>

class QAction;
class QMenu;
class QToolButton;

/// The tool bar of the console: one button an operation, four of them with a menu.
///
/// Buttons that do not fit stand in a menu at its end. Operations are found by object name. A button is
/// enabled by whoever carries its operation out.
class DeviceToolBar : public QFrame {
    Q_OBJECT

public:
    explicit DeviceToolBar(QWidget *parent = nullptr);

    QToolButton *button(const QString &objectName) const;

    /// Adds the operations that can be begun now to a menu.
    void addOperations(QMenu *menu) const;
    /// The entry of a button's menu that carries the name.
    QAction *entry(const QString &objectName) const;

    QSize minimumSizeHint() const override;

protected:
    void resizeEvent(QResizeEvent *event) override;

private:
    void buildMoreButton();
    void fitButtons();

    std::vector<QToolButton *> m_buttons;
    QToolButton *m_more = nullptr;
    QAction *m_certificates = nullptr;
};
