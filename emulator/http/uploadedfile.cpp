#include "http/uploadedfile.h"

#include "http/response.h"
#include "tables/credentials.h"

#include <algorithm>
#include <fstream>
#include <stdexcept>
#include <utility>
#include <vector>

namespace emulator {

namespace {

void require(bool done) {
    if (!done)
        throw std::runtime_error("a file cannot be hashed");
}

} // namespace

FileIntake::FileIntake(std::string part, std::string name) : m_digest(EVP_MD_CTX_new()) {
    m_file.part = std::move(part);
    m_file.name = std::move(name);
    require(m_digest && EVP_DigestInit_ex(m_digest.get(), EVP_sha256(), nullptr) == 1);
}

void FileIntake::take(std::string_view bytes) {
    require(EVP_DigestUpdate(m_digest.get(), bytes.data(), bytes.size()) == 1);
    m_file.size += bytes.size();
    const std::size_t room = maxHeadLength - m_file.head.size();
    m_file.head.append(bytes.substr(0, std::min(room, bytes.size())));
}

UploadedFile FileIntake::finish() {
    std::string digest(EVP_MAX_MD_SIZE, '\0');
    unsigned length = 0;
    require(EVP_DigestFinal_ex(m_digest.get(), reinterpret_cast<unsigned char *>(digest.data()), &length) ==
            1);
    m_file.sha256 = toHex(std::string_view(digest).substr(0, length));
    return std::move(m_file);
}

UploadedFile localFile(const std::filesystem::path &path, const std::string &name) {
    std::error_code ignored;
    std::ifstream file;
    // A pipe or a device would be read for ever.
    if (std::filesystem::is_regular_file(path, ignored))
        file.open(path, std::ios::binary);
    if (!file.is_open())
        throw Refusal(Code::Malformed, "the local file cannot be read");
    FileIntake intake("fimage", name);
    std::vector<char> piece(1U << 18);
    while (file.read(piece.data(), static_cast<std::streamsize>(piece.size())) || file.gcount() > 0)
        intake.take({piece.data(), static_cast<std::size_t>(file.gcount())});
    return intake.finish();
}

} // namespace emulator
