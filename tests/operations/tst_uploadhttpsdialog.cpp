#include "devices/operations/certificates/certificatemodel.h"
#include "devices/operations/certificates/macnames.h"
#include "devices/operations/certificates/uploadhttpsdialog.h"
#include "support/certificatemaker.h"
#include "support/devicemaker.h"
#include "support/fakelists.h"
#include "support/isolatedroot.h"
#include "support/testmain.h"
#include "tasks/service/taskinfopool.h"

#include <QDateTime>
#include <QDropEvent>
#include <QFileDialog>
#include <QLabel>
#include <QLineEdit>
#include <QMimeData>
#include <QPointer>
#include <QPushButton>
#include <QSpinBox>
#include <QTableView>
#include <QTest>
#include <QToolButton>

using namespace CertificateMaker;
using Finding = CertificateFinding;

namespace {

const char *const macs[] = {"02:00:00:00:00:0A", "02-00-00-00-00-0b", "0200.0000.000C", "none"};

/// Devices of which all but the last can be told by their addresses.
DeviceSnapshotPtr devices(int count) {
    std::vector<JSON> records;
    for (int i = 0; i < count; ++i)
        records.push_back(
            DeviceMaker::record(i, {{"d_mac", macs[i]}, {"d_has_matching_private_key", i == 0}}));
    return DeviceMaker::snapshot(records);
}

OperationTargets::List targets(const DeviceSnapshot &devices) {
    OperationTargets::List list;
    for (int i = 0; i < devices.size(); ++i)
        list.push_back({devices.at(i), DeviceStatusCode::Authorized, {}});
    return list;
}

CertificateFilePtr named(const QString &name) {
    CertificateFile file;
    file.name = name;
    file.certificates = 1;
    return std::make_shared<CertificateFile>(file);
}

CertificateFilePtr certificate(int fromDays, int untilDays, bool keyInside = false) {
    constexpr qint64 dayMs = 86400000;
    const qint64 now = QDateTime::currentMSecsSinceEpoch();
    CertificateFile file;
    file.certificates = 1;
    file.validFrom = now + fromDays * dayMs;
    file.validUntil = now + untilDays * dayMs;
    file.certificateMark = "A";
    file.hasKey = keyInside;
    return std::make_shared<CertificateFile>(file);
}

CertificateFilePtr key(const char *mark, bool encrypted = false) {
    CertificateFile file;
    file.hasKey = true;
    file.keyMark = mark;
    file.isEncrypted = encrypted;
    return std::make_shared<CertificateFile>(file);
}

} // namespace

Q_DECLARE_METATYPE(CertificatePair)

class TestUploadHttpsDialog : public QObject {
    Q_OBJECT

private slots:
    void cleanup() {
        delete m_dialog;
        CTaskInfoPool::instance().clear();
    }

    void filesFindTheirDevices_data() {
        QTest::addColumn<QString>("name");
        QTest::addColumn<int>("owner");        // of four devices; -1 for nobody
        QTest::addColumn<bool>("onlyOnesOwn"); // taken by a device that is alone
        QTest::newRow("plain") << "02000000000a.pem" << 0 << true;
        QTest::newRow("colons") << "02:00:00:00:00:0A" << 0 << true;
        QTest::newRow("in words") << "cert of gate_02-00-00-00-00-0a.v2.cer" << 0 << true;
        QTest::newRow("fours") << "0200.0000.000a.key" << 0 << true;
        QTest::newRow("behind a date") << "2024-01-15-02000000000B.pem" << 1 << false;
        QTest::newRow("spaces") << "02 00 00 00 00 0C.crt" << 2 << false;
        QTest::newRow("other device") << "02000000000D.pem" << -1 << false;
        QTest::newRow("two devices") << "02000000000A-02000000000B.pem" << -1 << true;
        QTest::newRow("cut") << "0200000000-A.pem" << -1 << true;
        QTest::newRow("two separators") << "02--00-00-00-00-0A.pem" << -1 << true;
        QTest::newRow("none") << "gate.pem" << -1 << true;
    }
    void filesFindTheirDevices() {
        QFETCH(QString, name);
        QFETCH(int, owner);
        CertificateModel model(targets(*devices(4)));
        QCOMPARE(model.matchFiles({named(name)}).size(), owner < 0 ? 1u : 0u);
        for (int item = 0; item < 4; ++item)
            QCOMPARE(model.pair(item).certificate != nullptr, item == owner);
        CertificateModel alone(targets(*devices(1)));
        alone.matchFiles({named(name)});
        QTEST(alone.pair(0).certificate != nullptr, "onlyOnesOwn");
    }

    void pairsAreJudged_data() {
        QTest::addColumn<CertificatePair>("pair");
        QTest::addColumn<CertificateNeeds>("needs");
        QTest::addColumn<int>("device"); // the first one waits for a certificate
        QTest::addColumn<CertificateFindings>("findings");
        QTest::addColumn<bool>("served");
        const auto row = [](const char *name, const CertificatePair &pair, CertificateNeeds needs, int device,
                            CertificateFindings findings, bool served) {
            QTest::newRow(name) << pair << needs << device << findings << served;
        };
        const CertificateFilePtr good = certificate(-1, 300);
        const CertificateNeeds one = CertificateNeeds::Certificate;
        const CertificateNeeds both = CertificateNeeds::Pair;
        const CertificateNeeds sealable = CertificateNeeds::PairWithPassphrase;
        row("nothing needed", {}, CertificateNeeds::Nothing, 3, {}, true);
        row("installed", {good, {}, {}}, one, 0, {}, true);
        row("nothing waits", {good, {}, {}}, one, 1, Finding::NoPendingKey, true);
        row("key inside", {certificate(-1, 300, true), {}, {}}, one, 0, Finding::KeyInside, true);
        row("pair", {good, key("A"), {}}, both, 1, {}, true);
        row("expired", {certificate(-9, -1), key("A"), {}}, both, 1, Finding::Expired, true);
        row("early", {certificate(1, 9), key("A"), {}}, both, 1, Finding::NotYetValid, true);
        row("soon", {certificate(-1, 9), key("A"), {}}, both, 1, Finding::ExpiresSoon, true);
        row("other key", {good, key("B"), {}}, both, 1, Finding::Mismatch, false);
        row("no key", {good, {}, {}}, both, 1, Finding::NoKey, false);
        row("no certificate", {{}, key("A"), {}}, both, 1, Finding::NoCertificate, false);
        row("only a bad file", {{}, {}, named("x")}, both, 1, Finding::Unusable, false);
        row("bad file beside a pair", {good, key("A"), named("x")}, both, 1, {}, true);
        row("encrypted", {good, key("A", true), {}}, both, 1, Finding::Encrypted, false);
        row("encrypted, opened", {good, key("A", true), {}}, sealable, 1, {}, true);
        row("encrypted, closed", {good, key("", true), {}}, sealable, 1, Finding::Closed, false);
        row("no address", {good, key("A"), {}}, both, 3, Finding::NoAddress, false);
    }
    void pairsAreJudged() {
        QFETCH(CertificatePair, pair);
        QFETCH(CertificateNeeds, needs);
        QFETCH(int, device);
        const CertificateFindings findings = CertificateCheck::judge(pair, *devices(4)->at(device), needs,
                                                                     QDateTime::currentMSecsSinceEpoch());
        QTEST(findings, "findings");
        QTEST(!CertificateCheck::blocks(findings), "served");
    }

    void droppedPairsAreSent() {
        const Key shared = makeKey();
        const QByteArray first = pem(makeCertificate(shared.get(), "first"));
        open(UploadHttpsDialog::Method::Pair);
        QVERIFY(!apply()->isEnabled());
        drop({{"02000000000a.pem", first},
              {"02-00-00-00-00-0A.key", pem(shared)},
              {"02000000000b.pem", pem(makeKey()) + first},
              {"02000000000c.pem", pem(shared) + first},
              {"stray.pem", first},
              {"02000000000a-broken.txt", "x"}});
        QTRY_COMPARE(note(0), QStringLiteral("Key matches"));
        QTRY_COMPARE(note(2), QStringLiteral("Key matches"));
        QCOMPARE(note(1), QStringLiteral("Key of another certificate"));
        QTRY_COMPARE(text("filesNoteLabel"), QStringLiteral("1 file(s) not used: stray.pem"));
        QTRY_VERIFY(apply()->isEnabled());
        QCOMPARE(text("totalLabel"), QStringLiteral("2 of 4 devices will be served"));
        QVERIFY(text("targetWarningLabel").contains("Key of another certificate (1)"));

        // A row is unticked, another one gets its file by hand.
        QVERIFY(table()->model()->setData(table()->model()->index(2, 0), Qt::Unchecked, Qt::CheckStateRole));
        table()->selectRow(0);
        QVERIFY(text("certificateDetailsLabel").startsWith("CN=first, self-signed, valid from "));
        table()->selectRow(3);
        pick("pickCertificateButton", "stray.pem");
        QTRY_COMPARE(cell(3, CertificateModel::CertificateColumn), QStringLiteral("stray.pem"));
        QVERIFY(note(3).contains("No MAC address"));
        table()->selectRow(1);
        pick("pickKeyButton", "stray.pem");
        QTRY_VERIFY(text("filesNoteLabel").contains("There is no private key in the file."));
        pick("pickKeyButton", "02-00-00-00-00-0A.key");
        QTRY_COMPARE(note(1), QStringLiteral("Key matches"));
        m_dialog->findChild<QSpinBox *>("portSpinBox")->setValue(8443);

        const std::string form = send("/v1/sslcertpkeys");
        QVERIFY(form.find("cert_02:00:00:00:00:0A") != form.npos && form.find(first) != form.npos);
        QVERIFY(form.find("pkey_02-00-00-00-00-0b") != form.npos);
        QVERIFY(form.find("000C") == form.npos);
        const JSON task = m_service.sentTo("/v1/task/init").back();
        QCOMPARE(stringMember(task, "type"), QStringLiteral("deviceHttpsCertsAndPKeys"));
        QCOMPARE(task["devices"].dump(), R"([{"https_port":8443,"id":"DV0","mode":"http_https"},)"
                                         R"({"https_port":8443,"id":"DV1","mode":"http_https"}])");
    }

    void certificatesAreInstalled() {
        open(UploadHttpsDialog::Method::Install);
        drop({{"02000000000a.cer", der(makeCertificate(makeKey().get(), "gate"))},
              {"02000000000b.cer", der(makeCertificate(makeKey().get(), "door", -9, -1))}});
        QTRY_COMPARE(note(0), QStringLiteral("Ready"));
        QTRY_COMPARE(note(1), QStringLiteral("Expired, No key or request on the device"));
        QTRY_VERIFY(apply()->isEnabled());
        const std::string form = send("/v1/sslcertinst");
        QVERIFY(form.find("cert_02:00:00:00:00:0A") != form.npos && form.find("pkey_") == form.npos);
    }

    void certificatesAreGenerated() {
        open(UploadHttpsDialog::methodOf(QStringLiteral("deviceGenSelfSignedCert")));
        apply()->click();
        QVERIFY(m_dialog->isVisible());
        QVERIFY(text("msgWarningLabel").contains("two letters"));
        QTest::keyClicks(edit("countryEdit"), "c1hx");
        QTest::keyClicks(edit("provinceEdit"), " Zug ");
        const JSON sent = JSON::parse(send("/v1/gencert"));
        QCOMPARE(stringMember(sent, "country"), QStringLiteral("CH"));
        QCOMPARE(stringMember(sent, "state"), QStringLiteral("Zug"));
        QCOMPARE(stringMember(sent, "validity"), QStringLiteral("365"));
        QCOMPARE(sent["devices"].size(), 4u);
    }

private:
    void open(UploadHttpsDialog::Method method) {
        const DeviceSnapshotPtr all = devices(4);
        m_dialog = new UploadHttpsDialog(targets(*all), all);
        m_dialog->setMethod(method);
        m_dialog->open();
        QVERIFY(QTest::qWaitForWindowExposed(m_dialog));
    }

    void drop(const std::vector<std::pair<const char *, QByteArray>> &files) {
        QList<QUrl> urls;
        for (const auto &[name, bytes] : files) {
            QVERIFY(m_root.write(name, bytes));
            urls += QUrl::fromLocalFile(m_root.filePath(name));
        }
        QMimeData data;
        data.setUrls(urls);
        QDragEnterEvent enter({50, 50}, Qt::CopyAction, &data, Qt::LeftButton, Qt::NoModifier);
        QCoreApplication::sendEvent(m_dialog, &enter);
        QVERIFY(enter.isAccepted());
        QDropEvent drop({50, 50}, Qt::CopyAction, &data, Qt::LeftButton, Qt::NoModifier);
        QCoreApplication::sendEvent(m_dialog, &drop);
    }

    void pick(const char *link, const char *name) {
        m_dialog->findChild<QToolButton *>(link)->click();
        auto *dialog = m_dialog->findChild<QFileDialog *>("openFileDialog");
        QVERIFY(dialog);
        emit dialog->fileSelected(m_root.filePath(name));
        delete dialog;
    }

    /// Applies the dialog and gives what the service got there.
    std::string send(const char *path) {
        const std::size_t before = m_service.rawSentTo(path).size();
        apply()->click();
        const auto isSent = [&] { return m_service.rawSentTo(path).size() > before; };
        if (!QTest::qWaitFor(isSent, 20000))
            qFatal("the upload was refused");
        return m_service.rawSentTo(path).back();
    }

    QTableView *table() const { return m_dialog->findChild<QTableView *>("deviceTable"); }
    QString cell(int row, int column) const { return table()->model()->index(row, column).data().toString(); }
    QString note(int row) const { return cell(row, CertificateModel::NoteColumn); }
    QPushButton *apply() const { return m_dialog->findChild<QPushButton *>("applyButton"); }
    QLineEdit *edit(const char *name) const { return m_dialog->findChild<QLineEdit *>(name); }
    QString text(const char *name) const { return m_dialog->findChild<QLabel *>(name)->text(); }

    IsolatedRoot m_root;
    FakeLists m_service;
    QPointer<UploadHttpsDialog> m_dialog;
};

NVLDM_TEST(TestUploadHttpsDialog)
#include "tst_uploadhttpsdialog.moc"
