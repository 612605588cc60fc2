#include "app/program.h"

#include "api/session/nettask.h"
#include "api/transport/requestdeadline.h"
#include "app/frame/framelesswindow.h"
#include "app/frame/mainwindow.h"
#include "app/help/interfacelanguage.h"
#include "platform/files/apppaths.h"
#include "platform/log/crashreport.h"
#include "platform/log/messagelog.h"
#include "platform/system/processsetup.h"
#include "platform/system/singleinstance.h"
#include "store/lastfolder.h"
#include "store/localstore.h"
#include "store/serverkeys.h"
#include "store/storewriter.h"
#include "widgets/style/theme.h"

#include <QApplication>
#include <QDebug>
#include <QSplashScreen>

#include <cstdlib>
#include <memory>

namespace {

constexpr int runnersEndMs = 10000;

void setIdentity() {
    QCoreApplication::setOrganizationName(QStringLiteral("Norvell Inc."));
    QCoreApplication::setApplicationName(QStringLiteral("Norvell Device Manager"));
    QCoreApplication::setApplicationVersion(QStringLiteral("v" NVLDM_VERSION));
}

QIcon applicationIcon() {
    QIcon icon;
    for (const int size : {16, 32, 48, 64, 128, 256})
        icon.addFile(QStringLiteral(":/images/app_icon_%1.png").arg(size));
    return icon;
}

/// Ends the process beside threads that still hang.
[[noreturn]] void endNow(int status) {
    MessageLog::finish();
    std::_Exit(status);
}

int runWindows(QApplication &application, const std::function<void(QWidget &)> &shown) {
    const QPixmap picture(QStringLiteral(":/images/img_splash.png"));
    QSplashScreen splash(picture);
    splash.show();
    splash.showMessage(QCoreApplication::applicationName(), Qt::AlignLeft | Qt::AlignBottom, Qt::white);

    FramelessWindow frame;
    frame.show();
    if (shown)
        shown(frame);
    splash.finish(&frame);
    // Nobody sees it before the login, so the first frame does not wait for it.
    auto *content = new MainWindow(frame.contentParent());
    content->setWindowTitle(QCoreApplication::translate("main", "Norvell Device Manager"));
    frame.setContent(content);
    return application.exec();
}

} // namespace

namespace Program {

int run(int argc, char *argv[], const std::function<void(QWidget &frame)> &shown) {
    ProcessSetup::dropRelativeFolders();
    SingleInstance instance(AppPaths::instanceKey(), AppPaths::clientStoreFolder());
    if (!instance.acquire()) {
        qDebug("An instance of this application is running!");
        return 0;
    }
    // The log's place depends on the identity, and Qt logs from the application's construction on.
    setIdentity();
    MessageLog::install();
    ProcessSetup::keepMemoryPrivate();
    ProcessSetup::ignoreBrokenPipes();
    CrashReport::install(QCoreApplication::applicationName() + QLatin1Char(' ') +
                         QCoreApplication::applicationVersion());

    int status = 0;
    {
        QApplication application(argc, argv);
        QApplication::setStyle(QStringLiteral("Fusion"));
        QApplication::setPalette(Theme::palette());
        QGuiApplication::setApplicationDisplayName(QCoreApplication::applicationName());
        QApplication::setWindowIcon(applicationIcon());
        Theme::installFonts();
        LastFolder::load();
        // Read here, so that no window waits for it.
        StoreWriter::post([] { ServerKeys::instance(); });
        InterfaceLanguage language;
        language.use(CLocalStore::instance().uiLanguage());
        application.setStyleSheet(Theme::styleSheet());
        status = runWindows(application, shown);
        RequestDeadline::cutAll();
        StoreWriter::flush();
        // A name look-up cannot be interrupted; nothing is being written while one hangs.
        if (!NetTask::waitForAll(runnersEndMs))
            endNow(status);
    }
    MessageLog::finish();
    return status;
}

} // namespace Program
