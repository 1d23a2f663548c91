#include "frame/GlogButtonPaneListener.h"

template class Provider<GlogButtonPaneListener>;
template class Dependent<GlogButtonPaneListener>;
template class DependentCastMessenger<GlogButtonPaneListener>;

GlogButtonPaneListener::GlogButtonPaneListener() {}

GlogButtonPaneListener::~GlogButtonPaneListener() {}

void GlogButtonPanePressedMsg::BroadcastChange(GlogButtonPaneListener *listener) {
    listener->GlogButtonPressed(source);
}
