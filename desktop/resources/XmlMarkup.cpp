#include "desktop/resources/XmlMarkup.h"
#include <algorithm>
#include <array>
#include <vector>

namespace {

constexpr std::string_view kNameEnds = " \t\r\n/>";
constexpr std::array<std::string_view, 5> kEntities = {"amp", "apos", "gt", "lt", "quot"};

bool BeginsWith(std::string_view text, std::string_view start) {
    return text.substr(0, start.size()) == start;
}

// Goes through a text from one piece of markup to the next.
class MarkupReader {
public:
    explicit MarkupReader(std::string_view text_)
        : text(text_) {}

    // Goes to the next piece, or to the end of the text, and answers whether there is one.
    bool Next() {
        formerEnd = end;
        start = std::min(text.find('<', end), text.size());
        end = start < text.size() ? EndOf(text.substr(start)) : start;
        return start < text.size();
    }

    // Whether it is a tag: no comment, CDATA section, instruction or document type.
    bool IsTag() const { return start + 1 < text.size() && text[start + 1] != '!' && text[start + 1] != '?'; }
    std::size_t FormerEnd() const { return formerEnd; } // where the text before it begins
    std::size_t Start() const { return start; }
    std::size_t End() const { return end; }
    bool ClosesAnElement() const { return BeginsWith(text.substr(start), "</"); }
    bool IsWhole() const { return end - start > 2 && text[end - 2] == '/'; } // an element without an end tag
    std::string Name() const {
        std::size_t const from = start + (ClosesAnElement() ? 2 : 1);
        return std::string(text.substr(from, std::min(text.find_first_of(kNameEnds, from), end) - from));
    }

private:
    std::size_t EndOf(std::string_view markup) const {
        if (BeginsWith(markup, "<!--"))
            return Behind("-->");
        if (BeginsWith(markup, "<![CDATA["))
            return Behind("]]>");
        if (BeginsWith(markup, "<?"))
            return Behind("?>");
        return BehindBrackets();
    }

    std::size_t Behind(std::string_view closing) const {
        std::size_t const at = text.find(closing, start);
        return at == std::string_view::npos ? text.size() : at + closing.size();
    }

    // Of a tag or a document type, in which declarations may stand. Brackets in quotes do not count.
    std::size_t BehindBrackets() const {
        int depth = 0;
        char quote = '\0';
        for (std::size_t i = start; i < text.size(); ++i) {
            char const c = text[i];
            if (quote)
                quote = c == quote ? '\0' : quote;
            else if (c == '"' || c == '\'')
                quote = c;
            else if (c == '<')
                ++depth;
            else if (c == '>' && --depth == 0)
                return i + 1;
        }
        return text.size();
    }

    std::string_view text;
    std::size_t formerEnd = 0, start = 0, end = 0;
};

struct OpenElement {
    std::string name;
    std::size_t offset;
};

int LineOf(std::string_view text, std::size_t offset) {
    XmlPlace place(text);
    place.MoveTo(offset);
    return place.Line();
}

bool IsKnown(std::string_view reference) {
    if (reference.size() > 1 && reference[0] == '#') {
        bool const isHex = reference[1] == 'x';
        std::string_view const digits = reference.substr(isHex ? 2 : 1);
        char const *const allowed = isHex ? "0123456789abcdefABCDEF" : "0123456789";
        return !digits.empty() && digits.find_first_not_of(allowed) == std::string_view::npos;
    }
    return std::find(kEntities.begin(), kEntities.end(), reference) != kEntities.end();
}

// The first "&" of the part that begins no known reference; npos when there is none.
std::size_t UnknownReference(std::string_view text, std::size_t from, std::size_t to) {
    for (std::size_t at = text.find('&', from); at < to; at = text.find('&', at + 1)) {
        std::size_t const end = text.find(';', at);
        if (end >= to || !IsKnown(text.substr(at + 1, end - at - 1)))
            return at;
    }
    return std::string_view::npos;
}

} // namespace

XmlTextFault FindXmlTagFault(std::string_view text) {
    std::vector<OpenElement> open;
    for (MarkupReader tag(text); tag.Next();) {
        if (!tag.IsTag())
            continue;
        std::string const name = tag.Name();
        if (!tag.ClosesAnElement()) {
            if (!tag.IsWhole())
                open.push_back({name, tag.Start()});
            continue;
        }
        if (open.empty())
            return {tag.Start(), "</" + name + "> closes nothing: no element is open here"};
        OpenElement const &inner = open.back();
        if (inner.name != name)
            return {tag.Start(), "expected </" + inner.name + "> for the <" + inner.name + "> of line " +
                                     std::to_string(LineOf(text, inner.offset)) + ", found </" + name + ">"};
        open.pop_back();
    }
    if (open.empty())
        return {0, std::string()};
    return {open.back().offset, "<" + open.back().name + "> is not closed"};
}

XmlTextFault FindXmlReferenceFault(std::string_view text) {
    if (text.find('&') == std::string_view::npos)
        return {0, std::string()};
    MarkupReader markup(text);
    bool isLast = false;
    while (!isLast) {
        isLast = !markup.Next();
        std::size_t const end = markup.IsTag() ? markup.End() : markup.Start();
        std::size_t const at = UnknownReference(text, markup.FormerEnd(), end);
        if (at != std::string_view::npos)
            return {at, "\"&\" begins no character that is known here; the sign itself is written &amp;"};
    }
    return {0, std::string()};
}
