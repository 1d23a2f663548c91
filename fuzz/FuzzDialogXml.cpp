// Dialogs in XML.
#include "dialogs/LoadGlog.h"
#include "fuzz/support/DialogTrial.h"
#include "fuzz/support/Entry.h"
#include <string_view>

int LLVMFuzzerTestOneInput(std::uint8_t const *data, std::size_t size) {
    std::string_view const xml(reinterpret_cast<char const *>(data), size);
    DialogTrial::Run([xml] { return LoadGlogFromText(xml, DialogTrial::kName); });
    return 0;
}
