// What a broken invariant does to the program.
#pragma once

// Gets the expression with its place. Must not return: it throws or ends the program.
typedef void (*AssertionHandler)(char const *text);

// Null (the default) reports on standard error and aborts.
void SetAssertionHandler(AssertionHandler);
