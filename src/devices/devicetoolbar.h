#pragma once

#include <QFrame>

class QToolButton;

/// The tool bar of the console: one button an operation, four of them with a menu.
///
/// Operations are found by object name. A button is enabled by whoever carries its operation out.
class DeviceToolBar : public QFrame {
    Q_OBJECT

public:
    explicit DeviceToolBar(QWidget *parent = nullptr);

    QToolButton *button(const QString &objectName) const;
};
