#pragma once
#include <cstddef>

class UString {
public:

    enum ByteEncoding { kByteEncoding1 = 1 };

    typedef char16_t Unit;
    static std::size_t const npos = static_cast<std::size_t>(-1);

    UString();
    UString(char const *bytes, ByteEncoding);
    UString(UString const &);
    UString(UString const &, std::size_t start, std::size_t count);
    ~UString();

    bool empty() const;
    std::size_t length() const;
    void clear();

    std::size_t find(UString const &, std::size_t from) const;

    UString substr(std::size_t start, std::size_t count) const;
    Unit &operator[](std::size_t);
    Unit operator[](std::size_t) const;
    UString &operator+=(UString const &);
    UString &operator=(UString const &);
private:
    struct Rep;
    Rep *rep;
};

bool operator==(UString const &, UString const &);
bool operator<(UString const &, UString const &);

namespace tarn {
bool IsASCII(UString::Unit);
void ToUpper(UString &);
enum NumFormat { kPlainNumber = 0 };
void NumToUString(long long, NumFormat, UString &);
}
