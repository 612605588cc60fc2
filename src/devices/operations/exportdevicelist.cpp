#include "devices/operations/deviceactions.h"
#include "devices/operations/operations.h"
#include "store/lastfolder.h"
#include "widgets/dialogs/filedialogs.h"

namespace {

QDialog *openExportDeviceList(OperationContext &context, OperationRequest) {
    const QString suggestion = LastFolder::file(Operation::tr("Device List") + QStringLiteral(".csv"));
    FileDialogs::askSavePath(
        context.dialogParent(), Operation::tr("Save as"), suggestion, Operation::tr("CSV files (*.csv)"),
        QStringLiteral("csv"), [&context](const QString &path) {
            LastFolder::rememberFile(path);
            context.actions()->exportList(path, context.devices(), context.shownDevices());
        });
    return nullptr;
}

} // namespace

const Operation Operations::exportDeviceList{.objectName = "exportDeviceListAction",
                                             .text = QT_TRANSLATE_NOOP("Operation", "Export Device List"),
                                             .group = Operation::Group::ExportMenu,
                                             .needs = Operation::Needs::Session,
                                             .helpPage = "exporting.html",
                                             .open = openExportDeviceList};
