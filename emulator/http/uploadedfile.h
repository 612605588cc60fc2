#pragma once

#include <openssl/evp.h>

#include <cstdint>
#include <filesystem>
#include <memory>
#include <string>
#include <string_view>

namespace emulator {

/// A file that came with a request, and of it what is worth keeping: images of gigabytes go by.
struct UploadedFile {
    std::string part; ///< the name of the form's part
    std::string name;
    std::uint64_t size = 0;
    std::string sha256; ///< hex
    std::string head;   ///< its beginning, all of a certificate or a key
};

/// Takes a file in, piece by piece.
class FileIntake {
public:
    static constexpr std::size_t maxHeadLength = 1U << 20;

    FileIntake(std::string part, std::string name);

    void take(std::string_view bytes);
    /// To be called once, at the end of the file.
    UploadedFile finish();

private:
    struct FreeDigest {
        void operator()(EVP_MD_CTX *digest) const { EVP_MD_CTX_free(digest); }
    };

    UploadedFile m_file;
    std::unique_ptr<EVP_MD_CTX, FreeDigest> m_digest;
};

/// Takes in a file of this machine. Throws Refusal(Malformed) when it cannot be read.
UploadedFile localFile(const std::filesystem::path &path, const std::string &name);

} // namespace emulator
