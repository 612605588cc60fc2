// An upload of 256 MiB by the client against the same upload by curl: how fast, and with how much memory.
//   bench_uploads PORT ACCOUNT PASSWORD FOLDER
// Each upload is a process of its own; the client's is this program again:
//   bench_uploads --send PORT ACCOUNT TASK FILE, the token on standard input

#include "api/client/apiclient.h"
#include "platform/crypto/ciphers.h"

#include <QCoreApplication>
#include <QElapsedTimer>
#include <QFile>
#include <QProcess>
#include <QRandomGenerator>

#include <nlohmann/json.hpp>

#include <algorithm>
#include <array>
#include <cstdio>
#include <vector>

namespace {

constexpr int uploads = 5;
constexpr int mebibytes = 256;

struct Figures {
    double megabytesPerSecond = 0;
    double peakMegabytes = 0;
};

void silence(QtMsgType type, const QMessageLogContext &, const QString &text) {
    if (type == QtFatalMsg)
        std::fprintf(stderr, "%s\n", qPrintable(text));
}

void makeImage(const QString &path) {
    QFile file(path);
    std::array<quint32, (1 << 20) / sizeof(quint32)> block{};
    bool written = file.open(QIODevice::WriteOnly);
    for (int i = 0; i < mebibytes && written; ++i) {
        QRandomGenerator(static_cast<quint32>(i)).fillRange(block.data(), qsizetype(block.size()));
        written = file.write(reinterpret_cast<const char *>(block.data()), 1 << 20) == 1 << 20;
    }
    if (!written)
        qFatal("no image at %s", qPrintable(path));
}

/// What the kernel has noted as the most that the process held in memory.
double peakOf(qint64 process) {
    QFile status(QStringLiteral("/proc/%1/status").arg(process));
    if (!status.open(QIODevice::ReadOnly))
        return 0;
    const QByteArray text = status.readAll();
    const qsizetype at = text.indexOf("VmHWM:");
    return at < 0 ? 0 : text.mid(at + 6, 12).simplified().split(' ').first().toDouble() * 1024 / 1e6;
}

Figures run(const QString &program, const QStringList &arguments, const QByteArray &input,
            const QByteArray &success) {
    Figures figures;
    QProcess process;
    QElapsedTimer timer;
    timer.start();
    process.start(program, arguments);
    process.write(input);
    process.closeWriteChannel();
    const qint64 id = process.waitForStarted() ? process.processId() : 0;
    while (process.state() != QProcess::NotRunning && !process.waitForFinished(2))
        figures.peakMegabytes = std::max(figures.peakMegabytes, peakOf(id));
    figures.megabytesPerSecond = mebibytes * 1.048576 / (static_cast<double>(timer.nsecsElapsed()) / 1e9);
    const QByteArray output = process.readAllStandardOutput();
    if (!output.contains(success))
        qFatal("%s has not uploaded: %s", qPrintable(program), output.constData());
    return figures;
}

/// Session and task of each upload; the latest token is the one to use.
class Service {
public:
    Service(const char *port, const char *account, const char *password) : m_port(port), m_account(account) {
        CApiClient client("127.0.0.1", m_port.toUInt());
        if (client.loginServer(account, password) != ApiOk)
            qFatal("login failed");
        take(client);
    }

    Figures byClient(const QString &file) {
        const QString task = newTask();
        return run(QCoreApplication::applicationFilePath(), {"--send", m_port, m_account, task, file},
                   m_token.toUtf8(), "result 0");
    }

    Figures byCurl(const QString &file) {
        const JSON parameters = {{"id", m_account.toStdString()}, {"tid", newTask().toStdString()}};
        // Quoted, so that curl takes separators in it as they are.
        QString text = QString::fromStdString(parameters.dump());
        text.replace('"', "\\\"");
        return run("curl",
                   {"-sk", "-H", "@-", "-F", "text=\"" + text + "\";filename=data", "-F", "fimage=@" + file,
                    "https://127.0.0.1:" + m_port + "/v1/fwupl"},
                   "Authorization: " + m_token.toUtf8(), "\"code\":0");
    }

private:
    void take(const CApiClient &client) { m_token = QString::fromStdString(client.accessToken()); }

    QString newTask() {
        CApiClient client("127.0.0.1", m_port.toUInt());
        client.setAccount(m_account.toUtf8().constData());
        client.setAccessToken(Ciphers::sealSecret(m_token.toStdString()).value_or("").c_str());
        JSON devices;
        JSON task;
        if (client.listDevices(0, 1, devices) != ApiOk || devices.empty())
            qFatal("no device");
        const JSON device = {
            {"id", devices[0].at("id")}, {"fwid", "bench"}, {"mode", "upgrade"}, {"actm", ""}};
        if (client.newTaskState("deviceFWUpgrade", JSON::array({device}), task) != ApiOk)
            qFatal("no task");
        take(client);
        return QString::fromStdString(task.at("tid").get<std::string>());
    }

    QString m_port;
    QString m_account;
    QString m_token;
};

Figures middle(std::vector<Figures> all) {
    const auto half = all.begin() + static_cast<std::ptrdiff_t>(all.size() / 2);
    std::nth_element(all.begin(), half, all.end(), [](const Figures &one, const Figures &other) {
        return one.megabytesPerSecond < other.megabytesPerSecond;
    });
    return *half;
}

int measure(Service service, const QString &file) {
    makeImage(file);
    std::vector<Figures> own;
    std::vector<Figures> reference;
    for (int i = 0; i < uploads; ++i) {
        own.push_back(service.byClient(file));
        reference.push_back(service.byCurl(file));
    }
    const Figures client = middle(own);
    const Figures curl = middle(reference);
    std::printf("%-32s %9.0f MB/s %-24s %9.0f MB/s ratio %6.2f   at least 0.8\n", "upload of 256 MiB",
                client.megabytesPerSecond, "curl", curl.megabytesPerSecond,
                client.megabytesPerSecond / curl.megabytesPerSecond);
    std::printf("%-32s %9.1f MB   %-24s %9.1f MB\n", "peak memory of the process", client.peakMegabytes,
                "curl", curl.peakMegabytes);
    return 0;
}

int send(char *argv[]) {
    QFile input;
    CApiClient client("127.0.0.1", QByteArray(argv[2]).toUInt());
    client.setAccount(argv[3]);
    if (!input.open(stdin, QIODevice::ReadOnly) ||
        !client.setAccessToken(Ciphers::sealSecret(input.readAll().toStdString()).value_or("").c_str()))
        return 1;
    std::printf("result %u\n", client.uploadFWFile(argv[4], argv[5], "image.bin"));
    return 0;
}

} // namespace

int main(int argc, char *argv[]) {
    qInstallMessageHandler(silence);
    const QCoreApplication application(argc, argv);
    if (argc == 6 && QByteArray(argv[1]) == "--send")
        return send(argv);
    if (argc == 5)
        return measure(Service(argv[1], argv[2], argv[3]), QString::fromUtf8(argv[4]) + "/image.bin");
    std::fprintf(stderr, "bench_uploads PORT ACCOUNT PASSWORD FOLDER\n");
    return 2;
}
