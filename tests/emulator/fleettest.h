#pragma once

#include "emulatorprocess.h"
#include "servicecaller.h"

#include <QObject>

#include <memory>

/// What tests of work on devices share: a quick service, a session, and a fleet that is there and open to it.
class FleetTest : public QObject {
protected:
    void start(const QStringList &arguments);
    /// A service with forty devices of its own.
    void fresh(const QStringList &more = {});

    int code(const std::string &path, const Json &body) { return m_caller.call(path, body).code; }
    int close(const Json &task, const char *state);
    /// A task on the first devices, each with the parameters; null where the service refuses.
    Json newTask(const char *type, std::size_t devices, const Json &parameters = Json::object());
    /// The elements of a "devices" argument under a task.
    static Json under(const Json &task);
    Json runUnder(const Json &task, const std::string &command = "/cgi-bin/admin/getparam.cgi");

    Json newest() { return m_caller.list("/v1/task/list", 300).at(0); }
    /// The newest task, once it has ended.
    Json ended();
    /// The states in which the devices of the newest task ended.
    Json outcomes();

    Json record(std::size_t index) { return m_caller.list("/v1/dev/list").at(index); }
    std::string authorization(std::size_t index);
    std::size_t withStatus(const char *name, const char *value);
    QString command(const QString &line) { return m_emulator->command(line); }
    /// Sets the authorization or the connection of a device; "-" leaves it.
    void setStatus(std::size_t index, const char *authorization, const char *connection = "-");

    static std::size_t count(const Json &records, const char *name, const Json &value);

    std::unique_ptr<EmulatorProcess> m_emulator;
    ServiceCaller m_caller{0};
    Json m_devices;
};
