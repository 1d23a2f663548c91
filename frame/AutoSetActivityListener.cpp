#include "frame/AutoSetActivityListener.h"

template class Provider<AutoSetActivityListener>;
template class Dependent<AutoSetActivityListener>;
template class DependentCastMessenger<AutoSetActivityListener>;

AutoSetActivityListener::AutoSetActivityListener() {}

AutoSetActivityListener::~AutoSetActivityListener() {}

void AutoSetActivityMsg::BroadcastChange(AutoSetActivityListener *listener) {
    listener->ListenToActivity(source);
}
