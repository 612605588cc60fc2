#include "tasks/service/taskstate.h"

#include "widgets/style/icons.h"

#include <QCoreApplication>

#include <algorithm>
#include <array>

namespace TaskState {

namespace {

struct Entry {
    const char *code;
    const char *text;
    Kind kind;
};

constexpr const char *context = "TaskState";

/// Codes that are compared as a whole.
constexpr Entry exactCodes[] = {
    {"pTaskInitState", QT_TRANSLATE_NOOP("TaskState", "Requesting"), Kind::Notice},
    {"pTaskQueueState", QT_TRANSLATE_NOOP("TaskState", "Queuing"), Kind::Time},
    {"pTaskProcessing", QT_TRANSLATE_NOOP("TaskState", "Processing"), Kind::Running},
    {"pTaskChecking", QT_TRANSLATE_NOOP("TaskState", "Processing"), Kind::Running},
    {"pTaskFileIsUploading", QT_TRANSLATE_NOOP("TaskState", "(1/3) File is uploading..."), Kind::Running},
    {"pTaskDeviceIsUpdating", QT_TRANSLATE_NOOP("TaskState", "(2/3) Device is updating..."), Kind::Running},
    {"pTaskDeviceIsReconnecting", QT_TRANSLATE_NOOP("TaskState", "(3/3) Device is reconnecting..."),
     Kind::Running},
    {"pTaskScheduled", QT_TRANSLATE_NOOP("TaskState", "Scheduled"), Kind::Calendar},
    {"pTaskDone", QT_TRANSLATE_NOOP("TaskState", "Applied successfully"), Kind::Success},
    {"pTaskDonePending", QT_TRANSLATE_NOOP("TaskState", "Applied successfully"), Kind::Success},
    {"pTaskUploadDone", QT_TRANSLATE_NOOP("TaskState", "Uploaded successfully"), Kind::Success},
    {"pTaskFailed", QT_TRANSLATE_NOOP("TaskState", "Failed"), Kind::Warning},
    {"pTaskMismatchingStatus", QT_TRANSLATE_NOOP("TaskState", "Mismatching status"), Kind::Warning},
    {"pTaskUnsupportedMethod", QT_TRANSLATE_NOOP("TaskState", "Unsupported method"), Kind::Warning},
    {"pTaskMismatchingPrivateKeyAndCertificate",
     QT_TRANSLATE_NOOP("TaskState", "Mismatching private key and certificate"), Kind::Warning},
    {"pTaskInvalidFileOrPublicKey", QT_TRANSLATE_NOOP("TaskState", "Invalid file or public key"),
     Kind::Warning},
    {"pTaskCertificateNotInstalled", QT_TRANSLATE_NOOP("TaskState", "Certificate not installed"),
     Kind::Notice},
    {"pTaskNotInstalled", QT_TRANSLATE_NOOP("TaskState", "Not installed"), Kind::Warning},
    {"pTaskDeviceResponseTimeout", QT_TRANSLATE_NOOP("TaskState", "Device response timeout"), Kind::Warning},
    {"pTaskDeviceResponseTimeoutEx",
     QT_TRANSLATE_NOOP("TaskState",
                       "Device response timeout. Contact Norvell technical support for further assistant."),
     Kind::Warning},
    {"pTaskFailedToConnectToDevice", QT_TRANSLATE_NOOP("TaskState", "Failed to connect to device"),
     Kind::Warning},
    {"pTaskFailedToConnectToDeviceEx",
     QT_TRANSLATE_NOOP("TaskState",
                       "Failed to connect to device. Check device status and connection, then retry."),
     Kind::Warning},
    {"pTaskFailedToSetPassword", QT_TRANSLATE_NOOP("TaskState", "Failed to set password to device"),
     Kind::Notice},
    {"pTaskInvalidFileForThisModelGroup", QT_TRANSLATE_NOOP("TaskState", "Invalid file for this model group"),
     Kind::Warning},
    {"pTaskIncompatibleFirmware",
     QT_TRANSLATE_NOOP(
         "TaskState",
         "Failed to upload: Incompatible Firmware. Check the firmware release notes for compatibility."),
     Kind::Warning},
    {"pTaskNoSdCardDetected",
     QT_TRANSLATE_NOOP("TaskState",
                       "Failed to upload: No SD card detected. Check SD card status, then retry."),
     Kind::Warning},
};

/// Codes that end in the three characters of a slot, and the sentence that follows these.
constexpr Entry slotCodes[] = {
    {"pTaskSdCardError", QT_TRANSLATE_NOOP("TaskState", " SD card error. Check SD card status, then retry."),
     Kind::Warning},
    {"pTaskMaxPackageUploadLimit",
     QT_TRANSLATE_NOOP("TaskState",
                       " Reached maximum package upload limit. Check package status, then retry."),
     Kind::Warning},
    {"pTaskInsufficientStorage",
     QT_TRANSLATE_NOOP("TaskState", " Insufficient storage. Check storage status, then retry."),
     Kind::Warning},
    {"pTaskBrokenFile",
     QT_TRANSLATE_NOOP("TaskState", " Broken or invalid file. Select valid file, then retry."),
     Kind::Warning},
    {"pInternalProcessError",
     QT_TRANSLATE_NOOP("TaskState",
                       " Internal process error.Contact Norvell technical support for further assistant."),
     Kind::Warning},
};

constexpr const char *uploadPrefix = QT_TRANSLATE_NOOP("TaskState", "Failed to upload: ");
constexpr int slotLength = 3;

const Entry *findExact(const QString &code) {
    // Thousands of codes are looked up in a row, most of them one of these few.
    static const auto index = [] {
        QHash<QString, const Entry *> entries;
        for (const Entry &entry : exactCodes)
            entries.insert(QLatin1String(entry.code), &entry);
        return entries;
    }();
    return index.value(code);
}

const Entry *findSlot(const QString &code) {
    const auto entry = std::find_if(std::begin(slotCodes), std::end(slotCodes), [&](const Entry &each) {
        return code.contains(QLatin1String(each.code));
    });
    return entry == std::end(slotCodes) ? nullptr : entry;
}

const Entry *find(const QString &code) {
    const Entry *exact = findExact(code);
    return exact ? exact : findSlot(code);
}

std::array<QIcon, 6> loadIcons() {
    std::array<QIcon, 6> icons;
    const char *const names[] = {"icon_general_notice_solid",   "icon_general_time_solid",
                                 "icon_general_none_line",      "icon_general_success_solid_green",
                                 "icon_general_calendar_solid", "icon_general_hint_solid_orange"};
    for (std::size_t i = 0; i < icons.size(); ++i)
        icons[i] = Icons::plainIcon(QStringLiteral(":/images/%1.svg").arg(QLatin1String(names[i])), {9, 9});
    return icons;
}

} // namespace

QString text(const QString &code) {
    if (const Entry *entry = findExact(code))
        return QCoreApplication::translate(context, entry->text);
    if (const Entry *entry = findSlot(code))
        return QCoreApplication::translate(context, uploadPrefix) + code.right(slotLength) +
               QCoreApplication::translate(context, entry->text);
    // The service may say more than this client knows, and a translation may know it.
    return QCoreApplication::translate(context, code.toUtf8().constData());
}

QString cause(const QString &code) {
    QString words = text(code);
    if (const Entry *entry = findExact(code) ? nullptr : findSlot(code))
        words = QCoreApplication::translate(context, entry->text).trimmed();
    else if (const QString prefix = QCoreApplication::translate(context, uploadPrefix);
             words.startsWith(prefix))
        words.remove(0, prefix.size());
    const qsizetype end = words.indexOf(QLatin1Char('.'));
    return end > 0 ? words.left(end) : words;
}

Kind kind(const QString &code) {
    const Entry *entry = find(code);
    return entry ? entry->kind : Kind::Notice;
}

const QIcon &icon(Kind kind) {
    static const std::array<QIcon, 6> icons = loadIcons();
    return icons[static_cast<std::size_t>(kind)];
}

void addIcon(const QString &code, QIcon &target) {
    target.addPixmap(icon(kind(code)).pixmap(QSize(9, 9)));
}

bool isFailure(const QString &code) {
    // Two failures have the notice icon all the same.
    return kind(code) == Kind::Warning || code == QLatin1String("pTaskCertificateNotInstalled") ||
           code == QLatin1String("pTaskFailedToSetPassword");
}

bool isFinal(const QString &code) {
    return kind(code) == Kind::Success || code == aborted || isFailure(code);
}

} // namespace TaskState
