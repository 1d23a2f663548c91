#pragma once
#include <memory>

class StyledStringItem {
public:
    virtual ~StyledStringItem() {}
};

class StyledString {
public:
    StyledString();
    ~StyledString();
    void Add(std::auto_ptr<StyledStringItem>);
    int GetWidth() const;
    short GetAscent() const;
    void Draw();
private:
    StyledString(StyledString const &);
    StyledString &operator=(StyledString const &);
    struct Rep;
    Rep *rep;
};
