// How search strings and texts are compared.
#pragma once
#include "host/UString.h"

// A text matches where the form of the search string occurs in its own; each unit keeps its place. Capitals
// and small letters are alike. In English there is a blank before both forms, and everything but ASCII
// letters and digits is a blank too: so matches are beginnings of words, and stand at the same unit of the
// text itself.
namespace SearchedForm {

// The form of a text that is searched.
UString OfText(UString const &);
// The form of what is searched for. In English a letter beyond ASCII becomes a blank even where its capital
// is ASCII, which in a text it does not.
UString OfSearch(UString const &);

} // namespace SearchedForm
