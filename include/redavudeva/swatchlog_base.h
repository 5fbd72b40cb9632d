// CSwatchlogBase: the chart store and the reader-writer interface a host uses.
//
// Hosts call the virtual operations by their position, so the declaration
// order below is part of the interface and must never change.
#pragma once

#include <cstdint>
#include <map>
#include <string>
#include <utility>
#include <vector>

#include "redavudeva/color_patch.h"
#include "redavudeva/records.h"

/// Colour-space index used by IsColorSpacePresent and GetDeviceColorSpace.
enum enumColorSpace {
    COLORSPACE_CMYK = 0,
    COLORSPACE_XYZ = 1,
    COLORSPACE_LAB = 2,
    COLORSPACE_RGB = 3,
    COLORSPACE_SPECTRAL = 4,
    COLORSPACE_CMYKOG = 5,
    COLORSPACE_CMYKRGB = 6,
    COLORSPACE_HTMLCOLOR = 7,
    COLORSPACE_NCOLOR = 8,
    COLORSPACE_DENSITY = 9,
    COLORSPACE_CMYKOGV = 10,
    COLORSPACE_CMYKO = 11
};

/// Wavelength grid of a chart's spectral fields.
struct SpectralRangeStruct {
    int startNm = 0;
    int stepNm = 0;
    int count = 0;
};

using KeywordPair = std::pair<std::string, std::string>;
using SpectralMap = std::map<std::string, double>;
using NColorMap = std::map<int, tagNCLR>;

/// Result codes: 0 success; 1 nothing found or nothing to write; 3 file cannot be
/// opened; 4 empty path; 5 unusable data format; 6 NUMBER_OF_SETS below 1; 7 file
/// ends inside the data block; 8 row or set count disagrees; 9 no data block;
/// 10 no such sample; 11 no patches; 12 colour space not carried; 15/16/17 strip
/// layout unusable / not set / strip out of range; 18 page count below 1;
/// 19 channel out of range; 21 source unreadable; 22 source not a readable chart;
/// 23 target cannot be written; 24 store data do not fit the source; 25 no
/// reference samples.
///
/// Reading a chart file (ReadChartFile, and the source of every writer):
/// - Only a regular file is read; a folder, a device or a pipe answers 3 (21 as a
///   writer's source) without a byte being read. The file is read whole, with its
///   length taken when it is opened.
/// - A UTF-8 byte-order mark at the start is skipped.
/// - Line ends: a file whose first line (up to its first LF) holds at most 1023
///   characters is read with LF line ends (a CR before an LF belongs to the line
///   end, any other CR separates tokens). A longer first line with a CR within
///   its first 1023 characters, or a file without any LF that holds a CR, is read
///   with CR line ends. Lines may be of any length; a NUL ends a line.
/// - Limits that keep memory proportional to the file: a field name of the data
///   format longer than 1023 characters answers 5; a data row answers 8 unless it
///   holds at least as many values as the format has spectral and n-colour
///   fields (every patch carries its own copy of those names). Peak memory while
///   reading is then at most about 1.1 KiB per byte of the file (a patch is about
///   1 KiB, the shortest row is two bytes) plus the file itself.
///
/// Writing a target (every writer): whether it may be written is decided by
/// opening it for writing; a symbolic link is followed, a loop answers 23. A new
/// target appears only when complete. An existing target keeps its owner, group,
/// mode, hard links, access lists and extended attributes: where replacing it
/// by a renamed temporary file would lose any of these (and always on Windows)
/// it is rewritten in place. On failure (23) the target holds its old content,
/// or, when that could not be read or put back, is left empty; it never holds a
/// part of the new text. A source may also be the target.
class CSwatchlogBase {
public:
    CSwatchlogBase();
    /// Destroys the store; hosts delete the object through this destructor.
    virtual ~CSwatchlogBase();

    // ---- File operations (implemented by the reader-writer) ------------------

    /// Reads a chart file into the store: 0, or 3, 4, 5, 6, 7, 8, 9.
    virtual int ReadChartFile(std::wstring path) = 0;
    /// Copies a template, reduces its format to the identifier column, appends the
    /// store's columns and white-point keywords: 0, 21, 23, 24.
    virtual int AppendColumnsWithWhitePoint(std::wstring templatePath, std::wstring targetPath,
                                            CColorPatch measuredWhite,
                                            CColorPatch profileWhite) = 0;
    /// append false: new file from the store; true: template with appended columns.
    /// 0, 21, 23, 24.
    virtual int WriteChartFile(std::wstring templatePath, std::wstring targetPath, bool append) = 0;
    /// Rebuilds the source's data block with the store's measurements: 0, 21-24.
    virtual int WriteMeasurementFile(std::wstring sourcePath, std::wstring targetPath) = 0;
    /// Appends the colour spaces the source lacks and the store has: 0, 21-24.
    virtual int AppendMissingColumns(std::wstring sourcePath, std::wstring targetPath,
                                     bool exactCounts) = 0;
    /// Copies a chart file with keyword lines inserted after its identification: 0, 21, 23.
    virtual int
    InsertKeywords(std::wstring sourcePath, std::wstring targetPath,
                   const std::vector<std::pair<std::string, std::string>>& keywords) = 0;
    /// Always 1.
    virtual int CanReadFile(std::wstring path) = 0;
    /// Writes the source reduced to the store's clean and white patches: 0, 1, 21-24.
    virtual int WriteTargetFile(std::wstring sourcePath, std::wstring targetPath) = 0;

    // ---- Store queries and edits --------------------------------------------

    /// Number of patches.
    virtual int GetPatchCount();
    virtual int GetNumberOfCols();
    virtual int GetNumberOfStrips();
    virtual int GetNumberOfPages();
    virtual int GetDevice();
    virtual int GetPatchesPerPage();
    /// Copy of the header keywords of the file last read.
    virtual std::map<std::string, std::string> GetKeywords();
    /// Value stored for exactly that keyword, or "".
    virtual std::string GetKeywordValue(std::string keyword);
    /// Copy of a patch; result 0, 10 (no such sample) or 11 (no patches).
    virtual CColorPatch GetPatch(int sampleNumber, int& result);
    /// Sample number of the closest patch within the distance (and below 400), or -1.
    virtual int FindClosestPatch(const tagCMYK& target, double maximumDistance);
    /// Sample number of the closest patch below distance 10000, or -1.
    virtual int FindClosestPatch(const tagCMYK& target);
    virtual int FindClosestPatch(const tagCMYKOG& target, double maximumDistance);
    virtual int FindClosestPatch(const tagCMYKOG& target);
    virtual int FindClosestPatch(const tagCMYKRGB& target, double maximumDistance);
    virtual int FindClosestPatch(const tagCMYKRGB& target);
    /// Record of one patch: 0, 11 (no patches), 12 (space not carried by the chart),
    /// 10 (no such sample), 12 (that patch does not hold the space, e.g. its spectrum
    /// gave no colour: one value, a non-finite value, nothing within 380..780 nm).
    /// Changed: the per-patch 12 is new; these queries used to answer 0 with the
    /// patch's unset (zero) record.
    virtual int GetPatchCMYK(int sampleNumber, tagCMYK& cmyk);
    virtual int GetPatchCMYKOG(int sampleNumber, tagCMYKOG& cmykog);
    virtual int GetPatchCMYKRGB(int sampleNumber, tagCMYKRGB& cmykrgb);
    virtual int GetPatchXYZ(int sampleNumber, tagXYZ& xyz);
    virtual int GetPatchLAB(int sampleNumber, tagLAB& lab);
    virtual int GetPatchRGB(int sampleNumber, tagRGB& rgb);
    virtual int GetPatchDensity(int sampleNumber, tagDENSITY& density);
    /// Every patch's record in sample order: 0, 11 (no patches), 12 (space not carried
    /// by the chart, or not held by one of its patches; the list is then untouched).
    /// Changed: a patch that lacks the space used to contribute a zero record.
    virtual int CollectCMYK(std::vector<tagCMYK>& list);
    virtual int CollectCMYKOG(std::vector<tagCMYKOG>& list);
    virtual int CollectCMYKO(std::vector<SWL_CMYKO>& list);
    virtual int CollectCMYKOGV(std::vector<tagCMYKOGV>& list);
    virtual int CollectCMYKRGB(std::vector<tagCMYKRGB>& list);
    virtual int CollectXYZ(std::vector<tagXYZ>& list);
    virtual int CollectLAB(std::vector<tagLAB>& list);
    virtual int CollectRGB(std::vector<tagRGB>& list);
    virtual int CollectHTMLCOLOR(std::vector<tagHTMLCOLOR>& list);
    /// Every patch's n-colour map: 0 or 12 (not carried, or a patch without channels).
    virtual int CollectNColorMaps(std::vector<std::map<int, tagNCLR>>& list);
    /// Device values of every patch as lists of numbers: 0, 12; base version 24.
    virtual int GetDeviceValueLists(std::vector<std::vector<double>>& lists);
    /// Every patch's densities in sample order: 0, 11, 12 (as for the records above).
    virtual int CollectDensities(std::vector<tagDENSITY>& list);
    /// Sets the strip layout: 0, or 15 for a count below 1.
    virtual int SetLayout(int strips, int columns);
    /// Sets the page count: 0, or 18 for a count below 1.
    virtual int SetNumberOfPages(int pages);
    /// Records of one strip (1-based): 0, 12, 15, 16, 17; also 12 (new) when a patch
    /// of that strip does not hold the space.
    virtual int CollectStripRGB(int strip, std::vector<tagRGB>& list);
    virtual int CollectStripLAB(int strip, std::vector<tagLAB>& list);
    virtual int CollectStripXYZ(int strip, std::vector<tagXYZ>& list);
    virtual int CollectStripCMYKOGV(int strip, std::vector<tagCMYKOGV>& list);
    virtual int CollectStripCMYKRGB(int strip, std::vector<tagCMYKRGB>& list);
    virtual int CollectStripCMYKO(int strip, std::vector<SWL_CMYKO>& list);
    virtual int CollectStripCMYKOG(int strip, std::vector<tagCMYKOG>& list);
    virtual int CollectStripCMYK(int strip, std::vector<tagCMYK>& list);
    /// Copies of all patches in sample order.
    virtual std::vector<CColorPatch> GetPatchList();
    /// Every patch's spectral map (empty without spectral data).
    virtual std::vector<std::map<std::string, double>> GetSpectralDataList();
    /// Grid of the first patch's spectral fields, or 0, 0, 0.
    virtual SpectralRangeStruct GetSpectralRange();
    /// Presence flag of an enumColorSpace value; false outside 0..11.
    virtual bool IsColorSpacePresent(int colorSpace);
    /// Device colour space of the chart; base version -1.
    virtual int GetDeviceColorSpace();
    /// Device channel count of the chart; base version -1.
    virtual int GetDeviceChannelCount();
    /// CHART_TYPE of the file read, or "unknown"; always 0.
    virtual int GetChartType(std::string& chartType);
    /// Sets CHART_TYPE in the keyword list to be written.
    virtual void SetChartType(std::string chartType);
    /// Writes the captured device-control lines: 0, or 23; base version 23.
    virtual int WriteDeviceControlSequence(std::string path);
    /// Patches on the straight gradient origin + t * direction.
    virtual std::vector<CColorPatch>
    SelectCMYKRGBGradient(const tagCMYKRGB& origin, const tagCMYKRGB& direction, double tolerance);
    virtual std::vector<CColorPatch>
    SelectCMYKOGGradient(const tagCMYKOG& origin, const tagCMYKOG& direction, double tolerance);
    virtual std::vector<CColorPatch> SelectCMYKGradient(const tagCMYK& origin,
                                                        const tagCMYK& direction, double tolerance);
    /// Clean and white patches; true when nothing was found.
    virtual bool SelectCleanAndWhitePatches(std::vector<CColorPatch>& patchesOut,
                                            bool stopAtFirstWhite);
    /// Patches printing exactly one channel.
    virtual std::vector<CColorPatch> SelectCleanColorPatches();
    /// Clean patches per channel (-1: every channel), first white in front: 0 or 19.
    virtual int GroupCleanColorPatches(std::map<int, std::vector<CColorPatch>>& groups,
                                       int channel);
    /// Sorted, thinned reference values and XYZ along each channel: 0 or 19.
    virtual int GetChannelRamps(std::vector<std::vector<double>>& references,
                                std::vector<tagXYZ>& xyz, int channel);
    /// Sets the chart's norm light and every patch's.
    virtual void SetChartNormLight(tagXYZ normLightValue);
    virtual void SetKeywordList(const std::vector<std::pair<std::string, std::string>>& keywords);
    virtual void SetSampleNameList(const std::vector<std::string>& names);
    virtual void SetCMYKList(const std::vector<tagCMYK>& list);
    virtual void SetCMYKOGList(const std::vector<tagCMYKOG>& list);
    virtual void SetCMYKRGBList(const std::vector<tagCMYKRGB>& list);
    virtual void SetCMYKOGVList(const std::vector<tagCMYKOGV>& list);
    virtual void SetXYZList(const std::vector<tagXYZ>& list);
    virtual void SetLABList(const std::vector<tagLAB>& list);
    virtual void SetRGBList(const std::vector<tagRGB>& list);
    /// Sets the spectra to be written; with `compute` also XYZ, Lab and densities, one
    /// entry each per spectrum that gives colour. Each spectrum is read on the
    /// wavelengths of its own field names; any step or range is brought onto 10 nm
    /// steps within 380..780 nm first (see CColorPatch::SetMissingColorSpace). A
    /// spectrum with an unreadable name, one value, a non-finite value or nothing
    /// within 380..780 nm is skipped.
    virtual void SetSpectralDataList(const std::vector<std::map<std::string, double>>& list,
                                     bool compute);
    virtual void SetNColorList(const std::vector<std::map<int, tagNCLR>>& list);
    /// Appends a keyword pair to the list to be written.
    virtual void AddKeyword(std::pair<std::string, std::string> keyword);
    /// Field names of the last data format read; base version "".
    virtual std::string GetDataFormatLine();
    /// Replaces the data-format line; the base version ignores it.
    virtual void SetDataFormatLine(std::string line);
    /// Empties the value lists except the sample names and densities.
    virtual void ClearLists();
    /// REFERENCE_SAMPLE_ID value to sample number: 0, or 25 when there is none.
    virtual int GetReferenceSampleMap(std::map<int, int>& map);
    /// Last word of every PROCESSCOLOR_ID line: 0, or 1 when there is none.
    virtual int GetProcessColorNames(std::vector<std::string>& names);

protected:
    /// Empties the read side of the store and the norm light.
    void ResetChart();
    /// Derives the presence flags and channel count from a missing-space mask.
    void UpdatePresenceFlags(std::uint32_t mask);
    /// Takes NUMBER_OF_STRIPS and NUMBER_OF_COLS from the keyword map.
    void ReadLayoutKeywords();
    /// Sets every keyword-list entry of that keyword, or appends the pair.
    void SetKeyword(std::pair<std::string, std::string> keyword);
    /// Start, step and count of a spectral map's field names.
    SpectralRangeStruct AnalyseSpectralKeys(const std::map<std::string, double>& spectral);

    int borderPatches = 0;
    int numberOfSets = 0;
    int originalNumberOfSets = 0;
    int numberOfFields = 0;
    int numberOfStrips = 0;
    int numberOfCols = 0;
    int numberOfPages = 0;
    int patchesPerPage = 0;
    int uvCutMode = 0;
    int zebraRulerMode = 0;
    int device = 0;
    std::wstring filePath;
    std::map<int, CColorPatch> patches;
    std::map<std::string, std::string> keywordMap;
    tagXYZ normLight;
    std::uint32_t missingColorSpaces = 0;
    int channelCount = 0;
    bool hasCMYK = false;
    bool hasLAB = false;
    bool hasXYZ = false;
    bool hasRGB = false;
    bool hasSpectral = false;
    bool hasCMYKO = false;
    bool hasCMYKOG = false;
    bool hasCMYKRGB = false;
    bool hasCMYKOGV = false;
    bool hasHTMLCOLOR = false;
    bool hasNColor = false;
    bool hasDensity = false;
    std::vector<std::string> sampleNameList;
    std::vector<tagCMYK> cmykList;
    std::vector<tagCMYKOG> cmykogList;
    std::vector<tagCMYKOGV> cmykogvList;
    std::vector<tagCMYKRGB> cmykrgbList;
    std::vector<tagXYZ> xyzList;
    std::vector<tagLAB> labList;
    std::vector<tagRGB> rgbList;
    std::vector<tagDENSITY> densityList;
    std::vector<std::map<std::string, double>> spectralList;
    std::vector<std::map<int, tagNCLR>> nColorList;
    std::vector<std::pair<std::string, std::string>> keywordList;
    std::map<int, int> referenceSampleMap;
};
