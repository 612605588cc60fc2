#include "fleettest.h"

#include <QTest>

void FleetTest::start(const QStringList &arguments) {
    QVERIFY(m_emulator->start(arguments));
    m_caller = ServiceCaller(m_emulator->port());
    QCOMPARE(m_caller.login("admin", "admin").code, 0);
}

void FleetTest::fresh(const QStringList &more) {
    m_emulator = std::make_unique<EmulatorProcess>();
    start(QStringList{"--devices", "40", "--task-pace", "80"} + more);
    QVERIFY(command("admit all").startsWith("ok"));
    m_devices = m_caller.list("/v1/dev/list");
}

int FleetTest::close(const Json &task, const char *state) {
    return code("/v1/task/updateState", {{"task_id", task.at("tid")}, {"task_state", state}});
}

Json FleetTest::newTask(const char *type, std::size_t devices, const Json &parameters) {
    Json entries = Json::array();
    for (std::size_t i = 0; i < devices; ++i) {
        entries.push_back(parameters);
        entries.back()["id"] = m_devices.at(i).at("id");
    }
    return m_caller.call("/v1/task/init", {{"type", type}, {"devices", entries}}).data;
}

Json FleetTest::under(const Json &task) {
    Json entries = Json::array();
    for (const Json &device : task.at("devices"))
        entries.push_back({{"id", device.at("id")}, {"tid", task.at("tid")}});
    return entries;
}

Json FleetTest::runUnder(const Json &task, const std::string &command) {
    const Json body = {{"cgis", Json::array({command})}, {"devices", under(task)}};
    return m_caller.call("/v1/cgi/customx", body).data;
}

Json FleetTest::ended() {
    for (int i = 0; i < 400 && newest().at("active"); ++i)
        QTest::qWait(10);
    return newest();
}

Json FleetTest::outcomes() {
    const Json task = ended();
    Json states = Json::array();
    for (const Json &device : task.at("devices"))
        states.push_back(device.at("state"));
    return states;
}

std::string FleetTest::authorization(std::size_t index) {
    return m_caller.list("/v1/dstatus/list").at(index).at("auth_status");
}

std::size_t FleetTest::withStatus(const char *name, const char *value) {
    return count(m_caller.list("/v1/dstatus/list"), name, value);
}

void FleetTest::setStatus(std::size_t index, const char *authorization, const char *connection) {
    const QString id = QString::fromStdString(m_devices.at(index).at("id"));
    QVERIFY(command(QString("status %1 \"%2\" %3 -").arg(id, authorization, connection)).startsWith("ok"));
}

std::size_t FleetTest::count(const Json &records, const char *name, const Json &value) {
    const auto fits = [&](const Json &record) { return record.at(name) == value; };
    return std::size_t(std::count_if(records.begin(), records.end(), fits));
}
