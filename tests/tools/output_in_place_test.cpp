// Copying an output into the existing file in place leaves that file whole:
// with the new content, its old one, or (where the old one cannot be put back)
// nothing, and the message says which.
#include <gtest/gtest.h>

#include "output_in_place.h"

namespace swatchlog {
namespace {

// A file in memory. Its first `failingWrites` writes fail after writing half
// of what they were given, as a disk that fills up does.
class MemoryFile final : public OpenOutput {
public:
    MemoryFile(std::string content, bool roomFails, int failingWrites)
        : content_(std::move(content)), roomFails_(roomFails), failingWrites_(failingWrites) {}
    const std::string& content() const { return content_; }

    bool ReadAt(std::uint64_t offset, char* data, std::size_t size) override {
        return content_.copy(data, size, static_cast<std::size_t>(offset)) == size;
    }
    bool WriteAt(std::uint64_t offset, const char* data, std::size_t size) override {
        const bool fails = failingWrites_-- > 0;
        const std::size_t count = fails ? size / 2 : size;
        const auto at = static_cast<std::size_t>(offset);
        content_.resize(std::max(content_.size(), at + count));
        content_.replace(at, count, data, count);
        return !fails;
    }
    bool Reserve(std::uint64_t size) override {
        content_.resize(std::max(content_.size(), static_cast<std::size_t>(size)));
        return !roomFails_;
    }
    bool Resize(std::uint64_t size) override {
        content_.resize(static_cast<std::size_t>(size));
        return true;
    }
    bool Flush() override { return true; }
    std::string Reason() const override { return "disk full"; }

private:
    std::string content_;
    bool roomFails_;
    int failingWrites_;
};

TEST(OutputInPlace, TheFileHoldsTheNewContentTheOldOneOrNothing) {
    const std::string old = "the old content\n";
    const std::string shorter = "new\n";
    const std::string longer(100, 'n');
    const struct {
        const char* what;
        const std::string& text;
        bool readable;
        bool roomFails;
        int failingWrites;
        std::string content; // afterwards
        std::string state;   // in the message; empty: no failure
    } cases[] = {
        {"shorter", shorter, true, false, 0, shorter, ""},
        {"no room", longer, true, true, 0, old, "it is unchanged"},
        {"write fails", shorter, true, false, 1, old, "its old content was put back"},
        {"putting back fails too", longer, true, false, 2, "", "it is now empty"},
        {"old content unreadable", longer, false, false, 1, "", "it is now empty"},
    };
    for (const auto& c : cases) {
        MemoryFile file(old, c.roomFails, c.failingWrites);
        std::string message;
        try {
            CopyInPlace(file, old.size(), c.readable, c.text, "out.it8");
        } catch (const ChartError& error) {
            message = error.what();
        }
        EXPECT_EQ(file.content(), c.content) << c.what;
        if (c.state.empty()) {
            EXPECT_EQ(message, "") << c.what;
        } else {
            EXPECT_EQ(message.rfind(
                          "out.it8: the output file cannot be written (disk full); " + c.state, 0),
                      0u)
                << c.what << ": " << message;
        }
    }
}

} // namespace
} // namespace swatchlog
