#include "apppaths.h"
#include "isolatedroot.h"
#include "secondlife.h"
#include "singleinstance.h"

#include <QCoreApplication>
#include <QTest>

namespace {

/// Holds the lock until it is told to end, or says that it did not get it.
int holdLock() {
    SingleInstance lock(AppPaths::instanceKey());
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
    QVERIFY2(!SingleInstance(AppPaths::instanceKey()).acquire(), "a refused copy must not free the lock");

    first.closeWriteChannel();
    QVERIFY(first.waitForFinished());
    QVERIFY(SingleInstance(AppPaths::instanceKey()).acquire());
}

void TestSingleInstance::crashLeavesNoLock() {
    QProcess holder;
    SecondLife::start(holder, {});
    QVERIFY(SecondLife::waitForLine(holder, "held"));
    holder.kill();
    QVERIFY(holder.waitForFinished());
    SingleInstance next(AppPaths::instanceKey());
    QVERIFY(next.acquire());
    QVERIFY(!SingleInstance(AppPaths::instanceKey()).acquire());
}

void TestSingleInstance::isolatedClientsDoNotMeet() {
    SingleInstance lock(AppPaths::instanceKey());
    QVERIFY(lock.acquire());
    const QString key = AppPaths::instanceKey();
    qputenv("NVLDM_ROOT", m_root.path().toUtf8() + '/');
    QCOMPARE(AppPaths::instanceKey(), key);
    const IsolatedRoot other;
    QVERIFY(SingleInstance(AppPaths::instanceKey()).acquire());
}

int main(int argc, char *argv[]) {
    const QCoreApplication application(argc, argv);
    if (SecondLife::isSecondLife(argc, argv))
        return holdLock();
    TestSingleInstance test;
    return QTest::qExec(&test, argc, argv);
}
#include "tst_singleinstance.moc"
