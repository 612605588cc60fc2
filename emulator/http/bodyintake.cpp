#include "http/bodyintake.h"

#include "http/dispatcher.h"

#include <httplib.h>

#include <utility>

namespace emulator {

namespace {

constexpr auto parameterPart = "text";
// What is kept of all the files of one form.
constexpr std::uint64_t maxKept = 64U << 20;

} // namespace

BodyIntake::BodyIntake(Request &incoming, const BodyLimits &limits, Watch watch)
    : m_incoming(incoming), m_limits(limits), m_watch(std::move(watch)) {}

BodyIntake::Result BodyIntake::readText(const httplib::ContentReader &reader) {
    return resultOf(reader([this](const char *bytes, std::size_t count) {
        return takeText({bytes, count}) && m_watch(count);
    }));
}

BodyIntake::Result BodyIntake::readForm(const httplib::ContentReader &reader) {
    m_incoming.isForm = true;
    const bool whole = reader(
        [this](const httplib::MultipartFormData &part) {
            endPart();
            beginPart(part.name, part.filename);
            return true;
        },
        [this](const char *bytes, std::size_t count) {
            return takePart({bytes, count}) && m_watch(count);
        });
    endPart();
    return resultOf(whole);
}

/// A body that is too long is still read to its end, or its sender would see a broken connection.
bool BodyIntake::takeText(std::string_view bytes) {
    m_tooLong = m_tooLong || m_incoming.body.size() + bytes.size() > m_limits.text;
    if (!m_tooLong)
        m_incoming.body.append(bytes);
    return true;
}

void BodyIntake::beginPart(const std::string &name, const std::string &fileName) {
    if (name == parameterPart)
        return;
    if (m_onParameters && !m_incoming.body.empty())
        std::exchange(m_onParameters, {})();
    m_file.emplace(name, fileName);
}

bool BodyIntake::takePart(std::string_view bytes) {
    m_size += bytes.size();
    m_tooLong = m_tooLong || m_size > m_limits.upload;
    if (m_tooLong)
        return true;
    if (!m_file)
        return takeText(bytes);
    m_file->take(bytes);
    return true;
}

void BodyIntake::endPart() {
    if (!m_file)
        return;
    UploadedFile file = m_file->finish();
    m_file.reset();
    m_headSize += file.head.size();
    m_tooLong = m_tooLong || m_headSize > maxKept;
    if (!m_tooLong)
        m_incoming.files.push_back(std::move(file));
}

BodyIntake::Result BodyIntake::resultOf(bool whole) const {
    return m_tooLong ? Result::TooLong : whole ? Result::Whole : Result::Broken;
}

} // namespace emulator
