// What LSTGetFirstAndLast answers.
#pragma once

struct GLFirstLastRec {
    int first, last; // rows that show at least in part
};
