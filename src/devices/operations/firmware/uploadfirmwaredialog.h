#pragma once

#include "devices/operations/firmware/firmwareheader.h"
#include "devices/operations/operationdialog.h"

#include <memory>
#include <vector>

class CheckTable;
class ModelGroupModel;
class QCheckBox;
class RolloutFields;
class ScheduleField;
class FileField;

/// Asks which firmware image devices are to get, when, and whether all of them at once, and puts the upload
/// into the queue.
class UploadFirmwareDialog : public OperationDialog {
    Q_OBJECT

public:
    explicit UploadFirmwareDialog(OperationTargets::List targets, QWidget *parent = nullptr);
    ~UploadFirmwareDialog() override;

protected:
    void apply() override;
    bool isComplete() const override;

private:
    /// What is read on a runner before the dialog can show it.
    struct Start;

    void buildFile();
    void buildDevices();
    void buildTimes();
    void readStart();
    void readUploadLimit();
    void onStartRead(std::shared_ptr<const Start> start);

    void onFileChanged();
    void onOnlyFailedToggled();
    void noteUnticked();
    void onTicked();
    void onGroupToggled(int group, bool checked);
    void showTargets();
    void showGroups();
    void showImage();
    void showMisfits();
    void fitTable();
    void showAction();

    std::vector<int> misfits() const;
    QStringList orderedIds() const;
    void keepChoices() const;
    void startUpload();

    /// Those that the dialog was opened for; never changed, for a runner reads them too.
    const std::shared_ptr<const OperationTargets::List> m_all;
    std::vector<int> m_shown;       ///< places of those that are shown among all
    std::vector<bool> m_isUnticked; ///< of all, as they were when they were last shown
    std::shared_ptr<const Start> m_start;
    FirmwareHeader m_head;
    std::vector<int> m_leftOut; ///< what was unticked because the image does not fit
    FileField *m_file;
    CheckTable *m_table;
    ModelGroupModel *m_groups;
    QLabel *m_empty = nullptr;
    ScheduleField *m_schedule;
    QLabel *m_scheduleWarning = nullptr;
    RolloutFields *m_waves;
    QCheckBox *m_onlyFailed;
};
