#include <gtest/gtest.h>

#include "automation/call.h"
#include "platform/picture.h"
#include "shared/model_element_utilities.h"

namespace kelqln {
namespace {

using automation::CLng;
using automation::Get;
using platform::Picture;

TEST(IconToPictureTest, IconHandlesBecomeIconPictures) {
  EXPECT_EQ(IconToPicture(0), nullptr);

  automation::Object picture = IconToPicture(4711);
  ASSERT_NE(picture, nullptr);
  EXPECT_EQ(picture->TypeName(), "Picture");
  EXPECT_EQ(CLng(Get(picture, Picture::kType)), platform::kPicTypeIcon);
  EXPECT_EQ(CLng(automation::GetByName(picture, "Handle")), 4711);
  EXPECT_EQ(CLng(Get(picture, Picture::kWidth)), 0);
  EXPECT_EQ(CLng(Get(picture, Picture::kHeight)), 0);
}

TEST(IconToPictureTest, ExclamationPictureHoldsTheStandardIcon) {
  automation::Object picture = GetExclamationPicture();
  ASSERT_NE(picture, nullptr);
  EXPECT_EQ(CLng(Get(picture, Picture::kType)), platform::kPicTypeIcon);
  EXPECT_NE(CLng(Get(picture, Picture::kHandle)), 0);
  EXPECT_EQ(CLng(Get(picture, Picture::kHandle)),
            platform::LoadStandardIcon(platform::kIdiExclamation));
  EXPECT_NE(platform::LoadStandardIcon(platform::kIdiExclamation),
            platform::LoadStandardIcon(platform::kIdiQuestion));
  EXPECT_EQ(platform::LoadStandardIcon(1), 0);
}

}  // namespace
}  // namespace kelqln
