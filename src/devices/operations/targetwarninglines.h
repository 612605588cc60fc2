#pragma once

#include "devices/operations/operationtargets.h"

#include <QWidget>

class CheckListModel;
class QVBoxLayout;

/// What speaks against an operation on some of the checked targets: a line each, with a way to leave those
/// targets out.
class TargetWarningLines : public QWidget {
    Q_OBJECT

public:
    /// targets: the model whose items are the targets.
    TargetWarningLines(CheckListModel *targets, QWidget *parent = nullptr);

    void setWarnings(std::vector<TargetWarning> warnings);

private:
    void showLines();
    void addLine(const TargetWarning &warning, const std::vector<int> &checked);

    CheckListModel *m_targets;
    QVBoxLayout *m_lines;
    std::vector<TargetWarning> m_warnings;
};
