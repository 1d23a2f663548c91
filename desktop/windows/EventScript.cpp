#include "desktop/windows/EventScript.h"
#include "desktop/SimulatedDesktop.h"
#include <algorithm>
#include <charconv>
#include <cmath>
#include <cstdlib>

namespace {

int const kFarthest = 32000;    // pixels
int const kMostComposed = 1000; // characters
double const kMostNotches = 1000;
double const kLongestWait = 86400; // a day
long const kLastMenuItem = 32767;
int const kLastItem = 32767;
char const kItemSign = '@';
std::size_t const kDeepestMenu = 64; // menus within each other

struct NamedKey {
    char const *name;
    int key;
};
NamedKey const kNamedKeys[] = {
    {"Return", KeyCodes::kReturn}, {"Enter", KeyCodes::kEnter},   {"Escape", KeyCodes::kEscape},
    {"Tab", KeyCodes::kTab},       {"Space", KeyCodes::kSpace},   {"Backspace", KeyCodes::kBackspace},
    {"Delete", KeyCodes::kDelete}, {"Left", KeyCodes::kLeft},     {"Right", KeyCodes::kRight},
    {"Up", KeyCodes::kUp},         {"Down", KeyCodes::kDown},     {"Home", KeyCodes::kHome},
    {"End", KeyCodes::kEnd},       {"PageUp", KeyCodes::kPageUp}, {"PageDown", KeyCodes::kPageDown},
    {"Help", KeyCodes::kHelp},
};
int const kFunctionKeys = 12;

struct NamedModifier {
    char const *name;
    unsigned short bit;
};
NamedModifier const kNamedModifiers[] = {
    {"shift", Modifiers::kShift},
    {"command", Modifiers::kCommand},
    {"option", Modifiers::kOption},
    {"control", Modifiers::kControl},
};

template <class Named, std::size_t count> std::string NamesIn(Named const (&table)[count]) {
    std::string text;
    for (Named const &entry : table)
        text += (text.empty() ? "" : ", ") + std::string(entry.name);
    return text;
}

// Whether the number stands at the start of the text, which then begins behind it. Regardless of the
// program's locale, unlike the C library.
template <class Value> bool TakeNumber(std::string_view &text, Value &value) {
    std::from_chars_result const result = std::from_chars(text.data(), text.data() + text.size(), value);
    if (result.ec != std::errc())
        return false;
    text.remove_prefix(static_cast<std::size_t>(result.ptr - text.data()));
    return true;
}

// Reads one line word by word.
class LineReader {
public:
    LineReader(std::string const &line_, std::string const &source_)
        : line(line_)
        , source(source_) {}

    [[noreturn]] void Fail(std::string const &what) const { throw ScriptError(source + ": " + what); }

    bool AtEnd() {
        while (at < line.size() && (line[at] == ' ' || line[at] == '\t' || line[at] == '\r'))
            ++at;
        return at == line.size() || line[at] == '#';
    }

    std::string Word(char const *expected) {
        if (AtEnd())
            Fail(std::string("expected ") + expected + " at the end of the line");
        std::size_t const start = at;
        while (at < line.size() && line[at] != ' ' && line[at] != '\t' && line[at] != '\r')
            ++at;
        return line.substr(start, at - start);
    }

    double Number(char const *expected, double smallest, double largest) {
        std::string const word = Word(expected);
        std::string_view rest = word;
        if (word.size() > 1 && word[0] == '+' && word[1] != '-')
            rest.remove_prefix(1);
        double value = 0;
        if (!TakeNumber(rest, value) || !rest.empty() || !(value >= smallest && value <= largest))
            Fail(std::string("expected ") + expected + ", found \"" + word + "\"");
        return value;
    }

    int Whole(char const *expected, int smallest, int largest) {
        double const value = Number(expected, smallest, largest);
        if (value != std::floor(value))
            Fail(std::string("expected ") + expected + ", a whole number");
        return static_cast<int>(value);
    }

    void Place(ScriptStep &step) {
        if (!AtEnd() && line[at] == kItemSign) {
            PlaceInItem(step);
            return;
        }
        step.h = Whole("a horizontal place", -kFarthest, kFarthest);
        step.v = Whole("a vertical place", -kFarthest, kFarthest);
    }

    void PlaceInItem(ScriptStep &step) {
        std::string const word = Word("an item");
        std::string_view rest = std::string_view(word).substr(1);
        bool isRight = TakeNumber(rest, step.item) && step.item >= 1 && step.item <= kLastItem;
        step.inMiddle = isRight && rest.empty();
        if (isRight && !step.inMiddle)
            isRight = TakeOffset(rest, step.h) && TakeOffset(rest, step.v) && rest.empty();
        if (!isRight)
            Fail("expected an item such as @3, or @3+20+8 for a place 20 right and 8 below its top left "
                 "corner, found \"" +
                 word + "\"");
    }

    void ModifierWords(ScriptStep &step) {
        while (!AtEnd()) {
            std::string const word = Word("a modifier");
            auto known = std::find_if(std::begin(kNamedModifiers), std::end(kNamedModifiers),
                                      [&](NamedModifier const &m) { return word == m.name; });
            if (known == std::end(kNamedModifiers))
                Fail("expected shift, command, option or control, found \"" + word + "\"");
            step.modifiers = static_cast<unsigned short>(step.modifiers | known->bit);
        }
    }

    std::string Quoted() {
        if (AtEnd() || line[at] != '"')
            Fail("expected a text in double quotes");
        std::string text;
        for (++at; at < line.size() && line[at] != '"'; ++at) {
            if (line[at] == '\\' && at + 1 < line.size())
                ++at;
            text += line[at];
        }
        if (at == line.size())
            Fail("the text has no closing double quote");
        ++at;
        return text;
    }

    void MenuItem(ScriptStep &step) {
        std::string const word = Word("an item number");
        char const *at = word.c_str();
        for (;;) {
            char *end = nullptr;
            long const number = *at >= '0' && *at <= '9' ? std::strtol(at, &end, 10) : -1;
            bool const dismisses = number == 0 && step.path.empty() && *end == '\0';
            if (!dismisses && (number < 1 || number > kLastMenuItem))
                break;
            step.path.push_back(static_cast<int>(number));
            if (*end == '\0')
                return;
            if (*end != '/' || step.path.size() == kDeepestMenu)
                break;
            at = end + 1;
        }
        Fail("expected an item number such as 3, or 4/2 for item 2 of the submenu of item 4, found \"" +
             word + "\"");
    }

private:
    static bool TakeOffset(std::string_view &text, int &offset) {
        if (text.empty() || text[0] != '+')
            return false;
        text.remove_prefix(1);
        return TakeNumber(text, offset) && offset >= 0 && offset <= kFarthest;
    }

    std::string const &line;
    std::string const &source;
    std::size_t at = 0;
};

void ReadPlaceStep(LineReader &reader, ScriptStep &step) {
    reader.Place(step);
    reader.ModifierWords(step);
}

void ReadRelease(LineReader &reader, ScriptStep &step) { reader.ModifierWords(step); }

void ReadWheel(LineReader &reader, ScriptStep &step) {
    reader.Place(step);
    step.wheelH = reader.Number("a horizontal delta", -kMostNotches, kMostNotches);
    step.wheelV = reader.Number("a vertical delta", -kMostNotches, kMostNotches);
    reader.ModifierWords(step);
}

void ReadKey(LineReader &reader, ScriptStep &step) {
    std::string const name = reader.Word("a key");
    step.key = EventScript::KeyByName(name);
    if (step.key == KeyCodes::kNone)
        reader.Fail("there is no key \"" + name + "\"; possible: a character, " + NamesIn(kNamedKeys) +
                    ", F1 to F12");
    reader.ModifierWords(step);
}

void ReadType(LineReader &reader, ScriptStep &step) { step.text = reader.Quoted(); }

void ReadCompose(LineReader &reader, ScriptStep &step) {
    step.text = reader.Quoted();
    step.caret = reader.AtEnd() ? kMostComposed : reader.Whole("a count of characters", 0, kMostComposed);
}

void ReadWait(LineReader &reader, ScriptStep &step) {
    step.seconds = reader.Number("a number of seconds", 0, kLongestWait);
}

void ReadResize(LineReader &reader, ScriptStep &step) {
    step.h = reader.Whole("a width of 1 to 16000", 1, 16000);
    step.v = reader.Whole("a height of 1 to 16000", 1, 16000);
}

void ReadActivate(LineReader &reader, ScriptStep &step) {
    std::string const word = reader.Word("on or off");
    if (word != "on" && word != "off")
        reader.Fail("expected on or off, found \"" + word + "\"");
    step.on = word == "on";
}

void ReadMenu(LineReader &reader, ScriptStep &step) { reader.MenuItem(step); }

void ReadFile(LineReader &reader, ScriptStep &step) { step.text = reader.Word("a file"); }

struct StepForm {
    char const *name;
    ScriptStep::Kind kind;
    void (*read)(LineReader &, ScriptStep &);
};
StepForm const kStepForms[] = {
    {"press", ScriptStep::kPress, ReadPlaceStep},
    {"move", ScriptStep::kMove, ReadPlaceStep},
    {"release", ScriptStep::kRelease, ReadRelease},
    {"click", ScriptStep::kClick, ReadPlaceStep},
    {"doubleclick", ScriptStep::kDoubleClick, ReadPlaceStep},
    {"rightclick", ScriptStep::kRightClick, ReadPlaceStep},
    {"wheel", ScriptStep::kWheel, ReadWheel},
    {"key", ScriptStep::kKey, ReadKey},
    {"type", ScriptStep::kType, ReadType},
    {"compose", ScriptStep::kCompose, ReadCompose},
    {"wait", ScriptStep::kWait, ReadWait},
    {"resize", ScriptStep::kResize, ReadResize},
    {"activate", ScriptStep::kActivate, ReadActivate},
    {"menu", ScriptStep::kMenu, ReadMenu},
    {"print", ScriptStep::kPrint, ReadFile},
    {"snapshot", ScriptStep::kSnapshot, ReadFile},
    {"dump", ScriptStep::kDump, ReadFile},
};

ScriptStep ReadStep(LineReader &reader, std::string const &source) {
    std::string const word = reader.Word("a step");
    for (StepForm const &form : kStepForms) {
        if (word != form.name)
            continue;
        ScriptStep step;
        step.kind = form.kind;
        step.source = source;
        form.read(reader, step);
        if (!reader.AtEnd())
            reader.Fail("there is more on the line than \"" + word + "\" takes");
        return step;
    }
    reader.Fail("there is no step \"" + word + "\"; possible: " + NamesIn(kStepForms));
}

} // namespace

int EventScript::KeyByName(std::string const &name) {
    for (NamedKey const &known : kNamedKeys)
        if (name == known.name)
            return known.key;
    if (name.size() == 1 && name[0] > ' ' && name[0] < 0x7F)
        return name[0] >= 'A' && name[0] <= 'Z' ? name[0] - 'A' + 'a' : name[0];
    if (name.size() >= 2 && name.size() <= 3 && name[0] == 'F') {
        int const number = std::atoi(name.c_str() + 1);
        if (number >= 1 && number <= kFunctionKeys)
            return KeyCodes::kF1 + number - 1;
    }
    return KeyCodes::kNone;
}

std::vector<ScriptStep> EventScript::Parse(std::string const &steps, std::string const &name) {
    std::vector<ScriptStep> result;
    std::size_t start = 0;
    for (int number = 1; start <= steps.size(); ++number) {
        std::size_t end = steps.find('\n', start);
        if (end == std::string::npos)
            end = steps.size();
        std::string const line = steps.substr(start, end - start);
        std::string const source = name + ":" + std::to_string(number);
        LineReader reader(line, source);
        if (!reader.AtEnd())
            result.push_back(ReadStep(reader, source));
        start = end + 1;
    }
    return result;
}
