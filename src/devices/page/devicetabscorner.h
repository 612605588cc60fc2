#pragma once

#include <QWidget>

class QComboBox;
class QLineEdit;
class QToolButton;

/// What stands beside the tabs of the console: the search, the choice of another server, the columns.
class DeviceTabsCorner : public QWidget {
    Q_OBJECT

public:
    explicit DeviceTabsCorner(QWidget *parent = nullptr);

    QLineEdit *search() const { return m_search; }
    QToolButton *columnsButton() const { return m_columns; }

    /// Offers the servers of the saved list.
    void loadServers();

    /// As wide as the tabs leave room for, within bounds.
    QSize sizeHint() const override;

signals:
    void serverChosen(const QString &serverId);

protected:
    void showEvent(QShowEvent *event) override;

private:
    QLineEdit *m_search;
    QComboBox *m_remoteCombo;
    QToolButton *m_columns;
};
