// Reference-counted pixel image loaded through stb (.bmp and the other formats stb reads).
// Pixel formats by code: 0 single-channel grey, 1 three channels (RGB), 3 four channels with
// alpha (RGBA). Rows are stored top row first.
#pragma once

#include <cstdint>
#include <string>
#include <vector>

#include "VORBaseUnknown.h"
#include "VORHandle.h"
#include "VORTypes.h"
#include "VORUnicodeString.h"

class VORPixelImage : public VORBaseUnknown {
  VOR_DECLARE_CLASS(VORPixelImage, VORBaseUnknown)
 public:
  enum Format { Grey = 0, RGB = 1, RGBA = 3 };

  // A new image (one reference, the caller's) or null when the file cannot be read or decoded.
  // mode 0 is read-only use; the image is always held in memory.
  static VORPixelImage* CreateFromFile(const VORUnicodeString& path, int mode = 0);
  // A new image of the given size and format, every byte set to fill.
  static VORPixelImage* Create(int width, int height, int format, std::uint8_t fill = 0);

  int GetWidth() const { return _width; }
  int GetHeight() const { return _height; }
  int GetFormat() const { return _format; }
  int GetChannels() const { return ChannelsOf(_format); }
  const std::vector<std::uint8_t>& GetPixels() const { return _pixels; }
  std::vector<std::uint8_t>& Pixels() { return _pixels; }

  // Converts in place. To grey: luminance (0.299 R + 0.587 G + 0.114 B, rounded); to RGBA from
  // a format without alpha: alpha = 255 - transparency. E_INVALIDARG for an unknown format.
  HRESULT Convert(int format);
  // Uniform transparency 0 (opaque) .. 255 (invisible); in RGBA it rewrites every alpha byte,
  // in other formats it is kept and applied when converted to RGBA.
  void SetTransparency(int transparency);
  int GetTransparency() const { return _transparency; }

  // PNG bytes of the image (any format), for embedding; empty on failure.
  std::string EncodePNG() const;

  static int ChannelsOf(int format);

 private:
  VORPixelImage() = default;
  int _width = 0;
  int _height = 0;
  int _format = RGB;
  int _transparency = 0;
  std::vector<std::uint8_t> _pixels;
};
VOR_DECLARE_HANDLE(VORPixelImage);

// Image search: looks for fileName along VORStartupPath, in each directory's "icons" and
// "images" sub-folders and then the directory itself. S_OK and the full path, or E_FAIL and
// path untouched.
HRESULT VORGetImagePathName(const VORUnicodeString& fileName, VORUnicodeString& path);
