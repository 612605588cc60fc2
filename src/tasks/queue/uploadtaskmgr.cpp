#include "tasks/queue/uploadtaskmgr.h"

#include "platform/crypto/ciphers.h"
#include "tasks/queue/selfsignedcert.h"
#include "tasks/queue/taskcheck.h"
#include "tasks/queue/uploadkinds.h"

#include <QDebug>

#include <nlohmann/json.hpp>

namespace {

constexpr const char *noRelatedInformation = "Inserting new task requires the related information.";

/// A password in the form in which it travels. No password stays empty.
std::optional<std::string> sealed(const QString &pass) {
    return pass.isEmpty() ? std::string() : Ciphers::sealSecret(pass.toStdString());
}

} // namespace

UploadTaskMgr &UploadTaskMgr::instance() {
    // Never destroyed: its worker may run until the program ends.
    static auto *const manager = new UploadTaskMgr;
    return *manager;
}

UploadTaskMgr::UploadTaskMgr() : TaskQueue(UploadFamilies::all(), "Handling task occurs error: ") {}

bool UploadTaskMgr::insertNewConfigFileUploadTask(const QString &mode, const QString &fileName,
                                                  const QString &filePath, const JSON &deviceIds,
                                                  QString *ctid) {
    return TaskCheck("UploadTaskMgr#insertNewConfigFileUploadTask")
               .texts({mode, fileName, filePath})
               .devices(deviceIds)
               .fileName(fileName)
               .passed() &&
           insert("configuration_file",
                  {{"device_ids", deviceIds},
                   {"mode", mode.toStdString()},
                   {"file_name", fileName.toStdString()},
                   {"file_path", filePath.toStdString()}},
                  ctid);
}

bool UploadTaskMgr::insertNewFWUploadTask(const QString &mode, const QString &filePath,
                                          const QString &fileName, const JSON &deviceIds, const QString &fwid,
                                          const QString &actionTime, QString *ctid) {
    return TaskCheck().texts({mode, filePath, fileName}).devices(deviceIds).fileName(fileName).passed() &&
           insert("fw",
                  {{"devices", deviceIds},
                   {"mode", mode.toStdString()},
                   {"fpath", filePath.toStdString()},
                   {"fname", fileName.toStdString()},
                   {"fwid", fwid.toStdString()},
                   {"actm", actionTime.toStdString()}},
                  ctid);
}

bool UploadTaskMgr::insertNewPackageUploadTask(const QString &mode, const QString &fileName,
                                               const QString &filePath, bool sdCard, const JSON &deviceIds,
                                               QString *ctid) {
    return TaskCheck("UploadTaskMgr::insertNewPackageUploadTask")
               .texts({mode, fileName, filePath})
               .devices(deviceIds, "Inserting new task requires the device ids")
               .fileName(fileName)
               .passed() &&
           insert("package",
                  {{"device_ids", deviceIds},
                   {"mode", mode.toStdString()},
                   {"file_name", fileName.toStdString()},
                   {"file_path", filePath.toStdString()},
                   {"sd_card", sdCard}},
                  ctid);
}

bool UploadTaskMgr::insertNewHttpsSelfSignedCertTask(const SelfSignedCert &cert, const JSON &deviceIds,
                                                     QString *ctid) {
    qDebug("Initiating generating HTTPS self-signed certificate task");
    return TaskCheck().texts({cert.mode}).devices(deviceIds).passed() &&
           insert("https_selfsigned_certs",
                  {{"devices", deviceIds},
                   {"mode", cert.mode.toStdString()},
                   {"https_port", cert.httpsPort},
                   {"country", cert.country.toStdString()},
                   {"province", cert.province.toStdString()},
                   {"locality", cert.locality.toStdString()},
                   {"org", cert.org.toStdString()},
                   {"org_unit", cert.orgUnit.toStdString()},
                   {"validity", cert.validity.toStdString()}},
                  ctid);
}

bool UploadTaskMgr::insertNewHttpsCertInstallTask(const QString &mode, int port, const JSON &certs,
                                                  const JSON &deviceIds, QString *ctid) {
    qDebug("Initiating the created HTTPS certificate installing task");
    return TaskCheck().texts({mode}).devices(deviceIds).certificates(certs).passed() &&
           insert(
               "https_certs_install",
               {{"devices", deviceIds}, {"mode", mode.toStdString()}, {"https_port", port}, {"cert", certs}},
               ctid);
}

bool UploadTaskMgr::insertNewHttpsCertPKeysTask(const QString &mode, int port, const JSON &certs,
                                                const JSON &pkeys, const JSON &deviceIds, QString *ctid) {
    qDebug("Initiating the uploading HTTPS certificate and private key task");
    return TaskCheck().texts({mode}).devices(deviceIds).certificates(certs).certificates(pkeys).passed() &&
           insert("https_cert_pkeys",
                  {{"devices", deviceIds},
                   {"mode", mode.toStdString()},
                   {"https_port", port},
                   {"cert", certs},
                   {"pkey", pkeys}},
                  ctid);
}

bool UploadTaskMgr::insertNewPeapTask(const QString &mode, const QString &caName, const QString &caPath,
                                      const QString &identity, const QString &pass, const JSON &deviceIds,
                                      QString *ctid) {
    qDebug("Initiating the uploading IEEE CA (EAP-PEAP) task");
    const std::optional<std::string> cipher = sealed(pass);
    return TaskCheck()
               .texts({mode, caName, caPath})
               .require(cipher.has_value())
               .devices(deviceIds, noRelatedInformation)
               .fileName(caName)
               .passed() &&
           insert("ieee_eap_peap",
                  {{"devices", deviceIds},
                   {"mode", mode.toStdString()},
                   {"ca_fname", caName.toStdString()},
                   {"ca_fpath", caPath.toStdString()},
                   {"identity", identity.toStdString()},
                   {"pass", *cipher}},
                  ctid);
}

bool UploadTaskMgr::insertNewTlsTask(const QString &mode, const QString &caName, const QString &caPath,
                                     const QString &identity, const QString &pass, const JSON &certs,
                                     const JSON &pkeys, const JSON &deviceIds, QString *ctid) {
    // The text of the other one: logs are read by what they have always said.
    qDebug("Initiating the uploading IEEE CA (EAP-PEAP) task");
    const std::optional<std::string> cipher = sealed(pass);
    return TaskCheck()
               .texts({mode, caName, caPath})
               .require(cipher.has_value())
               .devices(deviceIds, noRelatedInformation)
               .fileName(caName)
               .certificates(certs)
               .certificates(pkeys)
               .passed() &&
           insert("ieee_eap_tls",
                  {{"devices", deviceIds},
                   {"mode", mode.toStdString()},
                   {"ca_fname", caName.toStdString()},
                   {"ca_fpath", caPath.toStdString()},
                   {"identity", identity.toStdString()},
                   {"pass", *cipher},
                   {"cert", certs},
                   {"pkey", pkeys}},
                  ctid);
}
