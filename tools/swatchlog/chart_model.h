// A chart read through the library, with what the tool needs to know about it:
// which colour spaces its patches carry, which of them came from the file and
// which the library derived, its identification and its keywords.
#pragma once

#include <memory>
#include <string>
#include <utility>
#include <vector>

#include <redavudeva/redavudeva.h>

namespace swatchlog {

enum class Space { Cmyk, Rgb, NColor, Html, Cmykogv, Xyz, Lab, Density, Spectral };

struct SpaceName {
    Space space;
    const char* key;   ///< command-line name, e.g. "lab"
    const char* title; ///< human name, e.g. "L*a*b*"
};

/// Every space in display order.
const std::vector<SpaceName>& AllSpaces();
const SpaceName& NameOf(Space space);
/// The space of a command-line name; false when there is none.
bool SpaceFromKey(const std::string& key, Space& space);

using KeywordList = std::vector<std::pair<std::string, std::string>>;

class Chart {
public:
    /// Reads the chart at `path` (UTF-8); ChartError with the file name, the
    /// reason in words and the result code when it cannot be read.
    static Chart Load(const std::string& path);

    CSwatchlogBase& Store() const { return *store_; }
    const std::string& Path() const { return path_; }
    const std::vector<CColorPatch>& Patches() const { return patches_; }

    /// Whether the file's data format has that field (upper case).
    bool FileHasField(const std::string& field) const;
    /// Whether any patch carries the space.
    bool Has(Space space) const;
    /// Whether the space is carried but was not in the file.
    bool Derived(Space space) const;
    /// Whether this patch carries the space.
    static bool PatchHas(const CColorPatch& patch, Space space);

    /// The first word of the file's first line ("CGATS.17", "IT8.7/2" ...).
    const std::string& Identification() const { return identification_; }
    /// Header keywords without the identification, comments, KEYWORD
    /// declarations and PROCESSCOLOR_ID (the chart keeps only the last of those
    /// lines; GetProcessColorNames has them all), values without their trailing
    /// blank, in key order.
    KeywordList Keywords() const;
    /// Spectral field names of the first patch with a spectrum, in name order.
    std::vector<std::string> SpectralFields() const;
    /// n-colour channel names of the first patch with channels, by position.
    std::vector<std::string> NColorNames() const;

private:
    Chart() = default;

    std::unique_ptr<CSwatchlogBase> store_;
    std::string path_;
    std::string identification_;
    std::vector<std::string> fields_;
    std::vector<CColorPatch> patches_;
};

/// A library exception turned into words.
std::string DescribeLibraryException(const std::exception& error);

} // namespace swatchlog
