// What a client costs that shows a fleet and is left alone for a minute, beside another build of it that runs
// on the same service at the same time.
//   bench_idle EMULATOR CLIENT PROBE [REFERENCE]

#include <QCoreApplication>
#include <QFile>
#include <QProcess>
#include <QTemporaryDir>

#include <cstdio>
#include <memory>

namespace {

constexpr const char *account = "admin@norvell.example";
constexpr const char *password = "Passw0rd!";
constexpr int patienceMs = 300000;

struct Cost {
    double processorSeconds = 0;
    double megabytes = 0;
    double maxTurnMs = 0;
    double busiestTurnMs = 0;
};

/// A client that measures itself; it ends when it is done.
class Client {
public:
    Client(const QString &program, const QString &probe, const QString &server) {
        QProcessEnvironment environment = QProcessEnvironment::systemEnvironment();
        environment.insert(QStringLiteral("NVLDM_ROOT"), m_root.path());
        environment.insert(QStringLiteral("LD_PRELOAD"), probe);
        environment.insert(QStringLiteral("BENCH_SERVER"), server);
        environment.insert(QStringLiteral("BENCH_ACCOUNT"), QString::fromLatin1(account));
        environment.insert(QStringLiteral("BENCH_PASSWORD"), QString::fromLatin1(password));
        m_process.setProcessEnvironment(environment);
        m_process.setStandardErrorFile(QProcess::nullDevice());
        m_process.setStandardOutputFile(m_root.filePath(QStringLiteral("output")));
        m_process.start(program, QStringList());
    }

    Cost cost() {
        m_process.waitForFinished(patienceMs);
        QFile output(m_root.filePath(QStringLiteral("output")));
        const QByteArray text = output.open(QIODevice::ReadOnly) ? output.readAll() : QByteArray();
        Cost cost;
        const qsizetype at = text.lastIndexOf("bench_idle: ");
        if (at < 0 ||
            std::sscanf(text.constData() + at, "bench_idle: %lf %lf %lf %lf", &cost.processorSeconds,
                        &cost.megabytes, &cost.maxTurnMs, &cost.busiestTurnMs) != 4)
            qFatal("%s did not come to rest with its devices", qPrintable(m_process.program()));
        return cost;
    }

private:
    QTemporaryDir m_root;
    QProcess m_process;
};

/// Starts a service; gives its port.
QString startService(QProcess &service, const QString &emulator, const QString &root, int devices) {
    service.start(emulator, {QStringLiteral("--port"), QStringLiteral("0"), QStringLiteral("--devices"),
                             QString::number(devices), QStringLiteral("--sites"), QStringLiteral("40"),
                             QStringLiteral("--seed"), QStringLiteral("7"), QStringLiteral("--root"), root,
                             QStringLiteral("--account"),
                             QString::fromLatin1(account) + u':' + QString::fromLatin1(password)});
    service.setReadChannel(QProcess::StandardOutput);
    while (!service.canReadLine()) {
        if (!service.waitForReadyRead(patienceMs))
            qFatal("The service did not start");
    }
    return QString::fromUtf8(service.readLine()).trimmed().section(u':', -1);
}

void printLine(const char *what, int devices, double own, const char *unit, const Cost *reference,
               double referenceValue, const char *goal) {
    std::printf("%-26s %6d  %8.2f %-3s", what, devices, own, unit);
    if (reference)
        std::printf("   reference %8.2f %-3s   ratio %5.2f", referenceValue, unit, own / referenceValue);
    std::printf("   %s\n", goal);
}

} // namespace

int main(int argc, char *argv[]) {
    const QCoreApplication application(argc, argv);
    const QStringList arguments = QCoreApplication::arguments();
    if (arguments.size() < 4)
        qFatal("bench_idle EMULATOR CLIENT PROBE [REFERENCE]");
    const QString reference = arguments.value(4);
    struct Fleet {
        int devices;
        const char *time;
        const char *memory;
    };
    for (const Fleet &fleet :
         {Fleet{50000, "ratio at most 0.30", "at most 185"}, Fleet{5000, "at most 1", "at most 85"}}) {
        const QTemporaryDir root;
        QProcess service;
        const QString server =
            QStringLiteral("127.0.0.1:") + startService(service, arguments[1], root.path(), fleet.devices);
        Client client(arguments[2], arguments[3], server);
        std::unique_ptr<Client> other;
        if (!reference.isEmpty())
            other = std::make_unique<Client>(reference, arguments[3], server);
        const Cost own = client.cost();
        const Cost beside = other ? other->cost() : Cost();
        const Cost *compared = other ? &beside : nullptr;
        printLine("processor time of a minute", fleet.devices, own.processorSeconds, "s", compared,
                  beside.processorSeconds, fleet.time);
        printLine("resident after a minute", fleet.devices, own.megabytes, "MB", compared, beside.megabytes,
                  fleet.memory);
        printLine("longest event loop turn", fleet.devices, own.maxTurnMs, "ms", compared, beside.maxTurnMs,
                  "at most 33");
        printLine("busiest event loop turn", fleet.devices, own.busiestTurnMs, "ms", compared,
                  beside.busiestTurnMs, "of processor time");
        service.kill();
        service.waitForFinished();
    }
}
