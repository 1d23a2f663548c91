#include "frame/GListPane_SelectionListener.h"

template class Provider<GListPane_SelectionListener>;
template class Dependent<GListPane_SelectionListener>;
template class DependentCastMessenger<GListPane_SelectionListener>;

GListPane_SelectionListener::GListPane_SelectionListener() {}

GListPane_SelectionListener::~GListPane_SelectionListener() {}
