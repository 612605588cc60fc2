#include "devices/firmwareimage.h"

#include "tables/records.h"

#include <algorithm>
#include <charconv>
#include <regex>
#include <sstream>

namespace emulator {

namespace {

constexpr std::string_view mark = "NVLFW1 ";
constexpr std::size_t maxHeaderLength = 4096;
constexpr std::size_t maxNameLength = 255;

bool isVersion(const std::string &text) {
    static const std::regex form(R"(\d{1,6}(\.\d{1,6}){1,3})");
    return text.size() < 40 && std::regex_match(text, form);
}

std::string versionInName(const std::string &name) {
    static const std::regex form(R"(\d{1,6}(\.\d{1,6}){1,3})");
    std::smatch found;
    const std::string part = name.substr(0, maxNameLength);
    return std::regex_search(part, found, form) ? found.str() : std::string();
}

int firstNumber(const std::string &version) {
    int number = 0;
    std::from_chars(version.data(), version.data() + version.size(), number);
    return number;
}

/// The version after this one: its last number counted up.
std::string nextVersion(const std::string &version) {
    const auto dot = version.rfind('.');
    if (!isVersion(version))
        return "1.0.0";
    return version.substr(0, dot + 1) + std::to_string(std::stoi(version.substr(dot + 1)) + 1);
}

std::string textIn(const Json &record, const char *name) {
    const Json value = record.value(name, Json());
    return value.is_string() ? value.get<std::string>() : std::string();
}

} // namespace

FirmwareImage::FirmwareImage(const UploadedFile &file) : m_isBroken(file.size == 0) {
    if (file.head.starts_with(mark))
        readHeader(file.head.substr(0, std::min(file.head.find('\n'), maxHeaderLength)));
    else
        m_version = versionInName(file.name);
}

void FirmwareImage::readHeader(const std::string &line) {
    std::istringstream words(line.substr(mark.size()));
    std::string models;
    words >> models >> m_version;
    std::istringstream list(models);
    for (std::string model; std::getline(list, model, ',');)
        m_models.push_back(model);
    const bool hasGap = std::find(m_models.begin(), m_models.end(), std::string()) != m_models.end();
    m_isBroken = m_models.empty() || hasGap || !isVersion(m_version) || line.size() == maxHeaderLength;
}

bool FirmwareImage::fits(const std::string &model) const {
    return m_models.empty() || std::any_of(m_models.begin(), m_models.end(),
                                           [&](const auto &prefix) { return model.starts_with(prefix); });
}

DeviceWork FirmwareImage::workOf(const Device &device) const {
    const Json record = Json::parse(device.body);
    const std::string present = textIn(record, "d_fw");
    DeviceWork work;
    work.id = device.id;
    work.restarts = true;
    work.changes["d_fw"] = m_version.empty() ? nextVersion(present) : m_version;
    if (m_isBroken)
        work.failure = "pTaskBrokenFile_01";
    else if (!fits(textIn(record, "d_model")))
        work.failure = "pTaskInvalidFileForThisModelGroup";
    else if (!m_models.empty() && firstNumber(m_version) < firstNumber(present))
        work.failure = "pTaskIncompatibleFirmware";
    return work;
}

} // namespace emulator
