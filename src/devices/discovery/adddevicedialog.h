#pragma once

#include "devices/discovery/devicediscovery.h"
#include "devices/discovery/invaliddevicedialog.h"
#include "devices/inventory/deviceinventory.h"
#include "widgets/dialogs/framelessdialog.h"
#include "widgets/dialogs/transientmessage.h"
#include "widgets/dialogs/warningline.h"

#include <functional>
#include <memory>
#include <stop_token>

namespace CsvDevices {
struct Reading;
}
namespace Ui {
class AddDeviceDialog;
}
class DiscoveredModel;

/// Looks for devices that the service does not manage yet, and adds the chosen ones.
///
/// It searches as soon as it is shown and deletes itself when it has closed and nothing is being added any
/// more; closed earlier, it tells the outcome over its parent.
class AddDeviceDialog : public FramelessDialog {
    Q_OBJECT

public:
    /// Asks the user for a path and calls the function with it, or never.
    using AskPath = std::function<void(const std::function<void(const QString &path)> &chosen)>;

    /// managed: as for setManaged.
    explicit AddDeviceDialog(const DeviceSnapshotPtr &managed, QWidget *parent = nullptr);
    ~AddDeviceDialog() override;

    /// The devices that the service has by the latest reading; null while that is not known, and then nothing
    /// can be added: a device that is sent as a new one leaves its sites.
    void setManaged(const DeviceSnapshotPtr &managed);

    /// Replace the file dialogs.
    void setAskOpenPath(AskPath ask) { m_askOpenPath = std::move(ask); }
    void setAskSavePath(AskPath ask) { m_askSavePath = std::move(ask); }

public slots:
    void deviceAutoDiscovery();
    void onDeviceManualDiscovery(DeviceDiscovery::Method method, const QString &from, const QString &to);
    void on_addButton_clicked();

signals:
    /// The service has taken devices over: time to read the list anew.
    void devicesAdded();

protected:
    void showEvent(QShowEvent *event) override;

private:
    struct Addition;

    static Addition addTo(ServiceSession &session, const std::vector<DeviceRecordPtr> &devices);

    void connectParts();
    void onFound(const DeviceDiscovery::Search &search, const std::vector<DeviceRecordPtr> &devices);
    void openManualDialog();
    template <typename Work, typename Done>
    void runOnFile(const QString &path, Work work, Done done);
    void importCsv(const QString &path);
    void onCsvRead(const QString &name, const CsvDevices::Reading &reading);
    void saveTemplate(const QString &path);
    void onAdded(const Addition &addition);
    void onAddFailed(const QString &reason);

    /// Tells over the dialog, or over its parent once it is closed.
    void tell(const QString &message, TransientMessage::Kind kind);
    void listInvalid(const QString &message, const std::vector<InvalidDeviceDialog::Entry> &entries);
    void updateSelection();
    void updateState();
    QString waitText() const;
    void updateEmptyPage();

    std::unique_ptr<Ui::AddDeviceDialog> m_ui;
    WarningLine m_warning;
    DiscoveredModel *m_model;
    DeviceDiscovery *m_discovery;
    AskPath m_askOpenPath;
    AskPath m_askSavePath;
    DeviceSnapshotPtr m_managed;
    bool m_searched = false; ///< at least once
    bool m_adding = false;
    bool m_onFile = false;          ///< a job on a file runs
    std::stop_source m_stopReading; ///< ends it with the dialog
    QString m_failure;              ///< of the last search
    int m_knownFound = 0;           ///< devices that the last search found and the list did not take
};
