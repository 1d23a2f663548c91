#include "frame/PopUpMenuListener.h"

template class Provider<PopUpMenuListener>;
template class Dependent<PopUpMenuListener>;
template class DependentCastMessenger<PopUpMenuListener>;

PopUpMenuListener::PopUpMenuListener() {}

PopUpMenuListener::~PopUpMenuListener() {}

void PopUpMenuChangeMsg::BroadcastChange(PopUpMenuListener *listener) {
    listener->ListenToMenuChange(menu, item);
}
