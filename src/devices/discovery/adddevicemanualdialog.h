#pragma once

#include "devices/discovery/devicediscovery.h"
#include "widgets/dialogs/framelessdialog.h"
#include "widgets/dialogs/warningline.h"

#include <memory>
#include <optional>

namespace Ui {
class AddDeviceManualDialog;
}

/// Asks where a device is to be looked for: at one address, or in a range of them.
class AddDeviceManualDialog : public FramelessDialog {
    Q_OBJECT

public:
    static constexpr qint64 maxRangeSize = 65536;

    explicit AddDeviceManualDialog(QWidget *parent = nullptr);
    ~AddDeviceManualDialog() override;

    /// How many addresses a range has, the ends included; 0 or less for one that ends before it begins,
    /// nothing where one of the ends is no address.
    static std::optional<qint64> rangeSize(const QString &from, const QString &to);

signals:
    /// from: the address, with its port behind a colon if one was given, or the first one of a range. to: the
    /// last one of a range.
    void discoveryRequested(DeviceDiscovery::Method method, const QString &from, const QString &to);

private:
    void onAdd();
    void addAddress();
    void addRange();
    void onTextChanged();
    bool isRangeShown() const;
    /// What is wrong with the fields that are filled.
    QString complaint() const;

    std::unique_ptr<Ui::AddDeviceManualDialog> m_ui;
    WarningLine m_warning;
};
