#include "json_writer.h"

#include <array>
#include <cmath>

#include "number_format.h"
#include "utf8_text.h"

namespace swatchlog {

JsonWriter::JsonWriter(std::ostream& out) : out_(out) {}

std::string JsonWriter::Quote(std::string_view text) {
    const std::string valid = RepairUtf8(text);
    std::string out = "\"";
    for (const char c : valid) {
        switch (c) {
        case '"':
            out += "\\\"";
            break;
        case '\\':
            out += "\\\\";
            break;
        case '\n':
            out += "\\n";
            break;
        case '\r':
            out += "\\r";
            break;
        case '\t':
            out += "\\t";
            break;
        default:
            if (static_cast<unsigned char>(c) < 0x20) {
                static constexpr std::array<char, 16> hex{'0', '1', '2', '3', '4', '5', '6', '7',
                                                          '8', '9', 'a', 'b', 'c', 'd', 'e', 'f'};
                out += "\\u00";
                out += hex[static_cast<unsigned char>(c) >> 4];
                out += hex[static_cast<unsigned char>(c) & 0xF];
            } else {
                out += c;
            }
        }
    }
    out += '"';
    return out;
}

void JsonWriter::NewLine() {
    out_ << '\n';
    for (std::size_t i = 0; i < levels_.size(); ++i) {
        out_ << "  ";
    }
}

void JsonWriter::BeforeValue() {
    if (afterKey_) {
        afterKey_ = false;
        return;
    }
    if (levels_.empty()) {
        return;
    }
    Level& level = levels_.back();
    if (level.count > 0) {
        out_ << ',';
        if (level.oneLine) {
            out_ << ' ';
        }
    }
    if (!level.oneLine) {
        NewLine();
    }
    ++level.count;
}

void JsonWriter::Open(char bracket, bool isObject, bool oneLine) {
    BeforeValue();
    out_ << bracket;
    const bool parentOneLine = !levels_.empty() && levels_.back().oneLine;
    levels_.push_back(Level{isObject, oneLine || parentOneLine, 0});
}

void JsonWriter::Close(char bracket) {
    const Level level = levels_.back();
    levels_.pop_back();
    if (level.count > 0 && !level.oneLine) {
        NewLine();
    }
    out_ << bracket;
}

void JsonWriter::BeginObject() {
    Open('{', true, false);
}
void JsonWriter::EndObject() {
    Close('}');
}
void JsonWriter::BeginArray(bool oneLine) {
    Open('[', false, oneLine);
}
void JsonWriter::EndArray() {
    Close(']');
}

void JsonWriter::Key(std::string_view key) {
    BeforeValue();
    out_ << Quote(key) << ": ";
    afterKey_ = true;
}

void JsonWriter::String(std::string_view value) {
    BeforeValue();
    out_ << Quote(value);
}

void JsonWriter::Number(double value) {
    BeforeValue();
    out_ << (std::isfinite(value) ? FormatShortest(value) : "null");
}

void JsonWriter::Number(double value, int decimals) {
    BeforeValue();
    if (!std::isfinite(value)) {
        out_ << "null";
        return;
    }
    // Fixed rounding, then the shortest form of the rounded value ("12.5", not "12.5000").
    out_ << FormatShortest(RoundToDecimals(value, decimals));
}

void JsonWriter::Integer(long long value) {
    BeforeValue();
    out_ << value;
}

void JsonWriter::Bool(bool value) {
    BeforeValue();
    out_ << (value ? "true" : "false");
}

void JsonWriter::Null() {
    BeforeValue();
    out_ << "null";
}

void JsonWriter::Finish() {
    out_ << '\n';
}

} // namespace swatchlog
