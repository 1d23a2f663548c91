#include "desktop/resources/ResourceError.h"

namespace {

std::string Place(std::string const &file, int line) {
    return line > 0 ? file + ':' + std::to_string(line) : file;
}

} // namespace

ResourceError::ResourceError(std::string const &file_, int line_, std::string const &message_)
    : ResourceError(Place(file_, line_) + ": " + message_, file_, line_, message_) {}

ResourceError::ResourceError(std::string const &what, std::string const &file_, int line_,
                             std::string const &message_)
    : std::runtime_error(what)
    , file(file_)
    , line(line_)
    , message(message_) {}
