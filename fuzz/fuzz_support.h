// Shared pieces of the fuzz targets: a private scratch folder, the check that
// only the documented exceptions leave the library, and a hard failure that
// libFuzzer records as a crash.
#pragma once

#include <cstddef>
#include <cstdint>
#include <cstdio>
#include <cstdlib>
#include <exception>
#include <filesystem>
#include <fstream>
#include <new>
#include <stdexcept>
#include <string>
#include <system_error>
#include <unistd.h>

namespace fuzz {

/// Stops the run with a message; libFuzzer saves the input as a crash.
[[noreturn]] inline void Fail(const char* what, const std::string& detail = std::string()) {
    std::fprintf(stderr, "FUZZ CHECK FAILED: %s %s\n", what, detail.c_str());
    std::abort();
}

/// A folder of this process's own under the temporary folder; its files are
/// rewritten for every input and the folder is removed when the process ends.
class ScratchDir {
public:
    ScratchDir() {
        std::string pattern =
            (std::filesystem::temp_directory_path() / "redavudeva-fuzz-XXXXXX").string();
        if (mkdtemp(pattern.data()) == nullptr) {
            Fail("cannot create a scratch folder", pattern);
        }
        path_ = pattern;
    }
    ~ScratchDir() {
        std::error_code ignored;
        std::filesystem::remove_all(path_, ignored);
    }
    ScratchDir(const ScratchDir&) = delete;
    ScratchDir& operator=(const ScratchDir&) = delete;

    std::filesystem::path File(const char* name) const { return path_ / name; }

private:
    std::filesystem::path path_;
};

/// The scratch folder of this process.
inline ScratchDir& Scratch() {
    static ScratchDir dir;
    return dir;
}

/// Writes the bytes to the file, replacing it.
inline void WriteFile(const std::filesystem::path& path, const std::uint8_t* data,
                      std::size_t size) {
    std::ofstream out(path, std::ios::binary | std::ios::trunc);
    out.write(reinterpret_cast<const char*>(data), static_cast<std::streamsize>(size));
    if (!out) {
        Fail("cannot write the input file", path.string());
    }
}

/// The scratch paths are plain ASCII, so widening byte by byte is exact.
inline std::wstring Wide(const std::filesystem::path& path) {
    const std::string narrow = path.string();
    return std::wstring(narrow.begin(), narrow.end());
}

/// True for the exceptions the library documents as passing through: the
/// allocation failure, the two whole-number conversion errors, the string
/// position error of spectral field names and the subscript error of the
/// channel ramps. Anything else is a fault.
inline bool IsDocumentedException(const std::exception& e) {
    const std::string what = e.what();
    if (dynamic_cast<const std::bad_alloc*>(&e) != nullptr) {
        return true;
    }
    if (dynamic_cast<const std::invalid_argument*>(&e) != nullptr) {
        return what == "invalid stol argument";
    }
    if (dynamic_cast<const std::out_of_range*>(&e) != nullptr) {
        return what == "stol argument out of range" || what == "invalid string position" ||
               what == "invalid vector subscript";
    }
    return false;
}

/// Runs `call`; answers true when it returned, false when it threw one of the
/// documented exceptions, and fails the run on any other exception.
template <typename Call> bool Guarded(const char* name, Call&& call) {
    try {
        call();
        return true;
    } catch (const std::exception& e) {
        if (!IsDocumentedException(e)) {
            Fail(name, std::string("threw an undocumented exception: ") + e.what());
        }
        return false;
    } catch (...) {
        Fail(name, "threw something that is not a std::exception");
    }
}

/// Fails the run unless `code` is one of the listed result codes.
template <std::size_t N> void ExpectCode(const char* name, int code, const int (&allowed)[N]) {
    for (int a : allowed) {
        if (a == code) {
            return;
        }
    }
    Fail(name, "answered the undocumented result code " + std::to_string(code));
}

/// Sends the library's diagnostic prints on standard output to nowhere, so
/// that they do not drown libFuzzer's own report on standard error.
inline void SilenceStandardOutput() {
    if (std::freopen("/dev/null", "w", stdout) == nullptr) {
        Fail("cannot silence standard output");
    }
}

} // namespace fuzz
