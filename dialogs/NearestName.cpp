#include "dialogs/NearestName.h"
#include <algorithm>
#include <cstddef>
#include <numeric>

namespace {

std::size_t const kLongestName = 64; // characters; longer ones are nobody's slip of the pen

char Small(char c) { return c >= 'A' && c <= 'Z' ? static_cast<char>(c - 'A' + 'a') : c; }

// How many characters must be changed, added or taken out to make one of the other.
std::size_t Distance(std::string const &a, std::string const &b) {
    std::vector<std::size_t> row(b.size() + 1);
    std::iota(row.begin(), row.end(), std::size_t(0));
    for (std::size_t i = 1; i <= a.size(); ++i) {
        std::size_t diagonal = row[0];
        row[0] = i;
        for (std::size_t j = 1; j <= b.size(); ++j) {
            std::size_t const changed = diagonal + (Small(a[i - 1]) == Small(b[j - 1]) ? 0 : 1);
            diagonal = row[j];
            row[j] = std::min({changed, row[j] + 1, row[j - 1] + 1});
        }
    }
    return row[b.size()];
}

std::size_t Tolerance(std::string const &name) { return std::max<std::size_t>(2, name.size() / 3); }

} // namespace

std::string NearestName::Of(std::string const &name, std::vector<std::string> const &candidates) {
    std::string nearest;
    if (name.size() > kLongestName)
        return nearest;
    std::size_t fewest = Tolerance(name) + 1;
    for (std::string const &candidate : candidates) {
        std::size_t const distance = Distance(name, candidate);
        if (distance < fewest && distance < candidate.size()) {
            fewest = distance;
            nearest = candidate;
        }
    }
    return nearest;
}

std::string NearestName::Hint(std::string const &name, std::vector<std::string> const &candidates) {
    std::string const nearest = Of(name, candidates);
    if (!nearest.empty())
        return "; did you mean " + nearest + "?";
    std::string all;
    for (std::string const &candidate : candidates)
        all += (all.empty() ? "; possible: " : ", ") + candidate;
    return all;
}
