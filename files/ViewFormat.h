#pragma once
// The words of a saved view that the writer and the reader share.

#include <cstddef>
#include <string>

namespace zel {

inline constexpr const char* kTraceName = "Trace Name;";
inline constexpr const char* kTime = "Time";
inline constexpr const char* kMeasurementType = "Measurement Type";
inline constexpr const char* kDynamicRange = "Dynamic Range";
inline constexpr const char* kZeroSpan = "ZERO SPAN";
inline constexpr const char* kSweepTime = "Sweeptime";
inline constexpr const char* kResolutionBandwidth = "Resolution Bandwidth";
inline constexpr const char* kVideoBandwidth = "Video Bandwidth";
inline constexpr const char* kReferenceUnit = "Reference Unit";
inline constexpr const char* kReferenceRange = "Reference Range";
inline constexpr const char* kReferenceLevel = "Reference Level";
inline constexpr const char* kTraceDetector = "Trace Detector";
inline constexpr const char* kTraceWritePointer = "Trace Write Pointer";
inline constexpr const char* kMeasuredValue = "Measured Value";

/// Lines from the one with the trace's mark to its first value.
inline constexpr int kRowsAfterMark = 3;
/// Characters of a date at the head of a trace.
inline constexpr std::size_t kDayLength = 10;

/// With `toCode` dB a division becomes a range code: 10, 5, 2, 1 give 0 to 3, anything else
/// stays. Without it a range code becomes dB a division, 10 for a code that is none of 0 to 3.
void MapRangeCode(int value, bool toCode, int& out);

/// True for a path whose file name holds "dat", in either case: such a file is read as a log of the
/// older format, whatever is in it.
bool isNameOfOldLog(const std::string& path);
/// What a user who saves under such a name has to know; empty for other names.
std::string oldLogWarning(const std::string& path);

}  // namespace zel
