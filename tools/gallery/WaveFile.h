// A recording from a file.
#pragma once
#include <string>
#include <vector>

// Reads files of the kind WAV with one channel of whole numbers of 16 bits, and no others.
class WaveFile {
public:
    // Without samples when there is no such file, or it is of another kind.
    explicit WaveFile(std::string const &path);

    std::vector<short> const &Samples() const { return samples; }
    // The loudest up and down among the samples from `first` up to `end`, which are cut to those there are.
    struct Peak {
        short least, most;
    };
    Peak PeakOf(long long first, long long end) const;

private:
    std::vector<short> samples;
};
