// Writing the captured device-control lines to a file of their own.
#include <filesystem>
#include <stdexcept>
#include <string>
#include <system_error>

#include "it8/it8_reader_writer.h"
#include "it8/write/output_file.h"

int CIT8ReaderWriter::WriteDeviceControlSequence(std::string path) {
    if (deviceControlLines.empty() || path.empty()) {
        return 23;
    }
    // The narrow path is a UTF-8 file name. Where file names are wide, a path
    // that is no UTF-8 cannot be converted and names no file that can be written.
    std::filesystem::path target;
    try {
        target = std::filesystem::u8path(path);
    } catch (const std::system_error&) {
        return 23;
    } catch (const std::range_error&) {
        return 23;
    }
    return it8::WriteLinesToFile(target, deviceControlLines) ? 0 : 23;
}
