// Follows the text in a text editing pane.
#pragma once
#include "frame/Message.h"
#include <boost/ref.hpp>

class TextEditPane;

class TextEditPane_Listener : public Dependent<TextEditPane_Listener> {
public:
    TextEditPane_Listener();
    virtual ~TextEditPane_Listener();

    // The text has changed, by the user or an edit command.
    virtual void TextEditPane_TextChanged(TextEditPane &) {}
    // The text has scrolled by itself, to keep the insertion point or the selection in view.
    virtual void TextEditPane_Autoscrolled(TextEditPane &) {}
};

extern template class Provider<TextEditPane_Listener>;
extern template class Dependent<TextEditPane_Listener>;
extern template class DependentCastMessenger<TextEditPane_Listener>;
extern template class Message1<TextEditPane_Listener, TextEditPane &, boost::reference_wrapper<TextEditPane>>;
