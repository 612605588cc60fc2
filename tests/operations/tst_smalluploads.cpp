#include "devices/operations/files/exportdebuginfodialog.h"
#include "devices/operations/files/filefield.h"
#include "devices/operations/files/uploadconfigurationdialog.h"
#include "devices/operations/files/uploadpackagedialog.h"
#include "devices/operations/quicksetup/quicksetupdialog.h"
#include "devices/operations/quicksetup/timezones.h"
#include "store/lastfolder.h"
#include "store/storewriter.h"
#include "support/devicemaker.h"
#include "support/fakelists.h"
#include "support/isolatedroot.h"
#include "support/testmain.h"
#include "widgets/style/pluraltranslator.h"

#include <QCheckBox>
#include <QComboBox>
#include <QDropEvent>
#include <QFile>
#include <QLabel>
#include <QLineEdit>
#include <QMimeData>
#include <QPointer>
#include <QPushButton>
#include <QTest>
#include <QToolButton>

#include <sys/stat.h>
#include <unistd.h>

using nlohmann::json;

namespace {

const JSON plain = JSON::object();

OperationTargets::List targets(const std::vector<JSON> &members) {
    OperationTargets::List list;
    for (const JSON &each : members)
        list.push_back({DeviceRecords::parse(DeviceMaker::record(static_cast<int>(list.size()), each)),
                        DeviceStatusCode::Authorized,
                        {}});
    return list;
}

template <typename Widget>
Widget *child(QWidget *dialog, const char *name) {
    return dialog->findChild<Widget *>(QLatin1String(name));
}

void click(QWidget *dialog, const char *name) {
    QTest::mouseClick(child<QWidget>(dialog, name), Qt::LeftButton);
}

QStringList warnings(QWidget *dialog) {
    QStringList texts;
    for (const QLabel *line : dialog->findChildren<QLabel *>(QStringLiteral("targetWarningLabel"))) {
        if (line->isVisible())
            texts += line->text();
    }
    return texts;
}

/// True when the widget would take it.
bool drop(QWidget *widget, const QStringList &paths) {
    QMimeData data;
    QList<QUrl> urls;
    for (const QString &path : paths)
        urls += path.startsWith("http") ? QUrl(path) : QUrl::fromLocalFile(path);
    data.setUrls(urls);
    QDragEnterEvent enter({5, 5}, Qt::CopyAction, &data, Qt::LeftButton, Qt::NoModifier);
    enter.ignore();
    QCoreApplication::sendEvent(widget, &enter);
    if (!enter.isAccepted())
        return false;
    QDropEvent event({5, 5}, Qt::MoveAction | Qt::CopyAction, &data, Qt::LeftButton, Qt::NoModifier);
    QCoreApplication::sendEvent(widget, &event);
    return event.dropAction() == Qt::CopyAction;
}

} // namespace

/// The dialogs for packages, configuration files, debug information and quick setup.
class TestSmallUploads : public QObject {
    Q_OBJECT

private slots:
    void initTestCase() { QVERIFY(QCoreApplication::installTranslator(&m_plurals)); }

    void fileIsLookedAt_data();
    void fileIsLookedAt();
    void fileIsDropped();
    void packageGoesToTheCard();
    void configurationIsSent();
    void exportProposesTheLastFolder();
    void onlyWhatIsTickedIsSent();
    void deviceIsProposed();
    void badSettingsAreToldAndKept_data();
    void badSettingsAreToldAndKept();
    void zones_data();
    void zones();

private:
    QString file(const QString &name, const QByteArray &content = "content") {
        return m_root.write(name, content) ? m_root.filePath(name) : QString();
    }

    IsolatedRoot m_root;
    PluralTranslator m_plurals;
    FakeLists m_service;
};

void TestSmallUploads::fileIsLookedAt_data() {
    QTest::addColumn<QString>("path");
    QTest::addColumn<QString>("told");
    QTest::addColumn<bool>("good");
    const QString huge = file("huge.bin");
    QVERIFY(QFile::resize(huge, qint64{5} << 30));
    const QString pipe = m_root.filePath("pipe");
    QCOMPARE(mkfifo(pipe.toLocal8Bit().constData(), 0600), 0);
    QTest::newRow("missing") << m_root.filePath("none") << "There is no such file." << false;
    QTest::newRow("folder") << m_root.path() << "This is a folder." << false;
    QTest::newRow("pipe") << pipe << "This is no plain file." << false;
    QTest::newRow("damaged name") << m_root.filePath("a\uFFFDb")
                                  << "The name of the file is damaged; give it another one." << false;
    QTest::newRow("empty") << file("empty", "") << "The file is empty." << false;
    QTest::newRow("5 GiB") << huge << "The file has 5.0 GiB; the server takes 4 GiB at most." << false;
    QTest::newRow("blank name") << file(" ") << "The name of the file is blank; give it another one."
                                << false;
    QTest::newRow("unreadable") << "/proc/self/mem"
                                << "The file is empty." << false;
    const QString closed = file("closed");
    QVERIFY(QFile::setPermissions(closed, {}));
    // Nothing is closed to the superuser.
    if (geteuid() != 0)
        QTest::newRow("unreadable") << closed << "The file cannot be read." << false;
    QTest::newRow("odd name") << file("a\"b\n<i>.bin") << "Size: 7 bytes" << true;
    QTest::newRow("longest name") << file(QString(127, QChar(0xE9)) + 'x') << "Size: 7 bytes" << true;
}

void TestSmallUploads::fileIsLookedAt() {
    QFETCH(QString, path);
    FileField field(FileField::Kind::File, {"File", "Choose", "hint"}, nullptr);
    field.setAskPath([&](const auto &chosen) { chosen(path); });
    click(&field, "browseButton");
    QVERIFY(field.file().path.isEmpty());
    QTRY_VERIFY(child<QLabel>(&field, "fileStateLabel")->text() != "Looking at it...");
    QTEST(child<QLabel>(&field, "fileStateLabel")->text(), "told");
    QFETCH(bool, good);
    QCOMPARE(field.file().isGood(), good);
}

void TestSmallUploads::fileIsDropped() {
    UploadConfigurationDialog dialog(targets({plain}));
    dialog.setAttribute(Qt::WA_DeleteOnClose, false);
    const QString good = file("good.cfg");
    QVERIFY(!drop(&dialog, {"http://example.org/file"}));
    QVERIFY(drop(&dialog, {good, m_root.path()}));
    QCOMPARE(child<QLabel>(&dialog, "fileStateLabel")->text(), QString("Only one file can be taken."));
    QVERIFY(drop(&dialog, {good}));
    QTRY_COMPARE(dialog.fileField()->file().path, good);
    QVERIFY(child<QPushButton>(&dialog, "uploadButton")->isEnabled());
    QVERIFY(drop(&dialog, {m_root.path()}));
    QTRY_COMPARE(child<QLabel>(&dialog, "fileStateLabel")->text(), QString("This is a folder."));
    QVERIFY(!child<QPushButton>(&dialog, "uploadButton")->isEnabled());
}

void TestSmallUploads::packageGoesToTheCard() {
    QPointer dialog = new UploadPackageDialog(targets({{{"d_sdstatus", "ready"}, {"d_sdusage", 94}},
                                                       {{"d_sdstatus", "ready"}, {"d_sdusage", 95}},
                                                       {{"d_sdstatus", "readonly"}},
                                                       {{"d_sdstatus", "Empty"}},
                                                       plain}));
    dialog->open();
    QCOMPARE(warnings(dialog), QStringList());
    child<QCheckBox>(dialog, "sdCardCheckBox")->click();
    QCOMPARE(warnings(dialog), (QStringList{"3 devices will fail: no memory card is ready.",
                                            "1 device may fail: the memory card is almost full."}));
    click(dialog, "leaveOutButton");
    QVERIFY(!child<QPushButton>(dialog, "uploadButton")->isEnabled());
    dialog->fileField()->setPath(file("app.pkg", "package"));
    QTRY_VERIFY(child<QPushButton>(dialog, "uploadButton")->isEnabled());
    click(dialog, "uploadButton");
    QTRY_VERIFY(!dialog);
    QTRY_COMPARE(m_service.rawSentTo("/v1/upload_package").size(), 1u);
    const std::string sent = m_service.rawSentTo("/v1/upload_package").at(0);
    for (const char *part : {R"("sd_card":true)", R"("device_ids":["DV0","DV1"])", "app.pkg", "package"})
        QVERIFY2(sent.find(part) != std::string::npos, sent.c_str());
}

void TestSmallUploads::configurationIsSent() {
    QPointer dialog = new UploadConfigurationDialog(targets({plain}));
    dialog->open();
    dialog->fileField()->setPath(file("set.cfg", "settings"));
    QTRY_VERIFY(child<QPushButton>(dialog, "uploadButton")->isEnabled());
    click(dialog, "uploadButton");
    QTRY_VERIFY(!dialog);
    QTRY_COMPARE(m_service.rawSentTo("/v1/config_file_upload").size(), 1u);
    QVERIFY(m_service.rawSentTo("/v1/config_file_upload").at(0).find("settings") != std::string::npos);
}

void TestSmallUploads::exportProposesTheLastFolder() {
    const QString file = this->file("some.file");
    LastFolder::rememberFolder(m_root.path());
    QPointer dialog = new ExportDebugInfoDialog(targets({plain, plain}));
    dialog->open();
    QTRY_COMPARE(dialog->folderField()->file().path, m_root.path());
    dialog->folderField()->setPath(file);
    QTRY_COMPARE(child<QLabel>(dialog, "fileStateLabel")->text(), QString("This is no folder."));
    QVERIFY(!child<QPushButton>(dialog, "exportButton")->isEnabled());
    dialog->folderField()->setPath(m_root.path());
    QTRY_VERIFY(child<QPushButton>(dialog, "exportButton")->isEnabled());
    click(dialog, "exportButton");
    QTRY_VERIFY(!dialog);
    QTRY_COMPARE(m_service.sentTo("/v1/export/debif").size(), 1u);
    const json sent = m_service.sentTo("/v1/export/debif").at(0);
    QCOMPARE(sent["storepath"].get<std::string>(), m_root.path().toStdString());
    QCOMPARE(sent["devices"].size(), 2u);
    json kept;
    const auto isKept = [&] {
        StoreWriter::flush();
        kept = json::parse(CLocalStore::instance().pendingExports().toStdString(), nullptr, false);
        return kept.is_array() && !kept.empty();
    };
    QTRY_VERIFY(isKept());
    QVERIFY2(kept.at(0)["tid"] == sent["devices"][0]["tid"], "the report will be collected");
}

void TestSmallUploads::onlyWhatIsTickedIsSent() {
    QPointer dialog = new QuickSetupDialog(targets({plain, plain}));
    dialog->open();
    QVERIFY2(!child<QPushButton>(dialog, "applyButton")->isEnabled(), "nothing is ticked");
    QVERIFY(dialog->settings(QDateTime::currentDateTimeUtc()).empty());
    for (const char *name : {"frequencyCheckBox", "audioCheckBox", "timeCheckBox"})
        child<QCheckBox>(dialog, name)->click();
    child<QComboBox>(dialog, "frequencyComboBox")->setCurrentText("60 Hz");
    child<QComboBox>(dialog, "timeSyncComboBox")->setCurrentText("NTP servers");
    child<QLineEdit>(dialog, "server2Edit")->setText(" a.example ");
    child<QLineEdit>(dialog, "server5Edit")->setText("10.0.0.1");
    click(dialog, "applyButton");
    QTRY_VERIFY(!dialog);
    QTRY_COMPARE(m_service.sentTo("/v1/quicksetup").size(), 1u);
    json sent = m_service.sentTo("/v1/quicksetup").at(0);
    sent.erase("devices");
    const json expected = {{"id", "admin"},       {"powerfreq", 60},        {"mute", true},
                           {"timesync", "ntp"},   {"server1", "a.example"}, {"server2", "10.0.0.1"},
                           {"server3", ""},       {"server4", ""},          {"server5", ""},
                           {"updateInterval", 60}};
    QCOMPARE(sent.dump(), expected.dump());
}

void TestSmallUploads::deviceIsProposed() {
    QuickSetupDialog dialog(targets({{{"d_timezone", "FOO-3:15"},
                                      {"d_timesync", "ntp"},
                                      {"d_timeservers", {"x.example", 7}},
                                      {"d_syncinterval", "45"},
                                      {"d_daylight", false},
                                      {"d_powerfreq", 60},
                                      {"d_audio", "unmute"}}}));
    for (QCheckBox *tick : dialog.findChildren<QCheckBox *>())
        tick->click();
    const json expected = {{"posixTz", "FOO-3:15"}, {"timesync", "ntp"},      {"server1", "x.example"},
                           {"server2", ""},         {"server3", ""},          {"server4", ""},
                           {"server5", ""},         {"powerfreq", 60},        {"updateInterval", 45},
                           {"mute", false},         {"daylightEnable", false}};
    const QDateTime now(QDate(2024, 7, 1), QTime(22, 30), Qt::UTC);
    QCOMPARE(dialog.settings(now).dump(), expected.dump());

    child<QComboBox>(&dialog, "timeSyncComboBox")->setCurrentIndex(0);
    child<QLineEdit>(&dialog, "zoneEdit")->setText("CET-1CEST,M3.5.0,M10.5.0/3");
    json settings = dialog.settings(now);
    QVERIFY2(settings["date"] == "2024/07/01" && settings["time"] == "23:30:00", "without daylight saving");
    child<QCheckBox>(&dialog, "daylightCheckBox")->click();
    settings = dialog.settings(now);
    QVERIFY(settings["timesync"] == "manual" && !settings.contains("server1"));
    QVERIFY(settings["date"] == "2024/07/02" && settings["time"] == "00:30:00");
}

void TestSmallUploads::badSettingsAreToldAndKept_data() {
    QTest::addColumn<QString>("zone");
    QTest::addColumn<QStringList>("servers");
    QTest::addColumn<QString>("told");
    const QString noZone = "This is no time zone, as CET-1CEST,M3.5.0,M10.5.0/3 is one.";
    for (const char *zone :
         {"", "CET", "C-1", "CET-25", "CET-1CEST,M13.5.0,M10.5.0", "CET-1 x", "Europe/Rome"})
        QTest::newRow(zone) << zone << QStringList("a") << noZone;
    QTest::newRow("no server") << "UTC0" << QStringList() << "Name at least one NTP server.";
    QTest::newRow("twice") << "UTC0" << QStringList{"a", "A"} << "The server “a” is named twice.";
    for (const char *server : {"300.1.1.1", "a b", "-a", "a..b", "1.2.3"})
        QTest::newRow(server) << "UTC0" << QStringList(server)
                              << QString("“%1” is no name or address of a server.").arg(server);
}

void TestSmallUploads::badSettingsAreToldAndKept() {
    QFETCH(QString, zone);
    QFETCH(QStringList, servers);
    QuickSetupDialog dialog(targets({plain}));
    dialog.setAttribute(Qt::WA_DeleteOnClose, false);
    dialog.open();
    child<QCheckBox>(&dialog, "zoneCheckBox")->click();
    child<QCheckBox>(&dialog, "timeCheckBox")->click();
    child<QComboBox>(&dialog, "timeSyncComboBox")->setCurrentIndex(1);
    child<QLineEdit>(&dialog, "zoneEdit")->setText(zone);
    for (int i = 0; i < servers.size(); ++i)
        dialog.findChild<QLineEdit *>(QString("server%1Edit").arg(i + 1))->setText(servers[i]);
    click(&dialog, "applyButton");
    QTEST(child<QLabel>(&dialog, "msgWarningLabel")->text(), "told");
    QVERIFY(dialog.isVisible());
    child<QLineEdit>(&dialog, "server1Edit")->setText("other");
    QCOMPARE(child<QLabel>(&dialog, "msgWarningLabel")->text(), QString());
}

void TestSmallUploads::zones_data() {
    QTest::addColumn<QString>("posix");
    QTest::addColumn<QString>("shown");
    QTest::addColumn<QString>("summer");
    QTest::newRow("Berlin") << "CET-1CEST,M3.5.0,M10.5.0/3"
                            << "(UTC+01:00) Berlin, Madrid, Paris, Rome"
                            << "02:00";
    QTest::newRow("St. John’s") << "NST3:30NDT,M3.2.0,M11.1.0"
                                << "(UTC-03:30) St. John’s"
                                << "21:30";
    QTest::newRow("Kathmandu") << "<+0545>-5:45"
                               << "(UTC+05:45) Kathmandu"
                               << "05:45";
    QTest::newRow("Auckland") << "NZST-12NZDT,M9.5.0,M4.1.0/3"
                              << "(UTC+12:00) Auckland"
                              << "12:00";
}

void TestSmallUploads::zones() {
    QFETCH(QString, posix);
    for (const TimeZones::Zone &zone : TimeZones::all())
        QVERIFY2(TimeZones::isPosix(QLatin1String(zone.posix)), zone.posix);
    const int place = TimeZones::find(posix);
    QVERIFY(place >= 0);
    QTEST(TimeZones::text(TimeZones::all()[static_cast<std::size_t>(place)]), "shown");
    const QDateTime july(QDate(2024, 7, 1), QTime(0, 0), Qt::UTC);
    QTEST(TimeZones::clock(posix, july, true).toString("HH:mm"), "summer");
}

NVLDM_TEST(TestSmallUploads)
#include "tst_smalluploads.moc"
