#pragma once

#include "devices/devicework.h"
#include "http/uploadedfile.h"

#include <string>
#include <vector>

namespace emulator {

struct Device;

/// A firmware image. One made for this fleet begins with a line
///     NVLFW1 <model prefix>[,<model prefix>...] <version>
/// and fits the models that begin with one of the prefixes; it cannot be installed over firmware whose
/// version has a higher first number. Any other file fits every model, and its version is read from its name,
/// or is the next one of the device.
class FirmwareImage {
public:
    explicit FirmwareImage(const UploadedFile &file);

    DeviceWork workOf(const Device &device) const;

private:
    void readHeader(const std::string &line);
    bool fits(const std::string &model) const;

    bool m_isBroken = false;
    std::vector<std::string> m_models; ///< empty for every model
    std::string m_version;             ///< empty when unknown
};

} // namespace emulator
