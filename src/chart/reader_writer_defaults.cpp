// Answers of the store for the operations only a file-format reader-writer can
// give: the store alone knows no device values, data format, device-control
// lines or process colour names.
#include "redavudeva/swatchlog_base.h"

int CSwatchlogBase::GetDeviceValueLists(std::vector<std::vector<double>>& /*lists*/) {
    return 24;
}

int CSwatchlogBase::GetDeviceColorSpace() {
    return -1;
}

int CSwatchlogBase::GetDeviceChannelCount() {
    return -1;
}

int CSwatchlogBase::WriteDeviceControlSequence(std::string /*path*/) {
    return 23;
}

std::string CSwatchlogBase::GetDataFormatLine() {
    return std::string();
}

void CSwatchlogBase::SetDataFormatLine(std::string /*line*/) {}

int CSwatchlogBase::GetProcessColorNames(std::vector<std::string>& /*names*/) {
    return 1;
}
