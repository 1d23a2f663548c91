#include "dialogs/LoadError.h"

namespace {

std::string Described(LoadError::Place const &place, std::string const &message) {
    std::string text = place.file;
    if (place.line > 0)
        text += ':' + std::to_string(place.line) + ':' + std::to_string(place.column);
    if (place.byte >= 0)
        text += ": byte " + std::to_string(place.byte);
    if (!place.item.empty())
        text += ": " + place.item;
    if (!place.key.empty())
        text += ": key " + place.key;
    return text + ": " + message;
}

} // namespace

LoadError::LoadError(Place const &place_, std::string const &message_)
    : std::runtime_error(Described(place_, message_))
    , place(place_)
    , message(message_) {}
