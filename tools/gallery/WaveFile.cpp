#include "tools/gallery/WaveFile.h"
#include "tools/TextFile.h"
#include <algorithm>
#include <cstddef>
#include <exception>

namespace {

std::size_t const kRiffHeader = 12, kChunkHeader = 8; // bytes
std::size_t const kFormatSize = 16;
unsigned long const kWholeNumbers = 1, kOneChannel = 1, kSampleBits = 16;

// The number of so many bytes, the lowest first. The bytes must be there.
unsigned long NumberAt(std::string const &bytes, std::size_t at, int count) {
    unsigned long number = 0;
    for (int i = count; i-- > 0;)
        number = number << 8 | static_cast<unsigned char>(bytes[at + static_cast<std::size_t>(i)]);
    return number;
}

bool IsReadable(std::string const &bytes, std::size_t at) {
    return NumberAt(bytes, at, 2) == kWholeNumbers && NumberAt(bytes, at + 2, 2) == kOneChannel &&
           NumberAt(bytes, at + 14, 2) == kSampleBits;
}

std::vector<short> SamplesAt(std::string const &bytes, std::size_t at, std::size_t size) {
    std::vector<short> samples;
    for (std::size_t i = 0; i + 1 < size; i += 2)
        samples.push_back(static_cast<short>(NumberAt(bytes, at + i, 2)));
    return samples;
}

std::string BytesOf(std::string const &path) try {
    return TextFile::Read(path);
} catch (std::exception const &) {
    return std::string();
}

} // namespace

WaveFile::WaveFile(std::string const &path) {
    std::string const bytes = BytesOf(path);
    if (bytes.size() < kRiffHeader || bytes.compare(0, 4, "RIFF") != 0 || bytes.compare(8, 4, "WAVE") != 0)
        return;
    bool readable = false;
    for (std::size_t at = kRiffHeader; at + kChunkHeader <= bytes.size();) {
        std::string const kind = bytes.substr(at, 4);
        std::size_t const size =
            std::min<std::size_t>(NumberAt(bytes, at + 4, 4), bytes.size() - at - kChunkHeader);
        if (kind == "fmt " && size >= kFormatSize)
            readable = IsReadable(bytes, at + kChunkHeader);
        if (kind == "data" && readable)
            samples = SamplesAt(bytes, at + kChunkHeader, size);
        at += kChunkHeader + size + size % 2;
    }
}

WaveFile::Peak WaveFile::PeakOf(long long first, long long end) const {
    long long const count = static_cast<long long>(samples.size());
    first = std::clamp(first, 0LL, count);
    end = std::clamp(end, first, count);
    if (first == end)
        return {0, 0};
    auto const peak = std::minmax_element(samples.begin() + first, samples.begin() + end);
    return {*peak.first, *peak.second};
}
