#include <stb/stb_image_write.h>

#include <cstdlib>

#include "TempDir.h"
#include "VOR2DImagePixelRep.h"
#include "VORPixelImage.h"
#include "VisuTestSupport.h"

namespace {

class PixelImageTest : public VisuTest {
 protected:
  // A 4 x 2 bitmap: red, green, blue, white on the top row, black below.
  std::string WriteBitmap(const std::string& relative) {
    unsigned char rgb[4 * 2 * 3] = {255, 0, 0, 0, 255, 0, 0, 0, 255, 255, 255, 255};
    const std::string path = dir.Path() + "/" + relative;
    std::filesystem::create_directories(std::filesystem::path(path).parent_path());
    EXPECT_NE(stbi_write_bmp(path.c_str(), 4, 2, 3, rgb), 0);
    return path;
  }
  TempDir dir;
};

TEST_F(PixelImageTest, LoadsBitmapsAndConvertsToGreyAndAlpha) {
  const std::string path = WriteBitmap("icon.bmp");
  auto image = VORPixelImage_var::Adopt(VORPixelImage::CreateFromFile(VORUnicodeString(path), 0));
  ASSERT_TRUE(image);
  EXPECT_EQ(image->GetWidth(), 4);
  EXPECT_EQ(image->GetHeight(), 2);
  EXPECT_EQ(image->GetFormat(), VORPixelImage::RGB);
  EXPECT_EQ(image->GetPixels()[0], 255);  // top-left stays red after the bottom-up file layout
  EXPECT_EQ(image->GetPixels()[1], 0);

  ASSERT_EQ(image->Convert(0), S_OK);
  EXPECT_EQ(image->GetChannels(), 1);
  EXPECT_EQ(image->GetPixels()[0], 76);   // 0.299 * 255
  EXPECT_EQ(image->GetPixels()[1], 150);  // 0.587 * 255
  EXPECT_EQ(image->GetPixels()[3], 255);
  EXPECT_EQ(image->GetPixels()[4], 0);

  image->SetTransparency(55);  // kept until there is an alpha channel
  ASSERT_EQ(image->Convert(3), S_OK);
  EXPECT_EQ(image->GetChannels(), 4);
  EXPECT_EQ(image->GetPixels()[3], 200);
  image->SetTransparency(0);
  EXPECT_EQ(image->GetPixels()[7], 255);
  EXPECT_EQ(image->GetPixels()[4], 150);  // grey survives the widening
  EXPECT_EQ(image->Convert(7), E_INVALIDARG);
  EXPECT_FALSE(image->EncodePNG().empty());

  // The image rep sizes icons at a quarter unit per pixel and holds a reference.
  const unsigned long refs = image->RefCount();
  {
    auto rep = Make<VOR2DImagePixelRep>(VORMathPoint2Df(-2.0f, -2.0f), image, 1, 0, 0, 0);
    EXPECT_EQ(rep->GetBoundingBox(), VORBox2D(-2.0, -2.0, -1.0, -1.5));
    EXPECT_EQ(image->RefCount(), refs + 1);
    rep->Modify(VORMathPoint2Df(0.0f, 0.0f));
    EXPECT_EQ(rep->GetBoundingBox(), VORBox2D(0.0, 0.0, 1.0, 0.5));
  }
  EXPECT_EQ(image->RefCount(), refs);
}

TEST_F(PixelImageTest, MissingOrBrokenFilesGiveNullAndTheSearchPathFindsIcons) {
  EXPECT_FALSE(VORPixelImage::CreateFromFile(VORUnicodeString(dir.Path() + "/none.bmp")));
  const std::string broken = dir.Write("broken.bmp", "BM not really a bitmap");
  EXPECT_FALSE(VORPixelImage::CreateFromFile(VORUnicodeString(broken)));

  const std::string icon = WriteBitmap("icons/I_PODShownInputPart.bmp");
  const char* saved = std::getenv("VORStartupPath");
  const std::string savedValue = saved ? saved : "";
  setenv("VORStartupPath", ("/nonexistent:" + dir.Path()).c_str(), 1);
  VORUnicodeString found("untouched");
  EXPECT_EQ(VORGetImagePathName(VORUnicodeString("I_PODShownInputPart.bmp"), found), S_OK);
  EXPECT_EQ(found.ConvertToUTF8(), icon);
  VORUnicodeString missing("untouched");
  EXPECT_EQ(VORGetImagePathName(VORUnicodeString("I_Nothing.bmp"), missing), E_FAIL);
  EXPECT_EQ(missing.ConvertToUTF8(), "untouched");
  if (saved)
    setenv("VORStartupPath", savedValue.c_str(), 1);
  else
    unsetenv("VORStartupPath");
}

}  // namespace
