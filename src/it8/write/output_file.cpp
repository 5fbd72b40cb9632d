#include "it8/write/output_file.h"

#include "it8/files/output_target.h"
#include "it8/write/native_text.h"

namespace it8 {

bool WriteLinesToFile(const std::filesystem::path& target, const std::vector<std::string>& lines) {
    files::OutputTarget output;
    if (output.Open(target)) {
        return false;
    }
    return output.Replace(NativeTextContent(lines)).outcome == files::Outcome::Written;
}

} // namespace it8
