#pragma once

#include "platform/json.h"
#include "widgets/dialogs/framelessdialog.h"
#include "widgets/dialogs/warningline.h"

#include <memory>

namespace Ui {
class RemoteConnectionDialog;
}

/// The saved list of remote servers. Edits are kept in the dialog until "Save" writes the whole list.
class RemoteConnectionDialog : public FramelessDialog {
    Q_OBJECT

public:
    explicit RemoteConnectionDialog(QWidget *parent = nullptr);
    ~RemoteConnectionDialog() override;

signals:
    /// The list was saved.
    void updateSvr();

public slots:
    void onAddServer(const QString &remember, const QString &name, const QString &info, const QString &email,
                     const QString &password);
    void onEditServer(const QString &remember, const QString &name, const QString &info, const QString &email,
                      const QString &password);

private:
    void load();
    void fillTable();
    void filterRows();
    void updateButtons();
    void openAddDialog();
    void openEditDialog();
    void deleteSelected();
    bool matchesSearch(const JSON &server) const;
    void select(int row);
    void save();
    void onSaved(bool saved);
    void setSaving(bool saving);
    int selectedRow() const;
    void showKeyOfSelected();
    void forgetKeysBut(const QStringList &servers) const;

    std::unique_ptr<Ui::RemoteConnectionDialog> m_ui;
    WarningLine m_warning;
    std::unique_ptr<JSON> m_servers;
    QStringList m_loadedServers; ///< as ServerKeys names them
    bool m_saving = false;
};
