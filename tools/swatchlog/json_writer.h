// A small streaming JSON writer: indented objects, one-line arrays on request,
// strings repaired to valid UTF-8, numbers with a decimal point.
#pragma once

#include <ostream>
#include <string>
#include <string_view>
#include <vector>

namespace swatchlog {

class JsonWriter {
public:
    explicit JsonWriter(std::ostream& out);

    void BeginObject();
    void EndObject();
    /// `oneLine` keeps the array's values on one line (for lists of numbers).
    void BeginArray(bool oneLine = false);
    void EndArray();
    /// The key of the next value inside an object.
    void Key(std::string_view key);

    void String(std::string_view value);
    /// Finite numbers in their shortest exact form; NaN and infinities as null.
    void Number(double value);
    /// A number rounded to `decimals` places (null when not finite).
    void Number(double value, int decimals);
    void Integer(long long value);
    void Bool(bool value);
    void Null();

    /// Ends the document with a line break.
    void Finish();

    /// `text` as a JSON string literal, quotes included.
    static std::string Quote(std::string_view text);

private:
    struct Level {
        bool isObject = false;
        bool oneLine = false;
        int count = 0;
    };
    void BeforeValue();
    void Open(char bracket, bool isObject, bool oneLine);
    void Close(char bracket);
    void NewLine();

    std::ostream& out_;
    std::vector<Level> levels_;
    bool afterKey_ = false;
};

} // namespace swatchlog
