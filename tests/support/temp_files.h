// Temporary folders and files for tests.
#pragma once

#include <filesystem>
#include <string>

namespace test_support {

/// A fresh folder under the system's temporary folder, removed with its content.
class TempDir {
public:
    TempDir();
    ~TempDir();
    TempDir(const TempDir&) = delete;
    TempDir& operator=(const TempDir&) = delete;

    const std::filesystem::path& path() const { return path_; }
    /// Path of `name` inside the folder.
    std::filesystem::path file(const std::string& name) const { return path_ / name; }
    /// Writes `content` byte for byte to `name` and answers its path.
    std::filesystem::path write(const std::string& name, const std::string& content) const;

private:
    std::filesystem::path path_;
};

/// The bytes of a file ("" when it cannot be read).
std::string ReadBytes(const std::filesystem::path& path);
/// Writes bytes to a file, replacing it.
void WriteBytes(const std::filesystem::path& path, const std::string& content);
/// The path as the library's wide-string path argument.
std::wstring Wide(const std::filesystem::path& path);

} // namespace test_support
