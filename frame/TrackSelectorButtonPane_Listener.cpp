#include "frame/TrackSelectorButtonPane_Listener.h"

template class Provider<TrackSelectorButtonPane_Listener>;
template class Dependent<TrackSelectorButtonPane_Listener>;
template class DependentCastMessenger<TrackSelectorButtonPane_Listener>;
template class Message0<TrackSelectorButtonPane_Listener>;

TrackSelectorButtonPane_Listener::TrackSelectorButtonPane_Listener() {}

TrackSelectorButtonPane_Listener::~TrackSelectorButtonPane_Listener() {}
