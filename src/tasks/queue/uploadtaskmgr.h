#pragma once

#include "tasks/queue/taskqueue.h"

struct SelfSignedCert;

/// The queue of operations that send files or certificates to devices. Every insertion returns false, with
/// the reason in the log, when something is missing; ctid takes the record's id where it is not null.
///
/// deviceIds: array of ids. Lists of files: arrays of {"fpath","fname","d_mac"}, each file for the device
/// with that address. Passwords are ciphered at once.
class UploadTaskMgr : public TaskQueue {
    Q_OBJECT

public:
    static UploadTaskMgr &instance();

    bool insertNewConfigFileUploadTask(const QString &mode, const QString &fileName, const QString &filePath,
                                       const JSON &deviceIds, QString *ctid = nullptr);
    /// actionTime: Unix ms as text, empty for now.
    bool insertNewFWUploadTask(const QString &mode, const QString &filePath, const QString &fileName,
                               const JSON &deviceIds, const QString &fwid, const QString &actionTime,
                               QString *ctid = nullptr);
    /// sdCard: the package goes to the memory card.
    bool insertNewPackageUploadTask(const QString &mode, const QString &fileName, const QString &filePath,
                                    bool sdCard, const JSON &deviceIds, QString *ctid = nullptr);

    bool insertNewHttpsSelfSignedCertTask(const SelfSignedCert &cert, const JSON &deviceIds,
                                          QString *ctid = nullptr);
    bool insertNewHttpsCertInstallTask(const QString &mode, int port, const JSON &certs,
                                       const JSON &deviceIds, QString *ctid = nullptr);
    bool insertNewHttpsCertPKeysTask(const QString &mode, int port, const JSON &certs, const JSON &pkeys,
                                     const JSON &deviceIds, QString *ctid = nullptr);

    bool insertNewPeapTask(const QString &mode, const QString &caName, const QString &caPath,
                           const QString &identity, const QString &pass, const JSON &deviceIds,
                           QString *ctid = nullptr);
    bool insertNewTlsTask(const QString &mode, const QString &caName, const QString &caPath,
                          const QString &identity, const QString &pass, const JSON &certs, const JSON &pkeys,
                          const JSON &deviceIds, QString *ctid = nullptr);

private:
    UploadTaskMgr();
};
