#include "device_space.h"

namespace swatchlog {
namespace {

std::string DeviceSpaceName(int space) {
    switch (space) {
    case COLORSPACE_CMYK:
        return "CMYK";
    case COLORSPACE_LAB:
        return "L*a*b*";
    case COLORSPACE_RGB:
        return "RGB";
    case COLORSPACE_CMYKOG:
        return "six-colour CMYKOG";
    case COLORSPACE_CMYKRGB:
        return "CMYK+RGB";
    case COLORSPACE_NCOLOR:
        return "n-colour";
    default:
        return "none";
    }
}

} // namespace

DeviceSpace DescribeDevice(const Chart& chart) {
    CSwatchlogBase& store = chart.Store();
    DeviceSpace device{DeviceSpaceName(store.GetDeviceColorSpace()), store.GetDeviceChannelCount()};
    if (store.GetDeviceColorSpace() == COLORSPACE_CMYK && !chart.FileHasField("CMYK_C")) {
        const bool html = chart.Has(Space::Html);
        device.name = html ? "HTML colour" : "none";
        device.channels = html ? 3 : 0;
    }
    return device;
}

} // namespace swatchlog
