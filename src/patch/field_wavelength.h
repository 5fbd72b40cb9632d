// Wavelengths named by a patch's spectral field names: "SPECTRAL_NM_380",
// "SPECTRAL_380" or "380NM".
#pragma once

#include <optional>
#include <string>
#include <string_view>

namespace field_wavelength {

/// The first of "SPECTRAL_NM_", "SPECTRAL_" and "NM" that occurs anywhere in
/// `name`; nullptr when none does.
const char* MarkerIn(const std::string& name);

/// The wavelength `name` gives: the name with the first occurrence of `marker`
/// removed, read as white space, an optional sign and decimal digits. Nothing
/// when the marker is absent, no digit follows or the number leaves the signed
/// 32-bit range.
std::optional<int> WavelengthIn(const std::string& name, std::string_view marker);

} // namespace field_wavelength
