// A document of the project, cut into what the tests look at.
#pragma once
#include <string>
#include <utility>
#include <vector>

class Document {
public:
    // The path is from the top of the tree. Throws std::runtime_error when there is no such file.
    explicit Document(std::string const &path);

    typedef std::vector<std::string> Cells;
    struct Row {
        std::string section; // the text of the heading above
        Cells cells;         // without the white space around, and without backticks
    };
    // All rows of tables but their headings.
    std::vector<Row> const &Rows() const { return rows; }

    // The content of all code blocks in this language.
    std::vector<std::string> Blocks(std::string const &language) const;
    // Where the links lead, those to other hosts and within the document left out.
    std::vector<std::string> const &Links() const { return links; }

private:
    void ReadLine(std::string const &);
    void ReadRow(std::string const &);
    void ReadLinks(std::string const &);

    std::string section;
    bool inBlock = false;
    int rowsOfTable = 0;
    std::vector<Row> rows;
    std::vector<std::pair<std::string, std::string>> blocks; // language and content
    std::vector<std::string> links;
};
