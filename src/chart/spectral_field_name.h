// Wavelengths encoded in spectral field names ("SPECTRAL_NM_380", "SPECTRAL_380",
// "nm380" / "NM380").
#pragma once

#include <optional>
#include <string>

namespace spectral_field_name {

/// The name with its spectral lead-in removed, leaving the wavelength text; the
/// lead-ins are tried in the order "SPECTRAL_NM_", "SPECTRAL_", then "nm" in
/// either case, and the first one found is removed where it first occurs.
/// Nothing when the name carries none of them.
std::optional<std::string> WavelengthText(const std::string& name);

} // namespace spectral_field_name
