#pragma once

#include <QString>

/// Where the program keeps its files. With NVLDM_ROOT set everything stands flat in that one folder.
namespace AppPaths {

/// The isolating folder, or an empty text when the machine's own places are used.
QString root();

/// Folder of the client's store files; not created here.
QString clientStoreFolder();

/// The file that, where there is one, holds the key of the ciphers.
QString keyFile();

/// The local service's own store file, which the client only reads.
QString serviceStoreFile();

/// The text that stands for the service control's answer when a root is set.
QString serviceStateFile();

/// Folder of the daily log files; not created here.
QString logFolder();

/// Key of the single-instance segment; it carries a hash of the root, so isolated clients do not meet.
QString instanceKey();

} // namespace AppPaths
