#include "temp_files.h"

#include <atomic>
#include <chrono>
#include <cstdint>
#include <fstream>
#include <iterator>
#include <random>
#include <sstream>

namespace test_support {

TempDir::TempDir() {
    static std::atomic<unsigned> counter{0};
    std::random_device rd;
    const auto stamp = std::chrono::steady_clock::now().time_since_epoch().count();
    std::ostringstream name;
    name << "redavudeva-test-" << rd() << '-' << stamp << '-' << counter++;
    path_ = std::filesystem::temp_directory_path() / name.str();
    std::filesystem::create_directories(path_);
}

TempDir::~TempDir() {
    std::error_code ec;
    std::filesystem::remove_all(path_, ec);
}

std::filesystem::path TempDir::write(const std::string& name, const std::string& content) const {
    auto p = file(name);
    WriteBytes(p, content);
    return p;
}

std::string ReadBytes(const std::filesystem::path& path) {
    std::ifstream in(path, std::ios::binary);
    return std::string(std::istreambuf_iterator<char>(in), std::istreambuf_iterator<char>());
}

void WriteBytes(const std::filesystem::path& path, const std::string& content) {
    std::ofstream out(path, std::ios::binary | std::ios::trunc);
    out << content;
}

std::wstring Wide(const std::filesystem::path& path) {
#if defined(_WIN32)
    return path.wstring();
#else
    // The library opens wide paths as UTF-8 file names here: decode the bytes
    // into one wchar_t per code point.
    const std::string bytes = path.string();
    std::wstring out;
    for (std::size_t i = 0; i < bytes.size();) {
        const auto lead = static_cast<unsigned char>(bytes[i]);
        int extra = lead < 0x80 ? 0 : lead < 0xE0 ? 1 : lead < 0xF0 ? 2 : 3;
        std::uint32_t cp = extra == 0 ? lead : lead & (0x3F >> extra);
        ++i;
        for (; extra > 0 && i < bytes.size(); --extra, ++i) {
            cp = (cp << 6) | (static_cast<unsigned char>(bytes[i]) & 0x3F);
        }
        out += static_cast<wchar_t>(cp);
    }
    return out;
#endif
}

} // namespace test_support
