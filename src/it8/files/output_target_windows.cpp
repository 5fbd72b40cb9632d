// Replacing a target's content on Windows. An existing file is always
// rewritten in place: a file renamed over it would take the folder's access
// list instead of its own, and split its hard links.
#if defined(_WIN32)

#ifndef NOMINMAX
#define NOMINMAX
#endif
#include <windows.h>

#include <algorithm>

#include "it8/files/in_place_rewrite.h"
#include "it8/files/output_target.h"
#include "it8/files/temporary_name.h"

namespace it8::files {
namespace {

namespace fs = std::filesystem;

std::error_code SystemError(DWORD error = GetLastError()) {
    return {static_cast<int>(error), std::system_category()};
}

class Handle {
public:
    explicit Handle(HANDLE handle = INVALID_HANDLE_VALUE) : handle_(handle) {}
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

// Reads (or writes) all `size` bytes at `offset`, or at the current position
// when `offset` is null.
template <typename Call> bool Transfer(const std::uint64_t* offset, std::size_t size, Call call) {
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

bool WriteAll(HANDLE file, const std::uint64_t* offset, const char* data, std::size_t size) {
    return Transfer(offset, size, [&](std::size_t done, DWORD chunk, DWORD* step, OVERLAPPED* at) {
        return WriteFile(file, data + done, chunk, step, at) != 0;
    });
}

// Hands every piece of `content` to `file` at its current position; on failure
// `error` says why.
bool WritePieces(HANDLE file, const Content& content, std::error_code& error) {
    const bool written = content.pieces([&](const char* data, std::size_t size) {
        return WriteAll(file, nullptr, data, size) || (error = SystemError(), false);
    });
    if (!written && !error) {
        error = std::make_error_code(std::errc::io_error);
    }
    return written;
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
    std::error_code Error() const override { return error_; }

private:
    bool Check(bool ok) {
        if (!ok) {
            error_ = SystemError();
        }
        return ok;
    }

    HANDLE file_;
    std::error_code error_;
};

fs::path FolderOf(const fs::path& file) {
    return file.has_parent_path() ? file.parent_path() : fs::path(".");
}

// An empty new file in `folder` opened for writing; invalid with the system's
// error set when none can be made.
HANDLE CreateExclusive(const fs::path& folder, const std::string& prefix, fs::path& made) {
    for (int attempt = 0; attempt < kTemporaryNameAttempts; ++attempt) {
        made = folder / TemporaryName(prefix);
        const HANDLE file = CreateFileW(made.c_str(), GENERIC_WRITE, 0, nullptr, CREATE_NEW,
                                        FILE_ATTRIBUTE_NORMAL, nullptr);
        if (file != INVALID_HANDLE_VALUE || GetLastError() != ERROR_FILE_EXISTS) {
            return file;
        }
    }
    return INVALID_HANDLE_VALUE;
}

// A new target: written to a temporary file beside it and renamed into place,
// so that it appears only when complete. A file that appeared there meanwhile
// is not replaced.
WriteResult WriteNewFile(const fs::path& target, const Content& content) {
    fs::path temporary;
    Handle out(CreateExclusive(FolderOf(target), kWriterPrefix, temporary));
    if (!out.valid()) {
        return {Outcome::NotWritten, SystemError()};
    }
    std::error_code error;
    if (WritePieces(out.get(), content, error) && (out.Close() || (error = SystemError(), false)) &&
        (MoveFileExW(temporary.c_str(), target.c_str(), 0) || (error = SystemError(), false))) {
        return {};
    }
    out.Close();
    DeleteFileW(temporary.c_str());
    return {Outcome::NotWritten, error};
}

} // namespace

struct OutputTarget::Opened {
    fs::path given;
    Handle out;           // the existing target opened for writing, invalid for a missing one
    bool readable = true; // opened for reading as well, so its old content can be put back
    TargetKind kind = TargetKind::Missing;
};

OutputTarget::OutputTarget() : opened_(std::make_unique<Opened>()) {}
OutputTarget::~OutputTarget() = default;

std::error_code OutputTarget::Open(const fs::path& path) {
    Opened& opened = *opened_;
    if (path.empty()) {
        return std::make_error_code(std::errc::no_such_file_or_directory);
    }
    opened.given = path;
    // Read access too where allowed; the system follows symbolic links.
    opened.out.Reset(CreateFileW(path.c_str(), GENERIC_READ | GENERIC_WRITE, kShareAll, nullptr,
                                 OPEN_EXISTING, FILE_ATTRIBUTE_NORMAL, nullptr));
    if (!opened.out.valid() && GetLastError() == ERROR_ACCESS_DENIED) {
        opened.out.Reset(CreateFileW(path.c_str(), GENERIC_WRITE, kShareAll, nullptr, OPEN_EXISTING,
                                     FILE_ATTRIBUTE_NORMAL, nullptr));
        opened.readable = false;
    }
    if (!opened.out.valid()) {
        const DWORD error = GetLastError();
        std::error_code ec;
        if (fs::is_directory(path, ec)) {
            return std::make_error_code(std::errc::is_a_directory);
        }
        // A read-only file, a file another program holds without sharing:
        // refused. A missing file is made.
        return error == ERROR_FILE_NOT_FOUND ? std::error_code() : SystemError(error);
    }
    opened.kind =
        GetFileType(opened.out.get()) == FILE_TYPE_DISK ? TargetKind::Regular : TargetKind::Device;
    return {};
}

TargetKind OutputTarget::Kind() const {
    return opened_->kind;
}

fs::path OutputTarget::Folder() const {
    return opened_->kind == TargetKind::Device ? fs::path() : FolderOf(opened_->given);
}

bool OutputTarget::StillNamed() const {
    return true;
}

WriteResult OutputTarget::Replace(const Content& content) {
    Opened& opened = *opened_;
    if (!opened.out.valid()) {
        if (opened.given.empty()) {
            return {Outcome::NotWritten, std::make_error_code(std::errc::bad_file_descriptor)};
        }
        return WriteNewFile(opened.given, content);
    }
    if (opened.kind == TargetKind::Device) {
        // A device (NUL, CON) or a pipe: written as it is.
        std::error_code error;
        const bool written = WritePieces(opened.out.get(), content, error);
        if (!opened.out.Close() && written) {
            error = SystemError();
        }
        return error ? WriteResult{Outcome::Interrupted, error} : WriteResult{};
    }
    LARGE_INTEGER size{};
    if (!GetFileSizeEx(opened.out.get(), &size)) {
        return {Outcome::NotWritten, SystemError()};
    }
    WindowsFile file(opened.out.get());
    WriteResult result =
        RewriteInPlace(file, static_cast<std::uint64_t>(size.QuadPart), opened.readable, content);
    if (!opened.out.Close() && result.outcome == Outcome::Written) {
        result = {Outcome::Uncertain, SystemError()};
    }
    return result;
}

fs::path MakeTemporaryFile(const fs::path& folder, const std::string& prefix,
                           std::error_code& error) {
    fs::path made;
    const Handle file(folder.empty() ? INVALID_HANDLE_VALUE
                                     : CreateExclusive(folder, prefix, made));
    if (!file.valid()) {
        error = folder.empty() ? std::make_error_code(std::errc::no_such_file_or_directory)
                               : SystemError();
        return {};
    }
    error.clear();
    return made;
}

} // namespace it8::files

#endif
