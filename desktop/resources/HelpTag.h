// A help text as it appears in a tool tip.
#pragma once
#include "host/LocalizedStrings.h"
#include "host/UString.h"

// Made by HelpTagMgr, which keeps it for as long as the program runs. Its texts are those of the language
// that holds when they are asked for; they may throw ResourceError when that language's file is broken.
class LocalizedStrings::HelpTag {
public:
    HelpTag(UString const &title_, UString const &text_)
        : title(title_)
        , text(text_) {}
    UString const &Title() const; // empty for most
    UString const &Text() const;
    void SetTexts(UString const &newTitle, UString const &newText) {
        title = newTitle;
        text = newText;
    }

private:
    UString title, text;
};
