#include "it8/write/output_file.h"

#include <fstream>
#include <random>
#include <system_error>

namespace it8 {
namespace {

namespace fs = std::filesystem;

// A symbolic link is written through, as opening the link for writing would:
// the file it points to is the one replaced.
fs::path ResolveTarget(const fs::path& target) {
    std::error_code ec;
    if (fs::is_symlink(fs::symlink_status(target, ec))) {
        const fs::path resolved = fs::weakly_canonical(target, ec);
        if (!ec) {
            return resolved;
        }
    }
    return target;
}

// A short name in the target's folder that no other writer is likely to pick
// at the same moment. It does not grow with the target's name, so a target
// whose name is near the file system's limit still gets a temporary file.
fs::path TemporaryBeside(const fs::path& target) {
    std::random_device random;
    const unsigned long long stamp = (static_cast<unsigned long long>(random()) << 32) ^ random();
    return target.parent_path() / (".rdv" + std::to_string(stamp) + ".tmp");
}

enum class WriteOutcome { NotOpened, Failed, Written };

WriteOutcome WriteText(const fs::path& path, const std::vector<std::string>& lines) {
    std::ofstream out(path, std::ios::out | std::ios::trunc);
    if (!out.is_open()) {
        return WriteOutcome::NotOpened;
    }
    for (const std::string& line : lines) {
        out.write(line.data(), static_cast<std::streamsize>(line.size()));
        out.put('\n');
    }
    out.flush();
    const bool written = out.good();
    out.close();
    return written && !out.fail() ? WriteOutcome::Written : WriteOutcome::Failed;
}

// Writes straight into the target; a target left half written is removed.
bool WriteInPlace(const fs::path& destination, const std::vector<std::string>& lines) {
    const WriteOutcome outcome = WriteText(destination, lines);
    if (outcome == WriteOutcome::Failed) {
        std::error_code ec;
        fs::remove(destination, ec);
    }
    return outcome == WriteOutcome::Written;
}

} // namespace

bool WriteLinesToFile(const fs::path& target, const std::vector<std::string>& lines) {
    if (target.empty()) {
        return false;
    }
    const fs::path destination = ResolveTarget(target);
    std::error_code ec;
    const fs::file_status status = fs::status(destination, ec);
    if (fs::exists(status) && !fs::is_regular_file(status)) {
        // A device or pipe cannot be replaced by renaming; it is written in place.
        // A folder is no target at all.
        return !fs::is_directory(status) && WriteText(destination, lines) == WriteOutcome::Written;
    }
    // An existing file keeps its permissions; one that may not be written stays
    // as it is, as opening it for writing would have failed.
    const bool replacing = fs::exists(status);
    if (replacing && (status.permissions() & fs::perms::owner_write) == fs::perms::none) {
        return false;
    }
    const fs::path temporary = TemporaryBeside(destination);
    const WriteOutcome outcome = WriteText(temporary, lines);
    if (outcome == WriteOutcome::Written) {
        if (replacing) {
            fs::permissions(temporary, status.permissions(), ec);
        }
        fs::rename(temporary, destination, ec);
        if (!ec) {
            return true;
        }
    }
    fs::remove(temporary, ec);
    if (outcome == WriteOutcome::Failed) {
        return false; // the text does not fit (a full disk): the target stays as it was
    }
    // The folder takes no new file, or the target cannot be replaced by renaming
    // (held open elsewhere): the target is written in place, as opening it for
    // writing does.
    return WriteInPlace(destination, lines);
}

} // namespace it8
