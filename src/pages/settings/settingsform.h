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

    /// What the controls hold, of the settings that are offered and those that the user has changed.
    QVariantMap values() const;
    /// Sets controls; what is not named stays. Tells of no edit.
    void setValues(const QVariantMap &values);
    /// The same, and puts the others back to what they were at first: no change of the user's is left.
    void restore(const QVariantMap &values);
    /// Names the settings that the service has.
    void setOffered(const QStringList &keys);

signals:
    /// The user has changed a control; its limit has been applied already.
    void edited(const QString &key);

private:
    struct Field {
        QString key;
        std::function<QVariant()> value;
        std::function<void(const QVariant &)> setValue;
        QVariant first = {}; ///< its value before anything was set
        bool offered = true; ///< the service has it
        bool touched = false;
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
    void addField(const char *key, std::function<QVariant()> value,
                  std::function<void(const QVariant &)> setValue);
    void browse();
    void onEdited(const QString &key);
    void showEnabled();

    std::vector<Field> m_fields;
    QLineEdit *m_path = nullptr;
    QComboBox *m_language = nullptr;
    QCheckBox *m_uploadLimited = nullptr;
    QSpinBox *m_uploadLimit = nullptr;
};
