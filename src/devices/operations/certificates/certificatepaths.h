#pragma once

#include <QStringList>

#include <functional>

class QWidget;

/// The ways in which users point at certificate files.
namespace CertificatePaths {

enum class Count { One, Many };

/// Asks for files without an event loop of its own and remembers their folder; nothing is called when the
/// user gives it up.
void ask(QWidget *parent, const QString &title, Count count,
         const std::function<void(const QStringList &paths)> &chosen);

} // namespace CertificatePaths
