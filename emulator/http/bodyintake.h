#pragma once

#include "http/uploadedfile.h"

#include <cstdint>
#include <functional>
#include <optional>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

namespace httplib {
class ContentReader;
}

namespace emulator {

struct Request;

/// Bounds of a request's body, in bytes.
struct BodyLimits {
    std::uint64_t text = 16U << 20;
    std::uint64_t upload = 8ULL << 30;
};

/// Takes the body of a request in while it arrives: a text whole, of a form's files what an UploadedFile
/// keeps.
class BodyIntake {
public:
    enum class Result { Whole, Broken, TooLong };
    /// Is called with each piece; false ends the reading.
    using Watch = std::function<bool(std::size_t)>;

    BodyIntake(Request &incoming, const BodyLimits &limits, Watch watch);

    /// Called once, when the parameters of a form are there and its files follow.
    void setOnParameters(std::function<void()> onParameters) { m_onParameters = std::move(onParameters); }

    Result readText(const httplib::ContentReader &reader);
    Result readForm(const httplib::ContentReader &reader);

private:
    bool takeText(std::string_view bytes);
    void beginPart(const std::string &name, const std::string &fileName);
    bool takePart(std::string_view bytes);
    void endPart();
    Result resultOf(bool whole) const;

    Request &m_incoming;
    BodyLimits m_limits;
    Watch m_watch;
    std::function<void()> m_onParameters;
    std::optional<FileIntake> m_file; ///< none while the parameters arrive
    std::uint64_t m_size = 0;
    std::uint64_t m_headSize = 0;
    bool m_tooLong = false;
};

} // namespace emulator
