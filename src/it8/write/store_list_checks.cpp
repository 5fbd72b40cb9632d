#include "it8/write/store_list_checks.h"

#include <algorithm>

namespace it8 {
namespace {

template <typename Map> bool SameKeys(const Map& left, const Map& right) {
    return left.size() == right.size() &&
           std::equal(left.begin(), left.end(), right.begin(),
                      [](const auto& a, const auto& b) { return a.first == b.first; });
}

template <typename Map> bool MapListCovers(const std::vector<Map>& list, std::size_t rows) {
    if (!ListCovers(list, rows)) {
        return false;
    }
    for (std::size_t i = 1; i < rows && i < list.size(); ++i) {
        if (!SameKeys(list[i], list.front())) {
            return false;
        }
    }
    return true;
}

} // namespace

bool SpectralListCovers(const std::vector<std::map<std::string, double>>& list, std::size_t rows) {
    return MapListCovers(list, rows);
}

bool NColorListCovers(const std::vector<std::map<int, tagNCLR>>& list, std::size_t rows) {
    return MapListCovers(list, rows);
}

} // namespace it8
