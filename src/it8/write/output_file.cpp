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

// A name beside the target that no other writer is likely to pick at the same
// moment: the target's name with a random lead-out.
fs::path TemporaryBeside(const fs::path& target) {
    std::random_device random;
    const unsigned long long stamp = (static_cast<unsigned long long>(random()) << 32) ^ random();
    fs::path temporary = target;
    temporary += ".tmp" + std::to_string(stamp);
    return temporary;
}

bool WriteText(const fs::path& path, const std::vector<std::string>& lines) {
    std::ofstream out(path, std::ios::out | std::ios::trunc);
    if (!out.is_open()) {
        return false;
    }
    for (const std::string& line : lines) {
        out.write(line.data(), static_cast<std::streamsize>(line.size()));
        out.put('\n');
    }
    out.flush();
    const bool written = out.good();
    out.close();
    return written && !out.fail();
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
        return !fs::is_directory(status) && WriteText(destination, lines);
    }
    // An existing file keeps its permissions; one that may not be written stays
    // as it is, as opening it for writing would have failed.
    const bool replacing = fs::exists(status);
    if (replacing && (status.permissions() & fs::perms::owner_write) == fs::perms::none) {
        return false;
    }
    const fs::path temporary = TemporaryBeside(destination);
    if (!WriteText(temporary, lines)) {
        fs::remove(temporary, ec);
        return false;
    }
    if (replacing) {
        fs::permissions(temporary, status.permissions(), ec);
    }
    fs::rename(temporary, destination, ec);
    if (ec) {
        fs::remove(temporary, ec);
        return false;
    }
    return true;
}

} // namespace it8
