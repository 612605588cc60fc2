#pragma once

#include <string>

/// Folders and files of Windows that the user alone can open, also below a folder that everybody may read.
namespace WindowsAcl {

/// False where there is one already, or when it cannot be made. What is made in the folder is private as
/// well.
bool makeFolder(const std::wstring &path);

/// An empty file; false where there is one already, or when it cannot be made.
bool makeFile(const std::wstring &path);

} // namespace WindowsAcl
