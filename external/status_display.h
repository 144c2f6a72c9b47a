// The status display the reporter drives while the wizard shows a run: the
// log, warning, error and summary lists, their headers and their
// show-on-demand switches. Every member is called by number.
#ifndef KELQLN_EXTERNAL_STATUS_DISPLAY_H_
#define KELQLN_EXTERNAL_STATUS_DISPLAY_H_

#include "automation/dispatch.h"

namespace external::status_display {

using automation::DispId;

inline constexpr DispId kShowSummaryOnDemand = 0x68030000;   // Boolean property
inline constexpr DispId kShowLogOnDemand = 0x68030001;       // Boolean property
inline constexpr DispId kSummary = 0x60030007;               // (text)
inline constexpr DispId kLog = 0x60030008;                   // (text)
inline constexpr DispId kError = 0x60030009;                 // (text)
inline constexpr DispId kWarning = 0x6003000a;               // (text)
inline constexpr DispId kSummaryErrorHeader = 0x60030014;    // (text)
inline constexpr DispId kSummaryWarningHeader = 0x60030015;  // (text)
inline constexpr DispId kClear = 0x6003001d;
inline constexpr DispId kShowLog = 0x60030020;
inline constexpr DispId kShowSummary = 0x60030021;

}  // namespace external::status_display

#endif  // KELQLN_EXTERNAL_STATUS_DISPLAY_H_
