#include "it8/files/temporary_name.h"

#include <random>

namespace it8::files {

std::string TemporaryName(const std::string& prefix) {
    std::random_device random;
    const unsigned long long stamp = (static_cast<unsigned long long>(random()) << 32) ^ random();
    return prefix + std::to_string(stamp) + ".tmp";
}

} // namespace it8::files
