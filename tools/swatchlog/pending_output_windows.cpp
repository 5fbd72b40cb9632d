// Output files on Windows: checked by opening; a new one appears by rename, an
// existing one is always written in place (a file renamed over it would take
// the folder's access list instead of its own, and split its hard links).
#if defined(_WIN32)

#ifndef NOMINMAX
#define NOMINMAX
#endif
#include <windows.h>

#include <algorithm>
#include <random>
#include <system_error>

#include "file_paths.h"
#include "output_in_place.h"

namespace swatchlog {
namespace {

namespace fs = std::filesystem;

class Handle {
public:
    explicit Handle(HANDLE handle = INVALID_HANDLE_VALUE) : handle_(handle) {}
    ~Handle() { Close(); }
    Handle(const Handle&) = delete;
    Handle& operator=(const Handle&) = delete;
    HANDLE get() const { return handle_; }
    bool valid() const { return handle_ != INVALID_HANDLE_VALUE; }
    void Reset(HANDLE handle) {
        Close();
        handle_ = handle;
    }
    bool Close() {
        const HANDLE handle = handle_;
        handle_ = INVALID_HANDLE_VALUE;
        return handle == INVALID_HANDLE_VALUE || CloseHandle(handle) != 0;
    }

private:
    HANDLE handle_;
};

std::string Reason(DWORD error) {
    std::string text = std::system_category().message(static_cast<int>(error));
    while (!text.empty() && (text.back() == '.' || text.back() == '\n' || text.back() == '\r')) {
        text.pop_back();
    }
    return text;
}

constexpr std::size_t kLargestCall = std::size_t{1} << 30;

// Reads (or writes) all `size` bytes at `offset`, or from the current position
// when `offset` is null.
template <typename Call> bool Transfer(std::uint64_t* offset, std::size_t size, Call call) {
    std::size_t done = 0;
    while (done < size) {
        const DWORD chunk = static_cast<DWORD>(std::min(size - done, kLargestCall));
        OVERLAPPED at{};
        if (offset != nullptr) {
            at.Offset = static_cast<DWORD>((*offset + done) & 0xFFFFFFFFu);
            at.OffsetHigh = static_cast<DWORD>((*offset + done) >> 32);
        }
        DWORD step = 0;
        if (!call(done, chunk, &step, offset != nullptr ? &at : nullptr) || step == 0) {
            return false;
        }
        done += step;
    }
    return true;
}

bool WriteAll(HANDLE file, std::uint64_t* offset, const char* data, std::size_t size) {
    return Transfer(offset, size, [&](std::size_t done, DWORD chunk, DWORD* step, OVERLAPPED* at) {
        return WriteFile(file, data + done, chunk, step, at) != 0;
    });
}

bool SetLength(HANDLE file, std::uint64_t size) {
    LARGE_INTEGER position{};
    position.QuadPart = static_cast<LONGLONG>(size);
    return SetFilePointerEx(file, position, nullptr, FILE_BEGIN) && SetEndOfFile(file);
}

class WindowsOutput final : public OpenOutput {
public:
    explicit WindowsOutput(HANDLE file) : file_(file) {}

    bool ReadAt(std::uint64_t offset, char* data, std::size_t size) override {
        return Check(Transfer(&offset, size,
                              [&](std::size_t done, DWORD chunk, DWORD* step, OVERLAPPED* at) {
                                  return ReadFile(file_, data + done, chunk, step, at) != 0;
                              }));
    }
    bool WriteAt(std::uint64_t offset, const char* data, std::size_t size) override {
        return Check(WriteAll(file_, &offset, data, size));
    }
    // Setting the end of file allocates the space, so a full disk shows here.
    bool Reserve(std::uint64_t size) override { return Check(SetLength(file_, size)); }
    bool Resize(std::uint64_t size) override { return Check(SetLength(file_, size)); }
    bool Flush() override { return Check(FlushFileBuffers(file_) != 0); }
    std::string Reason() const override { return swatchlog::Reason(error_); }

private:
    bool Check(bool ok) {
        if (!ok) {
            error_ = GetLastError();
        }
        return ok;
    }

    HANDLE file_;
    DWORD error_ = 0;
};

// Other programs may go on reading and writing the output meanwhile, as with a
// file opened in text mode.
constexpr DWORD kShareAll = FILE_SHARE_READ | FILE_SHARE_WRITE | FILE_SHARE_DELETE;

// An empty file in `folder` with a short name of its own; false with the
// system's error set when none can be made.
bool CreateTemporary(const fs::path& folder, fs::path& made) {
    std::random_device random;
    for (int attempt = 0; attempt < 8; ++attempt) {
        const unsigned long long stamp =
            (static_cast<unsigned long long>(random()) << 32) ^ random();
        made = folder / (".swatchlog-" + std::to_string(stamp) + ".tmp");
        Handle file(CreateFileW(made.c_str(), GENERIC_WRITE, 0, nullptr, CREATE_NEW,
                                FILE_ATTRIBUTE_NORMAL, nullptr));
        if (file.valid()) {
            return true;
        }
        if (GetLastError() != ERROR_FILE_EXISTS) {
            return false;
        }
    }
    return false;
}

} // namespace

struct PendingOutput::Target {
    Handle out;           // the existing output opened for writing, or invalid for a new one
    bool readable = true; // opened for reading as well, so its old content can be put back
};

PendingOutput::PendingOutput(std::string finalPath)
    : final_(std::move(finalPath)), target_(std::make_unique<Target>()) {
    Target& target = *target_;
    const fs::path path = FileSystemPath(final_);
    // Opening for writing decides whether the user may write the output; the
    // system follows symbolic links. Read access too where allowed.
    target.out.Reset(CreateFileW(path.c_str(), GENERIC_READ | GENERIC_WRITE, kShareAll, nullptr,
                                 OPEN_EXISTING, FILE_ATTRIBUTE_NORMAL, nullptr));
    if (!target.out.valid() && GetLastError() == ERROR_ACCESS_DENIED) {
        target.out.Reset(CreateFileW(path.c_str(), GENERIC_WRITE, kShareAll, nullptr, OPEN_EXISTING,
                                     FILE_ATTRIBUTE_NORMAL, nullptr));
        target.readable = false;
    }
    const DWORD error = GetLastError();
    std::error_code ec;
    if (!target.out.valid() && fs::is_directory(path, ec)) {
        throw OutputError(final_, "it is a folder", "nothing was written");
    }
    if (!target.out.valid() && error != ERROR_FILE_NOT_FOUND) {
        throw OutputError(final_, Reason(error), "nothing was written");
    }
    // A new output appears by rename, so its temporary file is made beside it
    // and gets the folder's access list, as the output will. An existing one is
    // written in place: its temporary file goes to the user's own temporary
    // folder, which others may not read, and beside it only where that fails.
    const fs::path beside = path.has_parent_path() ? path.parent_path() : fs::path(".");
    fs::path temporary;
    const bool made = target.out.valid()
                          ? CreateTemporary(fs::temp_directory_path(ec), temporary) ||
                                CreateTemporary(beside, temporary)
                          : CreateTemporary(beside, temporary);
    if (!made) {
        const std::string reason = Reason(GetLastError());
        throw OutputError(final_,
                          target.out.valid() ? "no temporary file can be made: " + reason : reason,
                          "nothing was written");
    }
    temporary_ = temporary.u8string();
}

PendingOutput::~PendingOutput() {
    if (!committed_) {
        DeleteFileW(FileSystemPath(temporary_).c_str());
    }
}

void PendingOutput::Commit() {
    Target& target = *target_;
    const fs::path temporary = FileSystemPath(temporary_);
    if (!target.out.valid()) {
        if (!MoveFileExW(temporary.c_str(), FileSystemPath(final_).c_str(),
                         MOVEFILE_REPLACE_EXISTING)) {
            throw OutputError(final_, Reason(GetLastError()), "nothing was written");
        }
        committed_ = true;
        return;
    }
    std::string text;
    if (!ReadRegularFile(temporary_, text)) {
        throw OutputError(final_, "the checked output cannot be read back", "nothing was written");
    }
    if (GetFileType(target.out.get()) != FILE_TYPE_DISK) {
        // A device (NUL, CON) or a pipe: written as it is.
        if (!WriteAll(target.out.get(), nullptr, text.data(), text.size()) || !target.out.Close()) {
            throw OutputError(final_, Reason(GetLastError()));
        }
    } else {
        LARGE_INTEGER size{};
        if (!GetFileSizeEx(target.out.get(), &size)) {
            throw OutputError(final_, Reason(GetLastError()), "nothing was written");
        }
        WindowsOutput file(target.out.get());
        CopyInPlace(file, static_cast<std::uint64_t>(size.QuadPart), target.readable, text, final_);
        if (!target.out.Close()) {
            throw OutputError(final_, Reason(GetLastError()), "its content is uncertain");
        }
    }
    committed_ = true;
    DeleteFileW(temporary.c_str());
}

} // namespace swatchlog

#endif
