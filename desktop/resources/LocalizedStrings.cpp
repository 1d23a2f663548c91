#include "host/LocalizedStrings.h"
#include "desktop/resources/HelpTag.h"
#include "desktop/resources/HelpTagTexts.h"
#include "desktop/resources/LanguageFiles.h"
#include "desktop/resources/ResourceTable.h"
#include "desktop/resources/StringLists.h"
#include <map>

namespace LocalizedStrings {

namespace {

// All tags that were ever asked for, by group and key. Panes keep pointers to them, so none ever goes or
// moves.
class TagStore {
public:
    HelpTag const *Demand(HelpTagTexts::GroupAndKey const &groupAndKey) {
        HelpTagTexts const &present = texts.Get();
        Refresh(present);
        auto const kept = tags.find(groupAndKey);
        if (kept != tags.end())
            return &kept->second;
        HelpTagText const *found = present.Find(groupAndKey);
        if (!found)
            return nullptr;
        return &tags.emplace(groupAndKey, HelpTag(found->title, found->text)).first->second;
    }

    // Brings the texts of all tags up to the present language and directory.
    void Refresh() { Refresh(texts.Get()); }

private:
    void Refresh(HelpTagTexts const &present) {
        unsigned int const now = Resources::Instance().Generation();
        if (generation == now)
            return;
        for (auto &[groupAndKey, tag] : tags) {
            HelpTagText const *found = present.Find(groupAndKey);
            tag.SetTexts(found ? found->title : UString(), found ? found->text : UString());
        }
        generation = now;
    }

    ResourceTable<HelpTagTexts> texts{[] { return LanguageFiles("helptags"); }};
    std::map<HelpTagTexts::GroupAndKey, HelpTag> tags;
    unsigned int generation = 0;
};

TagStore &TheTags() {
    static TagStore store;
    return store;
}

} // namespace

UString GetString(short list, short index) {
    static ResourceTable<StringLists> lists([] { return LanguageFiles("strings"); });
    UString const *found = lists.Get().Find(list, index);
    return found ? *found : UString();
}

HelpTagMgr &HelpTagMgr::Instance() {
    static HelpTagMgr manager;
    return manager;
}

HelpTag const *HelpTagMgr::DemandHelpTag(char const *group, char const *key) {
    if (!group || !key)
        return nullptr;
    return TheTags().Demand({group, key});
}

UString const &HelpTag::Title() const {
    TheTags().Refresh();
    return title;
}

UString const &HelpTag::Text() const {
    TheTags().Refresh();
    return text;
}

} // namespace LocalizedStrings
