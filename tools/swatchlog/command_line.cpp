#include "command_line.h"

#if defined(_WIN32)
#include <windows.h>

#include <shellapi.h>

#include <memory>
#endif

namespace swatchlog {

#if defined(_WIN32)

namespace {

std::string Utf8FromWide(const wchar_t* wide) {
    const int size = WideCharToMultiByte(CP_UTF8, 0, wide, -1, nullptr, 0, nullptr, nullptr);
    if (size <= 1) {
        return "";
    }
    std::string text(static_cast<std::size_t>(size), '\0');
    WideCharToMultiByte(CP_UTF8, 0, wide, -1, text.data(), size, nullptr, nullptr);
    text.resize(static_cast<std::size_t>(size - 1));
    return text;
}

struct LocalFreeDeleter {
    void operator()(LPWSTR* p) const { LocalFree(p); }
};

} // namespace

std::vector<std::string> CommandLineWords(int argc, char** argv) {
    int count = 0;
    const std::unique_ptr<LPWSTR, LocalFreeDeleter> wide(
        CommandLineToArgvW(GetCommandLineW(), &count));
    std::vector<std::string> words;
    if (!wide) {
        words.assign(argv + 1, argv + argc);
        return words;
    }
    for (int i = 1; i < count; ++i) {
        words.push_back(Utf8FromWide(wide.get()[i]));
    }
    return words;
}

void PrepareConsole() {
    SetConsoleOutputCP(CP_UTF8);
}

#else

std::vector<std::string> CommandLineWords(int argc, char** argv) {
    return std::vector<std::string>(argv + 1, argv + argc);
}

void PrepareConsole() {}

#endif

} // namespace swatchlog
