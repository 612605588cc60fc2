#pragma once

#include "devices/operations/certificates/certificateassignments.h"
#include "devices/operations/certificates/certificatemodel.h"

#include <QWidget>

class CertificateReader;
class CheckTable;
class QCheckBox;
class QLabel;
class QPushButton;
class QToolButton;
class QVBoxLayout;
class TargetWarningLines;

/// The part of a dialog that says which device gets which certificate and private key: files are chosen many
/// at once and find their devices by themselves, or are picked by hand; devices can be unticked.
class CertificateBox : public QWidget {
    Q_OBJECT

public:
    explicit CertificateBox(OperationTargets::List targets, QWidget *parent = nullptr);

    void setNeeds(CertificateNeeds needs);
    CertificateNeeds needs() const { return m_model->needs(); }
    const OperationTargets::List &targets() const { return m_model->targets(); }
    /// Opens private keys that are under a pass phrase.
    void setPassPhrase(const QString &passPhrase);
    void forgetPassPhrase() { m_passPhrase.clear(); }
    /// What speaks against devices whatever their files are.
    void setDeviceWarnings(std::vector<TargetWarning> warnings);

    /// Reads files and gives each to its device.
    void takeFiles(const QStringList &paths);
    bool isReading() const;

    int checkedCount() const { return m_model->checkedCount(); }
    /// How many devices the upload can serve.
    int readyCount() const { return static_cast<int>(m_ready.size()); }
    /// Those devices with their files.
    CertificateAssignments order() const;

signals:
    /// Other devices can be served now, or files are read.
    void changed();

private:
    QWidget *buildHead();
    QWidget *buildTable();
    QWidget *buildHandPicking();
    QToolButton *addLink(QWidget *line, const char *name, const QString &text);
    void connectParts();

    void chooseFiles();
    void pick(CertificateModel::Slot slot);
    void onMatched(const CertificateModel::Files &files);
    void onPicked(const std::vector<int> &items, const CertificateFilePtr &file, CertificateModel::Slot slot);
    void showReading();
    void showState();
    void showSelection();
    std::vector<int> selectedItems() const;

    CertificateModel *m_model;
    CertificateReader *m_reader;
    QVBoxLayout *m_layout;
    QCheckBox *m_all = nullptr;
    QPushButton *m_choose = nullptr;
    CheckTable *m_table = nullptr;
    QLabel *m_details = nullptr;
    QWidget *m_handPicking = nullptr;
    QToolButton *m_pickCertificate = nullptr;
    QToolButton *m_pickKey = nullptr;
    QToolButton *m_takeAway = nullptr;
    QLabel *m_filesNote = nullptr; ///< what became of the last files
    TargetWarningLines *m_warnings;
    std::vector<int> m_ready;
    QString m_passPhrase;
    QStringList m_unmatchedFiles; ///< files of the present reading that are nobody's
};
