// A picture object with the standard picture interface (Handle, Type, Width,
// Height), as the system hands icons to its user interface. The picture owns
// its handle. Pixels and a size come from a graphical user interface later;
// until then the size is 0 by 0.
#ifndef KELQLN_PLATFORM_PICTURE_H_
#define KELQLN_PLATFORM_PICTURE_H_

#include <cstdint>
#include <memory>

#include "automation/member_table.h"

namespace platform {

// Picture types.
inline constexpr int16_t kPicTypeNone = 0;
inline constexpr int16_t kPicTypeBitmap = 1;
inline constexpr int16_t kPicTypeIcon = 3;

// The system's standard icons.
inline constexpr int32_t kIdiApplication = 32512;
inline constexpr int32_t kIdiHand = 32513;
inline constexpr int32_t kIdiQuestion = 32514;
inline constexpr int32_t kIdiExclamation = 32515;
inline constexpr int32_t kIdiAsterisk = 32516;

class Picture : public automation::DispatchImpl<Picture> {
 public:
  // Member numbers of the standard picture interface.
  static constexpr automation::DispId kHandle = 0;
  static constexpr automation::DispId kType = 3;
  static constexpr automation::DispId kWidth = 4;
  static constexpr automation::DispId kHeight = 5;

  Picture(int16_t type, int32_t handle) : type_(type), handle_(handle) {}
  static const automation::MemberTable<Picture>& Members();

  int16_t Type() const { return type_; }
  int32_t Handle() const { return handle_; }
  int32_t Width() const { return width_; }
  int32_t Height() const { return height_; }
  // For the user interface that gives the picture its pixels.
  void SetSize(int32_t width, int32_t height);

 private:
  int16_t type_;
  int32_t handle_;
  int32_t width_ = 0;
  int32_t height_ = 0;
};

// The handle of the system's standard icon `icon_id` (kIdiApplication to
// kIdiAsterisk), shared by every caller, or 0 for any other number.
int32_t LoadStandardIcon(int32_t icon_id);

}  // namespace platform

#endif  // KELQLN_PLATFORM_PICTURE_H_
