// What our programs of the comparison share.
#pragma once

struct glogRec;

// Draws what is damaged, and returns when the server has the pixels.
void FinishDrawing(glogRec *);
