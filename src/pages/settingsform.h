#pragma once

#include <QVariantMap>
#include <QWidget>

#include <functional>
#include <vector>

class QCheckBox;
class QComboBox;
class QLineEdit;
class QSpinBox;
class QVBoxLayout;

/// The controls of the settings page, one for each setting that it knows.
class SettingsForm : public QWidget {
    Q_OBJECT

public:
    explicit SettingsForm(QWidget *parent = nullptr);

    /// What the controls hold, of the settings that are offered.
    QVariantMap values() const;
    /// Sets controls; what is not named stays. Tells of no edit.
    void setValues(const QVariantMap &values);
    /// Settings that the service does not have are switched off.
    void setOffered(const QStringList &keys);

signals:
    /// The user has changed a control; its limit has been applied already.
    void edited(const QString &key);

private:
    struct Field {
        QString key;
        QWidget *control;
        std::function<QVariant()> value;
        std::function<void(const QVariant &)> setValue;
        bool offered = true;
    };

    void addClient(QVBoxLayout *layout);
    void addServer(QVBoxLayout *layout);
    void addDeviceManagement(QVBoxLayout *layout);
    void addSection(QVBoxLayout *layout, const QString &icon, const QString &title);
    void addGroup(QVBoxLayout *layout, const QString &title);
    QCheckBox *addSwitch(QVBoxLayout *layout, const char *key, const char *name, const QString &text);
    QSpinBox *addNumber(QVBoxLayout *layout, const char *key, const char *name, const QString &before,
                        const QString &after);
    void addPath(QVBoxLayout *layout);
    void addLanguage(QVBoxLayout *layout);
    void addUploadLimit(QVBoxLayout *layout);
    QSpinBox *makeNumber(const char *key, const char *name, const QString &accessibleName);
    void addField(const char *key, QWidget *control, std::function<QVariant()> value,
                  std::function<void(const QVariant &)> setValue);
    void browse();
    void showEnabled();

    std::vector<Field> m_fields;
    QLineEdit *m_path = nullptr;
    QComboBox *m_language = nullptr;
    QCheckBox *m_uploadLimited = nullptr;
    QSpinBox *m_uploadLimit = nullptr;
};
