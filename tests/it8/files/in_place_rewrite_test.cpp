// Rewriting a file in place: a failure at any step leaves the old content or
// nothing, never part of the new content, and the result says which.
#include <gtest/gtest.h>

#include <algorithm>
#include <string>
#include <vector>

#include "it8/files/in_place_rewrite.h"

namespace {

using it8::files::Outcome;

const std::error_code kDiskFull = std::make_error_code(std::errc::no_space_on_device);

// A file in memory. The n-th write or flush (from 0) fails where the n-th
// character of `writes` or `flushes` is 'n'; a failing write still puts half
// of its bytes down, as a disk that fills up does.
class MemoryFile final : public it8::files::RewritableFile {
public:
    std::string bytes;
    bool readable = true;
    bool roomForMore = true;
    std::string writes;
    std::string flushes;

    bool ReadAt(std::uint64_t offset, char* data, std::size_t size) override {
        return readable && bytes.copy(data, size, offset) == size;
    }
    bool WriteAt(std::uint64_t offset, const char* data, std::size_t size) override {
        const bool fails = Fails(writes, writeCount_);
        const std::size_t count = fails ? size / 2 : size;
        bytes.resize(std::max<std::size_t>(bytes.size(), offset + count));
        bytes.replace(offset, count, data, count);
        return !fails;
    }
    bool Reserve(std::uint64_t size) override {
        // A failed reservation may still have taken a part of the room.
        bytes.resize(std::max<std::size_t>(bytes.size(), roomForMore ? size : bytes.size() + 1));
        return roomForMore;
    }
    bool Resize(std::uint64_t size) override {
        bytes.resize(size, '\0');
        return true;
    }
    bool Flush() override { return !Fails(flushes, flushCount_); }
    std::error_code Error() const override { return kDiskFull; }

private:
    static bool Fails(const std::string& pattern, int& count) {
        const auto n = static_cast<std::size_t>(count++);
        return n < pattern.size() && pattern[n] == 'n';
    }
    int writeCount_ = 0;
    int flushCount_ = 0;
};

// The new content comes in two pieces, written one after the other.
const std::vector<std::string> kPieces = {"IT8\n", "NUMBER_OF_SETS\t1\n"};
const std::string kNew = kPieces[0] + kPieces[1];

it8::files::Content NewContent(bool sourceFails) {
    return {kNew.size(), [sourceFails](const it8::files::PieceSink& sink) {
                for (const std::string& piece : kPieces) {
                    if (!sink(piece.data(), piece.size()) || sourceFails) {
                        return false;
                    }
                }
                return true;
            }};
}

} // namespace

TEST(RewriteInPlace, EachFailureLeavesTheOldContentOrNothing) {
    const std::string shorter = "short";
    const std::string longer(200, 'o');
    const std::error_code none;
    const std::error_code sourceError = std::make_error_code(std::errc::io_error);
    const struct {
        const char* what;
        std::string old;
        bool readable;
        bool roomForMore;
        const char* writes;
        const char* flushes;
        bool sourceFails;
        Outcome outcome;
        std::string after; // "=" for the old content
        std::error_code error;
    } cases[] = {
        {"shorter old file", shorter, true, true, "", "", false, Outcome::Written, kNew, none},
        {"longer old file is cut", longer, true, true, "", "", false, Outcome::Written, kNew, none},
        {"no room", shorter, true, false, "", "", false, Outcome::Unchanged, "=", kDiskFull},
        {"write fails", longer, true, true, "n", "", false, Outcome::Restored, "=", kDiskFull},
        {"write fails, shorter old", shorter, true, true, "n", "", false, Outcome::Restored, "=",
         kDiskFull},
        {"second piece fails", longer, true, true, "yn", "", false, Outcome::Restored, "=",
         kDiskFull},
        {"putting back fails too", longer, true, true, "nn", "", false, Outcome::Emptied, "",
         kDiskFull},
        {"every flush fails", longer, true, true, "", "nnnn", false, Outcome::Emptied, "",
         kDiskFull},
        {"old content unreadable", longer, false, true, "n", "", false, Outcome::Emptied, "",
         kDiskFull},
        {"the source fails", longer, true, true, "", "", true, Outcome::Restored, "=", sourceError},
        // The last flush comes after the old tail was cut: the kept bytes are no
        // longer the whole old content of a longer file.
        {"last flush fails, shorter old", shorter, true, true, "", "yn", false, Outcome::Restored,
         "=", kDiskFull},
        {"last flush fails, tail cut", longer, true, true, "", "yn", false, Outcome::Emptied, "",
         kDiskFull},
    };
    for (const auto& c : cases) {
        SCOPED_TRACE(c.what);
        MemoryFile file;
        file.bytes = c.old;
        file.readable = c.readable;
        file.roomForMore = c.roomForMore;
        file.writes = c.writes;
        file.flushes = c.flushes;
        const it8::files::WriteResult result =
            it8::files::RewriteInPlace(file, c.old.size(), c.readable, NewContent(c.sourceFails));
        EXPECT_EQ(result.outcome, c.outcome);
        EXPECT_EQ(result.error, c.error);
        EXPECT_EQ(file.bytes, c.after == "=" ? c.old : c.after);
    }
}
