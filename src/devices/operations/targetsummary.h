#pragma once

#include "devices/operations/operationtargets.h"

#include <QWidget>

class QLabel;
class TargetModel;
class TargetWarningLines;

/// The part of a dialog that names the devices an operation is meant for: how many, a list that opens to be
/// searched and unticked, and what speaks against some of them, with a way to leave those out.
class TargetSummary : public QWidget {
    Q_OBJECT

public:
    explicit TargetSummary(QWidget *parent = nullptr);

    void setTargets(OperationTargets::List targets);
    /// Replaces what is said against targets.
    void setWarnings(std::vector<TargetWarning> warnings);

    const OperationTargets::List &targets() const;
    /// Places of the targets that are ticked.
    std::vector<int> ticked() const;
    int tickedCount() const;
    QStringList tickedIds() const;
    /// Ticks or unticks the targets at these places.
    void setTicked(const std::vector<int> &targets, bool ticked);

signals:
    /// Other devices are ticked now.
    void tickedChanged();

private:
    QWidget *buildHead();
    void openList();
    void showTicked();

    TargetModel *m_model;
    QLabel *m_count = nullptr;
    TargetWarningLines *m_warnings;
};
