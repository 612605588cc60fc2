// The client's start up to its first frame, against the least that a window of Qt costs.
//   bench_start PROGRAM REFERENCE

#include <QCoreApplication>
#include <QProcess>
#include <QTemporaryDir>

#include <algorithm>
#include <chrono>
#include <cstdio>
#include <vector>

namespace {

constexpr int starts = 11;

/// Milliseconds from the start of the process to its first frame.
double startTime(const QString &program, const QString &root) {
    using namespace std::chrono;
    QProcess process;
    QProcessEnvironment environment = QProcessEnvironment::systemEnvironment();
    environment.insert(QStringLiteral("NVLDM_ROOT"), root);
    const auto now = duration_cast<nanoseconds>(steady_clock::now().time_since_epoch()).count();
    environment.insert(QStringLiteral("BENCH_STARTED_NS"), QString::number(now));
    process.setProcessEnvironment(environment);
    process.start(program, QStringList());
    process.waitForFinished();
    const QByteArray output = process.readAllStandardError();
    const QByteArray label = "first frame: ";
    const qsizetype at = output.indexOf(label);
    if (at < 0)
        qFatal("%s showed no frame", qPrintable(program));
    return output.mid(at + label.size()).split(' ').first().toDouble() / 1000;
}

double median(const QString &program) {
    const QTemporaryDir root;
    std::vector<double> times;
    for (int i = 0; i < starts; ++i)
        times.push_back(startTime(program, root.path()));
    std::sort(times.begin(), times.end());
    return times[starts / 2];
}

} // namespace

int main(int argc, char *argv[]) {
    const QCoreApplication application(argc, argv);
    const QStringList arguments = QCoreApplication::arguments();
    if (arguments.size() != 3)
        qFatal("bench_start PROGRAM REFERENCE");
    const double own = median(arguments[1]);
    const double reference = median(arguments[2]);
    std::printf("%-22s %7s  %9.2f ms   %-24s %9.2f ms   ratio %6.2f   at most 6\n", "start to first frame",
                "", own, "bare window", reference, own / reference);
}
