// Sections of the header that are captured (device control) or passed over.
#include <string>
#include <string_view>
#include <vector>

#include "it8/it8_reader_writer.h"
#include "it8/read/tokens.h"

void CIT8ReaderWriter::ReadDeviceControlSequence() {
    it8::LineSpan line;
    while (chartStream.ReadLine(line)) {
        const std::string_view text = it8::View(line);
        // A line is taken whole, blanks and tabs included; only a line without
        // any character besides line feeds is dropped.
        if (text.find_first_not_of('\n') != std::string_view::npos) {
            if (text == "END_DEVICE_CONTROL_SEQUENCE") {
                return;
            }
            deviceControlLines.emplace_back(text);
        }
        if (chartStream.AtEnd()) {
            return;
        }
    }
}

void CIT8ReaderWriter::SkipSection(std::string_view endKeyword) {
    std::vector<std::string_view> tokens;
    it8::LineSpan line;
    while (chartStream.ReadLine(line)) {
        it8::SplitFields(it8::View(line), tokens);
        if (!tokens.empty() && tokens.front() == endKeyword) {
            return;
        }
        if (chartStream.AtEnd()) {
            return;
        }
    }
}
