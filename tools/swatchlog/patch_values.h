// The values of one colour space of a patch, as numbers and as table cells.
#pragma once

#include <string>
#include <vector>

#include "chart_model.h"

namespace swatchlog {

/// Field names of the space's columns in this chart (e.g. LAB_L, LAB_A, LAB_B).
std::vector<std::string> SpaceFields(const Chart& chart, Space space);
/// Digits after the point when the space is printed in a table.
int SpaceDecimals(Space space);
/// The patch's values of the space, one per field; empty when the patch lacks it,
/// NaN (null in JSON) for a field the patch has no value for. The HTML colour has
/// no numbers (see HtmlText).
std::vector<double> SpaceNumbers(const CColorPatch& patch, Space space, std::size_t fieldCount);
/// "#RRGGBB" of the patch's HTML colour.
std::string HtmlText(const CColorPatch& patch);
/// Table cells of the space for the patch; empty cells when the patch lacks it, and
/// for each field the patch has no value for (never a 0 in their place).
std::vector<std::string> SpaceCells(const CColorPatch& patch, Space space, std::size_t fieldCount);
/// The patch's label without the double quotes a file may put around it.
std::string DisplayName(const CColorPatch& patch);

} // namespace swatchlog
