#include "it8/chart_file_text.h"

#include <algorithm>
#include <cstdint>

#if defined(_WIN32)
#ifndef NOMINMAX
#define NOMINMAX
#endif
#include <windows.h>
#else
#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>

#include <cerrno>
#endif

namespace it8 {
namespace {

#if defined(_WIN32)

// Closes the handle when reading ends, on every path.
class Handle {
public:
    explicit Handle(HANDLE handle) : handle_(handle) {}
    ~Handle() {
        if (handle_ != INVALID_HANDLE_VALUE) {
            CloseHandle(handle_);
        }
    }
    Handle(const Handle&) = delete;
    Handle& operator=(const Handle&) = delete;
    HANDLE get() const { return handle_; }

private:
    HANDLE handle_;
};

bool ReadRegularFile(const std::filesystem::path& path, std::string& text) {
    // Other programs may go on reading, writing, renaming or deleting the file
    // while it is read.
    const Handle file(CreateFileW(path.c_str(), GENERIC_READ,
                                  FILE_SHARE_READ | FILE_SHARE_WRITE | FILE_SHARE_DELETE, nullptr,
                                  OPEN_EXISTING, FILE_ATTRIBUTE_NORMAL, nullptr));
    if (file.get() == INVALID_HANDLE_VALUE || GetFileType(file.get()) != FILE_TYPE_DISK) {
        return false; // missing, a folder, a device (NUL, CON, COM1) or a pipe
    }
    BY_HANDLE_FILE_INFORMATION info{};
    LARGE_INTEGER size{};
    if (!GetFileInformationByHandle(file.get(), &info) ||
        (info.dwFileAttributes & FILE_ATTRIBUTE_DIRECTORY) != 0 ||
        !GetFileSizeEx(file.get(), &size) || size.QuadPart < 0 ||
        static_cast<std::uint64_t>(size.QuadPart) > text.max_size()) {
        return false;
    }
    text.resize(static_cast<std::size_t>(size.QuadPart));
    std::size_t done = 0;
    while (done < text.size()) {
        const DWORD chunk =
            static_cast<DWORD>(std::min<std::size_t>(text.size() - done, std::size_t{1} << 30));
        DWORD got = 0;
        if (!ReadFile(file.get(), text.data() + done, chunk, &got, nullptr)) {
            return false;
        }
        if (got == 0) {
            break; // the file shrank meanwhile
        }
        done += got;
    }
    text.resize(done);
    return true;
}

#else

class Descriptor {
public:
    explicit Descriptor(int fd) : fd_(fd) {}
    ~Descriptor() {
        if (fd_ >= 0) {
            close(fd_);
        }
    }
    Descriptor(const Descriptor&) = delete;
    Descriptor& operator=(const Descriptor&) = delete;
    int get() const { return fd_; }

private:
    int fd_;
};

bool ReadRegularFile(const std::filesystem::path& path, std::string& text) {
    // Non-blocking, so that opening a pipe without a writer returns at once; the
    // flag does not change reading a regular file.
    const Descriptor file(open(path.c_str(), O_RDONLY | O_CLOEXEC | O_NOCTTY | O_NONBLOCK));
    struct stat info {};
    if (file.get() < 0 || fstat(file.get(), &info) != 0 || !S_ISREG(info.st_mode) ||
        info.st_size < 0 || static_cast<std::uint64_t>(info.st_size) > text.max_size()) {
        return false;
    }
    text.resize(static_cast<std::size_t>(info.st_size));
    std::size_t done = 0;
    while (done < text.size()) {
        const ssize_t got = read(file.get(), text.data() + done, text.size() - done);
        if (got < 0) {
            if (errno == EINTR) {
                continue;
            }
            return false;
        }
        if (got == 0) {
            break; // the file shrank meanwhile
        }
        done += static_cast<std::size_t>(got);
    }
    text.resize(done);
    return true;
}

#endif

} // namespace

bool ReadChartFileText(const std::filesystem::path& path, std::string& text) {
    text.clear();
    if (!ReadRegularFile(path, text)) {
        text.clear();
        return false;
    }
    // Editors on Windows often start a UTF-8 file with a byte-order mark; it is
    // no part of the first line.
    if (text.compare(0, 3, "\xEF\xBB\xBF") == 0) {
        text.erase(0, 3);
    }
    return true;
}

} // namespace it8
