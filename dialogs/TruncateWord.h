// Where a text that is too wide is shortened, as items say it.
#pragma once
#include "host/TextSettings.h"

class GlogStyleSheet;

namespace TruncateWord {

// What the sheet says under the key "Truncate" by "None", "End" or "Middle", or otherwise this.
TextSettings::TruncateCode Of(GlogStyleSheet *, TextSettings::TruncateCode otherwise);

} // namespace TruncateWord
