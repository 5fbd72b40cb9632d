#include "it8/write/diagnostic_sink.h"

#include <cstdio>
#include <utility>

namespace it8 {

DiagnosticSink::DiagnosticSink()
    : writer_([](const std::string& text) {
          std::fwrite(text.data(), 1, text.size(), stdout);
          std::fflush(stdout);
      }) {}

DiagnosticSink::DiagnosticSink(Writer writer) : writer_(std::move(writer)) {}

void DiagnosticSink::Print(const std::string& text) const {
    if (writer_) {
        writer_(text);
    }
}

} // namespace it8
