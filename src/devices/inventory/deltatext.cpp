#include "devices/inventory/deltatext.h"

#include <algorithm>

namespace {

/// Takes the next piece off a text: up to and with a comma, which mostly ends a member.
std::string_view takePiece(std::string_view &text) {
    const std::size_t comma = text.find(',');
    const std::string_view piece = text.substr(0, comma == std::string_view::npos ? comma : comma + 1);
    text.remove_prefix(piece.size());
    return piece;
}

/// Seven bits a byte, the lowest first.
void appendNumber(std::string &bytes, std::size_t number) {
    for (; number > 0x7F; number >>= 7)
        bytes += static_cast<char>(number | 0x80);
    bytes += static_cast<char>(number);
}

std::size_t takeNumber(std::string_view &bytes) {
    std::size_t number = 0;
    for (int shift = 0; !bytes.empty(); shift += 7) {
        const auto byte = static_cast<unsigned char>(bytes.front());
        bytes.remove_prefix(1);
        number |= static_cast<std::size_t>(byte & 0x7F) << shift;
        if (byte < 0x80)
            break;
    }
    return number;
}

/// A run of pieces that are as in the base is written as an empty piece and their number.
void appendRun(std::string &delta, std::size_t &run) {
    if (run > 0) {
        appendNumber(delta, 0);
        appendNumber(delta, 0);
        appendNumber(delta, run);
    }
    run = 0;
}

} // namespace

DeltaText::DeltaText(Base base, std::string_view text) : m_base(std::move(base)) {
    std::string_view rest = m_base ? std::string_view(*m_base) : std::string_view();
    std::size_t run = 0;
    while (!text.empty()) {
        const std::string_view piece = takePiece(text);
        const std::string_view old = takePiece(rest);
        if (piece == old) {
            ++run;
            continue;
        }
        appendRun(m_delta, run);
        const auto common = static_cast<std::size_t>(
            std::mismatch(piece.begin(), piece.end(), old.begin(), old.end()).first - piece.begin());
        appendNumber(m_delta, common);
        appendNumber(m_delta, piece.size() - common);
        m_delta += piece.substr(common);
    }
    appendRun(m_delta, run);
    m_delta.shrink_to_fit();
}

std::string DeltaText::text() const {
    std::string text;
    std::string_view delta = m_delta;
    std::string_view rest = m_base ? std::string_view(*m_base) : std::string_view();
    while (!delta.empty()) {
        const std::size_t common = takeNumber(delta);
        const std::size_t length = takeNumber(delta);
        if (common == 0 && length == 0) {
            for (std::size_t run = takeNumber(delta); run > 0; --run)
                text += takePiece(rest);
            continue;
        }
        text += takePiece(rest).substr(0, common);
        text += delta.substr(0, length);
        delta.remove_prefix(length);
    }
    return text;
}
