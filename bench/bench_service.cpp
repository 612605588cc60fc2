// One request against a bare call of the transport, and the road from a login to a filled table.
//   bench_service PORT ACCOUNT PASSWORD

#include "api/client/apiclient.h"
#include "api/session/nettask.h"
#include "devices/page/devicewindow.h"
#include "devices/page/mainconsoletable.h"
#include "platform/crypto/ciphers.h"
#include "platform/log/messagelog.h"
#include "store/localstore.h"
#include "widgets/style/theme.h"

#include <QApplication>
#include <QElapsedTimer>
#include <QFile>

#include <httplib.h>
#include <nlohmann/json.hpp>

#include <algorithm>
#include <cstdio>

namespace {

constexpr int calls = 60;

template <typename Work>
double milliseconds(Work work) {
    QElapsedTimer timer;
    timer.start();
    work();
    return static_cast<double>(timer.nsecsElapsed()) / 1e6;
}

double middle(std::vector<double> values) {
    std::sort(values.begin(), values.end());
    return values[values.size() / 2];
}

bool bareCall(int port, const std::string &account, const std::string &token) {
    httplib::SSLClient client("127.0.0.1", port);
    client.enable_server_certificate_verification(false);
    // Without it the reference would mostly measure a delayed acknowledgement.
    client.set_tcp_nodelay(true);
    const JSON body = {{"id", account}, {"start", 0}, {"count", 1}};
    const auto result = client.Post("/v1/dev/list", {{"Authorization", token}}, body.dump(),
                                    "application/x-www-form-urlencoded");
    return result && result->status == 200 && JSON::parse(result->body).at("code") == 0;
}

bool ownCall(int port, const char *account, const QByteArray &token) {
    CApiClient client("127.0.0.1", static_cast<std::uint32_t>(port));
    client.setAccount(account);
    client.setAccessToken(token.constData());
    JSON devices;
    return client.listDevices(0, 1, devices) == ApiOk;
}

int measureRequests(int port, const char *account, const std::string &rawToken) {
    std::vector<double> bare;
    std::vector<double> own;
    bool ok = true;
    const QByteArray token = CLocalStore::instance().access();
    for (int i = 0; i < calls; ++i) {
        bare.push_back(milliseconds([&] { ok &= bareCall(port, account, rawToken); }));
        own.push_back(milliseconds([&] { ok &= ownCall(port, account, token); }));
    }
    std::printf("%-32s %9.2f ms   %-24s %9.2f ms   ratio %6.2f   at most 1.3\n", "one request", middle(own),
                "bare transport call", middle(bare), middle(own) / middle(bare));
    return ok ? 0 : 1;
}

double residentMegabytes() {
    QFile file(QStringLiteral("/proc/self/statm"));
    if (!file.open(QIODevice::ReadOnly))
        return 0;
    return file.readAll().split(' ').value(1).toDouble() * 4096 / 1e6;
}

/// From the login's request to the last item of the camera table.
void measureLogin(int port, const char *account, const char *password) {
    const double before = residentMegabytes();
    DeviceWindow window;
    window.resize(1280, 720);
    window.show();
    QApplication::processEvents();
    const auto *table = window.findChild<MainConsoleTable *>(QStringLiteral("cameraTable"));
    double maxTurn = 0;
    const double time = milliseconds([&] {
        CApiClient client("127.0.0.1", static_cast<std::uint32_t>(port));
        client.loginServer(account, password);
        CLocalStore::instance().setLoginInfo(QStringLiteral("127.0.0.1"), static_cast<quint32>(port),
                                             QString::fromUtf8(account), CLocalStore::instance().access());
        window.startWork();
        while (table->rowCount() == 0 || !table->item(0, 0)) {
            maxTurn = std::max(maxTurn, milliseconds([] { QApplication::processEvents(); }));
            QThread::usleep(100);
        }
    });
    std::printf("%-32s %9.2f ms   of the event loop meanwhile\n", "longest turn", maxTurn);
    std::printf("%-32s %9.2f ms   %d cameras in the table; resident %.0f MB (%.0f MB before)\n",
                "login to filled table", time, table->rowCount(), residentMegabytes(), before);
    window.stopWork();
}

void silence(QtMsgType, const QMessageLogContext &, const QString &) {}

} // namespace

int main(int argc, char *argv[]) {
    if (argc != 4) {
        std::fprintf(stderr, "bench_service PORT ACCOUNT PASSWORD\n");
        return 2;
    }
    // Both sides of the first comparison do without the log; the second one has it, as users do.
    qInstallMessageHandler(silence);
    QApplication application(argc, argv);
    Theme::installFonts();
    application.setStyleSheet(Theme::styleSheet());
    const int port = std::atoi(argv[1]);
    CApiClient client("127.0.0.1", static_cast<std::uint32_t>(port));
    if (client.loginServer(argv[2], argv[3]) != ApiOk) {
        std::fprintf(stderr, "login failed\n");
        return 1;
    }
    if (measureRequests(port, argv[2], client.accessToken()) != 0)
        return 1;
    MessageLog::install();
    std::fflush(stdout);
    // The log's copy on standard output does not belong into the table.
    measureLogin(port, argv[2], argv[3]);
    NetTask::waitForAll(10000);
}
