#include "isolatedroot.h"

#include <QFile>

namespace {
constexpr const char *rootVariable = "NVLDM_ROOT";
} // namespace

IsolatedRoot::IsolatedRoot() {
    qputenv(rootVariable, m_folder.path().toUtf8());
}

IsolatedRoot::~IsolatedRoot() {
    qunsetenv(rootVariable);
}

QString IsolatedRoot::path() const {
    return m_folder.path();
}

bool IsolatedRoot::write(const QString &name, const QByteArray &contents) const {
    QFile file(filePath(name));
    return file.open(QIODevice::WriteOnly, QFileDevice::ReadOwner | QFileDevice::WriteOwner) &&
           file.write(contents) == contents.size();
}

QByteArray IsolatedRoot::read(const QString &name) const {
    QFile file(filePath(name));
    return file.open(QIODevice::ReadOnly) ? file.readAll() : QByteArray();
}
