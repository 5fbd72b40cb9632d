// Writing a chart text to its target on Windows.
#if defined(_WIN32)

#ifndef NOMINMAX
#define NOMINMAX
#endif
#include <windows.h>

#include <algorithm>
#include <random>

#include "it8/write/in_place_rewrite.h"
#include "it8/write/native_text.h"
#include "it8/write/output_file.h"

namespace it8 {
namespace {

namespace fs = std::filesystem;

class Handle {
public:
    explicit Handle(HANDLE handle) : handle_(handle) {}
    ~Handle() { Close(); }
    Handle(const Handle&) = delete;
    Handle& operator=(const Handle&) = delete;
    HANDLE get() const { return handle_; }
    bool valid() const { return handle_ != INVALID_HANDLE_VALUE; }
    /// Takes over `handle`, closing the one held before.
    void Reset(HANDLE handle) {
        Close();
        handle_ = handle;
    }
    /// Closes the handle; false when closing reported an error.
    bool Close() {
        const HANDLE handle = handle_;
        handle_ = INVALID_HANDLE_VALUE;
        return handle == INVALID_HANDLE_VALUE || CloseHandle(handle) != 0;
    }

private:
    HANDLE handle_;
};

// Other programs may go on reading and writing the target meanwhile, as with a
// file opened in text mode.
constexpr DWORD kShareAll = FILE_SHARE_READ | FILE_SHARE_WRITE | FILE_SHARE_DELETE;
constexpr std::size_t kLargestCall = std::size_t{1} << 30;

OVERLAPPED At(std::uint64_t offset) {
    OVERLAPPED at{};
    at.Offset = static_cast<DWORD>(offset & 0xFFFFFFFFu);
    at.OffsetHigh = static_cast<DWORD>(offset >> 32);
    return at;
}

bool WriteAll(HANDLE file, const char* data, std::size_t size, std::uint64_t* offset) {
    while (size > 0) {
        const DWORD chunk = static_cast<DWORD>(std::min(size, kLargestCall));
        DWORD done = 0;
        OVERLAPPED at = offset != nullptr ? At(*offset) : OVERLAPPED{};
        if (!WriteFile(file, data, chunk, &done, offset != nullptr ? &at : nullptr) || done == 0) {
            return false;
        }
        data += done;
        size -= done;
        if (offset != nullptr) {
            *offset += done;
        }
    }
    return true;
}

bool SetLength(HANDLE file, std::uint64_t size) {
    LARGE_INTEGER position{};
    position.QuadPart = static_cast<LONGLONG>(size);
    return SetFilePointerEx(file, position, nullptr, FILE_BEGIN) && SetEndOfFile(file);
}

class WindowsFile final : public RewritableFile {
public:
    explicit WindowsFile(HANDLE file) : file_(file) {}

    bool ReadAt(std::uint64_t offset, char* data, std::size_t size) override {
        while (size > 0) {
            const DWORD chunk = static_cast<DWORD>(std::min(size, kLargestCall));
            DWORD done = 0;
            OVERLAPPED at = At(offset);
            if (!ReadFile(file_, data, chunk, &done, &at) || done == 0) {
                return false;
            }
            data += done;
            size -= done;
            offset += done;
        }
        return true;
    }

    bool WriteAt(std::uint64_t offset, const char* data, std::size_t size) override {
        return WriteAll(file_, data, size, &offset);
    }

    // Setting the end of file allocates the space, so a full disk shows here.
    bool Reserve(std::uint64_t size) override { return SetLength(file_, size); }

    bool Resize(std::uint64_t size) override { return SetLength(file_, size); }

    bool Flush() override { return FlushFileBuffers(file_) != 0; }

private:
    HANDLE file_;
};

fs::path TemporaryBeside(const fs::path& target) {
    std::random_device random;
    const unsigned long long stamp = (static_cast<unsigned long long>(random()) << 32) ^ random();
    return target.parent_path() / (".rdv" + std::to_string(stamp) + ".tmp");
}

// A new target: written to a temporary file beside it and renamed into place,
// so that it appears only when complete. A file that appeared there meanwhile
// is not replaced.
bool WriteNewFile(const fs::path& target, const std::vector<std::string>& lines) {
    fs::path temporary;
    Handle out(INVALID_HANDLE_VALUE);
    for (int attempt = 0; attempt < 8 && !out.valid(); ++attempt) {
        temporary = TemporaryBeside(target);
        out.Reset(CreateFileW(temporary.c_str(), GENERIC_WRITE, 0, nullptr, CREATE_NEW,
                              FILE_ATTRIBUTE_NORMAL, nullptr));
        if (!out.valid() && GetLastError() != ERROR_FILE_EXISTS) {
            return false;
        }
    }
    if (!out.valid()) {
        return false;
    }
    const bool written = ForEachTextPiece(lines, [&out](const char* data, std::size_t size) {
        return WriteAll(out.get(), data, size, nullptr);
    });
    const bool closed = out.Close();
    if (written && closed && MoveFileExW(temporary.c_str(), target.c_str(), 0)) {
        return true;
    }
    DeleteFileW(temporary.c_str());
    return false;
}

} // namespace

bool WriteLinesToFile(const fs::path& target, const std::vector<std::string>& lines) {
    if (target.empty()) {
        return false;
    }
    // Opening for writing decides whether the caller may write the target. It is
    // opened for reading too where allowed, so that its old content can be put
    // back; symbolic links are followed by the system.
    bool readable = true;
    Handle out(CreateFileW(target.c_str(), GENERIC_READ | GENERIC_WRITE, kShareAll, nullptr,
                           OPEN_EXISTING, FILE_ATTRIBUTE_NORMAL, nullptr));
    if (!out.valid() && GetLastError() == ERROR_ACCESS_DENIED) {
        out.Reset(CreateFileW(target.c_str(), GENERIC_WRITE, kShareAll, nullptr, OPEN_EXISTING,
                              FILE_ATTRIBUTE_NORMAL, nullptr));
        readable = false;
    }
    if (!out.valid()) {
        // A read-only file, a folder, a file another program holds without
        // sharing: refused. A missing file is made.
        return GetLastError() == ERROR_FILE_NOT_FOUND && WriteNewFile(target, lines);
    }
    if (GetFileType(out.get()) != FILE_TYPE_DISK) {
        // A device (NUL, CON) or a pipe: written as it is.
        const bool written = ForEachTextPiece(lines, [&out](const char* data, std::size_t size) {
            return WriteAll(out.get(), data, size, nullptr);
        });
        return out.Close() && written;
    }
    // An existing file is always rewritten in place: a file renamed over it would
    // take the folder's access list instead of its own, and split its hard links.
    LARGE_INTEGER size{};
    if (!GetFileSizeEx(out.get(), &size)) {
        return false;
    }
    WindowsFile file(out.get());
    const bool written =
        RewriteInPlace(file, static_cast<std::uint64_t>(size.QuadPart), readable, lines);
    return out.Close() && written;
}

} // namespace it8

#endif
