#pragma once
namespace TextSettings {

enum Alignment { kAlignRight = -1, kAlignDefault = 0, kAlignCenter = 1, kAlignLeft = 2 };

enum TruncateCode { kTruncateNone = 0, kTruncateEnd = 1, kTruncateMiddle = 2 };
}
