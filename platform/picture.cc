#include "platform/picture.h"

namespace platform {

using automation::Args;
using automation::CallKind;
using automation::Variant;

const automation::MemberTable<Picture>& Picture::Members() {
  static const automation::MemberTable<Picture> table(
      "Picture",
      {
          {kHandle, "Handle", CallKind::kPropertyGet,
           [](Picture& self, Args&) { return Variant(self.handle_); }},
          {kType, "Type", CallKind::kPropertyGet,
           [](Picture& self, Args&) { return Variant(self.type_); }},
          {kWidth, "Width", CallKind::kPropertyGet,
           [](Picture& self, Args&) { return Variant(self.width_); }},
          {kHeight, "Height", CallKind::kPropertyGet,
           [](Picture& self, Args&) { return Variant(self.height_); }},
      });
  return table;
}

void Picture::SetSize(int32_t width, int32_t height) {
  width_ = width;
  height_ = height;
}

int32_t LoadStandardIcon(int32_t icon_id) {
  // The standard icons are the system's own: their numbers serve as their
  // handles.
  return icon_id >= kIdiApplication && icon_id <= kIdiAsterisk ? icon_id : 0;
}

}  // namespace platform
