#include "platform/files/apppaths.h"
#include "platform/system/processsetup.h"
#include "platform/system/singleinstance.h"
#include "support/isolatedroot.h"
#include "support/secondlife.h"

#include <QCoreApplication>
#include <QDir>
#include <QFile>
#include <QTest>

#ifdef Q_OS_LINUX
#include <sys/ipc.h>
#include <sys/shm.h>
#include <unistd.h>
#endif

namespace {

bool isFree() {
    return SingleInstance(AppPaths::instanceKey(), AppPaths::clientStoreFolder()).acquire();
}

QString segmentName() {
    QSharedMemory segment;
    segment.setKey(AppPaths::instanceKey());
    return segment.nativeKey();
}

#ifdef Q_OS_LINUX
/// As another user, holds the segment with the mode, or gives it to the first user.
int squat(const QStringList &arguments) {
    const bool given = arguments[0] == "given";
    const int mode = given ? 0666 : arguments[0].toInt(nullptr, 8);
    constexpr uid_t nobody = 65534;
    shmid_ds segment{};
    const key_t key = ::ftok(QFile::encodeName(segmentName()).constData(), 'Q');
    const int id = ::setuid(nobody) == 0 ? ::shmget(key, 1, IPC_CREAT | IPC_EXCL | mode) : -1;
    void *const held = ::shmat(id, nullptr, 0);
    bool done = id >= 0 && ::shmctl(id, IPC_STAT, &segment) == 0;
    segment.shm_perm.uid = 0;
    done = done && (!given || ::shmctl(id, IPC_SET, &segment) == 0);
    SecondLife::reportAndWait(done ? "held" : "failed");
    ::shmctl(id, IPC_RMID, nullptr);
    ::shmdt(held);
    return 0;
}
#endif

/// Holds the lock until it is told to end, or says that it did not get it.
int holdLock() {
    SingleInstance lock(AppPaths::instanceKey(), AppPaths::clientStoreFolder());
    SecondLife::reportAndWait(lock.acquire() ? "held" : "refused");
    return 0;
}

} // namespace

class TestSingleInstance : public QObject {
    Q_OBJECT

private slots:
    void secondCopyIsRefused();
    void crashLeavesNoLock();
    void isolatedClientsDoNotMeet();
    void temporaryFilesAreCleanedAway();
    void anotherUserHoldsTheName_data();
    void anotherUserHoldsTheName();
    void relativeFolderIsNone();

private:
    IsolatedRoot m_root;
};

void TestSingleInstance::secondCopyIsRefused() {
    QProcess first;
    SecondLife::start(first, {});
    QVERIFY(SecondLife::waitForLine(first, "held"));
    QProcess second;
    SecondLife::start(second, {});
    QVERIFY(SecondLife::waitForLine(second, "refused"));
    second.closeWriteChannel();
    QVERIFY(second.waitForFinished());
    QVERIFY2(!isFree(), "a refused copy must not free the lock");

    first.closeWriteChannel();
    QVERIFY(first.waitForFinished());
    QVERIFY(isFree());
}

void TestSingleInstance::crashLeavesNoLock() {
    QProcess holder;
    SecondLife::start(holder, {});
    QVERIFY(SecondLife::waitForLine(holder, "held"));
    holder.kill();
    QVERIFY(holder.waitForFinished());
    SingleInstance next(AppPaths::instanceKey(), AppPaths::clientStoreFolder());
    QVERIFY(next.acquire());
    QVERIFY(!isFree());
}

void TestSingleInstance::isolatedClientsDoNotMeet() {
    SingleInstance lock(AppPaths::instanceKey(), AppPaths::clientStoreFolder());
    QVERIFY(lock.acquire());
    const QString key = AppPaths::instanceKey();
    qputenv("NVLDM_ROOT", m_root.path().toUtf8() + '/');
    QCOMPARE(AppPaths::instanceKey(), key);
    const IsolatedRoot other;
    QVERIFY(isFree());
}

void TestSingleInstance::temporaryFilesAreCleanedAway() {
    QProcess first;
    SecondLife::start(first, {});
    QVERIFY(SecondLife::waitForLine(first, "held"));
    if (!QFile::remove(segmentName()))
        QSKIP("the name is no file here");
    const bool refused = !isFree();
    first.closeWriteChannel();
    QVERIFY(first.waitForFinished());
    QVERIFY(refused);
}

void TestSingleInstance::anotherUserHoldsTheName_data() {
    QTest::addColumn<QString>("how");
    for (const char *how : {"0600", "0666", "given"})
        QTest::newRow(how) << how;
}

void TestSingleInstance::anotherUserHoldsTheName() {
#ifdef Q_OS_LINUX
    if (::geteuid() != 0)
        QSKIP("only root can act as another user");
    QFETCH(QString, how);
    const IsolatedRoot root;
    QFile name(segmentName());
    QVERIFY(name.open(QIODevice::WriteOnly));
    QProcess other;
    SecondLife::start(other, {how});
    QVERIFY(SecondLife::waitForLine(other, "held"));
    {
        SingleInstance lock(AppPaths::instanceKey(), AppPaths::clientStoreFolder());
        QVERIFY2(lock.acquire(), "another user keeps the program from starting");
        QVERIFY(!isFree());
    }
    other.closeWriteChannel();
    QVERIFY(other.waitForFinished());
    name.remove();
#endif
}

void TestSingleInstance::relativeFolderIsNone() {
    const QByteArray root = qgetenv("NVLDM_ROOT");
    qunsetenv("NVLDM_ROOT");
    qputenv("XDG_DATA_HOME", "data");
    ProcessSetup::dropRelativeFolders();
    const QString folder = AppPaths::clientStoreFolder();
    qputenv("XDG_DATA_HOME", m_root.path().toUtf8());
    ProcessSetup::dropRelativeFolders();
    const QString absolute = AppPaths::clientStoreFolder();
    qputenv("NVLDM_ROOT", root);
    QVERIFY2(QDir::isAbsolutePath(folder), qPrintable(folder));
#ifdef Q_OS_LINUX
    QVERIFY2(absolute.startsWith(m_root.path()), qPrintable(absolute));
#endif
}

int main(int argc, char *argv[]) {
    const QCoreApplication application(argc, argv);
    if (SecondLife::isSecondLife(argc, argv)) {
#ifdef Q_OS_LINUX
        if (const QStringList arguments = SecondLife::arguments(argc, argv); !arguments.isEmpty())
            return squat(arguments);
#endif
        return holdLock();
    }
    TestSingleInstance test;
    return QTest::qExec(&test, argc, argv);
}
#include "tst_singleinstance.moc"
