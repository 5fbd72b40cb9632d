// Output files written first under a temporary name, then put in place with
// the shared rules that keep an existing output's identity.
#include <system_error>

#include "file_paths.h"
#include "it8/files/output_target.h"
#include "output_error.h"

namespace swatchlog {
namespace {

namespace fs = std::filesystem;

constexpr char kPrefix[] = ".swatchlog-";

fs::path SystemTemporaryFolder() {
    std::error_code ec;
    fs::path folder = fs::temp_directory_path(ec);
    return ec ? fs::path() : folder;
}

} // namespace

struct PendingOutput::Target {
    it8::files::OutputTarget output;
};

PendingOutput::PendingOutput(std::string finalPath)
    : final_(std::move(finalPath)), target_(std::make_unique<Target>()) {
    it8::files::OutputTarget& output = target_->output;
    if (const std::error_code error = output.Open(FileSystemPath(final_))) {
        throw OutputError(final_, Reason(error), "nothing was written");
    }
    // The temporary file is the user's alone; its content reaches the output
    // only on commit. For a new output it is made beside it, so that a folder
    // the user may not write is refused before any work.
    std::error_code error;
    fs::path temporary;
    if (output.Kind() == it8::files::TargetKind::Missing) {
        temporary = it8::files::MakeTemporaryFile(output.Folder(), kPrefix, error);
        if (temporary.empty()) {
            throw OutputError(final_, Reason(error), "nothing was written");
        }
    } else {
        // On Windows in the user's own temporary folder first, which others may
        // not read; elsewhere beside the output first, on the same disk.
#if defined(_WIN32)
        const fs::path folders[] = {SystemTemporaryFolder(), output.Folder()};
#else
        const fs::path folders[] = {output.Folder(), SystemTemporaryFolder()};
#endif
        for (const fs::path& folder : folders) {
            if (temporary.empty()) {
                temporary = it8::files::MakeTemporaryFile(folder, kPrefix, error);
            }
        }
        if (temporary.empty()) {
            throw OutputError(final_, "no temporary file can be made: " + Reason(error),
                              "nothing was written");
        }
    }
    temporary_ = temporary.u8string();
}

PendingOutput::~PendingOutput() {
    std::error_code ec;
    fs::remove(FileSystemPath(temporary_), ec);
}

void PendingOutput::Commit() {
    it8::files::OutputTarget& output = target_->output;
    if (!output.StillNamed()) {
        throw OutputError(final_, "it was replaced or removed while the command ran",
                          "the new content was not written");
    }
    std::string text;
    if (!ReadRegularFile(temporary_, text)) {
        throw OutputError(final_, "the checked output cannot be read back", "nothing was written");
    }
    const it8::files::WriteResult result = output.Replace(it8::files::BytesContent(text));
    std::error_code ec;
    fs::remove(FileSystemPath(temporary_), ec); // no longer needed, whatever happened
    ThrowUnlessWritten(final_, result);
}

} // namespace swatchlog
