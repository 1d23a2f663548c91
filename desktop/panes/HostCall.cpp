#include "desktop/panes/HostCall.h"

int HostCall::depth = 0;
