#include "devices/packageupload.h"

#include "tables/records.h"

#include <algorithm>

namespace emulator {

namespace {

constexpr std::size_t slots = 4;
constexpr std::int64_t fullCard = 95;
constexpr std::uint64_t percentOfCard = (32ULL << 30) / 100;

std::string inSlot(const char *code, std::size_t slot) {
    return std::string(code) + (slot < 10 ? "_0" : "_") + std::to_string(slot);
}

std::vector<std::string> packagesOf(const Json &record) {
    std::vector<std::string> names;
    const Json kept = record.value("d_packages", Json::array());
    for (const Json &name : kept.is_array() ? kept : Json::array())
        names.push_back(name.is_string() ? name.get<std::string>() : std::string());
    return names;
}

std::string cardFailure(const Json &record, std::size_t slot) {
    const Json status = record.value("d_sdstatus", Json());
    const Json usage = record.value("d_sdusage", Json());
    if (status == "Error" || status == "readonly")
        return inSlot("pTaskSdCardError", slot);
    if (status != "ready")
        return "pTaskNoSdCardDetected";
    const bool full = usage.is_number_integer() && usage.get<std::int64_t>() >= fullCard;
    return full ? inSlot("pTaskInsufficientStorage", slot) : std::string();
}

std::int64_t usageWith(const Json &record, std::uint64_t size) {
    const Json usage = record.value("d_sdusage", Json());
    const std::int64_t before = usage.is_number_integer() ? usage.get<std::int64_t>() : 0;
    return std::min<std::int64_t>(before + static_cast<std::int64_t>(size / percentOfCard) + 1, 100);
}

} // namespace

DeviceWork packageWork(const UploadedFile &file, bool onCard, const Device &device) {
    const Json record = Json::parse(device.body);
    auto packages = packagesOf(record);
    const auto known = std::find(packages.begin(), packages.end(), file.name);
    const bool isNew = known == packages.end();
    const auto slot = static_cast<std::size_t>(known - packages.begin()) + 1;
    DeviceWork work;
    work.id = device.id;
    work.failure = onCard ? cardFailure(record, std::min(slot, slots)) : std::string();
    if (work.failure.empty() && slot > slots)
        work.failure = inSlot("pTaskMaxPackageUploadLimit", slots);
    if (work.failure.empty() && file.size == 0)
        work.failure = inSlot("pTaskBrokenFile", slot);
    if (isNew)
        packages.push_back(file.name);
    work.changes["d_packages"] = packages;
    if (onCard)
        work.changes["d_sdusage"] = usageWith(record, file.size);
    return work;
}

} // namespace emulator
