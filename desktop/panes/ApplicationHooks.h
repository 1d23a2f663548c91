// What the application supplies, for applications that do not.
#pragma once

// Stands in for VelaFoundationCallbackAPI::gInstance and InternalCallbackAPI::gInstance while the application
// has set neither.
namespace ApplicationHooks {
void InstallWhereNoneAre();
void Remove(); // only what was installed here
} // namespace ApplicationHooks
