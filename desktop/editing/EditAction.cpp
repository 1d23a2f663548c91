#include "desktop/editing/EditAction.h"
#include "desktop/editing/KeyEvent.h"
#include "desktop/resources/Utf.h"

typedef OS::TextEditAction Action;

namespace {

// On some keyboards one modifier is used with shortcuts, on others another; words are stepped over with
// either of the remaining ones.
bool IsShortcut(unsigned short modifiers) {
    return (modifiers & (Modifiers::kCommand | Modifiers::kControl)) != 0;
}

bool IsByWord(unsigned short modifiers) {
    return (modifiers & (Modifiers::kCommand | Modifiers::kOption)) != 0;
}

Action Plain(Action::Kind kind) {
    Action action;
    action.kind = kind;
    return action;
}

Action Move(Action::Reach reach, Action::Way way, unsigned short modifiers) {
    Action action = Plain(Action::kMove);
    action.reach = reach;
    action.way = way;
    action.extends = (modifiers & Modifiers::kShift) != 0;
    return action;
}

Action Delete(Action::Way way, unsigned short modifiers) {
    Action action = Plain(Action::kDelete);
    bool const byWord = IsByWord(modifiers);
    action.reach = byWord && (modifiers & Modifiers::kShift) ? Action::kLine
                   : byWord                                  ? Action::kWord
                                                             : Action::kCharacter;
    action.way = way;
    return action;
}

Action OfShortcut(int code, unsigned short modifiers) {
    switch (code) {
    case 'x':
        return Plain(Action::kCut);
    case 'c':
        return Plain(Action::kCopy);
    case 'v':
        return Plain(Action::kPaste);
    case 'a':
        return Plain(Action::kSelectAll);
    case 'z':
        return Plain(modifiers & Modifiers::kShift ? Action::kRedo : Action::kUndo);
    case 'y':
        return Plain(Action::kRedo);
    default:
        return Action();
    }
}

Action OfMovingKey(int code, unsigned short modifiers) {
    bool const byWord = IsByWord(modifiers), whole = (modifiers & Modifiers::kCommand) != 0;
    switch (code) {
    case KeyCodes::kLeft:
        return Move(byWord ? Action::kWord : Action::kCharacter, Action::kLeft, modifiers);
    case KeyCodes::kRight:
        return Move(byWord ? Action::kWord : Action::kCharacter, Action::kRight, modifiers);
    case KeyCodes::kUp:
        return Move(whole    ? Action::kDocument
                    : byWord ? Action::kParagraph
                             : Action::kLine,
                    whole || byWord ? Action::kStart : Action::kUp, modifiers);
    case KeyCodes::kDown:
        return Move(whole    ? Action::kDocument
                    : byWord ? Action::kParagraph
                             : Action::kLine,
                    whole || byWord ? Action::kEnd : Action::kDown, modifiers);
    case KeyCodes::kHome:
        return Move(whole ? Action::kDocument : Action::kLine, Action::kStart, modifiers);
    case KeyCodes::kEnd:
        return Move(whole ? Action::kDocument : Action::kLine, Action::kEnd, modifiers);
    case KeyCodes::kPageUp:
        return Move(Action::kPage, Action::kUp, modifiers);
    case KeyCodes::kPageDown:
        return Move(Action::kPage, Action::kDown, modifiers);
    default:
        return Action();
    }
}

} // namespace

Action Action::OfKey(int code, unsigned short modifiers) {
    switch (code) {
    case KeyCodes::kBackspace:
        return Delete(kLeft, modifiers);
    case KeyCodes::kDelete:
        return Delete(kRight, modifiers);
    case KeyCodes::kReturn:
    case KeyCodes::kEnter:
        return Plain(kNewLine);
    case KeyCodes::kTab:
        return Plain(kTab);
    default:
        break;
    }
    Action const moving = OfMovingKey(code, modifiers);
    if (moving.kind != kNone)
        return moving;
    return IsShortcut(modifiers) ? OfShortcut(code, modifiers) : Action();
}

UString KeyReading::TextOf(EventRecordAdapter const &event) {
    if (IsShortcut(event.modifiers))
        return UString();
    if (KeyEvent const *const key = dynamic_cast<KeyEvent const *>(&event))
        return key->text;
    char16_t const character = static_cast<char16_t>(event.message & 0xFF);
    bool const types = character >= KeyCodes::kSpace && character < KeyCodes::kDelete;
    return types ? Utf::FromUnits({&character, 1}) : UString();
}
