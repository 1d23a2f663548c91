#include "lists/EditBoxPane.h"

EditBoxPane::EditBoxPane() {}
