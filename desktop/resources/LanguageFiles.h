// The files of a folder that has one for each language.
#pragma once
#include <string>
#include <vector>

// "FOLDER/en.xml", which has everything, and then the present language's file, whose entries go before.
std::vector<std::string> LanguageFiles(std::string const &folder);
