// The message for an output that was not written says why and which state the
// output was left in.
#include <gtest/gtest.h>

#include "output_error.h"

namespace swatchlog {
namespace {

using it8::files::Outcome;

TEST(OutputError, SaysWhyAndWhatTheOutputHolds) {
    const std::error_code full = std::make_error_code(std::errc::no_space_on_device);
    const std::string prefix = "out.it8: the output file cannot be written (" + Reason(full) + ")";
    const struct {
        Outcome outcome;
        std::string state; // after "; "; empty: none
    } cases[] = {
        {Outcome::NotWritten, "nothing was written"},
        {Outcome::Unchanged, "it is unchanged"},
        {Outcome::Restored, "its old content was put back"},
        {Outcome::Emptied, "it is now empty, since its old content could not be put back"},
        {Outcome::Uncertain, "its content is uncertain"},
        {Outcome::Interrupted, ""},
    };
    EXPECT_NO_THROW(ThrowUnlessWritten("out.it8", {Outcome::Written, {}}));
    for (const auto& c : cases) {
        std::string message;
        try {
            ThrowUnlessWritten("out.it8", {c.outcome, full});
        } catch (const ChartError& error) {
            message = error.what();
        }
        EXPECT_EQ(message, prefix + (c.state.empty() ? "" : "; " + c.state)) << c.state;
    }
}

} // namespace
} // namespace swatchlog
