// What keys do to an edited text.
#pragma once
#include "host/OSTextEdit.h"

// One action: what is done, how far it reaches, and which way.
class OS::TextEditAction {
public:
    enum Kind { kNone, kMove, kDelete, kNewLine, kTab, kCut, kCopy, kPaste, kSelectAll, kUndo, kRedo };
    enum Reach { kCharacter, kWord, kLine, kParagraph, kPage, kDocument };
    enum Way { kLeft, kRight, kUp, kDown, kStart, kEnd };

    Kind kind = kNone;
    Reach reach = kCharacter;
    Way way = kLeft;
    bool extends = false; // the selection, when it moves

    // What a key stands for; kNone for one that types, or does nothing here.
    static TextEditAction OfKey(int code, unsigned short modifiers);
    // Whether it changes text.
    bool Edits() const {
        return kind == kDelete || kind == kNewLine || kind == kTab || kind == kCut || kind == kPaste ||
               kind == kUndo || kind == kRedo;
    }
};
