// What the comparison of editable text asks of a toolkit.
#pragma once
#include <string>

// A window with an editable text of 10,000 lines, which shows its middle and has its insertion point there.
// Every operation returns when its pixels are finished in the window.
class PeerText {
public:
    static int const kLines = 10000, kLineLength = 60, kWidth = 600, kHeight = 400; // the break counts
    // Between the characters of the line in the middle.
    static int const kMiddle = kLines / 2 * kLineLength + kLineLength / 2;
    static char const kTyped = 'x';

    virtual ~PeerText() {}

    // Makes the text and shows it, with the insertion point in the middle.
    virtual void Show() = 0;
    // Inserts the character there, as typing does, and draws what that damages.
    virtual void Type() = 0;
    // Deletes it again.
    virtual void Delete() = 0;
    // Handles what has come.
    virtual void Settle() = 0;

protected:
    // All lines, each as long as the others, in words of seven letters.
    static std::string Lines() {
        std::string line;
        while (line.size() + 1 < static_cast<std::size_t>(kLineLength))
            line += line.size() % 8 == 7 ? ' ' : static_cast<char>('a' + line.size() % 26);
        line += '\n';
        std::string text;
        for (int i = 0; i < kLines; ++i)
            text += line;
        return text;
    }
};

// Every program has its own.
PeerText *NewPeerText(int &argc, char **argv);
