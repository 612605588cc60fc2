#include "platform/windows/windowsacl.h"

#include <windows.h>

#include <sddl.h>

#include <memory>
#include <vector>

namespace WindowsAcl {

namespace {

struct LocalDeleter {
    void operator()(void *memory) const { ::LocalFree(memory); }
};
struct HandleCloser {
    void operator()(HANDLE handle) const { ::CloseHandle(handle); }
};
using Descriptor = std::unique_ptr<void, LocalDeleter>;

/// The text of the user's identity; empty when the system does not tell it.
std::wstring userIdentity() {
    HANDLE opened = nullptr;
    if (!::OpenProcessToken(::GetCurrentProcess(), TOKEN_QUERY, &opened))
        return {};
    const std::unique_ptr<void, HandleCloser> token(opened);
    DWORD size = 0;
    ::GetTokenInformation(opened, TokenUser, nullptr, 0, &size);
    std::vector<unsigned char> user(size);
    LPWSTR text = nullptr;
    if (size == 0 || !::GetTokenInformation(opened, TokenUser, user.data(), size, &size) ||
        !::ConvertSidToStringSidW(reinterpret_cast<const TOKEN_USER *>(user.data())->User.Sid, &text))
        return {};
    const std::unique_ptr<wchar_t, LocalDeleter> owned(text);
    return text;
}

/// Everything for the user, nothing for others, and nothing taken over from the folder above.
Descriptor userOnly() {
    const std::wstring user = userIdentity();
    const std::wstring rules = L"D:P(A;OICI;FA;;;" + user + L")";
    PSECURITY_DESCRIPTOR descriptor = nullptr;
    if (!user.empty())
        ::ConvertStringSecurityDescriptorToSecurityDescriptorW(rules.c_str(), SDDL_REVISION_1, &descriptor,
                                                               nullptr);
    return Descriptor(descriptor);
}

} // namespace

bool makeFolder(const std::wstring &path) {
    const Descriptor descriptor = userOnly();
    SECURITY_ATTRIBUTES attributes{sizeof(SECURITY_ATTRIBUTES), descriptor.get(), FALSE};
    return descriptor && ::CreateDirectoryW(path.c_str(), &attributes);
}

bool makeFile(const std::wstring &path) {
    const Descriptor descriptor = userOnly();
    SECURITY_ATTRIBUTES attributes{sizeof(SECURITY_ATTRIBUTES), descriptor.get(), FALSE};
    if (!descriptor)
        return false;
    const HANDLE file = ::CreateFileW(path.c_str(), GENERIC_WRITE, 0, &attributes, CREATE_NEW,
                                      FILE_ATTRIBUTE_NORMAL, nullptr);
    if (file == INVALID_HANDLE_VALUE)
        return false;
    ::CloseHandle(file);
    return true;
}

} // namespace WindowsAcl
