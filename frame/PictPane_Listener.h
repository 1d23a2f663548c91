// Hears of clicks on a picture.
#pragma once
#include "frame/Provider.h"

class EventRecordAdapter;

class PictPane_Listener : public Dependent<PictPane_Listener> {
public:
    PictPane_Listener();
    virtual ~PictPane_Listener();

    // The mouse was pressed on the picture. The event's point is in the picture's coordinates; the event is
    // valid during the call only. Not sent by a picture that lets clicks through.
    virtual void PictClicked(EventRecordAdapter *event) = 0;
};

// Tells the listeners of one click.
class PictClickMsg : public DependentCastMessenger<PictPane_Listener> {
public:
    explicit PictClickMsg(EventRecordAdapter *click)
        : event(click) {}
    void BroadcastChange(PictPane_Listener *listener) override;

private:
    EventRecordAdapter *event;
};

extern template class Provider<PictPane_Listener>;
extern template class Dependent<PictPane_Listener>;
extern template class DependentCastMessenger<PictPane_Listener>;
