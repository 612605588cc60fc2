#pragma once

#include <memory>
#include <string>
#include <string_view>

/// A text kept as its difference from another one that is much alike, as the records of two devices are: a
/// third of the memory or less. Never changed, so threads share it.
class DeltaText {
public:
    using Base = std::shared_ptr<const std::string>;

    DeltaText() = default;
    /// The base may be null or any text; the more alike, the less is kept.
    DeltaText(Base base, std::string_view text);

    /// The whole text.
    std::string text() const;

private:
    Base m_base;
    std::string m_delta; ///< for each piece: how much of the base's piece it begins with, and what follows
};
