#include "utf8_text.h"

#include <cstdint>

namespace swatchlog {
namespace {

// Length of the well-formed sequence at `pos` and its code point, or 0 when ill-formed.
std::size_t DecodeOne(std::string_view text, std::size_t pos, std::uint32_t& cp) {
    const auto byte = [&](std::size_t i) { return static_cast<unsigned char>(text[i]); };
    const unsigned char lead = byte(pos);
    std::size_t length = 0;
    std::uint32_t minimum = 0;
    if (lead < 0x80) {
        cp = lead;
        return 1;
    }
    if (lead >= 0xC2 && lead <= 0xDF) {
        length = 2;
        cp = lead & 0x1Fu;
        minimum = 0x80;
    } else if (lead >= 0xE0 && lead <= 0xEF) {
        length = 3;
        cp = lead & 0x0Fu;
        minimum = 0x800;
    } else if (lead >= 0xF0 && lead <= 0xF4) {
        length = 4;
        cp = lead & 0x07u;
        minimum = 0x10000;
    } else {
        return 0;
    }
    if (pos + length > text.size()) {
        return 0;
    }
    for (std::size_t i = 1; i < length; ++i) {
        const unsigned char next = byte(pos + i);
        if ((next & 0xC0) != 0x80) {
            return 0;
        }
        cp = (cp << 6) | (next & 0x3Fu);
    }
    if (cp < minimum || cp > 0x10FFFF || (cp >= 0xD800 && cp <= 0xDFFF)) {
        return 0;
    }
    return length;
}

} // namespace

bool IsValidUtf8(std::string_view text) {
    std::uint32_t cp = 0;
    for (std::size_t pos = 0; pos < text.size();) {
        const std::size_t length = DecodeOne(text, pos, cp);
        if (length == 0) {
            return false;
        }
        pos += length;
    }
    return true;
}

std::string RepairUtf8(std::string_view text) {
    std::string out;
    out.reserve(text.size());
    std::uint32_t cp = 0;
    for (std::size_t pos = 0; pos < text.size();) {
        const std::size_t length = DecodeOne(text, pos, cp);
        if (length == 0) {
            out += "\xEF\xBF\xBD";
            ++pos;
        } else {
            out.append(text.substr(pos, length));
            pos += length;
        }
    }
    return out;
}

std::size_t DisplayWidth(std::string_view text) {
    std::size_t width = 0;
    for (const char c : text) {
        if ((static_cast<unsigned char>(c) & 0xC0) != 0x80) {
            ++width;
        }
    }
    return width;
}

bool WideFromUtf8(std::string_view text, std::wstring& wide) {
    wide.clear();
    std::uint32_t cp = 0;
    for (std::size_t pos = 0; pos < text.size();) {
        const std::size_t length = DecodeOne(text, pos, cp);
        if (length == 0) {
            return false;
        }
        if constexpr (sizeof(wchar_t) == 2) {
            if (cp >= 0x10000) {
                const std::uint32_t v = cp - 0x10000;
                wide += static_cast<wchar_t>(0xD800 + (v >> 10));
                wide += static_cast<wchar_t>(0xDC00 + (v & 0x3FF));
                pos += length;
                continue;
            }
        }
        wide += static_cast<wchar_t>(cp);
        pos += length;
    }
    return true;
}

} // namespace swatchlog
