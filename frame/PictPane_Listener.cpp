#include "frame/PictPane_Listener.h"

template class Provider<PictPane_Listener>;
template class Dependent<PictPane_Listener>;
template class DependentCastMessenger<PictPane_Listener>;

PictPane_Listener::PictPane_Listener() {}

PictPane_Listener::~PictPane_Listener() {}

void PictClickMsg::BroadcastChange(PictPane_Listener *listener) { listener->PictClicked(event); }
