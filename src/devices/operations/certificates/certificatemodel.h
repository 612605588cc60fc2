#pragma once

#include "devices/operations/certificates/certificatecheck.h"
#include "devices/operations/operationtargets.h"
#include "widgets/lists/checklistmodel.h"

#include <QHash>

/// The devices of a certificate upload, each with the files that it gets and what is wrong with them.
class CertificateModel : public CheckListModel {
    Q_OBJECT

public:
    enum Column {
        ModelColumn,
        IpColumn,
        MacColumn,
        CertificateColumn,
        KeyColumn,
        ExpiryColumn,
        NoteColumn,
        columnTotal
    };
    using Files = std::vector<CertificateFilePtr>;

    explicit CertificateModel(OperationTargets::List targets, QObject *parent = nullptr);

    const OperationTargets::List &targets() const { return m_targets; }
    const CertificatePair &pair(int item) const { return m_pairs[static_cast<std::size_t>(item)]; }
    const DeviceRecord &device(int item) const { return *m_targets[static_cast<std::size_t>(item)].device; }

    void setNeeds(CertificateNeeds needs);
    CertificateNeeds needs() const { return m_needs; }
    /// What speaks against devices whatever their files are.
    void setDeviceWarnings(std::vector<TargetWarning> warnings);

    /// Gives each file to the device whose address its name bears, in place of one that the device had; the
    /// only device gets those that bear no address, too. Returns the files that are nobody's.
    Files matchFiles(const Files &files);
    enum class Slot { Certificate, Key };
    /// Gives devices a file, chosen for them by hand. False where it is not of the kind.
    bool assign(const std::vector<int> &items, const CertificateFilePtr &file, Slot slot);
    /// Takes files that were read again in place of those with the same paths.
    void replace(const Files &files);
    void removeFiles(const std::vector<int> &items);

    /// The paths of the private keys under pass phrases.
    QStringList encryptedKeys() const;

    /// What speaks against devices, their files included.
    std::vector<TargetWarning> warnings() const;
    /// The checked devices that the upload can serve.
    std::vector<int> readyItems() const;
    /// Subject, issuer and validity of a device's certificate; empty where it has none.
    QString details(int item) const;

    int columnCount(const QModelIndex &parent = {}) const override;
    QVariant data(const QModelIndex &index, int role) const override;
    QVariant headerData(int section, Qt::Orientation orientation, int role) const override;

signals:
    /// Devices have other files now, or need others.
    void filesChanged();

protected:
    QString text(int item, int column) const override;
    std::vector<int> find(const QString &search) const override;
    int compare(int left, int right, int column, bool ascending) const override;

private:
    void readAddresses();
    int ownerOf(const QString &fileName) const;
    static void give(CertificatePair &pair, const CertificateFilePtr &file);
    void judge(std::size_t item, qint64 now);
    void judgeAll();
    void tellFiles();
    QString blockedText() const;
    QString note(int item) const;
    QString noteIcon(int item) const;

    OperationTargets::List m_targets;
    std::vector<CertificatePair> m_pairs;
    std::vector<CertificateFindings> m_findings;
    std::vector<TargetWarning> m_deviceWarnings;
    std::vector<QString> m_deviceNotes;
    QHash<quint64, int> m_byMac;
    std::vector<bool> m_isNameless; ///< without an address of their own that files can bear
    CertificateNeeds m_needs = CertificateNeeds::Nothing;
};
