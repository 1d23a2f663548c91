// How text is placed and shortened.
#pragma once

namespace TextSettings {

// Where a line stands in its rectangle. The XML key "Align" numbers them differently: 0 left, 1 right, 2
// centre.
enum Alignment { kAlignRight = -1, kAlignDefault = 0, kAlignCenter = 1, kAlignLeft = 2 };

// Where a text that is too wide loses characters to an ellipsis: nowhere (it is cut at the edge), at its end,
// in its middle. The XML key "Truncate" has the words "None", "End" and "Middle".
enum TruncateCode { kTruncateNone = 0, kTruncateEnd = 1, kTruncateMiddle = 2 };

} // namespace TextSettings
