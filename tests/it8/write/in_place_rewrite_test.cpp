// Rewriting a target in place: a failure at any step leaves the old content or
// nothing, never part of the new text.
#include <gtest/gtest.h>

#include <algorithm>
#include <string>
#include <vector>

#include "it8/write/in_place_rewrite.h"

namespace {

// A file in memory that refuses the operations it is told to.
class MemoryFile final : public it8::RewritableFile {
public:
    std::string bytes;
    bool readable = true;
    bool roomForMore = true;
    int failingWrite = -1; ///< the write (from 0) that fails; -1: none does
    int writes = 0;
    bool flushFails = false;

    bool ReadAt(std::uint64_t offset, char* data, std::size_t size) override {
        if (!readable || offset + size > bytes.size()) {
            return false;
        }
        bytes.copy(data, size, offset);
        return true;
    }
    bool WriteAt(std::uint64_t offset, const char* data, std::size_t size) override {
        if (writes++ == failingWrite) {
            // A failing write may still have put part of its bytes down.
            bytes.replace(offset, std::min<std::size_t>(1, size), "#");
            return false;
        }
        if (offset + size > bytes.size()) {
            bytes.resize(offset + size);
        }
        bytes.replace(offset, size, data, size);
        return true;
    }
    bool Reserve(std::uint64_t size) override {
        if (!roomForMore) {
            bytes.resize(bytes.size() + 1, '\0'); // a part of the room was taken
            return false;
        }
        if (size > bytes.size()) {
            bytes.resize(size, '\0');
        }
        return true;
    }
    bool Resize(std::uint64_t size) override {
        bytes.resize(size, '\0');
        return true;
    }
    bool Flush() override { return !flushFails; }
};

#if defined(_WIN32)
const std::string kNewText = "IT8\r\nNUMBER_OF_SETS\t1\r\n";
#else
const std::string kNewText = "IT8\nNUMBER_OF_SETS\t1\n";
#endif
const std::vector<std::string> kLines = {"IT8", "NUMBER_OF_SETS\t1"};

} // namespace

TEST(RewriteInPlace, EachFailureLeavesTheOldContentOrNothing) {
    struct Case {
        const char* what;
        std::string old;
        bool readable;
        bool roomForMore;
        int failingWrite;
        bool flushFails;
        bool written;
        std::string after; // "=" for the old content
    };
    const std::string shorter = "short";
    const std::string longer(200, 'o');
    const Case cases[] = {
        {"shorter old file", shorter, true, true, -1, false, true, kNewText},
        {"longer old file is cut", longer, true, true, -1, false, true, kNewText},
        {"no room for the longer text", shorter, true, false, -1, false, false, "="},
        {"write fails, old put back", longer, true, true, 0, false, false, "="},
        {"write fails on a shorter old file", shorter, true, true, 0, false, false, "="},
        {"flush fails, old put back", longer, true, true, -1, true, false, ""},
        {"write fails, old unreadable", longer, false, true, 0, false, false, ""},
    };
    for (const Case& c : cases) {
        SCOPED_TRACE(c.what);
        MemoryFile file;
        file.bytes = c.old;
        file.readable = c.readable;
        file.roomForMore = c.roomForMore;
        file.failingWrite = c.failingWrite;
        file.flushFails = c.flushFails;
        EXPECT_EQ(it8::RewriteInPlace(file, c.old.size(), c.readable, kLines), c.written);
        EXPECT_EQ(file.bytes, c.after == "=" ? c.old : c.after);
    }
}
