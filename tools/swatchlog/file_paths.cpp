#include "file_paths.h"

#include <algorithm>
#include <fstream>
#include <system_error>

#include "tool_error.h"
#include "utf8_text.h"

namespace swatchlog {
namespace fs = std::filesystem;

fs::path FileSystemPath(const std::string& utf8Path) {
#if defined(_WIN32)
    std::wstring wide;
    WideFromUtf8(utf8Path, wide);
    return fs::path(wide);
#else
    return fs::path(utf8Path);
#endif
}

std::wstring LibraryPath(const std::string& utf8Path) {
    std::wstring wide;
    if (!WideFromUtf8(utf8Path, wide)) {
        throw ChartError(RepairUtf8(utf8Path) + ": the file name is not valid UTF-8", utf8Path, 0);
    }
    return wide;
}

bool ReadRegularFile(const std::string& utf8Path, std::string& text) {
    const fs::path path = FileSystemPath(utf8Path);
    std::error_code ec;
    if (!fs::is_regular_file(path, ec)) {
        return false;
    }
    std::ifstream in(path, std::ios::binary);
    if (!in) {
        return false;
    }
    // The size is a hint; a file that grows while it is read is read to its end.
    const auto size = fs::file_size(path, ec);
    text.clear();
    std::size_t piece = std::size_t{1} << 20;
    if (!ec && size < (std::uintmax_t{1} << 30)) {
        piece = std::max(piece, static_cast<std::size_t>(size) + 1);
    }
    while (in.good()) {
        const std::size_t before = text.size();
        text.resize(before + piece);
        in.read(text.data() + before, static_cast<std::streamsize>(piece));
        text.resize(before + static_cast<std::size_t>(in.gcount()));
    }
    return !in.bad();
}

bool SameFile(const std::string& first, const std::string& second) {
    std::error_code ec;
    const fs::path a = FileSystemPath(first);
    const fs::path b = FileSystemPath(second);
    if (fs::exists(a, ec) && fs::exists(b, ec)) {
        const bool same = fs::equivalent(a, b, ec);
        return !ec && same;
    }
    const fs::path normalA = fs::weakly_canonical(fs::absolute(a, ec), ec);
    const fs::path normalB = fs::weakly_canonical(fs::absolute(b, ec), ec);
    return normalA == normalB;
}

} // namespace swatchlog
