#pragma once

#include <QString>

/// The kinds of tasks.
namespace TaskType {

inline const QString firmwareUpload = QStringLiteral("deviceFWUpgrade");
inline const QString configFileUpload = QStringLiteral("deviceConfigFileUpload");
inline const QString packageUpload = QStringLiteral("devicePackageUpload");
inline const QString debugInfoExport = QStringLiteral("deviceExportDeviceInfo");
inline const QString restart = QStringLiteral("deviceRestart");
inline const QString restore = QStringLiteral("deviceRestore");
inline const QString changePassword = QStringLiteral("deviceChangePass");
inline const QString passwordPolicy = QStringLiteral("devicePassPolicy");

/// The title of a type in plain words, the type itself where it is not known.
QString title(const QString &type);

} // namespace TaskType
