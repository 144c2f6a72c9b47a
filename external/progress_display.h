// The progress display the reporter drives while the wizard shows a run:
// progress, error and warning counts, and the component, class and member
// being worked on. Every member is called by number; counts are 16-bit
// integers, flags Booleans, texts strings.
#ifndef KELQLN_EXTERNAL_PROGRESS_DISPLAY_H_
#define KELQLN_EXTERNAL_PROGRESS_DISPLAY_H_

#include "automation/dispatch.h"

namespace external::progress_display {

using automation::DispId;

inline constexpr DispId kTickText = 0x6003000a;          // (text, clear)
inline constexpr DispId kComponentCount = 0x6003000b;    // (count)
inline constexpr DispId kComponent = 0x6003000c;         // (name)
inline constexpr DispId kClassCount = 0x6003000d;        // (count)
inline constexpr DispId kTotalClassCount = 0x6003000e;   // (count)
inline constexpr DispId kTotalMemberCount = 0x6003000f;  // (count)
inline constexpr DispId kClass = 0x60030010;             // (name)
// (count, with delay); the member count gives the count alone.
inline constexpr DispId kTickCount = 0x60030011;
inline constexpr DispId kTick = 0x60030012;          // (name)
inline constexpr DispId kErrorCount = 0x60030013;    // read: 16-bit count
inline constexpr DispId kWarningCount = 0x60030014;  // read: 16-bit count
inline constexpr DispId kAddError = 0x60030015;      // () counts one error
inline constexpr DispId kAddWarning = 0x60030016;    // () counts one warning
inline constexpr DispId kClearStatusCounts = 0x60030018;
inline constexpr DispId kClearTask = 0x60030019;
inline constexpr DispId kComponentHeader = 0x6003001a;       // (text)
inline constexpr DispId kClassHeader = 0x6003001b;           // (text)
inline constexpr DispId kErrorWarningString = 0x6003001c;    // (text)
inline constexpr DispId kMemberProgressString = 0x6003001d;  // (text)
// (components, classes, members) a 16-bit integer
inline constexpr DispId kTask = 0x6003001e;

}  // namespace external::progress_display

#endif  // KELQLN_EXTERNAL_PROGRESS_DISPLAY_H_
