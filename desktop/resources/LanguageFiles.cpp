#include "desktop/resources/LanguageFiles.h"
#include "desktop/resources/Resources.h"

std::vector<std::string> LanguageFiles(std::string const &folder) {
    constexpr char kCompleteLanguage[] = "en";
    std::vector<std::string> files(1, folder + '/' + kCompleteLanguage + ".xml");
    std::string const &language = Resources::Instance().Language();
    if (language != kCompleteLanguage)
        files.push_back(folder + '/' + language + ".xml");
    return files;
}
