#include "it8/files/content.h"

namespace it8::files {

Content BytesContent(const std::string& bytes) {
    return {bytes.size(), [&bytes](const PieceSink& sink) {
                return bytes.empty() || sink(bytes.data(), bytes.size());
            }};
}

} // namespace it8::files
