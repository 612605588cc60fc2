#include "tasks/queue/uploadkinds.h"

#include "api/session/servicesession.h"
#include "tasks/service/tasktargets.h"

#include <QDebug>

#include <nlohmann/json.hpp>

namespace UploadFamilies {

namespace {

/// Makes a call that sends files: it can be watched and cancelled.
template <typename Call>
unsigned send(TaskContext &step, Call call) {
    return step.session.call([&](CApiClient &client) {
        client.setTransfer(step.transfer);
        return call(client, step.tid.c_str());
    });
}

unsigned sendConfigFile(TaskContext &step) {
    return send(step, [&](CApiClient &client, const char *tid) {
        return client.uploadConfigFile(tid, step.text("file_path").c_str(), step.text("file_name").c_str(),
                                       TaskTargets::ids(step.record.at("device_ids")));
    });
}

unsigned sendFirmware(TaskContext &step) {
    return send(step, [&](CApiClient &client, const char *tid) {
        return client.uploadFWFile(tid, step.text("fpath").c_str(), step.text("fname").c_str());
    });
}

unsigned sendPackage(TaskContext &step) {
    return send(step, [&](CApiClient &client, const char *tid) {
        return client.uploadPackage(tid, step.text("file_path").c_str(), step.text("file_name").c_str(),
                                    TaskTargets::ids(step.record.at("device_ids")),
                                    step.record.at("sd_card").get<bool>());
    });
}

unsigned generateCertificates(TaskContext &step) {
    JSON settings = {{"mode", step.record.at("mode")},         {"https_port", step.record.at("https_port")},
                     {"country", step.record.at("country")},   {"state", step.record.at("province")},
                     {"locality", step.record.at("locality")}, {"org", step.record.at("org")},
                     {"org_unit", step.record.at("org_unit")}, {"validity", step.record.at("validity")}};
    return step.session.call([&](CApiClient &client) {
        return client.createHttpsSelfSignedCerts(settings,
                                                 TaskTargets::withTask(step.record.at("devices"), step.tid));
    });
}

unsigned installCertificates(TaskContext &step) {
    return send(step, [&](CApiClient &client, const char *tid) {
        return client.createHttpsCertsInstall(tid, step.record.at("cert"));
    });
}

unsigned sendCertificatesAndKeys(TaskContext &step) {
    return send(step, [&](CApiClient &client, const char *tid) {
        return client.createHttpsCertsPKeys(tid, step.record.at("cert"), step.record.at("pkey"));
    });
}

unsigned sendPeapCa(TaskContext &step) {
    return send(step, [&](CApiClient &client, const char *tid) {
        return client.uploadPEAPCA(tid, step.text("ca_fpath").c_str(), step.text("ca_fname").c_str());
    });
}

unsigned sendTlsCa(TaskContext &step) {
    return send(step, [&](CApiClient &client, const char *tid) {
        return client.uploadTLSCA(tid, step.text("ca_fpath").c_str(), step.text("ca_fname").c_str(),
                                  step.record.at("cert"), step.record.at("pkey"));
    });
}

JSON firmwareDevices(const JSON &record) {
    return TaskTargets::withMembers(record.at("devices"), record, {"fwid", "mode", "actm"});
}

JSON fileDevices(const JSON &record) {
    return TaskTargets::withMembers(record.at("device_ids"), record, {"mode"});
}

JSON plainDevices(const JSON &record) {
    return TaskTargets::ids(record.at("devices"));
}

JSON httpsDevices(const JSON &record) {
    return TaskTargets::withMembers(record.at("devices"), record, {"mode", "https_port"});
}

JSON networkLoginDevices(const JSON &record) {
    return TaskTargets::withMembers(record.at("devices"), record, {"mode", "identity", "pass"});
}

void announceNothing(const TaskContext &) {}

int portOf(const TaskContext &step) {
    return step.record.value("https_port", 0);
}

void announceGeneration(const TaskContext &step) {
    qDebug("Mode: %s, HTTPS Port: %d, Country: %s, State&Province: %s, Organization: %s, Validity: %s, "
           "Devices Info: %s",
           step.text("mode").c_str(), portOf(step), step.text("country").c_str(),
           step.text("province").c_str(), step.text("org").c_str(), step.text("validity").c_str(),
           dumpJson(step.record.at("devices")).c_str());
}

void announceCertificates(const TaskContext &step) {
    qDebug("Mode: %s, HTTPS Port: %d, Certificate files: %s", step.text("mode").c_str(), portOf(step),
           dumpJson(step.record.at("cert")).c_str());
}

void announceCertificatesAndKeys(const TaskContext &step) {
    qDebug("Mode: %s, HTTPS Port: %d, Certificate files: %s, PKey files: %s", step.text("mode").c_str(),
           portOf(step), dumpJson(step.record.at("cert")).c_str(), dumpJson(step.record.at("pkey")).c_str());
}

constexpr const char *updateFirmware = "Updating fw task state occurs error: ";
constexpr TaskKind::Lines firmwareLines = {"ERROR: FW Uploading has failed. (%d)", nullptr,
                                           "Handling FW upload occurs error: ", updateFirmware};
constexpr TaskKind::Lines keyLines = {
    "Uploading the HTTPs Certificate and Private Key has failed!",
    "Uploading the HTTPs Certificate and Private Key is successful.",
    "Handling uploading HTTPS certificate and private key occurs error: ", updateFirmware};

constexpr TaskKind families[] = {
    {.type = "configuration_file",
     .serviceType = "deviceConfigFileUpload",
     .idPrefix = "config_file_id_",
     .targets = "device_ids",
     .isUpload = true,
     .fileName = "file_name",
     .lines = {"ERROR: Configuration File Uploading has failed. (%d)", nullptr,
               "Handling configuration file upload occurs error: ",
               "Updating config file task state occurs error: "},
     .devices = &fileDevices,
     .announce = &announceNothing,
     .work = &sendConfigFile},
    {.type = "fw",
     .serviceType = "deviceFWUpgrade",
     .idPrefix = "FWi_",
     .targets = "devices",
     .isUpload = true,
     .fileName = "fname",
     .lines = firmwareLines,
     .devices = &firmwareDevices,
     .announce = &announceNothing,
     .work = &sendFirmware},
    {.type = "package",
     .serviceType = "devicePackageUpload",
     .idPrefix = "package_id_",
     .targets = "device_ids",
     .isUpload = true,
     .fileName = "file_name",
     .lines = {"ERROR: Package Uploading has failed. (%d)", "Uploading the package is successful.",
               "Handling package upload occurs error: ", "Updating package task state occurs error: "},
     .devices = &fileDevices,
     .announce = &announceNothing,
     .work = &sendPackage},
    {.type = "https_selfsigned_certs",
     .serviceType = "deviceGenSelfSignedCert",
     .idPrefix = "https_selfsigned_certs_id_",
     .targets = "devices",
     .lines = {"Generating HTTPs Self-Signed Certificate failed!",
               "Generating HTTPs Self-Signed Certificate success.",
               "Handling generating self-signed certificate occurs error: ", updateFirmware},
     .devices = &plainDevices,
     .announce = &announceGeneration,
     .work = &generateCertificates},
    {.type = "https_certs_install",
     .serviceType = "deviceHttpsCertInstall",
     .idPrefix = "https_certs_install_id_",
     .targets = "devices",
     .lines = {"Uploading the created HTTPs Certificate for installing has failed!",
               "Uploading the created HTTPs Certificate for installing is successful.",
               "Handling creating HTTPS certificate and installing occurs error: ", updateFirmware},
     .devices = &httpsDevices,
     .announce = &announceCertificates,
     .work = &installCertificates},
    {.type = "https_cert_pkeys",
     .serviceType = "deviceHttpsCertsAndPKeys",
     .idPrefix = "https_cert_pkeys_id_",
     .targets = "devices",
     .asksAgain = true,
     .lines = keyLines,
     .devices = &httpsDevices,
     .announce = &announceCertificatesAndKeys,
     .work = &sendCertificatesAndKeys},
    // The lines of the two below are those of others: logs are read by what they have always said.
    {.type = "ieee_eap_peap",
     .serviceType = "deviceIEEE_EAP_PEAP",
     .idPrefix = "ieee_eap_peap_id_",
     .targets = "devices",
     .asksAgain = true,
     .fileName = "ca_fname",
     .lines = firmwareLines,
     .devices = &networkLoginDevices,
     .announce = &announceNothing,
     .work = &sendPeapCa},
    {.type = "ieee_eap_tls",
     .serviceType = "deviceIEEE_EAP_TLS",
     .idPrefix = "ieee_eap_tls_id_",
     .targets = "devices",
     .asksAgain = true,
     .fileName = "ca_fname",
     .lines = keyLines,
     .devices = &networkLoginDevices,
     .announce = &announceCertificatesAndKeys,
     .work = &sendTlsCa},
};

} // namespace

std::span<const TaskKind> all() {
    return families;
}

} // namespace UploadFamilies
