// A chart read through the library, with what the tool needs to know about it:
// which colour spaces its patches carry, which of them came from the file and
// which the library derived, its identification, keywords and sample ids, and
// the table it is when its file holds several.
#pragma once

#include <string>
#include <utility>
#include <vector>

#include <redavudeva/redavudeva.h>

#include "chart_tables.h"

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

/// The data-format field whose presence means the file supplies the space
/// itself ("CMYK_C", "RGB_R", "XYZ_X", "LAB_L", "D_RED"); a space the library
/// works out has none of these in its file. Null for the other spaces, which
/// the library never works out.
const char* SupplyingField(Space space);

/// Header keywords of a table the library has read, without the
/// identification, comments, KEYWORD declarations and PROCESSCOLOR_ID (the
/// library keeps only the last of those lines; GetProcessColorNames has them
/// all), values without their trailing blank, in key order.
KeywordList TableKeywords(const LoadedTable& table);

class Chart {
public:
    /// Reads table `table` (0: the first with data) of the chart at `path`
    /// (UTF-8); ChartError with the file, the table, the reason in words and
    /// the result code when it cannot be read.
    static Chart Load(const std::string& path, int table = 0);

    CSwatchlogBase& Store() const { return loaded_.Chart(); }
    const std::string& Path() const { return loaded_.Path(); }
    /// The path, with ", table N" when the file holds several tables.
    std::string Name() const { return loaded_.Name(); }
    /// The file the library read (the chart file, or its table alone): the
    /// source path for the library's writers.
    const std::wstring& SourcePath() const { return loaded_.LibraryPath(); }
    const LoadedTable& Loaded() const { return loaded_; }
    const std::vector<CColorPatch>& Patches() const { return patches_; }

    /// Whether the file's data format has that field (upper case).
    bool FileHasField(const std::string& field) const;
    /// Whether any patch carries the space.
    bool Has(Space space) const;
    /// Whether the space is carried but was not in the file.
    bool Derived(Space space) const;
    /// Whether this patch carries the space.
    static bool PatchHas(const CColorPatch& patch, Space space);

    /// The word alone on the table's first line ("CGATS.17", "IT8.7/2" ...);
    /// empty when that line holds anything else.
    const std::string& Identification() const { return loaded_.Table().identification; }
    /// The table's header keywords (TableKeywords).
    KeywordList Keywords() const { return TableKeywords(loaded_); }
    /// Spectral field names of the first patch with a spectrum, in name order.
    std::vector<std::string> SpectralFields() const;
    /// n-colour channel names of the first patch with channels, by position.
    std::vector<std::string> NColorNames() const;
    /// Whether the data format has a SAMPLE_ID field.
    bool HasSampleIds() const { return !sampleIds_.empty(); }
    /// The SAMPLE_ID text of each patch without double quotes; empty when the
    /// data format has no SAMPLE_ID.
    const std::vector<std::string>& SampleIds() const { return sampleIds_; }
    /// The SAMPLE_ID of patch `index` (0-based), "" when there is none.
    std::string SampleId(std::size_t index) const;

private:
    explicit Chart(LoadedTable loaded) : loaded_(std::move(loaded)) {}

    // Members go in reverse order: the table (with the file's text) before the
    // many small allocations of the patches, which costs the allocator less.
    std::vector<CColorPatch> patches_;
    std::vector<std::string> sampleIds_;
    LoadedTable loaded_;
};

} // namespace swatchlog
