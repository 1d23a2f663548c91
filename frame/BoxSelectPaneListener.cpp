#include "frame/BoxSelectPaneListener.h"

template class Provider<BoxSelectPaneListener>;
template class Dependent<BoxSelectPaneListener>;
template class DependentCastMessenger<BoxSelectPaneListener>;

BoxSelectPaneListener::BoxSelectPaneListener() {}

BoxSelectPaneListener::~BoxSelectPaneListener() {}

void BoxSelectPaneChangeMsg::BroadcastChange(BoxSelectPaneListener *listener) {
    listener->BoxValueChanged(source, index, value);
}
