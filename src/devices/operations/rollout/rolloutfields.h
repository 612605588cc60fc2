#pragma once

#include <QWidget>

class QCheckBox;
class QComboBox;
class QSpinBox;

/// Asks whether an upload is to go out in waves, how large the first one is, how long to wait after it, and
/// how much of it may fail.
class RolloutFields : public QWidget {
    Q_OBJECT

public:
    explicit RolloutFields(QWidget *parent = nullptr);

    /// Tells how many devices there are: one alone has no waves.
    void setDeviceCount(int count);

    bool isInWaves() const;
    /// At least one, and less than all of the devices.
    int firstCount() const;
    int waitMinutes() const;
    int maxFailedPercent() const;

signals:
    void changed();

private:
    QWidget *buildDetails();
    QSpinBox *addSpinBox(const char *name, const QString &accessibleName, int least, int most, int value);
    void onUnitChanged();
    void updateEnabled();

    int m_deviceCount = 0;
    QCheckBox *m_inWaves;
    QWidget *m_details;
    QSpinBox *m_first;
    QComboBox *m_unit;
    QSpinBox *m_wait;
    QSpinBox *m_failed;
};
