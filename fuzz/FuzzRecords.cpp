// Dialogs of binary records.
#include "dialogs/LoadGlog.h"
#include "fuzz/support/DialogTrial.h"
#include "fuzz/support/Entry.h"

int LLVMFuzzerTestOneInput(std::uint8_t const *data, std::size_t size) {
    DialogTrial::Run([=] { return LoadGlogFromRecords(data, size, GlogOptions(), DialogTrial::kName); });
    return 0;
}
