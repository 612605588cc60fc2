#include "devices/operations/certificates/cafilefield.h"
#include "devices/operations/certificates/certificatebox.h"
#include "devices/operations/certificates/certificatelist.h"
#include "devices/operations/certificates/certificatemodel.h"
#include "devices/operations/certificates/certificatesdialog.h"
#include "devices/operations/certificates/uploadieeedialog.h"
#include "support/certificatemaker.h"
#include "support/devicemaker.h"
#include "support/fakelists.h"
#include "support/isolatedroot.h"
#include "support/testmain.h"
#include "tasks/service/taskinfopool.h"

#include <QDateTime>
#include <QLabel>
#include <QLineEdit>
#include <QPointer>
#include <QPushButton>
#include <QSignalSpy>
#include <QTableView>
#include <QTest>

using namespace CertificateMaker;

/// The dialog for IEEE 802.1X and the list of the certificates in use.
class TestCertificateDialogs : public QObject {
    Q_OBJECT

private slots:
    void cleanup() { CTaskInfoPool::instance().clear(); }

    void peapIsSent() {
        const QPointer<UploadIeeeDialog> dialog = open("deviceIEEE_EAP_PEAP");
        write("ca.key", pem(makeKey()));
        write("ca.pem", pem(makeCertificate(makeKey().get(), "Authority", -9, 99, true)));
        auto *ca = dialog->findChild<CaFileField *>();
        ca->take(m_root.filePath("ca.key"));
        QTRY_COMPARE(text(dialog, "fileStateLabel"), QStringLiteral("There is no certificate in the file."));
        for (const auto &[field, value] : {std::pair("identityEdit", "me"), {"passEdit", "Passw0rd!"}}) {
            button(dialog)->click();
            QVERIFY(!text(dialog, "msgWarningLabel").isEmpty());
            QTest::keyClicks(dialog->findChild<QLineEdit *>(field), value);
        }
        button(dialog)->click();
        QCOMPARE(text(dialog, "msgWarningLabel"), QStringLiteral("Choose the certificate of the authority."));
        ca->take(m_root.filePath("ca.pem"));
        QTRY_VERIFY(text(dialog, "fileStateLabel").startsWith("CN=Authority, valid from"));
        QTRY_VERIFY(button(dialog)->isEnabled());
        button(dialog)->click();
        QTRY_VERIFY(!dialog);
        QTRY_COMPARE(m_service.rawSentTo("/v1/ie_peap").size(), 1u);
        QVERIFY(m_service.rawSentTo("/v1/ie_peap").back().find("ca_") != std::string::npos);
        const JSON device = m_service.sentTo("/v1/task/init").back()["devices"][0];
        QCOMPARE(stringMember(device, "identity"), QStringLiteral("me"));
        QCOMPARE(stringMember(device, "mode"), QStringLiteral("eap_peap"));
        QCOMPARE(Ciphers::openSecret(device["pass"].get<std::string>()),
                 std::optional(std::string("Passw0rd!")));
    }

    void keyPasswordOpensKeys() {
        const QPointer<UploadIeeeDialog> dialog = open("deviceIEEE_EAP_TLS");
        const Key key = makeKey();
        write("ca.pem", pem(makeCertificate(makeKey().get(), "no authority")));
        write("020000000001.pem", pem(makeCertificate(key.get(), "one")));
        write("020000000001.key", pem(key, "secret"));
        dialog->findChild<CaFileField *>()->take(m_root.filePath("ca.pem"));
        dialog->findChild<CertificateBox *>()->takeFiles(
            {m_root.filePath("020000000001.pem"), m_root.filePath("020000000001.key")});
        auto *model = dialog->findChild<CertificateModel *>();
        const auto note = [model] { return model->index(0, CertificateModel::NoteColumn).data().toString(); };
        QTRY_COMPARE(note(), QStringLiteral("Key not opened by the password"));
        QVERIFY(text(dialog, "fileStateLabel").contains("no certificate of an authority"));
        auto *password = dialog->findChild<QLineEdit *>("keyPassEdit");
        QTest::keyClicks(password, "secret");
        QVERIFY(!button(dialog)->isEnabled());
        QTRY_COMPARE(note(), QStringLiteral("Key matches"));
        QTRY_VERIFY(button(dialog)->isEnabled());
        QTest::keyClick(password, Qt::Key_Backspace);
        QTRY_COMPARE(note(), QStringLiteral("Key not opened by the password"));
        QTest::keyClicks(password, "t");
        QTRY_VERIFY(button(dialog)->isEnabled());
        QTest::keyClicks(dialog->findChild<QLineEdit *>("identityEdit"), "me");
        button(dialog)->click();
        QTRY_VERIFY(!dialog);
        QTRY_COMPARE(m_service.rawSentTo("/v1/ie_tls").size(), 1u);
        const std::string form = m_service.rawSentTo("/v1/ie_tls").back();
        QVERIFY(form.find("pkey_02:00:00:00:00:01") != form.npos);
        QVERIFY(form.find("ENCRYPTED PRIVATE KEY") != form.npos);
    }

    void certificatesAreListedByTheirExpiry() {
        const qint64 day = 86400000;
        const qint64 now = QDateTime::currentMSecsSinceEpoch();
        auto *dialog = new CertificatesDialog(DeviceMaker::snapshot(
            {DeviceMaker::record(1, {{"d_cert_subject", "CN=Gate,O=Öst"}, {"d_cert_expires", now + 9 * day}}),
             DeviceMaker::record(2, {{"d_ip", "10.0.0.2"}, {"d_8021x_expires", now - day}}),
             DeviceMaker::record(3,
                                 {{"d_cert_expires", now + 31 * day}, {"d_8021x_expires", now + 99 * day}}),
             DeviceMaker::record(4, {{"d_has_matching_cert", true}, {"d_cert_expires", "soon"}}),
             DeviceMaker::record(5, {{"d_has_matching_cert", false}, {"d_8021x_expires", -5}})}));
        dialog->open();
        auto *table = dialog->findChild<QTableView *>("certificateTable");
        const auto column = [table](CertificateColumn which) {
            QStringList texts;
            for (int row = 0; row < table->model()->rowCount(); ++row)
                texts += table->model()->index(row, static_cast<int>(which)).data().toString();
            return texts.join(u'|');
        };
        QTRY_COMPARE(column(CertificateColumn::State),
                     QStringLiteral("Expired|Expires soon|Valid|Valid|Unknown"));
        QCOMPARE(column(CertificateColumn::Use), QStringLiteral("IEEE 802.1X|HTTPS|HTTPS|IEEE 802.1X|HTTPS"));
        QCOMPARE(text(dialog, "expiredLabel"), QStringLiteral("1 expired, 1 within 30 days"));
        table->sortByColumn(int(CertificateColumn::Expires), Qt::DescendingOrder);
        QTRY_COMPARE(column(CertificateColumn::State),
                     QStringLiteral("Valid|Valid|Expires soon|Expired|Unknown"));
        auto *search = dialog->findChild<QLineEdit *>("searchEdit");
        search->setText(QStringLiteral("gate,o=ÖS"));
        QTRY_COMPARE(column(CertificateColumn::Subject), QStringLiteral("CN=Gate,O=Öst"));
        search->setText(QStringLiteral("10.0.0.2"));
        QTRY_COMPARE(column(CertificateColumn::Ip), QStringLiteral("10.0.0.2"));
        QCOMPARE(text(dialog, "countLabel"), QStringLiteral("1 of 5 certificates"));
        QSignalSpy chosen(dialog, &CertificatesDialog::deviceChosen);
        const QPoint cell = table->visualRect(table->model()->index(0, 0)).center();
        QTest::mouseClick(table->viewport(), Qt::LeftButton, {}, cell);
        QTest::mouseDClick(table->viewport(), Qt::LeftButton, {}, cell);
        QCOMPARE(chosen.size(), 1);
        QCOMPARE(chosen[0][0].toString(), QStringLiteral("DV2"));
        QVERIFY(!dialog->isVisible());
    }

private:
    UploadIeeeDialog *open(const char *serviceType) {
        const DeviceSnapshotPtr all =
            DeviceMaker::snapshot({DeviceMaker::record(1, {{"d_mac", "02:00:00:00:00:01"}})});
        auto *dialog = new UploadIeeeDialog({{all->at(0), DeviceStatusCode::Authorized, {}}}, all);
        dialog->setMethod(UploadIeeeDialog::methodOf(QLatin1String(serviceType)));
        dialog->open();
        return dialog;
    }
    void write(const char *name, const QByteArray &bytes) { QVERIFY(m_root.write(name, bytes)); }
    static QString text(QDialog *dialog, const char *name) {
        return dialog->findChild<QLabel *>(name)->text();
    }
    static QPushButton *button(QDialog *dialog) { return dialog->findChild<QPushButton *>("applyButton"); }

    IsolatedRoot m_root;
    FakeLists m_service;
};

NVLDM_TEST(TestCertificateDialogs)
#include "tst_certificatedialogs.moc"
