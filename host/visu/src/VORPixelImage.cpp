#include "VORPixelImage.h"

#include <stb/stb_image.h>
#include <stb/stb_image_write.h>

#include <cmath>
#include <sstream>

#include "VOREnv.h"
#include "VORFileIO.h"

int VORPixelImage::ChannelsOf(int format) {
  switch (format) {
    case Grey:
      return 1;
    case RGB:
      return 3;
    case RGBA:
      return 4;
    default:
      return 0;
  }
}

VORPixelImage* VORPixelImage::CreateFromFile(const VORUnicodeString& path, int /*mode*/) {
  std::string bytes;
  std::string error;
  // Icons are small; refuse anything absurd before handing it to the decoder.
  if (!VORReadFile(path.ConvertToUTF8(), bytes, error, std::size_t{64} << 20) || bytes.empty())
    return nullptr;
  int w = 0;
  int h = 0;
  int channels = 0;
  stbi_uc* data = stbi_load_from_memory(reinterpret_cast<const stbi_uc*>(bytes.data()),
                                        static_cast<int>(bytes.size()), &w, &h, &channels, 0);
  if (data == nullptr)
    return nullptr;
  auto* image = new VORPixelImage();
  image->_width = w;
  image->_height = h;
  const size_t count = static_cast<size_t>(w) * static_cast<size_t>(h);
  if (channels == 1 || channels == 3 || channels == 4) {
    image->_format = channels == 1 ? Grey : (channels == 3 ? RGB : RGBA);
    image->_pixels.assign(data, data + count * static_cast<size_t>(channels));
  } else {
    // Grey with alpha: widen to RGBA.
    image->_format = RGBA;
    image->_pixels.resize(count * 4);
    for (size_t i = 0; i < count; ++i) {
      const stbi_uc g = data[i * 2];
      image->_pixels[i * 4] = image->_pixels[i * 4 + 1] = image->_pixels[i * 4 + 2] = g;
      image->_pixels[i * 4 + 3] = data[i * 2 + 1];
    }
  }
  stbi_image_free(data);
  return image;
}

VORPixelImage* VORPixelImage::Create(int width, int height, int format, std::uint8_t fill) {
  if (width < 0 || height < 0 || ChannelsOf(format) == 0)
    return nullptr;
  auto* image = new VORPixelImage();
  image->_width = width;
  image->_height = height;
  image->_format = format;
  image->_pixels.assign(
      static_cast<size_t>(width) * static_cast<size_t>(height) * ChannelsOf(format), fill);
  return image;
}

HRESULT VORPixelImage::Convert(int format) {
  const int to = ChannelsOf(format);
  if (to == 0)
    return E_INVALIDARG;
  if (format == _format)
    return S_OK;
  const int from = GetChannels();
  const size_t count = static_cast<size_t>(_width) * static_cast<size_t>(_height);
  std::vector<std::uint8_t> out(count * static_cast<size_t>(to));
  const auto alpha = static_cast<std::uint8_t>(255 - _transparency);
  for (size_t i = 0; i < count; ++i) {
    const std::uint8_t* p = &_pixels[i * static_cast<size_t>(from)];
    std::uint8_t r = p[0];
    std::uint8_t g = from >= 3 ? p[1] : p[0];
    std::uint8_t b = from >= 3 ? p[2] : p[0];
    std::uint8_t a = from == 4 ? p[3] : alpha;
    std::uint8_t* q = &out[i * static_cast<size_t>(to)];
    if (to == 1) {
      q[0] = static_cast<std::uint8_t>(std::lround(0.299 * r + 0.587 * g + 0.114 * b));
    } else {
      q[0] = r;
      q[1] = g;
      q[2] = b;
      if (to == 4)
        q[3] = a;
    }
  }
  _pixels.swap(out);
  _format = format;
  return S_OK;
}

void VORPixelImage::SetTransparency(int transparency) {
  _transparency = transparency < 0 ? 0 : (transparency > 255 ? 255 : transparency);
  if (_format != RGBA)
    return;
  const auto alpha = static_cast<std::uint8_t>(255 - _transparency);
  for (size_t i = 3; i < _pixels.size(); i += 4)
    _pixels[i] = alpha;
}

std::string VORPixelImage::EncodePNG() const {
  std::string out;
  if (_width <= 0 || _height <= 0)
    return out;
  auto sink = [](void* context, void* data, int size) {
    static_cast<std::string*>(context)->append(static_cast<const char*>(data),
                                               static_cast<size_t>(size));
  };
  if (stbi_write_png_to_func(sink, &out, _width, _height, GetChannels(), _pixels.data(),
                             _width * GetChannels()) == 0)
    out.clear();
  return out;
}

HRESULT VORGetImagePathName(const VORUnicodeString& fileName, VORUnicodeString& path) {
  const char* startup = VORGetEnv("VORStartupPath");
  if (startup == nullptr || fileName.IsEmpty())
    return E_FAIL;
  std::string expanded;
  std::istringstream dirs(startup);
  for (std::string dir; std::getline(dirs, dir, ':');) {
    if (dir.empty())
      continue;
    for (const char* sub : {"/icons", "/images", ""})
      expanded += (expanded.empty() ? "" : ":") + dir + sub;
  }
  VORUnicodeString found = VORFindPath(fileName, VORUnicodeString(expanded));
  if (found.IsEmpty())
    return E_FAIL;
  path = found;
  return S_OK;
}
