#include "desktop/printing/Paper.h"
#include <stdexcept>

namespace {

int const kMargin = 36; // half an inch, which every printer leaves room for

struct NamedPaper {
    char const *name;
    Paper paper;
};
NamedPaper const kPapers[] = {{"A4", {595, 842, kMargin}}, {"Letter", {612, 792, kMargin}}};

} // namespace

Paper Paper::Named(std::string const &name) {
    for (NamedPaper const &known : kPapers)
        if (name == known.name)
            return known.paper;
    throw std::invalid_argument("there is no paper \"" + name + "\", only A4 and Letter");
}
