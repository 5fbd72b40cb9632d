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
    return DescribeDevice(chart.Store(), chart.FileHasField("CMYK_C"), chart.Has(Space::Html));
}

DeviceSpace DescribeDevice(CSwatchlogBase& store, bool fileHasCmyk, bool anyHtml) {
    DeviceSpace device{DeviceSpaceName(store.GetDeviceColorSpace()), store.GetDeviceChannelCount()};
    // A chart of spectra alone reports CMYK: the densities its patches derive
    // are kept as CMYK. It has no device values. An HTML colour is reported as
    // CMYK too.
    if (store.GetDeviceColorSpace() == COLORSPACE_CMYK && !fileHasCmyk) {
        device.name = anyHtml ? "HTML colour" : "none";
        device.channels = anyHtml ? 3 : 0;
    }
    if (device.name == "none") {
        device.channels = 0;
    }
    return device;
}

} // namespace swatchlog
