// The dialogs of uploads for fifty thousand devices: the longest time for which each step keeps the
// user-interface thread, what follows from it in the event loop included.
//   bench_dialogs [DEVICES]

#include "api/session/nettask.h"
#include "devices/operations/certificates/certificatemodel.h"
#include "devices/operations/certificates/uploadhttpsdialog.h"
#include "devices/operations/certificates/uploadieeedialog.h"
#include "devices/operations/files/exportdebuginfodialog.h"
#include "devices/operations/files/filefield.h"
#include "devices/operations/files/uploadconfigurationdialog.h"
#include "devices/operations/files/uploadpackagedialog.h"
#include "devices/operations/firmware/modelgroupmodel.h"
#include "devices/operations/firmware/uploadfirmwaredialog.h"
#include "devices/operations/quicksetup/quicksetupdialog.h"
#include "devices/operations/rollout/rolloutmgr.h"
#include "store/localstore.h"
#include "tasks/queue/uploadtaskmgr.h"
#include "widgets/style/theme.h"

#include <QApplication>
#include <QCheckBox>
#include <QComboBox>
#include <QElapsedTimer>
#include <QPointer>
#include <QPushButton>
#include <QTemporaryDir>
#include <QTimer>

#include <nlohmann/json.hpp>

#include <cstdio>
#include <ctime>
#include <functional>

namespace {

constexpr double limitMs = 16;
constexpr int models = 20;
constexpr int filesAtATime = 2000; ///< about what is read before it is shown
constexpr int quietMs = 200;
constexpr int maxStepMs = 10000;

/// What this thread has worked, in ms: other programs do not count.
double threadTime() {
    timespec time{};
    clock_gettime(CLOCK_THREAD_CPUTIME_ID, &time);
    return static_cast<double>(time.tv_sec) * 1e3 + static_cast<double>(time.tv_nsec) / 1e6;
}

/// Notes the longest event.
class TimedApplication : public QApplication {
public:
    using QApplication::QApplication;

    bool notify(QObject *receiver, QEvent *event) override {
        if (m_isBusy)
            return QApplication::notify(receiver, event);
        m_isBusy = true;
        const double begin = threadTime();
        const bool handled = QApplication::notify(receiver, event);
        m_max = std::max(m_max, threadTime() - begin);
        m_isBusy = false;
        return handled;
    }
    double takeLongest() { return std::exchange(m_max, 0); }

private:
    bool m_isBusy = false;
    double m_max = 0;
};

TimedApplication *application() {
    return static_cast<TimedApplication *>(QApplication::instance());
}

/// Lets the event loop run until what the step has begun has come to its end.
void settle(const std::function<bool()> &isOver) {
    QTimer wake;
    wake.start(quietMs / 10);
    QElapsedTimer timer;
    timer.start();
    const auto isDue = [&] { return timer.elapsed() >= quietMs && isOver(); };
    while (!isDue() && timer.elapsed() < maxStepMs)
        QApplication::processEvents(QEventLoop::WaitForMoreEvents);
}

void step(
    const char *what, const std::function<void()> &work,
    const std::function<bool()> &isOver = [] { return true; }) {
    application()->takeLongest();
    const double begin = threadTime();
    work();
    const double own = threadTime() - begin;
    settle(isOver);
    const double later = application()->takeLongest();
    std::printf("%-34s %7.1f ms   afterwards %7.1f ms   at most %.0f\n", what, own, later, limitMs);
}

OperationTargets::List makeTargets(int count) {
    OperationTargets::List targets;
    for (int i = 0; i < count; ++i) {
        char mac[24];
        std::snprintf(mac, sizeof mac, "00:1A:07:%02X:%02X:%02X", (i >> 16) & 255, (i >> 8) & 255, i & 255);
        const JSON record = {{"id", "DV" + std::to_string(100000000000 + i)},
                             {"d_mac", mac},
                             {"d_ip", "10.0." + std::to_string(i >> 8) + '.' + std::to_string(i & 255)},
                             {"d_model", "NC-" + std::to_string(4000 + i % models)},
                             {"d_hostname", "gate-" + std::to_string(i)},
                             {"d_svrtype", "Camera"},
                             {"d_fw", "2.4." + std::to_string(i % 3)},
                             {"d_http", 80},
                             {"d_https", 443}};
        // Every tenth one is warned of, as in a network that lives.
        targets.push_back({DeviceRecords::parse(record),
                           i % 10 ? DeviceStatusCode::Authorized : DeviceStatusCode::Unreachable,
                           i % 50 ? QString() : QStringLiteral("Restart")});
    }
    return targets;
}

template <typename Dialog, typename... Arguments>
Dialog *openTimed(const char *what, Arguments... arguments) {
    Dialog *dialog = nullptr;
    step(what, [&] {
        dialog = new Dialog(arguments...);
        dialog->open();
    });
    return dialog;
}

template <typename Widget>
Widget *part(QWidget *dialog, const char *name) {
    return dialog->findChild<Widget *>(QLatin1String(name));
}

bool isAllAccepted = true;

void acceptTimed(const char *what, QDialog *dialog, const char *button) {
    const QPointer<QDialog> open(dialog);
    step(
        what, [&] { part<QPushButton>(dialog, button)->click(); }, [&] { return !open; });
    isAllAccepted = isAllAccepted && !open;
}

void choose(const char *what, QWidget *dialog, const QString &path) {
    auto *field = dialog->findChild<FileField *>();
    step(
        what, [&] { field->setPath(path); }, [&] { return !field->isChecking(); });
}

void measureSmall(const OperationTargets::List &targets, const QTemporaryDir &folder, const QString &file) {
    auto *package = openTimed<UploadPackageDialog>("package: open", targets);
    step("package: memory card", [&] { part<QCheckBox>(package, "sdCardCheckBox")->click(); });
    choose("package: file", package, file);
    acceptTimed("package: upload", package, "uploadButton");
    auto *configuration = openTimed<UploadConfigurationDialog>("configuration: open", targets);
    choose("configuration: file", configuration, file);
    acceptTimed("configuration: upload", configuration, "uploadButton");
    auto *debug = openTimed<ExportDebugInfoDialog>("debug information: open", targets);
    choose("debug information: folder", debug, folder.path());
    acceptTimed("debug information: export", debug, "exportButton");
    auto *setup = openTimed<QuickSetupDialog>("quick setup: open", targets);
    step("quick setup: tick", [&] { part<QCheckBox>(setup, "audioCheckBox")->click(); });
    acceptTimed("quick setup: apply", setup, "applyButton");
}

void measureFirmware(const OperationTargets::List &targets, const QString &image) {
    auto *dialog = openTimed<UploadFirmwareDialog>("firmware: open", targets);
    choose("firmware: image", dialog, image);
    auto *groups = dialog->findChild<ModelGroupModel *>();
    for (const Qt::CheckState state : {Qt::Unchecked, Qt::Checked})
        step("firmware: a model", [&] { groups->setData(groups->index(0, 0), state, Qt::CheckStateRole); });
    auto *failed = part<QCheckBox>(dialog, "onlyFailedCheckBox");
    step("firmware: only failed", [&] { failed->click(); });
    step("firmware: all again", [&] { failed->click(); });
    acceptTimed("firmware: upload", dialog, "uploadButton");
    dialog = openTimed<UploadFirmwareDialog>("firmware: open again", targets);
    choose("firmware: image", dialog, image);
    step("firmware: in waves", [&] { part<QCheckBox>(dialog, "inWavesCheckBox")->click(); });
    acceptTimed("firmware: upload in waves", dialog, "uploadButton");
}

std::vector<CertificateModel::Files> makeCertificates(const OperationTargets::List &targets) {
    std::vector<CertificateModel::Files> portions;
    for (std::size_t i = 0; i < targets.size(); ++i) {
        if (i % filesAtATime == 0)
            portions.emplace_back();
        auto file = std::make_shared<CertificateFile>();
        file->name = targets[i].device->text(DeviceColumn::Mac) + QStringLiteral(".pem");
        file->path = QStringLiteral("/certificates/") + file->name;
        file->certificates = 1;
        file->hasKey = true;
        file->certificateMark = file->keyMark = "mark";
        file->validUntil = QDateTime::currentMSecsSinceEpoch() * 2;
        portions.back().push_back(std::move(file));
    }
    return portions;
}

template <typename Dialog>
void measureMethods(const char *name, Dialog *dialog) {
    auto *method = part<QComboBox>(dialog, "methodComboBox");
    for (int i = method->count() - 2; i < 2 * method->count() - 1; ++i)
        step(name, [&] { method->setCurrentIndex(i % method->count()); });
}

void measureCertificates(const OperationTargets::List &targets, const DeviceSnapshotPtr &devices) {
    const auto portions = makeCertificates(targets);
    auto *https = openTimed<UploadHttpsDialog>("HTTPS: open", targets, devices);
    measureMethods("HTTPS: method", https);
    https->setMethod(UploadHttpsDialog::Method::Pair);
    auto *model = https->findChild<CertificateModel *>();
    for (std::size_t i = 0; i < portions.size(); ++i) {
        if (i == 0 || i + 1 == portions.size())
            step("HTTPS: files", [&] { model->matchFiles(portions[i]); });
        else
            model->matchFiles(portions[i]);
    }
    step("HTTPS: mode", [&] { part<QComboBox>(https, "modeComboBox")->setCurrentIndex(1); });
    acceptTimed("HTTPS: apply", https, "applyButton");
    auto *ieee = openTimed<UploadIeeeDialog>("IEEE 802.1X: open", targets, devices);
    measureMethods("IEEE 802.1X: method", ieee);
    step("IEEE 802.1X: close", [&] { ieee->reject(); });
}

} // namespace

int main(int argc, char *argv[]) {
    const QTemporaryDir folder;
    qputenv("NVLDM_ROOT", folder.path().toLocal8Bit());
    TimedApplication application(argc, argv);
    QApplication::setStyle(QStringLiteral("Fusion"));
    Theme::installFonts();
    application.setStyleSheet(Theme::styleSheet());
    const QString image = folder.filePath(QStringLiteral("image.bin"));
    QFile file(image);
    if (!file.open(QIODevice::WriteOnly) || file.write("NVLFW1 NC-400 2.5.0\n") < 0)
        return 1;
    file.close();
    const OperationTargets::List targets = makeTargets(argc > 1 ? std::max(std::atoi(argv[1]), 2) : 50000);
    std::vector<DeviceRecordPtr> records;
    for (const OperationTarget &target : targets)
        records.push_back(target.device);
    const auto devices = std::make_shared<const DeviceSnapshot>(std::move(records));
    // Fonts, icons and the list of time zones are read once.
    const OperationTargets::List few = makeTargets(2);
    openTimed<UploadFirmwareDialog>("first dialog of the program", few)->reject();
    openTimed<QuickSetupDialog>("first quick setup of the program", few)->reject();
    measureSmall(targets, folder, image);
    measureFirmware(targets, image);
    measureCertificates(targets, devices);
    NetTask::waitForAll(maxStepMs);
    return isAllAccepted ? 0 : 1;
}
