#include "output_error.h"

#include "utf8_text.h"

namespace swatchlog {

std::string Reason(const std::error_code& error) {
    std::string text = error.message();
    while (!text.empty() && (text.back() == '.' || text.back() == '\n' || text.back() == '\r')) {
        text.pop_back();
    }
    return text;
}

ChartError OutputError(const std::string& output, const std::string& reason,
                       const std::string& state) {
    return ChartError(RepairUtf8(output) + ": the output file cannot be written (" + reason + ")" +
                          (state.empty() ? "" : "; " + state),
                      output, 0);
}

void ThrowUnlessWritten(const std::string& output, const it8::files::WriteResult& result) {
    using it8::files::Outcome;
    const char* state = "";
    switch (result.outcome) {
    case Outcome::Written:
        return;
    case Outcome::NotWritten:
        state = "nothing was written";
        break;
    case Outcome::Unchanged:
        state = "it is unchanged";
        break;
    case Outcome::Restored:
        state = "its old content was put back";
        break;
    case Outcome::Emptied:
        state = "it is now empty, since its old content could not be put back";
        break;
    case Outcome::Uncertain:
        state = "its content is uncertain";
        break;
    case Outcome::Interrupted:
        break; // a device or pipe: what it took is gone
    }
    throw OutputError(output, Reason(result.error), state);
}

} // namespace swatchlog
