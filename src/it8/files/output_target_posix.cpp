// Replacing a target's content on POSIX systems.
#if !defined(_WIN32)

#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>
#if defined(__linux__)
#include <sys/xattr.h>
#endif

#include <cerrno>

#include "it8/files/in_place_rewrite.h"
#include "it8/files/output_target.h"
#include "it8/files/temporary_name.h"

namespace it8::files {
namespace {

namespace fs = std::filesystem;

std::error_code SystemError(int error = errno) {
    return {error, std::generic_category()};
}

class Descriptor {
public:
    explicit Descriptor(int fd = -1) : fd_(fd) {}
    ~Descriptor() { Close(); }
    Descriptor(const Descriptor&) = delete;
    Descriptor& operator=(const Descriptor&) = delete;
    int get() const { return fd_; }
    /// Takes over `fd`, closing the descriptor held before.
    void Reset(int fd) {
        Close();
        fd_ = fd;
    }
    /// Closes the descriptor; false when closing reported an error (a late
    /// write error).
    bool Close() {
        const int fd = fd_;
        fd_ = -1;
        return fd < 0 || close(fd) == 0;
    }

private:
    int fd_;
};

// Follows the symbolic links that the last part of `path` names, as opening it
// would. `final` is the name that is no link (it need not exist). False for a
// loop or a chain too long to follow.
bool FollowLinks(const fs::path& path, fs::path& final) {
    constexpr int kMostLinks = 40; // as the kernel's own limit
    fs::path current = path;
    for (int links = 0; links <= kMostLinks; ++links) {
        struct stat info {};
        if (lstat(current.c_str(), &info) != 0 || !S_ISLNK(info.st_mode)) {
            final = current;
            return true;
        }
        std::error_code ec;
        const fs::path next = fs::read_symlink(current, ec);
        if (ec) {
            return false;
        }
        current = next.is_absolute() ? next : current.parent_path() / next;
    }
    return false;
}

bool SameInode(const struct stat& a, const struct stat& b) {
    return a.st_dev == b.st_dev && a.st_ino == b.st_ino;
}

// Whether `name` leads to the file described by `info`.
bool Names(const fs::path& name, const struct stat& info) {
    struct stat named {};
    return stat(name.c_str(), &named) == 0 && SameInode(named, info);
}

bool HasExtendedAttributes(int fd) {
#if defined(__linux__)
    // Access lists are extended attributes here as well. A list that cannot be
    // read is taken to hold some.
    const ssize_t size = flistxattr(fd, nullptr, 0);
    return size > 0 || (size < 0 && errno != ENOTSUP);
#else
    (void)fd;
    return false;
#endif
}

fs::path FolderOf(const fs::path& file) {
    return file.has_parent_path() ? file.parent_path() : fs::path(".");
}

// Reads (`Call` = pread) or writes (pwrite) all `size` bytes, retrying after
// interruptions and short transfers; errno is set on failure.
template <typename Call> bool Transfer(std::size_t size, Call call) {
    std::size_t done = 0;
    while (done < size) {
        const ssize_t step = call(done, size - done);
        if (step < 0 && errno == EINTR) {
            continue;
        }
        if (step <= 0) {
            if (step == 0) {
                errno = EIO;
            }
            return false;
        }
        done += static_cast<std::size_t>(step);
    }
    return true;
}

bool WriteAll(int fd, const char* data, std::size_t size) {
    return Transfer(
        size, [&](std::size_t done, std::size_t rest) { return write(fd, data + done, rest); });
}

// Hands every piece of `content` to `fd`; on failure `error` says why.
bool WritePieces(int fd, const Content& content, std::error_code& error) {
    const bool written = content.pieces([&](const char* data, std::size_t size) {
        return WriteAll(fd, data, size) || (error = SystemError(), false);
    });
    if (!written && !error) {
        error = std::make_error_code(std::errc::io_error);
    }
    return written;
}

class PosixFile final : public RewritableFile {
public:
    PosixFile(int writeFd, int readFd) : write_(writeFd), read_(readFd) {}

    bool ReadAt(std::uint64_t offset, char* data, std::size_t size) override {
        return Check(Transfer(size, [&](std::size_t done, std::size_t rest) {
            return pread(read_, data + done, rest, static_cast<off_t>(offset + done));
        }));
    }
    bool WriteAt(std::uint64_t offset, const char* data, std::size_t size) override {
        return Check(Transfer(size, [&](std::size_t done, std::size_t rest) {
            return pwrite(write_, data + done, rest, static_cast<off_t>(offset + done));
        }));
    }
    bool Reserve(std::uint64_t size) override {
        const int error = posix_fallocate(write_, 0, static_cast<off_t>(size));
        // A file system that cannot reserve space is written without.
        if (error == 0 || error == EINVAL || error == EOPNOTSUPP) {
            return true;
        }
        error_ = SystemError(error);
        return false;
    }
    bool Resize(std::uint64_t size) override {
        return Check(ftruncate(write_, static_cast<off_t>(size)) == 0);
    }
    bool Flush() override { return Check(fdatasync(write_) == 0 || errno == EINVAL); }
    std::error_code Error() const override { return error_; }

private:
    bool Check(bool ok) {
        if (!ok) {
            error_ = SystemError();
        }
        return ok;
    }

    int write_;
    int read_;
    std::error_code error_;
};

// An empty new file in `folder` created with `mode`; -1 with errno set when
// none can be made.
int CreateExclusive(const fs::path& folder, const std::string& prefix, mode_t mode,
                    fs::path& made) {
    for (int attempt = 0; attempt < kTemporaryNameAttempts; ++attempt) {
        made = folder / TemporaryName(prefix);
        const int fd = open(made.c_str(), O_WRONLY | O_CREAT | O_EXCL | O_CLOEXEC | O_NOCTTY, mode);
        if (fd >= 0 || errno != EEXIST) {
            return fd;
        }
    }
    return -1;
}

enum class Renamed { Done, Failed, NotPossible };

// Writes `content` to a temporary file beside `final` and renames it over
// `final`. `existing` describes the file replaced (null for a new one): the
// temporary file is created with no more permissions than it has and then
// given its exact group and mode, so the new content is never readable by more
// users than the old. Failed: the content could not be written (a full disk);
// NotPossible: no such temporary file could be made or renamed.
Renamed ReplaceByRename(const fs::path& final, const struct stat* existing, const Content& content,
                        std::error_code& error) {
    const mode_t mode = existing != nullptr ? (existing->st_mode & 07777) : 0666;
    fs::path temporary;
    Descriptor out(CreateExclusive(FolderOf(final), kWriterPrefix, mode & 0777, temporary));
    if (out.get() < 0) {
        error = SystemError();
        return Renamed::NotPossible;
    }
    Renamed failure = Renamed::NotPossible;
    if (existing != nullptr) {
        struct stat created {};
        const bool sameGroup = fstat(out.get(), &created) == 0 &&
                               (created.st_gid == existing->st_gid ||
                                fchown(out.get(), static_cast<uid_t>(-1), existing->st_gid) == 0);
        // The mode after the group: a change of group clears set-ID bits.
        if (!sameGroup || fchmod(out.get(), mode) != 0) {
            error = SystemError();
            out.Close();
            unlink(temporary.c_str());
            return failure;
        }
    }
    if (!WritePieces(out.get(), content, error)) {
        failure = Renamed::Failed;
    } else if (!out.Close()) {
        error = SystemError();
        failure = Renamed::Failed;
    } else if (rename(temporary.c_str(), final.c_str()) == 0) {
        return Renamed::Done;
    } else {
        error = SystemError();
    }
    out.Close();
    unlink(temporary.c_str());
    return failure;
}

} // namespace

struct OutputTarget::Opened {
    fs::path given;
    fs::path final; // the name the links lead to; empty when unknown
    Descriptor out; // the existing target opened for writing, -1 for a missing one
    struct stat info {};
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
    // Non-blocking, so that a pipe without a reader answers at once; not
    // truncated, so that a refusal changes nothing.
    opened.out.Reset(open(path.c_str(), O_WRONLY | O_CLOEXEC | O_NOCTTY | O_NONBLOCK));
    if (opened.out.get() < 0 && errno != ENOENT) {
        return SystemError();
    }
    if (opened.out.get() >= 0 && fstat(opened.out.get(), &opened.info) != 0) {
        const std::error_code error = SystemError();
        opened.out.Close();
        return error;
    }
    // The name the links lead to, for a temporary file beside it. Where it is
    // not the file just opened (a link of the system's own kind, or a name
    // changed meanwhile), the target is written in place.
    if (!FollowLinks(path, opened.final)) {
        opened.final.clear();
    } else if (opened.out.get() >= 0 && !Names(opened.final, opened.info)) {
        opened.final.clear();
    }
    if (opened.out.get() < 0 && opened.final.empty()) {
        return SystemError(ELOOP);
    }
    if (opened.out.get() >= 0) {
        opened.kind = S_ISREG(opened.info.st_mode) ? TargetKind::Regular : TargetKind::Device;
    }
    return {};
}

TargetKind OutputTarget::Kind() const {
    return opened_->kind;
}

fs::path OutputTarget::Folder() const {
    if (Kind() == TargetKind::Device || opened_->final.empty()) {
        return {};
    }
    return FolderOf(opened_->final);
}

bool OutputTarget::StillNamed() const {
    const Opened& opened = *opened_;
    struct stat now {};
    if (opened.kind != TargetKind::Regular || opened.final.empty() || opened.out.get() < 0) {
        return true;
    }
    return fstat(opened.out.get(), &now) == 0 && Names(opened.final, now);
}

WriteResult OutputTarget::Replace(const Content& content) {
    Opened& opened = *opened_;
    std::error_code error;
    if (opened.out.get() < 0) {
        if (opened.final.empty()) {
            return {Outcome::NotWritten, std::make_error_code(std::errc::bad_file_descriptor)};
        }
        return ReplaceByRename(opened.final, nullptr, content, error) == Renamed::Done
                   ? WriteResult{}
                   : WriteResult{Outcome::NotWritten, error};
    }
    struct stat now {};
    if (fstat(opened.out.get(), &now) != 0) {
        return {Outcome::NotWritten, SystemError()};
    }
    if (!S_ISREG(now.st_mode)) {
        const int flags = fcntl(opened.out.get(), F_GETFL);
        if (flags < 0 || fcntl(opened.out.get(), F_SETFL, flags & ~O_NONBLOCK) != 0) {
            return {Outcome::NotWritten, SystemError()};
        }
        const bool written = WritePieces(opened.out.get(), content, error);
        if (!opened.out.Close() && written) {
            error = SystemError();
        }
        return error ? WriteResult{Outcome::Interrupted, error} : WriteResult{};
    }
    // Renaming a new file over the target keeps it whole until the new content
    // is complete, but makes a new file: only for a target whose identity that
    // keeps (one link, the caller's own, no attributes that would be lost).
    if (!opened.final.empty() && now.st_nlink == 1 && now.st_uid == geteuid() &&
        !HasExtendedAttributes(opened.out.get()) && Names(opened.final, now)) {
        const Renamed renamed = ReplaceByRename(opened.final, &now, content, error);
        if (renamed != Renamed::NotPossible) {
            opened.out.Close();
            return renamed == Renamed::Done ? WriteResult{}
                                            : WriteResult{Outcome::NotWritten, error};
        }
    }
    // In place. The old content is kept for putting back if the file can be
    // read as well (the same file, not one renamed there meanwhile).
    const Descriptor in(open(opened.given.c_str(), O_RDONLY | O_CLOEXEC | O_NOCTTY | O_NONBLOCK));
    struct stat readInfo {};
    const bool readable =
        in.get() >= 0 && fstat(in.get(), &readInfo) == 0 && SameInode(readInfo, now);
    PosixFile file(opened.out.get(), readable ? in.get() : -1);
    WriteResult result =
        RewriteInPlace(file, static_cast<std::uint64_t>(now.st_size), readable, content);
    if (!opened.out.Close() && result.outcome == Outcome::Written) {
        result = {Outcome::Uncertain, SystemError()};
    }
    return result;
}

fs::path MakeTemporaryFile(const fs::path& folder, const std::string& prefix,
                           std::error_code& error) {
    fs::path made;
    Descriptor file(folder.empty() ? -1 : CreateExclusive(folder, prefix, 0600, made));
    if (file.get() < 0) {
        error = SystemError(folder.empty() ? ENOENT : errno);
        return {};
    }
    error.clear();
    return made;
}

} // namespace it8::files

#endif
