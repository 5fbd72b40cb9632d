// A template chart reduced to its identifier column, with the store's columns
// and the white-point keywords of a measured and a profile white patch.
#pragma once

#include <string>

#include "it8/write/diagnostic_sink.h"
#include "it8/write/template_blocks.h"
#include "redavudeva/color_patch.h"

namespace it8 {

/// Writes the template's lines with the data format cut to the identifier field
/// plus the store's columns, CMYK rows renumbered from 1, and the white-point
/// keyword block before "BEGIN_DATA_FORMAT"; the last template line is replaced
/// by "END_DATA". Diagnostic lines go to `sink`. Answers 0, 21 (template
/// unreadable), 23 (target not written) or 24 (no data format or data block, or
/// a list too short for the rows). A NUMBER_OF_FIELDS value that is not a 32-bit
/// number throws std::invalid_argument or std::out_of_range before anything is
/// written.
int WriteColumnsWithWhitePoint(const std::wstring& templatePath, const std::wstring& targetPath,
                               const TemplateLists& lists, const CColorPatch& measuredWhite,
                               const CColorPatch& profileWhite, const DiagnosticSink& sink);

} // namespace it8
