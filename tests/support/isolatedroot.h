#pragma once

#include <QTemporaryDir>

/// Gives the test program a folder of its own for every file of the product, for as long as the object lives.
/// To be made before anything of the product is touched: stores and keys look for their folder once.
/// A program that is started again by a test keeps the folder of the test.
class IsolatedRoot {
public:
    IsolatedRoot();
    ~IsolatedRoot();

    QString path() const;
    QString filePath(const QString &name) const { return path() + QLatin1Char('/') + name; }

    /// Writes a file of the folder, readable for its owner alone.
    bool write(const QString &name, const QByteArray &contents) const;
    QByteArray read(const QString &name) const;

private:
    QTemporaryDir m_folder;
};
