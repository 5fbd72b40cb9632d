// How writing a target's new content ended.
#pragma once

#include <system_error>

namespace it8::files {

enum class Outcome {
    Written,     ///< the target holds the new content, whole
    NotWritten,  ///< nothing was written: the target is as it was
    Unchanged,   ///< rewritten in place: there was no room, the target is as it was
    Restored,    ///< rewritten in place: writing failed, the old content was put back
    Emptied,     ///< rewritten in place: writing failed and the old content could
                 ///< not be put back, so the target is empty
    Uncertain,   ///< rewritten in place, but closing the file reported an error
    Interrupted, ///< a device or pipe: writing failed part way
};

struct WriteResult {
    Outcome outcome = Outcome::Written;
    std::error_code error; ///< why, for every outcome but Written
};

} // namespace it8::files
