#pragma once

#include "devices/operations/operationtargets.h"
#include "devices/operations/uploadkind.h"

#include <QObject>

class DeviceWindow;
class QDialog;

/// Opens the dialogs of uploads for the console, and opens them again for operations whose passwords or keys
/// were not kept.
class UploadDialogs : public QObject {
    Q_OBJECT

public:
    /// The console is the dialogs' parent; it outlives this object.
    explicit UploadDialogs(DeviceWindow *console);

private:
    /// serviceType: of the task that is to be done again; empty for none.
    void open(UploadKind kind, const OperationTargets::List &targets, const QString &serviceType = {});
    QDialog *dialogFor(UploadKind kind, const OperationTargets::List &targets, const QString &serviceType);
    template <typename Dialog>
    void connectChosen(Dialog *dialog);
    void openAgain(const QString &serviceType, const QStringList &deviceIds);

    DeviceWindow *m_console;
};
