#include "desktop/type/FontSpec.h"
#include <algorithm>

FontSpec FontSpec::Make(unsigned int family, int face, int size) {
    FontSpec spec;
    spec.family = family;
    spec.face = face & (FontFace::kFileBits | FontFace::kUnderline);
    spec.size = std::clamp(size, kSmallestSize, kLargestSize);
    return spec;
}
