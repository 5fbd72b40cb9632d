// Writing a chart text to its target on POSIX systems.
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

#include "it8/write/in_place_rewrite.h"
#include "it8/write/native_text.h"
#include "it8/write/output_file.h"

namespace it8 {
namespace {

namespace fs = std::filesystem;

class Descriptor {
public:
    explicit Descriptor(int fd) : fd_(fd) {}
    ~Descriptor() { Close(); }
    Descriptor(const Descriptor&) = delete;
    Descriptor& operator=(const Descriptor&) = delete;
    int get() const { return fd_; }
    /// Takes over `fd`, closing the descriptor held before.
    void Reset(int fd) {
        Close();
        fd_ = fd;
    }
    /// Closes the descriptor; false when closing reported an error.
    bool Close() {
        const int fd = fd_;
        fd_ = -1;
        return fd < 0 || close(fd) == 0;
    }

private:
    int fd_;
};

// Follows the symbolic links that the last part of `target` names, as opening
// it would. `final` is the name that is no link (it need not exist). False for
// a loop or a chain too long to follow.
bool FollowLinks(const fs::path& target, fs::path& final) {
    constexpr int kMostLinks = 40; // as the kernel's own limit
    fs::path current = target;
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

bool WriteAll(int fd, const char* data, std::size_t size) {
    while (size > 0) {
        const ssize_t done = write(fd, data, size);
        if (done < 0) {
            if (errno == EINTR) {
                continue;
            }
            return false;
        }
        data += done;
        size -= static_cast<std::size_t>(done);
    }
    return true;
}

class PosixFile final : public RewritableFile {
public:
    PosixFile(int writeFd, int readFd) : write_(writeFd), read_(readFd) {}

    bool ReadAt(std::uint64_t offset, char* data, std::size_t size) override {
        while (size > 0) {
            const ssize_t done = pread(read_, data, size, static_cast<off_t>(offset));
            if (done < 0 && errno == EINTR) {
                continue;
            }
            if (done <= 0) {
                return false;
            }
            data += done;
            size -= static_cast<std::size_t>(done);
            offset += static_cast<std::uint64_t>(done);
        }
        return true;
    }

    bool WriteAt(std::uint64_t offset, const char* data, std::size_t size) override {
        while (size > 0) {
            const ssize_t done = pwrite(write_, data, size, static_cast<off_t>(offset));
            if (done < 0 && errno == EINTR) {
                continue;
            }
            if (done <= 0) {
                return false;
            }
            data += done;
            size -= static_cast<std::size_t>(done);
            offset += static_cast<std::uint64_t>(done);
        }
        return true;
    }

    bool Reserve(std::uint64_t size) override {
        const int error = posix_fallocate(write_, 0, static_cast<off_t>(size));
        // A file system that cannot reserve space is written without.
        return error == 0 || error == EINVAL || error == EOPNOTSUPP;
    }

    bool Resize(std::uint64_t size) override {
        return ftruncate(write_, static_cast<off_t>(size)) == 0;
    }

    bool Flush() override { return fdatasync(write_) == 0 || errno == EINVAL; }

private:
    int write_;
    int read_;
};

bool HasExtendedAttributes(int fd) {
#if defined(__linux__)
    // Access lists are extended attributes here as well. When the list cannot
    // be read, the file is taken to carry some.
    const ssize_t size = flistxattr(fd, nullptr, 0);
    return size > 0 || (size < 0 && errno != ENOTSUP);
#else
    (void)fd;
    return false;
#endif
}

// A short name in the target's folder that no other writer is likely to pick
// at the same moment. It does not grow with the target's name, so a target
// whose name is near the file system's limit still gets a temporary file.
fs::path TemporaryBeside(const fs::path& target) {
    std::random_device random;
    const unsigned long long stamp = (static_cast<unsigned long long>(random()) << 32) ^ random();
    return target.parent_path() / (".rdv" + std::to_string(stamp) + ".tmp");
}

enum class Replaced { Done, Failed, NotPossible };

// Writes the text to a temporary file beside `final` and renames it over
// `final`. `existing` describes the file replaced (null for a new one): the
// temporary file is created with no more permissions than it has and then
// given its exact mode and group, so the new text is never readable by more
// users than the old. Failed: the text could not be written (a full disk);
// NotPossible: no such temporary file could be made or renamed.
Replaced ReplaceByRename(const fs::path& final, const struct stat* existing,
                         const std::vector<std::string>& lines) {
    const mode_t mode = existing != nullptr ? (existing->st_mode & 07777) : 0666;
    fs::path temporary;
    Descriptor out(-1);
    for (int attempt = 0; attempt < 8 && out.get() < 0; ++attempt) {
        temporary = TemporaryBeside(final);
        out.Reset(open(temporary.c_str(), O_WRONLY | O_CREAT | O_EXCL | O_CLOEXEC | O_NOCTTY,
                       mode & 0777));
        if (out.get() < 0 && errno != EEXIST) {
            return Replaced::NotPossible;
        }
    }
    if (out.get() < 0) {
        return Replaced::NotPossible;
    }
    if (existing != nullptr) {
        struct stat created {};
        const bool sameGroup = fstat(out.get(), &created) == 0 &&
                               (created.st_gid == existing->st_gid ||
                                fchown(out.get(), static_cast<uid_t>(-1), existing->st_gid) == 0);
        // The mode after the group: a change of group clears set-ID bits.
        if (!sameGroup || fchmod(out.get(), mode) != 0) {
            out.Close();
            unlink(temporary.c_str());
            return Replaced::NotPossible;
        }
    }
    const bool written = ForEachTextPiece(lines, [&out](const char* data, std::size_t size) {
        return WriteAll(out.get(), data, size);
    });
    if (!out.Close() || !written) {
        unlink(temporary.c_str());
        return Replaced::Failed;
    }
    if (rename(temporary.c_str(), final.c_str()) != 0) {
        unlink(temporary.c_str());
        return Replaced::NotPossible;
    }
    return Replaced::Done;
}

// A device or a pipe: written as it is, nothing can be put back there.
bool WriteToDevice(Descriptor& out, const std::vector<std::string>& lines) {
    const int flags = fcntl(out.get(), F_GETFL);
    if (flags < 0 || fcntl(out.get(), F_SETFL, flags & ~O_NONBLOCK) != 0) {
        return false;
    }
    const bool written = ForEachTextPiece(lines, [&out](const char* data, std::size_t size) {
        return WriteAll(out.get(), data, size);
    });
    return out.Close() && written;
}

} // namespace

bool WriteLinesToFile(const fs::path& target, const std::vector<std::string>& lines) {
    fs::path final;
    if (target.empty() || !FollowLinks(target, final)) {
        return false;
    }
    // Opening for writing decides whether the caller may write the target.
    // Non-blocking, so that a pipe without a reader answers at once.
    Descriptor out(open(final.c_str(), O_WRONLY | O_CLOEXEC | O_NOCTTY | O_NONBLOCK));
    if (out.get() < 0) {
        // No permission, a folder, a loop of links, a pipe without a reader, a
        // read-only file system: refused. A missing file is made.
        return errno == ENOENT && ReplaceByRename(final, nullptr, lines) == Replaced::Done;
    }
    struct stat info {};
    if (fstat(out.get(), &info) != 0) {
        return false;
    }
    if (!S_ISREG(info.st_mode)) {
        return WriteToDevice(out, lines);
    }
    // Renaming a new file over the target keeps it whole until the new text is
    // complete, but makes a new file: only for a target whose identity that
    // keeps (one link, the caller's own, no attributes that would be lost).
    if (info.st_nlink == 1 && info.st_uid == geteuid() && !HasExtendedAttributes(out.get())) {
        const Replaced replaced = ReplaceByRename(final, &info, lines);
        if (replaced != Replaced::NotPossible) {
            return replaced == Replaced::Done;
        }
    }
    // In place. The old content is kept for putting back if the file can be
    // read as well (the same file, not one renamed there meanwhile).
    Descriptor in(open(final.c_str(), O_RDONLY | O_CLOEXEC | O_NOCTTY | O_NONBLOCK));
    struct stat readInfo {};
    const bool readable = in.get() >= 0 && fstat(in.get(), &readInfo) == 0 &&
                          readInfo.st_dev == info.st_dev && readInfo.st_ino == info.st_ino;
    PosixFile file(out.get(), readable ? in.get() : -1);
    const bool written =
        RewriteInPlace(file, static_cast<std::uint64_t>(info.st_size), readable, lines);
    return out.Close() && written;
}

} // namespace it8

#endif
