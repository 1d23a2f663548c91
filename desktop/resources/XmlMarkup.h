// What does not fit together in an XML text, in words that name it: the parser only says that something does
// not.
#pragma once
#include "desktop/resources/XmlText.h"

// Looks for start and end tags that are no partners, in a text that the parser has refused for that.
XmlTextFault FindXmlTagFault(std::string_view);

// Looks for an "&" that begins no reference to a character, in a text that the parser has taken. The parser
// leaves such ones as they are, other programs refuse them.
XmlTextFault FindXmlReferenceFault(std::string_view);
