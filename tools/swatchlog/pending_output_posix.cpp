// Output files on POSIX systems: checked by opening, replaced by rename only
// where that keeps the output's identity, otherwise written in place.
#if !defined(_WIN32)

#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>
#if defined(__linux__)
#include <sys/xattr.h>
#endif

#include <cerrno>
#include <random>
#include <system_error>

#include "file_paths.h"
#include "output_in_place.h"

namespace swatchlog {
namespace {

namespace fs = std::filesystem;

class Descriptor {
public:
    explicit Descriptor(int fd = -1) : fd_(fd) {}
    ~Descriptor() { Close(); }
    Descriptor(const Descriptor&) = delete;
    Descriptor& operator=(const Descriptor&) = delete;
    int get() const { return fd_; }
    void Reset(int fd) {
        Close();
        fd_ = fd;
    }
    /// False when closing reported an error (a late write error).
    bool Close() {
        const int fd = fd_;
        fd_ = -1;
        return fd < 0 || close(fd) == 0;
    }

private:
    int fd_;
};

std::string Reason(int error) {
    return std::generic_category().message(error);
}

// Follows the symbolic links that the last part of `path` names, as opening it
// would. False for a loop or a chain too long to follow.
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

// Whether a file renamed over `fd`'s file would be the same to its users.
bool RenameKeepsIdentity(int fd, const struct stat& info) {
    return S_ISREG(info.st_mode) && info.st_nlink == 1 && info.st_uid == geteuid() &&
           !HasExtendedAttributes(fd);
}

bool WriteAll(int fd, const char* data, std::size_t size) {
    while (size > 0) {
        const ssize_t done = write(fd, data, size);
        if (done < 0 && errno == EINTR) {
            continue;
        }
        if (done <= 0) {
            return false;
        }
        data += done;
        size -= static_cast<std::size_t>(done);
    }
    return true;
}

class PosixOutput final : public OpenOutput {
public:
    PosixOutput(int writeFd, int readFd) : write_(writeFd), read_(readFd) {}

    bool ReadAt(std::uint64_t offset, char* data, std::size_t size) override {
        return Transfer(size, [&](std::size_t done, std::size_t rest) {
            return pread(read_, data + done, rest, static_cast<off_t>(offset + done));
        });
    }
    bool WriteAt(std::uint64_t offset, const char* data, std::size_t size) override {
        return Transfer(size, [&](std::size_t done, std::size_t rest) {
            return pwrite(write_, data + done, rest, static_cast<off_t>(offset + done));
        });
    }
    bool Reserve(std::uint64_t size) override {
        const int error = posix_fallocate(write_, 0, static_cast<off_t>(size));
        error_ = error;
        // A file system that cannot reserve space is written without.
        return error == 0 || error == EINVAL || error == EOPNOTSUPP;
    }
    bool Resize(std::uint64_t size) override {
        return Check(ftruncate(write_, static_cast<off_t>(size)) == 0);
    }
    bool Flush() override { return Check(fdatasync(write_) == 0 || errno == EINVAL); }
    std::string Reason() const override { return swatchlog::Reason(error_); }

private:
    template <typename Call> bool Transfer(std::size_t size, Call call) {
        std::size_t done = 0;
        while (done < size) {
            const ssize_t step = call(done, size - done);
            if (step < 0 && errno == EINTR) {
                continue;
            }
            if (step <= 0) {
                return Check(false, step == 0 ? EIO : errno);
            }
            done += static_cast<std::size_t>(step);
        }
        return true;
    }
    bool Check(bool ok, int error = errno) {
        if (!ok) {
            error_ = error;
        }
        return ok;
    }

    int write_;
    int read_;
    int error_ = 0;
};

enum class Way { Rename, InPlace, Device };

// An empty file in `folder` with a short name of its own (so that an output
// whose name is near the file system's limit still gets one), created with
// `mode`; -1 with errno set when none can be made.
int CreateTemporary(const fs::path& folder, mode_t mode, fs::path& made) {
    std::random_device random;
    for (int attempt = 0; attempt < 8; ++attempt) {
        const unsigned long long stamp =
            (static_cast<unsigned long long>(random()) << 32) ^ random();
        made = folder / (".swatchlog-" + std::to_string(stamp) + ".tmp");
        const int fd = open(made.c_str(), O_WRONLY | O_CREAT | O_EXCL | O_CLOEXEC | O_NOCTTY, mode);
        if (fd >= 0 || errno != EEXIST) {
            return fd;
        }
    }
    return -1;
}

fs::path Folder(const fs::path& file) {
    return file.has_parent_path() ? file.parent_path() : fs::path(".");
}

} // namespace

struct PendingOutput::Target {
    fs::path final;        // the output with its links followed; empty when unknown
    Descriptor out;        // the existing output opened for writing, or -1 for a new one
    struct stat info {};   // the existing output as opened
    Way way = Way::Rename; // how the commit puts the content in place
};

PendingOutput::PendingOutput(std::string finalPath)
    : final_(std::move(finalPath)), target_(std::make_unique<Target>()) {
    Target& target = *target_;
    const fs::path given = FileSystemPath(final_);
    // Opening for writing decides whether the user may write the output; the
    // system follows the links. Non-blocking, so that a pipe without a reader
    // answers at once; not truncated, so that a refusal changes nothing.
    target.out.Reset(open(given.c_str(), O_WRONLY | O_CLOEXEC | O_NOCTTY | O_NONBLOCK));
    const int error = errno;
    if (target.out.get() < 0 && error != ENOENT) {
        throw OutputError(final_, Reason(error), "nothing was written");
    }
    if (target.out.get() >= 0 && fstat(target.out.get(), &target.info) != 0) {
        throw OutputError(final_, Reason(errno), "nothing was written");
    }
    // The name the links lead to, for the temporary file beside it; where it is
    // not the file just opened (a link of the system's own kind, or a name
    // changed meanwhile), the output is written in place.
    struct stat named {};
    if (!FollowLinks(given, target.final)) {
        target.final.clear();
    } else if (target.out.get() >= 0 &&
               (stat(target.final.c_str(), &named) != 0 || !SameInode(named, target.info))) {
        target.final.clear();
    }
    if (target.out.get() < 0) {
        if (target.final.empty()) {
            throw OutputError(final_, Reason(ELOOP), "nothing was written");
        }
        target.way = Way::Rename;
    } else if (!S_ISREG(target.info.st_mode)) {
        target.way = Way::Device;
    } else if (target.final.empty() || !RenameKeepsIdentity(target.out.get(), target.info)) {
        target.way = Way::InPlace;
    }

    // The temporary file, made before any content is written: with the usual
    // mode for a new output; for one it replaces by rename, the output's group
    // and mode (and at least the user's read and write, for the writer and the
    // check, until the commit); otherwise for the user alone.
    fs::path temporary;
    Descriptor made;
    const bool created = target.out.get() < 0;
    if (target.way != Way::Device && !target.final.empty()) {
        made.Reset(CreateTemporary(Folder(target.final), created ? 0666 : 0600, temporary));
        if (made.get() < 0 && created) {
            throw OutputError(final_, Reason(errno), "nothing was written");
        }
        if (made.get() >= 0 && !created && target.way == Way::Rename) {
            struct stat info {};
            const bool sameGroup =
                fstat(made.get(), &info) == 0 &&
                (info.st_gid == target.info.st_gid ||
                 fchown(made.get(), static_cast<uid_t>(-1), target.info.st_gid) == 0);
            if (!sameGroup || fchmod(made.get(), (target.info.st_mode & 0777) | 0600) != 0) {
                target.way = Way::InPlace; // the file stays the user's alone
            }
        }
    }
    if (made.get() < 0) {
        // No file can be made beside the output (a folder the user may not
        // write, or a device's): the content is copied in from elsewhere.
        if (target.way == Way::Rename) {
            target.way = Way::InPlace;
        }
        std::error_code ec;
        made.Reset(CreateTemporary(fs::temp_directory_path(ec), 0600, temporary));
        if (made.get() < 0) {
            throw OutputError(final_, "no temporary file can be made: " + Reason(errno),
                              "nothing was written");
        }
    }
    temporary_ = temporary.u8string();
}

PendingOutput::~PendingOutput() {
    if (!committed_) {
        unlink(FileSystemPath(temporary_).c_str());
    }
}

void PendingOutput::Commit() {
    Target& target = *target_;
    const fs::path temporary = FileSystemPath(temporary_);
    const int fd = target.out.get();
    struct stat now {};
    if (fd >= 0 && fstat(fd, &now) != 0) {
        throw OutputError(final_, Reason(errno), "nothing was written");
    }
    if (fd >= 0 && S_ISREG(now.st_mode) && !target.final.empty()) {
        // The output's name must still lead to the file that was checked.
        struct stat named {};
        if (stat(target.final.c_str(), &named) != 0 || !SameInode(named, now)) {
            throw OutputError(final_, "it was replaced or removed while the command ran",
                              "the new content was not written");
        }
    }
    if (target.way == Way::Rename && fd >= 0) {
        // The output's exact mode, given after its group (a change of group
        // clears set-ID bits), where a rename still keeps its identity.
        const Descriptor check(open(temporary.c_str(), O_RDONLY | O_CLOEXEC | O_NOFOLLOW));
        if (!RenameKeepsIdentity(fd, now) || check.get() < 0 ||
            fchmod(check.get(), now.st_mode & 07777) != 0) {
            target.way = Way::InPlace;
        }
    }
    if (target.way == Way::Rename) {
        if (rename(temporary.c_str(), target.final.c_str()) != 0) {
            throw OutputError(final_, Reason(errno), "nothing was written");
        }
        committed_ = true;
        return;
    }
    std::string text;
    if (!ReadRegularFile(temporary_, text)) {
        throw OutputError(final_, "the checked output cannot be read back", "nothing was written");
    }
    if (target.way == Way::Device) {
        const int flags = fcntl(fd, F_GETFL);
        if (flags < 0 || fcntl(fd, F_SETFL, flags & ~O_NONBLOCK) != 0 ||
            !WriteAll(fd, text.data(), text.size()) || !target.out.Close()) {
            throw OutputError(final_, Reason(errno));
        }
    } else {
        // The old content is kept for putting back when the output can be read
        // as well (the same file, not one renamed there meanwhile).
        const Descriptor in(
            open(FileSystemPath(final_).c_str(), O_RDONLY | O_CLOEXEC | O_NOCTTY | O_NONBLOCK));
        struct stat read {};
        const bool readable = in.get() >= 0 && fstat(in.get(), &read) == 0 && SameInode(read, now);
        PosixOutput file(fd, readable ? in.get() : -1);
        CopyInPlace(file, static_cast<std::uint64_t>(now.st_size), readable, text, final_);
        if (!target.out.Close()) {
            throw OutputError(final_, Reason(errno), "its content is uncertain");
        }
    }
    committed_ = true;
    unlink(temporary.c_str());
}

} // namespace swatchlog

#endif
