#include "tests/docs/Document.h"
#include <algorithm>
#include <fstream>
#include <regex>
#include <sstream>
#include <stdexcept>

namespace {

int const kRowsOfHeading = 2; // the names of the columns and the line below them

std::string Trimmed(std::string const &cell) {
    std::size_t const first = cell.find_first_not_of(' ');
    if (first == std::string::npos)
        return "";
    std::string text = cell.substr(first, cell.find_last_not_of(' ') - first + 1);
    text.erase(std::remove(text.begin(), text.end(), '`'), text.end());
    return text;
}

bool BeginsWith(std::string const &text, char const *start) { return text.rfind(start, 0) == 0; }

} // namespace

Document::Document(std::string const &path) {
    std::ifstream file(std::string(GLOG_TEST_SOURCE_DIR) + "/../" + path);
    if (!file)
        throw std::runtime_error("there is no " + path);
    for (std::string line; std::getline(file, line);)
        ReadLine(line);
}

void Document::ReadLine(std::string const &line) {
    if (BeginsWith(line, "```")) {
        inBlock = !inBlock;
        if (inBlock)
            blocks.emplace_back(line.substr(3), "");
        return;
    }
    if (inBlock) {
        blocks.back().second += line + '\n';
        return;
    }
    ReadLinks(line);
    if (BeginsWith(line, "#"))
        section = line.substr(line.find_first_not_of("# "));
    if (BeginsWith(line, "|"))
        ReadRow(line);
    else
        rowsOfTable = 0;
}

void Document::ReadRow(std::string const &line) {
    if (++rowsOfTable <= kRowsOfHeading)
        return;
    Row row;
    row.section = section;
    std::istringstream cells(line.substr(1, line.rfind('|') - 1));
    for (std::string cell; std::getline(cells, cell, '|');)
        row.cells.push_back(Trimmed(cell));
    rows.push_back(row);
}

void Document::ReadLinks(std::string const &line) {
    static std::regex const link("\\]\\(([^)#]+)|src=\"([^\"]+)\"");
    for (std::sregex_iterator i(line.begin(), line.end(), link), end; i != end; ++i) {
        std::string const target = (*i)[1].matched ? (*i)[1] : (*i)[2];
        if (target.find("://") == std::string::npos)
            links.push_back(target);
    }
}

std::vector<std::string> Document::Blocks(std::string const &language) const {
    std::vector<std::string> found;
    for (auto const &[name, content] : blocks) {
        if (name == language)
            found.push_back(content);
    }
    return found;
}
