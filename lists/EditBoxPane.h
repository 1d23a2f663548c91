// The base of text fields.
#pragma once
#include "lists/SelectPane.h"

// A SelectPane in everything.
class EditBoxPane : public SelectPane {
public:
    EditBoxPane();
};
