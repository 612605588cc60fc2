#pragma once

#include "devices/operations/operationdialog.h"

#include <QString>

class QCheckBox;
class QComboBox;
class QDateTime;
class QGridLayout;
class QLineEdit;
class TimeSyncFields;

/// Asks for the settings that new devices mostly need. Each has a tick, and only those that are ticked
/// change.
class QuickSetupDialog : public OperationDialog {
    Q_OBJECT

public:
    explicit QuickSetupDialog(OperationTargets::List targets, QWidget *parent = nullptr);

    /// What is ticked, as a quick setup takes it. now: for devices that are set from this computer's clock.
    JSON settings(const QDateTime &now) const;

protected:
    void apply() override;
    bool isComplete() const override;

private:
    QCheckBox *addSetting(QGridLayout *grid, const char *name, const QString &text, QWidget *field);
    QWidget *buildZone();
    QComboBox *buildChoice(const char *name, const QString &caption,
                           std::initializer_list<std::pair<QString, QVariant>> entries);
    void onZoneChosen();
    void onZoneTyped();
    void propose(const DeviceRecord &device);
    void showDoubts();
    bool complain(const QString &problem);

    QComboBox *m_zoneChoice = nullptr;
    QLineEdit *m_zoneEdit = nullptr;
    TimeSyncFields *m_timeFields;
    QComboBox *m_daylightChoice;
    QComboBox *m_frequencyChoice;
    QComboBox *m_audioChoice;
    QCheckBox *m_zone = nullptr;
    QCheckBox *m_time = nullptr;
    QCheckBox *m_daylight = nullptr;
    QCheckBox *m_frequency = nullptr;
    QCheckBox *m_audio = nullptr;
};
