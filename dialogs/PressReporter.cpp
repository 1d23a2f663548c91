#include "dialogs/PressReporter.h"
#include "buttons/GlogButtonPane.h"
#include "desktop/observe/MessageTrace.h"
#include "dialogs/MessageReporter.h"

namespace {

class PressReporter : public MessageReporter<GlogButtonPaneListener> {
public:
    using MessageReporter::MessageReporter;
    void GlogButtonPressed(GlogButtonPane *button) override {
        if (MessageTrace::On())
            MessageTrace::Write(
                MessageTrace::Begin(*button).Text("message", std::string("GlogButtonPressed")));
    }
};

} // namespace

void ReportPresses(GlogPane *pane) {
    if (GlogButtonPane *button = dynamic_cast<GlogButtonPane *>(pane))
        new PressReporter(button);
}
