#include "generated_chart.h"

#include <cstdint>
#include <cstdio>
#include <cstdlib>
#include <fstream>
#include <system_error>
#include <unistd.h>

namespace bench {

namespace {

// A 32-bit linear congruential generator with fixed constants: the same
// sequence on every machine.
class Sequence {
public:
    std::uint32_t Next() {
        state_ = state_ * 1664525u + 1013904223u;
        return state_ >> 8;
    }
    // A multiple of 10^-decimals in [low, low + span].
    double Value(double low, std::uint32_t steps, double unit) {
        return low + static_cast<double>(Next() % (steps + 1)) * unit;
    }

private:
    std::uint32_t state_ = 20261206u;
};

void Append(std::string& out, const char* format, double value) {
    char buffer[64];
    const int length = std::snprintf(buffer, sizeof buffer, format, value);
    out.append(buffer, static_cast<std::size_t>(length));
}

class ScratchDir {
public:
    ScratchDir() {
        std::string pattern =
            (std::filesystem::temp_directory_path() / "redavudeva-bench-XXXXXX").string();
        if (mkdtemp(pattern.data()) == nullptr) {
            std::perror("mkdtemp");
            std::exit(1);
        }
        path_ = pattern;
    }
    ~ScratchDir() {
        std::error_code ignored;
        std::filesystem::remove_all(path_, ignored);
    }
    const std::filesystem::path& path() const { return path_; }

private:
    std::filesystem::path path_;
};

} // namespace

std::vector<std::string> FieldNames() {
    std::vector<std::string> names = {"SAMPLE_ID", "SAMPLE_NAME", "CMYK_C",
                                      "CMYK_M",    "CMYK_Y",      "CMYK_K"};
    for (int nm = 380; nm <= 730; nm += 10) {
        names.push_back("SPECTRAL_NM_" + std::to_string(nm));
    }
    names.insert(names.end(), {"LAB_L", "LAB_A", "LAB_B"});
    return names;
}

ChartTable GenerateTable(int patches) {
    ChartTable table;
    Sequence sequence;
    const std::vector<std::string> fields = FieldNames();
    for (int i = 0; i < patches; ++i) {
        char name[32];
        std::snprintf(name, sizeof name, "P%06d", i + 1);
        table.names.emplace_back(name);
        tagCMYK cmyk;
        cmyk.c = sequence.Value(0.0, 10000, 0.01);
        cmyk.m = sequence.Value(0.0, 10000, 0.01);
        cmyk.y = sequence.Value(0.0, 10000, 0.01);
        cmyk.k = sequence.Value(0.0, 10000, 0.01);
        table.cmyk.push_back(cmyk);
        std::map<std::string, double> spectrum;
        for (int k = 0; k < 36; ++k) {
            spectrum[fields[6 + k]] = sequence.Value(0.02, 95000, 0.00001);
        }
        table.spectra.push_back(std::move(spectrum));
        tagLAB lab;
        lab.l = sequence.Value(0.0, 10000, 0.01);
        lab.a = sequence.Value(-128.0, 25600, 0.01);
        lab.b = sequence.Value(-128.0, 25600, 0.01);
        table.lab.push_back(lab);
    }
    return table;
}

std::string ChartText(const ChartTable& table) {
    const std::vector<std::string> fields = FieldNames();
    std::string text = "CGATS.17\nORIGINATOR\t\"Redavudeva benchmark\"\nNUMBER_OF_FIELDS\t" +
                       std::to_string(fields.size()) + "\nBEGIN_DATA_FORMAT\n";
    for (std::size_t i = 0; i < fields.size(); ++i) {
        text += fields[i];
        text += i + 1 < fields.size() ? '\t' : '\n';
    }
    text +=
        "END_DATA_FORMAT\nNUMBER_OF_SETS\t" + std::to_string(table.names.size()) + "\nBEGIN_DATA\n";
    text.reserve(text.size() + table.names.size() * 360);
    for (std::size_t i = 0; i < table.names.size(); ++i) {
        text += std::to_string(i + 1);
        text += '\t';
        text += table.names[i];
        const tagCMYK& c = table.cmyk[i];
        for (double v : {c.c, c.m, c.y, c.k}) {
            Append(text, "\t%.2f", v);
        }
        for (const auto& entry : table.spectra[i]) {
            Append(text, "\t%.5f", entry.second);
        }
        const tagLAB& l = table.lab[i];
        for (double v : {l.l, l.a, l.b}) {
            Append(text, "\t%.2f", v);
        }
        text += '\n';
    }
    text += "END_DATA\n";
    return text;
}

std::filesystem::path ChartFile(const std::filesystem::path& folder, int patches) {
    const auto path = folder / ("chart_" + std::to_string(patches) + ".it8");
    if (!std::filesystem::exists(path)) {
        std::ofstream out(path, std::ios::binary | std::ios::trunc);
        out << ChartText(GenerateTable(patches));
    }
    return path;
}

const std::filesystem::path& ScratchFolder() {
    static const ScratchDir folder;
    return folder.path();
}

} // namespace bench
