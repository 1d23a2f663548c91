#include "frame/ButtonGroupPaneListener.h"

template class Provider<ButtonGroupPaneListener>;
template class Dependent<ButtonGroupPaneListener>;
template class DependentCastMessenger<ButtonGroupPaneListener>;

ButtonGroupPaneListener::ButtonGroupPaneListener() {}

ButtonGroupPaneListener::~ButtonGroupPaneListener() {}

void ButtonValueChangeMsg::BroadcastChange(ButtonGroupPaneListener *listener) {
    listener->ButtonValueChanged(source, index, value);
}
