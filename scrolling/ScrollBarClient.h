// What a scroll bar scrolls.
#pragma once

class ScrollBarPane;
struct glogRec;

// A bar never moves by itself: it tells its client, and the client calls ScrollBarPane::Set with where it has
// come to. One client may serve several bars and tells them apart by the pointer. The client is not the
// bar's, and must be taken from it by SetClient before it goes away.
//
// In every call but GetThumbRatio, which must leave both where they are, the client may do anything, also
// take itself from the bar or delete the bar: it hears no more then.
class ScrollBarClient {
public:
    virtual ~ScrollBarClient();
    // The bar is about to move the client; called before every other call that will. By default does nothing.
    virtual void InhibitAutoScroll(glogRec *);
    // The largest position that the bar can reach.
    virtual int GetMaxScrollValue(ScrollBarPane *) = 0;
    // Goes to the position, which may lie outside of what is possible.
    virtual void ScrollTo(ScrollBarPane *, int position) = 0;
    // The visible part over the whole extent. From 1.0 on the bar is dead; what is not a number leaves it
    // live.
    virtual double GetThumbRatio(ScrollBarPane *) = 0;
    // Writes the size of one step and the first multiplier. `byUnit` is true for a step of an arrow or of the
    // wheel, false for a page. Both must be written; what they hold before means nothing. An amount below 1
    // becomes 1.
    virtual void StartScrolling(ScrollBarPane *, bool byUnit, int &amount, int &multiplier) = 0;
    // Moves by the amount, negative toward the start, times the multiplier, as far as the client's own rule
    // says. May change the multiplier for the next repeat, which keeps it only toward the end: toward the
    // start every repeat begins with 1.
    virtual void Scroll(ScrollBarPane *, int &amount, int &multiplier) = 0;
    // Ticks of 1/60 second between the repeats of an arrow step, by default 3, and of a page step, by default
    // 5. The first repeat waits three times as long.
    virtual int GetArrowScrollDelay();
    virtual int GetPageScrollDelay();
    // A gesture or command has ended. By default does nothing.
    virtual void DoneScrolling(ScrollBarPane *);
};
